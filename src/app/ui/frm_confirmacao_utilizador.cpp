#include "app/ui/frm_confirmacao_utilizador.h"

#include "app/passwords.h"

namespace brasel::app {

frmConfirmacaoUtilizador::frmConfirmacaoUtilizador(Estado& estado, MessagePort& mensagens,
                                                   QWidget* pai)
    : PromptPassword(QStringLiteral("frmConfirmacaoUtilizador"),
                     QStringLiteral("Confirmação do Utilizador"),
                     QStringLiteral("Utilizador e password:"), pai),
      estado_(estado),
      mensagens_(mensagens),
      txtLogin_(new QLineEdit(this)) {
    txtLogin_->setObjectName(QStringLiteral("txtLogin"));
    txtLogin_->setMinimumHeight(52);
    txtLogin_->setPlaceholderText(QStringLiteral("Utilizador"));
    campos()->addWidget(txtLogin_);
    txtLogin_->setFocus();
}

QString frmConfirmacaoUtilizador::UtilizadorConfirma_str() {
    codigo_.clear();
    return exec() == QDialog::Accepted ? codigo_ : QString();
}

bool frmConfirmacaoUtilizador::aceita() {
    const auto codigo =
        confirmaUtilizador(estado_, txtLogin_->text(), txtPassword()->text(), mensagens_);
    codigo_ = codigo.value_or(QString());
    return codigo.has_value();
}

}  // namespace brasel::app
