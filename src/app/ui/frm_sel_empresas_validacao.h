#pragma once

#include "app/definicoes_posto.h"
#include "common/message_port.h"

#include <QDialog>

class QLineEdit;
class QRadioButton;
class QTreeWidget;

namespace brasel::app {

// The server list of the workstation: add, change and delete entries, import the list of an
// older installation, and save. Nothing is stored until Save, which closes the window accepted.
class frmSelEmpresas_Validacao : public QDialog {
    Q_OBJECT

  public:
    explicit frmSelEmpresas_Validacao(MessagePort& mensagens, QWidget* pai = nullptr);

    // Adds the servers of an "Empresas.csv" file and says how many were taken.
    void importar(const QString& ficheiro);
    const ListaServidores& lista() const { return lista_; }

  private:
    void mostrarLista();
    void mostrarEntrada();
    void autenticacaoMudou();
    EntradaServidor entradaDasCaixas() const;
    int indiceSeleccionado() const;
    void acrescentar();
    void alterar();
    void apagar();
    void gravar();
    void escolherFicheiro();

    MessagePort& mensagens_;
    ListaServidores lista_;

    QTreeWidget* lvwServidores_;
    QLineEdit* txtServidor_;
    QLineEdit* txtLogin_;
    QLineEdit* txtPassword_;
    QRadioButton* optSQL_;
    QRadioButton* optWIN_;
};

}  // namespace brasel::app
