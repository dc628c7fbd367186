#include "pos/ui/frm_facturacao.h"

#include "app/definicoes_posto.h"
#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/colunas_lista.h"
#include "pos/abertura_mesa.h"
#include "pos/adicionar_produto.h"
#include "pos/alteracao_linhas.h"
#include "pos/codigo_barras.h"
#include "pos/colunas_tab.h"
#include "pos/cozinha/historico_copa.h"
#include "pos/fecho_tab.h"
#include "pos/grupos.h"
#include "pos/imprime_doc_aberto.h"
#include "pos/mover_tab.h"
#include "pos/pendentes_tab.h"
#include "pos/produtos_facturacao.h"
#include "pos/ui/a_grupos.h"
#include "pos/ui/a_pedidos.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDate>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QInputDialog>
#include <QPixmap>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

// The list's widths are kept in twips; the touch font needs twice as much on screen.
constexpr double kEscalaTactil = 2.0;
// One product button: the picture above, two lines of description below.
const QSize kBotaoProduto(122, 100);
constexpr int kPedidosMs = 5000;

int pixeis(int twips) {
    return static_cast<int>(lookups::twipsParaPixeis(twips) * kEscalaTactil);
}
int twips(int pixeis) {
    return static_cast<int>(pixeis / kEscalaTactil * lookups::kTwipsPorPolegada / 96.0 + 0.5);
}

QLabel* lampada(const char* nome, const char* cor, QWidget* pai) {
    auto* l = new QLabel(pai);
    l->setObjectName(QString::fromLatin1(nome));
    l->setFixedSize(28, 28);
    l->setStyleSheet(
        QStringLiteral("border-radius: 14px; background-color: %1;").arg(QLatin1String(cor)));
    return l;
}

}  // namespace

frmFacturacao::frmFacturacao(app::Estado& estado, devices::LinhaSerie& linha, QWidget* pai)
    : QWidget(pai),
      estado_(estado),
      mensagens_(this),
      perguntas_(estado, mensagens_, this),
      tab_(estado, mensagens_, linha),
      perguntasFecho_(estado, mensagens_, linha, perguntas_, this),
      nivel_(app::posto::NivelEmenta.ler()) {
    setObjectName(QStringLiteral("frmFacturacao"));
    setWindowTitle(QStringLiteral("Movimentos Gerais"));
    tab_.Luzes = [this](char cor) { Luzes(cor); };

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(criaTopo());
    auto* meio = new QHBoxLayout;
    meio->addWidget(criaProdutos(), 11);
    meio->addWidget(criaLinhas(), 9);
    layout->addLayout(meio, 1);
    layout->addWidget(criaAccoes());

    aplicaFonteTactil(this);
    aplicaCorFundo(this, estado_.gUtilizador);
    resize(1024, 768);
    guardaGeometria(this, app::posto::JanPro);

    const InicioFacturacao inicio = ValoresIniciais(estado_);
    txtTipo_->setText(inicio.tipo);
    tab_.definirTipo(inicio.tipo);
    mostraCabecalho();
    if (!inicio.mesa.isEmpty()) abrirMesa(inicio.mesa);
    CarregarProdutos();

    connect(&timer1_, &QTimer::timeout, this, [this] {
        cmdPedidosCozinha_->setEnabled(cozinha::ExistemPedidosPorLibertar(estado_));
    });
    cmdPedidosCozinha_->setEnabled(cozinha::ExistemPedidosPorLibertar(estado_));
    timer1_.start(kPedidosMs);
}

QPushButton* frmFacturacao::botao(const char* nome, const QString& texto) {
    auto* b = new QPushButton(texto, this);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumHeight(64);
    b->setFocusPolicy(Qt::NoFocus);
    return b;
}

