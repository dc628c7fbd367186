#pragma once

#include "app/estado.h"
#include "app/ui/frm_muda_utilizador_password.h"
#include "common/message_port.h"

#include <QLineEdit>

namespace brasel::app {

// Who is at the workstation: a login and its password, proven by the company accepting them.
class frmConfirmacaoUtilizador : public PromptPassword {
    Q_OBJECT
  public:
    frmConfirmacaoUtilizador(Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // The code of the confirmed user; "" when the prompt was cancelled.
    QString UtilizadorConfirma_str();

    QLineEdit* txtLogin() const { return txtLogin_; }

  protected:
    bool aceita() override;

  private:
    Estado& estado_;
    MessagePort& mensagens_;
    QLineEdit* txtLogin_;
    QString codigo_;
};

}  // namespace brasel::app
