#include "lookups/ui/w_pesquisa_nova.h"

#include "common/ui/estilo_tactil.h"
#include "common/ui/mensagens_janela.h"
#include "lookups/ui/lista_colunas.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace brasel::lookups {

namespace {

QPushButton* botao(const QString& nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(nome);
    b->setMinimumSize(170, 60);
    b->setAutoDefault(false);
    return b;
}

}  // namespace

WPesquisaNOVA::WPesquisaNOVA(db::Sessao& sessao, PedidoPesquisa pedido, QWidget* pai)
    : QDialog(pai),
      sessao_(sessao),
      pedido_(std::move(pedido)),
      cmbCampo_(new QComboBox(this)),
      txtChave_(new QLineEdit(this)),
      txtLimite_(new QLineEdit(this)),
      lvwPesquisa_(new QTreeWidget(this)),
      lblRegistos_(new QLabel(this)) {
    setObjectName(QStringLiteral("WPesquisaNOVA"));
    setWindowTitle(pedido_.titulo.isEmpty() ? QStringLiteral("Pesquisa") : pedido_.titulo);
    resize(960, 640);

    cmbCampo_->setObjectName(QStringLiteral("cmbCampo"));
    for (const CampoPesquisa& campo : pedido_.campos)
        cmbCampo_->addItem(campo.titulo);
    cmbCampo_->setCurrentIndex(pedido_.campo);
    cmbCampo_->setMinimumHeight(52);
    txtChave_->setObjectName(QStringLiteral("txtChave"));
    txtChave_->setText(pedido_.chave);
    txtChave_->setMinimumHeight(52);
    txtLimite_->setObjectName(QStringLiteral("txtLimite"));
    txtLimite_->setText(pedido_.limite);
    txtLimite_->setMinimumHeight(52);
    txtLimite_->setMaximumWidth(130);
    txtLimite_->setAlignment(Qt::AlignRight);
    lvwPesquisa_->setObjectName(QStringLiteral("lvwPesquisa"));
    lblRegistos_->setObjectName(QStringLiteral("lblRegistos"));

    auto* cmdPesquisar = botao(QStringLiteral("cmdPesquisar"), QStringLiteral("&Pesquisar"), this);
    auto* cmdSeleccionar =
        botao(QStringLiteral("cmdSeleccionar"), QStringLiteral("&Seleccionar"), this);
    auto* cmdCancelar = botao(QStringLiteral("cmdCancelar"), QStringLiteral("&Cancelar"), this);

    auto* filtro = new QHBoxLayout;
    filtro->addWidget(new QLabel(QStringLiteral("Campo"), this));
    filtro->addWidget(cmbCampo_);
    filtro->addWidget(new QLabel(QStringLiteral("Chave"), this));
    filtro->addWidget(txtChave_, 1);
    filtro->addWidget(new QLabel(QStringLiteral("Registos"), this));
    filtro->addWidget(txtLimite_);
    filtro->addWidget(cmdPesquisar);
    auto* botoes = new QHBoxLayout;
    botoes->addWidget(lblRegistos_, 1);
    botoes->addWidget(cmdSeleccionar);
    botoes->addWidget(cmdCancelar);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(filtro);
    layout->addWidget(lvwPesquisa_, 1);
    layout->addLayout(botoes);

    connect(cmdPesquisar, &QPushButton::clicked, this, &WPesquisaNOVA::pesquisar);
    connect(txtChave_, &QLineEdit::returnPressed, this, &WPesquisaNOVA::pesquisar);
    connect(txtLimite_, &QLineEdit::returnPressed, this, &WPesquisaNOVA::pesquisar);
    connect(cmdSeleccionar, &QPushButton::clicked, this, &WPesquisaNOVA::seleccionar);
    connect(lvwPesquisa_, &QTreeWidget::itemActivated, this, [this](QTreeWidgetItem* item) {
        lvwPesquisa_->setCurrentItem(item);
        seleccionar();
    });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    aplicaFonteTactil(this);
    // The rows are as tall as a finger: the font alone leaves them too thin to touch.
    lvwPesquisa_->setStyleSheet(QStringLiteral("QTreeView::item { min-height: 40px; }"));
    txtChave_->setFocus();
    pesquisar();
}

void WPesquisaNOVA::pesquisar() {
    QString erro;
    const auto linhas = executarPesquisa(sessao_.gConn, pedido_, cmbCampo_->currentIndex(),
                                         txtChave_->text(), txtLimite_->text(), &erro);
    Cria_lvwLISTA(lvwPesquisa_, pedido_.colunas);
    lvwPesquisa_->header()->setStretchLastSection(true);
    if (!linhas) {
        lblRegistos_->clear();
        MensagensJanela(this).mensagem(mensagemErroBaseDados(erro, pedido_.tabela), Icone::Critico);
        return;
    }
    for (const QStringList& linha : *linhas)
        adicionaLinha(lvwPesquisa_, linha);
    if (lvwPesquisa_->topLevelItemCount() > 0)
        lvwPesquisa_->setCurrentItem(lvwPesquisa_->topLevelItem(0));
    lblRegistos_->setText(QStringLiteral("%1 registo(s)").arg(linhas->size()));
}

std::optional<LinhaEscolhida> WPesquisaNOVA::escolhida() const {
    const QTreeWidgetItem* item = lvwPesquisa_->currentItem();
    if (!item) return std::nullopt;
    return LinhaEscolhida{item->text(0), item->text(1)};
}

void WPesquisaNOVA::seleccionar() {
    if (escolhida()) accept();
}

std::optional<LinhaEscolhida> WPesquisaNOVA::Pesquisa(db::Sessao& sessao,
                                                      const PedidoPesquisa& pedido, QWidget* pai) {
    WPesquisaNOVA janela(sessao, pedido, pai);
    if (janela.exec() != QDialog::Accepted) return std::nullopt;
    return janela.escolhida();
}

std::optional<LinhaEscolhida> PesquisaEmJanela::Pesquisa(const PedidoPesquisa& pedido) {
    return WPesquisaNOVA::Pesquisa(sessao_, pedido, pai_);
}

}  // namespace brasel::lookups
