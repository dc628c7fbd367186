#include "app/ui/frm_password_supervisor.h"

#include "app/passwords.h"

namespace brasel::app {

frmPasswordSupervisor::frmPasswordSupervisor(Estado& estado, MessagePort& mensagens, QWidget* pai)
    : PromptPassword(QStringLiteral("frmPasswordSupervisor"),
                     QStringLiteral("Password do Supervisor"),
                     QStringLiteral("Introduza a password do supervisor:"), pai),
      estado_(estado),
      mensagens_(mensagens) {}

bool frmPasswordSupervisor::Confirma_bln() {
    return exec() == QDialog::Accepted;
}

bool frmPasswordSupervisor::Autoriza(Estado& estado, MessagePort& mensagens, QWidget* pai) {
    if (!precisaPasswordSupervisor()) return true;
    frmPasswordSupervisor prompt(estado, mensagens, pai);
    return prompt.Confirma_bln();
}

bool frmPasswordSupervisor::aceita() {
    return confirmaPasswordSupervisor(estado_, txtPassword()->text(), mensagens_);
}

}  // namespace brasel::app