QWidget* frmFacturacao::criaTopo() {
    auto* topo = new QWidget(this);
    auto* l = new QHBoxLayout(topo);
    l->setContentsMargins(0, 0, 0, 0);
    auto* mesas = botao("cmdMesas", QStringLiteral("Mesas"));
    txtCliente_ = new QLineEdit(topo);
    txtCliente_->setObjectName(QStringLiteral("txtCliente"));
    txtCliente_->setMaximumWidth(110);
    lblCliente_ = new QLabel(topo);
    lblCliente_->setObjectName(QStringLiteral("lblCliente"));
    txtTipo_ = new QLineEdit(topo);
    txtTipo_->setObjectName(QStringLiteral("txtTipo"));
    txtTipo_->setMaximumWidth(70);
    lblTipo_ = new QLabel(topo);
    lblTipo_->setObjectName(QStringLiteral("lblTipo"));
    cmdAlterarTipo_ = botao("cmdAlterarTipo", QStringLiteral("Tipo"));
    auto* altCliente = botao("cmdAltCliente", QStringLiteral("Mudar Mesa"));
    shpVerde_ = lampada("shpVerde", "#2e9e44", topo);
    shpVermelho_ = lampada("shpVermelho", "#d63b2f", topo);
    shpVermelho_->hide();
    l->addWidget(mesas);
    l->addWidget(txtCliente_);
    l->addWidget(lblCliente_, 1);
    l->addWidget(txtTipo_);
    l->addWidget(lblTipo_);
    l->addWidget(cmdAlterarTipo_);
    l->addWidget(altCliente);
    l->addWidget(shpVerde_);
    l->addWidget(shpVermelho_);
    connect(mesas, &QPushButton::clicked, this, &frmFacturacao::cmdMesas);
    connect(txtCliente_, &QLineEdit::returnPressed, this,
            [this] { abrirMesa(txtCliente_->text().trimmed()); });
    connect(txtTipo_, &QLineEdit::returnPressed, this, [this] {
        tab_.definirTipo(txtTipo_->text().trimmed());
        mostraCabecalho();
        mostraLista();
    });
    connect(cmdAlterarTipo_, &QPushButton::clicked, this, &frmFacturacao::cmdAlterarTipo);
    connect(altCliente, &QPushButton::clicked, this, &frmFacturacao::cmdAltCliente);
    return topo;
}

QWidget* frmFacturacao::criaProdutos() {
    auto* painel = new QWidget(this);
    auto* l = new QVBoxLayout(painel);
    l->setContentsMargins(0, 0, 0, 0);
    auto* cabeca = new QHBoxLayout;
    auto* grupo = botao("cmdGrupo", QStringLiteral("Grupos"));
    lblGrupo_ = new QLabel(painel);
    lblGrupo_->setObjectName(QStringLiteral("lblGrupo"));
    cabeca->addWidget(grupo);
    cabeca->addWidget(lblGrupo_, 1);
    l->addLayout(cabeca);
    lvwListaProdutos_ = new QListWidget(painel);
    lvwListaProdutos_->setObjectName(QStringLiteral("lvwListaProdutos"));
    lvwListaProdutos_->setViewMode(QListView::IconMode);
    lvwListaProdutos_->setResizeMode(QListView::Adjust);
    lvwListaProdutos_->setMovement(QListView::Static);
    lvwListaProdutos_->setWordWrap(true);
    lvwListaProdutos_->setIconSize(QSize(56, 56));
    lvwListaProdutos_->setGridSize(kBotaoProduto + QSize(8, 8));
    lvwListaProdutos_->setUniformItemSizes(true);
    lvwListaProdutos_->setSpacing(4);
    lvwListaProdutos_->setStyleSheet(QStringLiteral(
        "QListWidget { font-size: 12pt; font-weight: bold; }"
        "QListWidget::item { background: #fdf6e3; border: 1px solid #b9a97a; border-radius: 8px; }"
        "QListWidget::item:pressed { background: #f4d35e; }"));
    l->addWidget(lvwListaProdutos_, 1);
    connect(grupo, &QPushButton::clicked, this, &frmFacturacao::cmdGrupo);
    connect(lvwListaProdutos_, &QListWidget::itemClicked, this, &frmFacturacao::produtoPremido);
    return painel;
}

