#include "pos/ui/frm_dados_cli_div.h"

#include "app/definicoes_posto.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/w_pesquisa_nova.h"
#include "pos/dados_cli_div.h"

#include <QDate>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

QPushButton* botao(QWidget* pai, const char* nome, const QString& texto) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumHeight(64);
    b->setMinimumWidth(160);
    return b;
}

}  // namespace

frmDadosCliDiv::frmDadosCliDiv(app::Estado& estado, MessagePort& mensagens, QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens) {
    setObjectName(QStringLiteral("frmDadosCliDiv"));
    setWindowTitle(QStringLiteral("Dados do Cliente"));
    auto* layout = new QVBoxLayout(this);
    lblData_ = new QLabel(this);
    lblData_->setObjectName(QStringLiteral("lblData"));
    layout->addWidget(lblData_);

    auto* form = new QFormLayout;
    txtContribuinte_ = campo("txtContribuinte");
    txtNomeCli_ = campo("txtNomeCli");
    txtDeferencia_ = campo("txtDeferencia");
    txtMorada_ = campo("txtMorada");
    txtLocal_ = campo("txtLocal");
    txtCodPost_ = campo("txtCodPost");
    txtPais_ = campo("txtPais");
    chkCarregaDados_ = new QCheckBox(QStringLiteral("Carregar Dados"), this);
    chkCarregaDados_->setObjectName(QStringLiteral("chkCarregaDados"));
    chkCarregaDados_->setChecked(app::posto::CarregaDados.ler());
    auto* contribuinte = new QHBoxLayout;
    contribuinte->addWidget(txtContribuinte_, 1);
    contribuinte->addWidget(chkCarregaDados_);
    form->addRow(QStringLiteral("Contribuinte"), contribuinte);
    form->addRow(QStringLiteral("Nome"), txtNomeCli_);
    form->addRow(QStringLiteral("A/C"), txtDeferencia_);
    form->addRow(QStringLiteral("Morada"), txtMorada_);
    form->addRow(QStringLiteral("Localidade"), txtLocal_);
    auto* codPost = new QHBoxLayout;
    codPost->addWidget(txtCodPost_, 1);
    auto* cmdCodPost = botao(this, "cmdCodPost", QStringLiteral("..."));
    cmdCodPost->setMinimumWidth(64);
    codPost->addWidget(cmdCodPost);
    form->addRow(QStringLiteral("Código Postal"), codPost);
    form->addRow(QStringLiteral("País"), txtPais_);
    layout->addLayout(form);

    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    auto* cmdFechaDiv = botao(this, "cmdFechaDiv", QStringLiteral("Confirmar"));
    auto* cmdCancelar = botao(this, "cmdCancelar", QStringLiteral("Cancelar"));
    botoes->addWidget(cmdFechaDiv);
    botoes->addWidget(cmdCancelar);
    layout->addLayout(botoes);

    connect(txtContribuinte_, &QLineEdit::editingFinished, this, &frmDadosCliDiv::carregaDados);
    connect(chkCarregaDados_, &QCheckBox::toggled, this,
            [](bool ligado) { app::posto::CarregaDados.gravar(ligado); });
    connect(cmdCodPost, &QPushButton::clicked, this, &frmDadosCliDiv::pesquisaCodPost);
    connect(cmdFechaDiv, &QPushButton::clicked, this, &frmDadosCliDiv::fechaDiv);
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);
    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(760, 520);
}

QLineEdit* frmDadosCliDiv::campo(const char* nome) {
    auto* c = new QLineEdit(this);
    c->setObjectName(QString::fromLatin1(nome));
    c->setMinimumHeight(44);
    return c;
}

std::optional<DadosClienteDiverso> frmDadosCliDiv::Abrir(const DadosClienteDiverso& propostos,
                                                         const QString& data,
                                                         bool lancaSemContribuinte) {
    data_ = data;
    lancaSemContribuinte_ = lancaSemContribuinte;
    lblData_->setText(QStringLiteral("Data do Documento: ") +
                      QDate::fromString(data, QStringLiteral("yyyy-MM-dd"))
                          .toString(QStringLiteral("dd-MM-yyyy")));
    mostra(propostos);
    txtContribuinte_->setFocus();
    if (exec() != QDialog::Accepted) return std::nullopt;
    return dados();
}

DadosClienteDiverso frmDadosCliDiv::dados() const {
    return {txtContribuinte_->text().trimmed(), txtNomeCli_->text().trimmed(),
            txtDeferencia_->text().trimmed(),   txtMorada_->text().trimmed(),
            txtLocal_->text().trimmed(),        txtCodPost_->text().trimmed(),
            txtPais_->text().trimmed()};
}

void frmDadosCliDiv::mostra(const DadosClienteDiverso& d) {
    txtContribuinte_->setText(d.contribuinte);
    txtNomeCli_->setText(d.nome);
    txtDeferencia_->setText(d.deferencia);
    txtMorada_->setText(d.morada);
    txtLocal_->setText(d.local);
    txtCodPost_->setText(d.codPostal);
    txtPais_->setText(d.pais);
}

void frmDadosCliDiv::carregaDados() {
    if (!chkCarregaDados_->isChecked()) return;
    if (const auto d = DadosUltimoDocumento(estado_.gConn, txtContribuinte_->text())) mostra(*d);
}

void frmDadosCliDiv::pesquisaCodPost() {
    lookups::PesquisaEmJanela janela(estado_, this);
    lookups::PesquisaTabelas pesquisa(estado_, mensagens_, janela);
    lookups::CampoCodigo campo{txtCodPost_->text().trimmed(), txtLocal_->text()};
    pesquisa.TabPostal(campo, true);
    txtCodPost_->setText(campo.codigo);
    if (!campo.descricao.isEmpty()) txtLocal_->setText(campo.descricao);
}

void frmDadosCliDiv::fechaDiv() {
    if (ConfirmaDadosCliDiv(mensagens_, dados(), data_, lancaSemContribuinte_)) accept();
}

}  // namespace brasel::pos
