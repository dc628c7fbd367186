#pragma once

#include "app/acessos.h"
#include "app/estado.h"
#include "common/message_port.h"

#include <QList>
#include <QWidget>

class QLabel;
class QLineEdit;

namespace brasel::app {

// The login into the selected company. OK logs in (entrou: the main window follows, this
// window hides); a refused password is cleared for typing again. Cancel, or closing the window,
// closes the company's connections and goes back to the company selection (cancelado).
class frmLogin : public QWidget {
    Q_OBJECT

  public:
    // `janelas`: the program's windows, whose rights a new user gets.
    frmLogin(Estado& estado, MessagePort& mensagens, FornecedorJanelas janelas,
             QWidget* pai = nullptr);

    // Prepares and shows the window; with Windows authentication in a remote session and
    // `automatico`, logs in at once.
    void Abrir(bool automatico);
    // Login OK with what the boxes hold.
    void entrar();

  Q_SIGNALS:
    void entrou();
    void cancelado();

  protected:
    void closeEvent(QCloseEvent* evento) override;

  private:
    Estado& estado_;
    MessagePort& mensagens_;
    FornecedorJanelas janelas_;
    bool entrou_ = false;

    QLabel* lblEmpresa_;
    QLineEdit* txtLogin_;
    QLineEdit* txtPassword_;
};

}  // namespace brasel::app
