#pragma once

#include "app/estado.h"
#include "app/ui/frm_muda_utilizador_password.h"
#include "common/message_port.h"

namespace brasel::app {

// The supervisor's password, asked before a protected action of the order screen.
class frmPasswordSupervisor : public PromptPassword {
    Q_OBJECT
  public:
    frmPasswordSupervisor(Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

    // True once the supervisor's password was typed; false when the prompt was cancelled.
    bool Confirma_bln();

    // Whether the protected action may go on: at once on a workstation that does not ask for
    // the supervisor's password, otherwise after the prompt.
    static bool Autoriza(Estado& estado, MessagePort& mensagens, QWidget* pai = nullptr);

  protected:
    bool aceita() override;

  private:
    Estado& estado_;
    MessagePort& mensagens_;
};

}  // namespace brasel::app
