#include "app/ui/frm_login.h"

#include "app/definicoes_posto.h"
#include "app/login.h"
#include "common/ui/estilo_tactil.h"

#include <QCloseEvent>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::app {

frmLogin::frmLogin(Estado& estado, MessagePort& mensagens, FornecedorJanelas janelas, QWidget* pai)
    : QWidget(pai),
      estado_(estado),
      mensagens_(mensagens),
      janelas_(std::move(janelas)),
      lblEmpresa_(new QLabel(this)),
      txtLogin_(new QLineEdit(this)),
      txtPassword_(new QLineEdit(this)) {
    setObjectName(QStringLiteral("frmLogin"));
    setWindowTitle(QStringLiteral("Login"));
    resize(620, 360);

    lblEmpresa_->setObjectName(QStringLiteral("lblEmpresa"));
    lblEmpresa_->setAlignment(Qt::AlignCenter);
    lblEmpresa_->setWordWrap(true);
    txtLogin_->setObjectName(QStringLiteral("txtLogin"));
    txtPassword_->setObjectName(QStringLiteral("txtPassword"));
    txtPassword_->setEchoMode(QLineEdit::Password);
    for (QLineEdit* caixa : {txtLogin_, txtPassword_})
        caixa->setMinimumHeight(52);

    auto* cmdOK = new QPushButton(QStringLiteral("&OK"), this);
    cmdOK->setObjectName(QStringLiteral("cmdOK"));
    auto* cmdCancelar = new QPushButton(QStringLiteral("&Cancelar"), this);
    cmdCancelar->setObjectName(QStringLiteral("cmdCancelar"));
    for (QPushButton* b : {cmdOK, cmdCancelar})
        b->setMinimumSize(170, 64);

    auto* caixas = new QFormLayout;
    caixas->addRow(QStringLiteral("Utilizador"), txtLogin_);
    caixas->addRow(QStringLiteral("Password"), txtPassword_);
    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);
    botoes->addStretch();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(lblEmpresa_);
    layout->addStretch();
    layout->addLayout(caixas);
    layout->addStretch();
    layout->addLayout(botoes);

    connect(txtLogin_, &QLineEdit::returnPressed, txtPassword_, qOverload<>(&QWidget::setFocus));
    connect(txtPassword_, &QLineEdit::returnPressed, this, &frmLogin::entrar);
    connect(cmdOK, &QPushButton::clicked, this, &frmLogin::entrar);
    connect(cmdCancelar, &QPushButton::clicked, this, &QWidget::close);

    aplicaFonteTactil(this);
    // The two boxes and the company are what the user reads at arm's length.
    for (QWidget* w : std::initializer_list<QWidget*>{lblEmpresa_, txtLogin_, txtPassword_}) {
        QFont f = font();
        f.setPointSize(f.pointSize() + 4);
        w->setFont(f);
    }
}

void frmLogin::Abrir(bool automatico) {
    const AberturaLogin abertura = prepararLogin(estado_, automatico);
    entrou_ = false;
    lblEmpresa_->setText(estado_.gEmpresa + QStringLiteral(" - ") + estado_.gNomeEmpresa);
    txtLogin_->setText(abertura.nome);
    txtLogin_->setReadOnly(abertura.nomeBloqueado);
    txtPassword_->clear();
    show();
    raise();
    activateWindow();
    if (abertura.nomeBloqueado || txtLogin_->text().isEmpty()) {
        txtLogin_->setFocus();
    } else {
        txtPassword_->setFocus();
    }
    if (abertura.entrarJa) entrar();
}

void frmLogin::entrar() {
    switch (validarLogin(estado_, txtLogin_->text(), txtPassword_->text(), janelas_, mensagens_)) {
        case ResultadoLogin::Entrou:
            entrou_ = true;
            txtPassword_->clear();
            hide();
            Q_EMIT entrou();
            return;
        case ResultadoLogin::PasswordErrada:
            txtPassword_->clear();
            txtPassword_->setFocus();
            return;
        case ResultadoLogin::Recusado:
            return;
    }
}

void frmLogin::closeEvent(QCloseEvent* evento) {
    // Hiding for the main window is not leaving the login.
    if (!entrou_) {
        if (!txtLogin_->isReadOnly())
            posto::NomeUtilizador.gravar(txtLogin_->text().trimmed().toUpper());
        fecharLigacoes(estado_);
        Q_EMIT cancelado();
    }
    evento->accept();
}

}  // namespace brasel::app
