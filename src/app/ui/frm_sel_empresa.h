#pragma once

#include "app/empresas.h"
#include "app/estado.h"
#include "common/message_port.h"

#include <QList>
#include <QWidget>

class QLabel;
class QLineEdit;
class QPushButton;
class QTreeWidget;

namespace brasel::app {

// The company selection: the companies of the listed servers, with the year and name filters,
// the search and the server maintenance. OK enters the chosen company (empresaEscolhida: the
// login follows); Cancel, or closing the window, ends the program (cancelado).
class frmSelEmpresa : public QWidget {
    Q_OBJECT

  public:
    frmSelEmpresa(Estado& estado, MessagePort& mensagens, QString linhaComando,
                  QWidget* pai = nullptr);

    // Lists the companies again with the filters of the boxes.
    void filtrar();
    // Selects the company with this index in linhas().
    void seleccionar(int indice);
    // Company OK on the selected row.
    void entrar();
    const QList<LinhaEmpresa>& linhas() const { return linhas_; }

  Q_SIGNALS:
    void empresaEscolhida();
    void cancelado();

  protected:
    void closeEvent(QCloseEvent* evento) override;

  private:
    void pesquisar();
    void servidores();
    void guardarFiltros();
    int indiceSeleccionado() const;

    Estado& estado_;
    MessagePort& mensagens_;
    QString linhaComando_;
    QList<LinhaEmpresa> linhas_;
    bool saiu_ = false;

    QLabel* lblVersao_;
    QLineEdit* txtAno_;
    QLineEdit* txtEmpresa_;
    QTreeWidget* lvwEmpresas_;
};

}  // namespace brasel::app