QWidget* frmFacturacao::criaLinhas() {
    auto* painel = new QWidget(this);
    auto* l = new QVBoxLayout(painel);
    l->setContentsMargins(0, 0, 0, 0);
    lvwLista_ = new QTreeWidget(painel);
    lvwLista_->setObjectName(QStringLiteral("lvwLista"));
    lvwLista_->setRootIsDecorated(false);
    lvwLista_->setAlternatingRowColors(true);
    lvwLista_->setStyleSheet(QStringLiteral("QTreeWidget { font-size: 12pt; }"));
    lvwLista_->setSelectionMode(QAbstractItemView::SingleSelection);
    criaColunas();
    l->addWidget(lvwLista_, 1);
    auto* incidencias = new QGridLayout;
    for (std::size_t i = 0; i < lblInc_.size(); ++i) {
        lblInc_[i] = new QLabel(painel);
        lblInc_[i]->setObjectName(QStringLiteral("lblInc%1").arg(i + 1));
        incidencias->addWidget(lblInc_[i], static_cast<int>(i / 2), static_cast<int>(i % 2));
    }
    l->addLayout(incidencias);
    lblResumo_ = new QLabel(painel);
    lblResumo_->setObjectName(QStringLiteral("lblResumo"));
    l->addWidget(lblResumo_);
    lblTotal_ = new QLabel(painel);
    lblTotal_->setObjectName(QStringLiteral("lblTotal"));
    lblTotal_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblTotal_->setStyleSheet(QStringLiteral(
        "font-size: 34pt; font-weight: bold; color: #f8f8f2; background: #1d3557; padding: 6px;"));
    l->addWidget(lblTotal_);
    connect(lvwLista_, &QTreeWidget::itemChanged, this, &frmFacturacao::linhaMarcada);
    connect(lvwLista_, &QTreeWidget::itemDoubleClicked, this, &frmFacturacao::linhaDuploClique);
    return painel;
}

QWidget* frmFacturacao::criaAccoes() {
    auto* barra = new QWidget(this);
    auto* l = new QGridLayout(barra);
    l->setContentsMargins(0, 0, 0, 0);
    cmdQty_ = botao("cmdQty", QStringLiteral("Qty"));
    cmdPreco_ = botao("cmdPreco", QStringLiteral("Preço"));
    auto* observa = botao("cmdObserva", QStringLiteral("Obs."));
    auto* codigo = botao("cmdImputCodigoBarras", QStringLiteral("Código"));
    auto* altQty = botao("cmdAltQtyJaLancada", QStringLiteral("Alt. Qty"));
    auto* eliminar = botao("cmdEliminarpro", QStringLiteral("Eliminar"));
    cmdPedidosCozinha_ = botao("cmdPedidosCozinha", QStringLiteral("Pedidos"));
    auto* sair = botao("cmdSair", QStringLiteral("Sair"));
    const QList<QPushButton*> botoes{cmdQty_,  cmdPreco_,          observa, codigo, altQty,
                                     eliminar, cmdPedidosCozinha_, sair};
    for (int i = 0; i < botoes.size(); ++i)
        l->addWidget(botoes[i], 0, i);
    // The closing buttons, under the tab's lines and larger than the rest.
    auto* impDocAberto = botao("cmdImpDocAberto", QStringLiteral("Imp. Conta"));
    auto* talao = botao("cmdTalao", QStringLiteral("Talão"));
    auto* gravarDoc = botao("cmdGravarDoc", QStringLiteral("Fechar"));
    // A style sheet drops the window's font: the button names its own.
    gravarDoc->setStyleSheet(
        QStringLiteral("font-size: 18pt; font-weight: bold; background: #2e9e44; color: white;"));
    for (QPushButton* b : {impDocAberto, talao, gravarDoc})
        b->setMinimumHeight(72);
    l->addWidget(impDocAberto, 1, 4, 1, 1);
    l->addWidget(talao, 1, 5, 1, 1);
    l->addWidget(gravarDoc, 1, 6, 1, 2);
    connect(impDocAberto, &QPushButton::clicked, this, &frmFacturacao::cmdImpDocAberto);
    connect(talao, &QPushButton::clicked, this, &frmFacturacao::cmdTalao);
    connect(gravarDoc, &QPushButton::clicked, this, &frmFacturacao::cmdGravarDoc);
    connect(cmdQty_, &QPushButton::clicked, this, &frmFacturacao::cmdQty);
    connect(cmdPreco_, &QPushButton::clicked, this, &frmFacturacao::cmdPreco);
    connect(observa, &QPushButton::clicked, this, &frmFacturacao::cmdObserva);
    connect(codigo, &QPushButton::clicked, this, &frmFacturacao::cmdImputCodigoBarras);
    connect(altQty, &QPushButton::clicked, this, &frmFacturacao::cmdAltQtyJaLancada);
    connect(eliminar, &QPushButton::clicked, this, &frmFacturacao::cmdEliminarpro);
    connect(cmdPedidosCozinha_, &QPushButton::clicked, this, &frmFacturacao::cmdPedidosCozinha);
    connect(sair, &QPushButton::clicked, this, &QWidget::close);
    return barra;
}

