#include "app/ui/frm_muda_utilizador_password.h"

#include "common/ui/estilo_tactil.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

namespace brasel::app {

PromptPassword::PromptPassword(const QString& nome, const QString& titulo, const QString& pergunta,
                               QWidget* pai)
    : QDialog(pai), campos_(new QVBoxLayout), txtPassword_(new QLineEdit(this)) {
    setObjectName(nome);
    setWindowTitle(titulo);
    QFont fonte = font();
    fonte.setPointSize(16);
    setFont(fonte);

    auto* layout = new QVBoxLayout(this);
    auto* lblPergunta = new QLabel(pergunta, this);
    lblPergunta->setObjectName(QStringLiteral("lblPergunta"));
    lblPergunta->setWordWrap(true);
    layout->addWidget(lblPergunta);
    layout->addLayout(campos_);

    txtPassword_->setObjectName(QStringLiteral("txtPassword"));
    txtPassword_->setEchoMode(QLineEdit::Password);
    txtPassword_->setPlaceholderText(QStringLiteral("Password"));
    txtPassword_->setMinimumHeight(52);
    layout->addWidget(txtPassword_);

    auto* botoes = new QHBoxLayout;
    auto* cmdOK = new QPushButton(QStringLiteral("&OK"), this);
    cmdOK->setObjectName(QStringLiteral("cmdOK"));
    cmdOK->setDefault(true);
    auto* cmdCancelar = new QPushButton(QStringLiteral("&Cancelar"), this);
    cmdCancelar->setObjectName(QStringLiteral("cmdCancelar"));
    for (QPushButton* botao : {cmdOK, cmdCancelar}) {
        botao->setMinimumSize(180, 64);
        botoes->addWidget(botao);
    }
    layout->addLayout(botoes);
    connect(cmdOK, &QPushButton::clicked, this, &PromptPassword::ok);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    setMinimumWidth(520);
    txtPassword_->setFocus();
}

void PromptPassword::ok() {
    if (aceita()) {
        accept();
        return;
    }
    txtPassword_->clear();
    txtPassword_->setFocus();
}

frmMudaUtilizadorPassword::frmMudaUtilizadorPassword(const UtilizadorMudanca& utilizador,
                                                     MessagePort& mensagens, QWidget* pai)
    : PromptPassword(
          QStringLiteral("frmMudaUtilizadorPassword"), QStringLiteral("Password"),
          utilizador.login +
              (utilizador.semPassword() ? QStringLiteral(" ") + kSemPassword : QString()),
          pai),
      utilizador_(utilizador),
      mensagens_(mensagens) {}

std::optional<QString> frmMudaUtilizadorPassword::Password_str() {
    if (exec() != QDialog::Accepted) return std::nullopt;
    return txtPassword()->text();
}

bool frmMudaUtilizadorPassword::aceita() {
    return confirmaPasswordUtilizador(utilizador_, txtPassword()->text(), mensagens_);
}

}  // namespace brasel::app
