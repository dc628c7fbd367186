#pragma once

#include "app/estado.h"
#include "app/muda_utilizador.h"
#include "common/message_port.h"

#include <QDialog>
#include <QList>
#include <QTreeWidget>

namespace brasel::app {

// Another user takes over the workstation without leaving the program.
class frmMudaUtilizador : public QDialog {
    Q_OBJECT
  public:
    frmMudaUtilizador(Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // Lists the users, lets one be chosen (with the password when the workstation asks for it)
    // and makes them the program's user. True when the user changed: the main window then
    // checks the order screen's right, the cash-register rule and the status bar again.
    bool Muda_de_Utilizador();

    QTreeWidget* lvwUtilizadores() const { return lista_; }

  Q_SIGNALS:
    void utilizadorMudado();

  private:
    void carregaLista();
    void ok();

    Estado& estado_;
    MessagePort& mensagens_;
    QTreeWidget* lista_;
    QList<UtilizadorMudanca> utilizadores_;
};

}  // namespace brasel::app