void frmFacturacao::criaColunas() {
    const std::vector<ColunaTab> colunas =
        ColunasTab(estado_.param, app::posto::JanProTamQTY.ler(700),
                   app::posto::JanProTamDscr.ler(1300), app::posto::JanProTamPrec.ler(1100));
    QStringList titulos;
    for (const ColunaTab& c : colunas)
        titulos << c.titulo;
    lvwLista_->setColumnCount(static_cast<int>(colunas.size()));
    lvwLista_->setHeaderLabels(titulos);
    for (std::size_t i = 0; i < colunas.size(); ++i) {
        const int n = static_cast<int>(i);
        lvwLista_->setColumnHidden(n, colunas[i].twips <= 0);
        lvwLista_->setColumnWidth(n, pixeis(colunas[i].twips));
        if (colunas[i].direita)
            lvwLista_->headerItem()->setTextAlignment(n, Qt::AlignRight | Qt::AlignVCenter);
    }
}

void frmFacturacao::mostraCabecalho() {
    txtCliente_->setText(tab_.mesa().codigo);
    lblCliente_->setText(tab_.mesa().descricao);
    txtTipo_->setText(tab_.tipo().codigo);
    lblTipo_->setText(tab_.tipo().codigo.isEmpty()
                          ? QString()
                          : QStringLiteral("[") + tab_.tipo().descricao + QStringLiteral("]"));
    const bool podeMudar = tab_.configuracao() && tab_.configuracao()->altTipoMov == u"1";
    cmdAlterarTipo_->setEnabled(podeMudar && !tab_.mesa().codigo.isEmpty());
}

void frmFacturacao::mostraLista() {
    aPreencher_ = true;
    lvwLista_->clear();
    const std::vector<ColunaTab> colunas = ColunasTab(estado_.param, 0, 0, 0);
    for (const pricing::LinhaLista& linha : tab_.lista().linhas) {
        auto* item = new QTreeWidgetItem(
            lvwLista_, TextosLinha(linha, estado_.param, tab_.mostraPrecoAplicado()));
        item->setFlags(item->flags() | Qt::ItemIsUserCheckable);
        item->setCheckState(0, linha.seleccionada ? Qt::Checked : Qt::Unchecked);
        item->setData(0, Qt::UserRole, QVariant::fromValue<qlonglong>(linha.numRegisto));
        for (std::size_t i = 0; i < colunas.size(); ++i)
            if (colunas[i].direita)
                item->setTextAlignment(static_cast<int>(i), Qt::AlignRight | Qt::AlignVCenter);
    }
    if (lvwLista_->topLevelItemCount() > 0)
        lvwLista_->scrollToItem(lvwLista_->topLevelItem(lvwLista_->topLevelItemCount() - 1));
    aPreencher_ = false;
    mostraTotais();
}

