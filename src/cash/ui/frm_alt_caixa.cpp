#include "cash/ui/frm_alt_caixa.h"

#include "app/definicoes_posto.h"
#include "common/ui/estilo_tactil.h"
#include "db/query_helpers.h"
#include "lookups/ui/campo_codigo_janela.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QPushButton>

namespace brasel::cash {

namespace {

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(160, 64);
    return b;
}

}  // namespace

frmAltCaixa::frmAltCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai,
                         lookups::JanelaPesquisa* janela)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      janelaPropria_(estado, this),
      pesquisaTabelas_(estado, mensagens, janela ? *janela : janelaPropria_) {
    setObjectName(QStringLiteral("frmAltCaixa"));
    setWindowTitle(QStringLiteral("Alterar Caixa"));
    txtCaixa_ = new QLineEdit(estado_.gCaixa.trimmed(), this);
    txtCaixa_->setObjectName(QStringLiteral("txtCaixa"));
    txtCaixa_->setMinimumHeight(56);
    lblCaixa_ = new QLabel(this);
    lblCaixa_->setObjectName(QStringLiteral("lblCaixa"));
    lblCaixa_->setFrameShape(QFrame::Panel);
    lblCaixa_->setFrameShadow(QFrame::Sunken);
    lblCaixa_->setMinimumWidth(320);
    if (!txtCaixa_->text().isEmpty()) {
        lblCaixa_->setText(db::Select_Campo_str(estado_, QStringLiteral("Caixas"),
                                                QStringLiteral("Descricao"),
                                                QStringLiteral("Codigo"), txtCaixa_->text()));
    }
    auto* cmdPesquisa = botao("cmdPesquisa", QStringLiteral("..."), this);
    cmdPesquisa->setMinimumWidth(64);
    auto* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    connect(txtCaixa_, &QLineEdit::editingFinished, this, [this] {
        // Leaving the box empty chooses nothing; only the search button searches then.
        if (txtCaixa_->isModified() && !txtCaixa_->text().trimmed().isEmpty()) pesquisa(false);
        txtCaixa_->setModified(false);
    });
    connect(cmdPesquisa, &QPushButton::clicked, this, [this] { pesquisa(true); });
    connect(cmdOK, &QPushButton::clicked, this, [this] { confirma(); });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    auto* layout = new QGridLayout(this);
    layout->addWidget(new QLabel(QStringLiteral("Caixa"), this), 0, 0);
    layout->addWidget(txtCaixa_, 0, 1);
    layout->addWidget(cmdPesquisa, 0, 2);
    layout->addWidget(lblCaixa_, 1, 1, 1, 2);
    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);
    layout->addLayout(botoes, 2, 0, 1, 3);
    aplicaFonteTactil(this);
    resize(640, 260);
}

void frmAltCaixa::pesquisa(bool forcar) {
    lookups::pesquisaNoCampo(txtCaixa_, lblCaixa_,
                             [&](lookups::CampoCodigo& c) { pesquisaTabelas_.Caixas(c, forcar); });
}

void frmAltCaixa::confirma() {
    if (txtCaixa_->text().trimmed().isEmpty()) {
        mensagens_.mensagem(QStringLiteral("Não definiu o Caixa!"), Icone::Critico);
        return;
    }
    // The code is checked again: a register typed and not yet left may not exist.
    pesquisa(false);
    const QString caixa = txtCaixa_->text().trimmed();
    if (caixa.isEmpty()) return;
    if (!app::posto::ConfigRest_CAIXA.gravar(caixa)) {
        mensagens_.mensagem(QStringLiteral("Não foi possível gravar a configuração do posto."),
                            Icone::Critico);
        return;
    }
    estado_.gCaixa = caixa;
    accept();
}

}  // namespace brasel::cash