void frmFacturacao::mostraTotais() {
    const pricing::TotaisDocumento& t = tab_.lista().totais;
    const int dec = estado_.param.casadec;
    for (std::size_t i = 0; i < lblInc_.size(); ++i) {
        const pricing::SlotIva& s = t.slots[i];
        lblInc_[i]->setText(s.vazio()
                                ? QString()
                                : s.tabIva + QStringLiteral(" ") + NumeroParaTexto(s.taxa, 0) +
                                      QStringLiteral("%: ") + NumeroParaTexto(s.incidencia, dec) +
                                      QStringLiteral(" / ") + NumeroParaTexto(s.iva, dec));
    }
    lblResumo_->setText(QStringLiteral("Mercadoria %1   Desconto %2   IVA %3")
                            .arg(NumeroParaTexto(t.mercadoria, dec),
                                 NumeroParaTexto(t.desconto, dec), NumeroParaTexto(t.iva, dec)));
    lblTotal_->setText(QStringLiteral("Total  ") + NumeroParaTexto(t.total, dec));
}

void frmFacturacao::Luzes(char cor) {
    if (cor == 'R') {
        shpVerde_->hide();
        shpVermelho_->show();
        shpVermelho_->repaint();
    } else {
        shpVerde_->show();
        shpVerde_->repaint();
    }
    QApplication::processEvents();
    if (shpVerde_->isVisible() && shpVermelho_->isVisible()) shpVermelho_->hide();
}

void frmFacturacao::abrirMesa(const QString& codigo) {
    AbrirMesa(tab_, codigo);
    mostraCabecalho();
    mostraLista();
}

void frmFacturacao::escolherGrupo(const QString& codigo) {
    grupo_ = codigo;
    CarregarProdutos();
}

void frmFacturacao::CarregarProdutos() {
    lblGrupo_->setText(DescricaoGrupo(estado_, nivel_, grupo_));
    lvwListaProdutos_->clear();
    const auto botoes =
        ProdutosDosBotoes(estado_.gConn, nivel_, grupo_, estado_.gUtilizador,
                          QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd")),
                          app::posto::ConfigRest_ActivaProdutosFacturaREST.ler());
    if (!botoes) return;
    for (const BotaoProduto& b : *botoes) {
        auto* item = new QListWidgetItem(b.descricao, lvwListaProdutos_);
        item->setData(Qt::UserRole, b.codigo);
        item->setTextAlignment(Qt::AlignCenter);
        item->setSizeHint(kBotaoProduto);
        QPixmap foto;
        if (!b.foto.isEmpty() && foto.loadFromData(b.foto)) item->setIcon(foto);
    }
}

std::int64_t frmFacturacao::linhaSeleccionada() const {
    const QTreeWidgetItem* item = lvwLista_->currentItem();
    return item ? item->data(0, Qt::UserRole).toLongLong() : 0;
}

void frmFacturacao::produtoPremido(QListWidgetItem* item) {
    if (!item || tab_.ocupado) return;
    const QString codigo = item->data(Qt::UserRole).toString();
    lvwListaProdutos_->clearSelection();
    setEnabled(false);
    QApplication::processEvents();
    const std::int64_t n = PremirProduto(tab_, perguntas_, codigo);
    setEnabled(true);
    perguntasFecho_.fechaTroco();
    if (n > 0) {
        cmdQty_->setText(QStringLiteral("Qty"));
        cmdPreco_->setText(QStringLiteral("Preço"));
        mostraLista();
    }
}

void frmFacturacao::linhaMarcada(QTreeWidgetItem* item, int coluna) {
    if (aPreencher_ || !item || coluna != 0) return;
    tab_.marcarLinha(item->data(0, Qt::UserRole).toLongLong(), item->checkState(0) == Qt::Checked);
    // Only the totals change: the item is still inside its own change.
    mostraTotais();
}

void frmFacturacao::linhaDuploClique(QTreeWidgetItem* item) {
    if (!item) return;
    item->setCheckState(0, item->checkState(0) == Qt::Checked ? Qt::Unchecked : Qt::Checked);
}

void frmFacturacao::cmdMesas() {
    if (const std::optional<QString> mesa = perguntas_.mesa()) abrirMesa(*mesa);
}

void frmFacturacao::cmdGrupo() {
    aGrupos picker(estado_, nivel_, this);
    if (const std::optional<QString> grupo = picker.escolher()) escolherGrupo(*grupo);
}

void frmFacturacao::cmdQty() {
    cmdQty_->setText(PedeQuantidadePendente(tab_, perguntas_));
}

void frmFacturacao::cmdPreco() {
    cmdPreco_->setText(PedePrecoPendente(tab_, perguntas_));
}

void frmFacturacao::cmdObserva() {
    PedeObservacaoPendente(tab_, perguntas_);
}

void frmFacturacao::cmdEliminarpro() {
    const std::int64_t n = linhaSeleccionada();
    if (n != 0 && EliminarLinha(tab_, perguntas_, n)) mostraLista();
}

void frmFacturacao::cmdAltQtyJaLancada() {
    const std::int64_t n = linhaSeleccionada();
    if (n == 0) return;
    setEnabled(false);
    const bool alterada = AlterarQuantidade(tab_, perguntas_, n) > 0;
    setEnabled(true);
    if (alterada) mostraLista();
}

void frmFacturacao::cmdAltCliente() {
    if (MudarMesa(tab_, perguntas_)) {
        mostraCabecalho();
        mostraLista();
    }
}

void frmFacturacao::cmdAlterarTipo() {
    if (MudarTipo(tab_, perguntas_)) {
        mostraCabecalho();
        mostraLista();
    }
}

void frmFacturacao::cmdImputCodigoBarras() {
    bool ok = false;
    const QString codigo =
        QInputDialog::getText(this, QStringLiteral("Recolha do Código do Produto"),
                              QStringLiteral("Digite o Código"), QLineEdit::Normal, QString(), &ok);
    if (!ok || !tab_.temMesaETipo()) return;
    const std::optional<ProdutoLido> lido =
        pos::cmdImputCodigoBarras(estado_, mensagens_, codigo, tab_.escalao());
    if (!lido) return;
    if (!lido->quantidade.isZero()) tab_.pendentes.quantidade = lido->quantidade;
    if (lido->preco) {
        tab_.pendentes.preco = *lido->preco;
        tab_.pendentes.precoDefinido = true;
    }
    setEnabled(false);
    const bool adicionado = AdicionarProduto(tab_, perguntas_, lido->produto, lido->texto) > 0;
    setEnabled(true);
    if (adicionado) mostraLista();
}

void frmFacturacao::cmdPedidosCozinha() {
    TecladoJanela teclado(mensagens_, nullptr, this);
    APedidos pedidos(estado_, mensagens_, teclado, this);
    pedidos.exec();
    cmdPedidosCozinha_->setEnabled(cozinha::ExistemPedidosPorLibertar(estado_));
}

void frmFacturacao::mostraTudo() {
    mostraCabecalho();
    mostraLista();
}

// The dialogs of the closing are modal: the screen stays enabled, since a disabled parent would
// disable them too.
void frmFacturacao::cmdGravarDoc() {
    FecharTab(tab_, perguntasFecho_);
    mostraTudo();
}

void frmFacturacao::cmdTalao() {
    FecharComTalao(tab_, perguntasFecho_);
    mostraTudo();
}

void frmFacturacao::cmdImpDocAberto() {
    ImprimeDocAberto(tab_);
    mostraTudo();
}

void frmFacturacao::closeEvent(QCloseEvent* evento) {
    app::posto::JanProTamQTY.gravar(twips(lvwLista_->columnWidth(kColunaQty)));
    app::posto::JanProTamDscr.gravar(twips(lvwLista_->columnWidth(kColunaDescricao)));
    app::posto::JanProTamPrec.gravar(twips(lvwLista_->columnWidth(kColunaPreco)));
    timer1_.stop();
    evento->accept();
}

}  // namespace brasel::pos
