#include "pos/ui/frm_lote.h"

#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "lookups/ui/lista_colunas.h"
#include "pos/adicionar_produto.h"
#include "pricing/leitura.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::pos {

namespace {

constexpr const char* kColunasLotes =
    "Lote,2000/Data Fabrico,1800,C/Data Validade,1800,C/Existência,1800,D/";

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(170, 60);
    b->setAutoDefault(false);
    return b;
}

QLineEdit* campo(const char* nome, QWidget* pai) {
    auto* c = new QLineEdit(pai);
    c->setObjectName(QString::fromLatin1(nome));
    c->setMinimumHeight(56);
    return c;
}

}  // namespace

frmLote::frmLote(app::Estado& estado, MessagePort& mensagens, lookups::PesquisaTabelas& pesquisa,
                 PedeTexto& teclado, const QString& produto, Currency jaLancado, QWidget* pai)
    : QDialog(pai), estado_(estado), mensagens_(mensagens), pesquisa_(pesquisa), teclado_(teclado) {
    setObjectName(QStringLiteral("frmLote"));
    const auto descricao =
        estado_.gConn.firstRow(QStringLiteral("select Descricao from Produtos where Codigo=?"),
                               {pricing::textoSql(produto)});
    setWindowTitle(
        QStringLiteral("Lote do Produto ") + produto +
        (descricao ? QStringLiteral(" - ") + descricao->value(0).toString() : QString()));
    auto* layout = new QVBoxLayout(this);

    lblJaLancado_ = new QLabel(this);
    lblJaLancado_->setObjectName(QStringLiteral("lblJaLancado"));
    lblJaLancado_->setText(QStringLiteral("Já lançado nesta mesa: ") +
                           NumeroParaTexto(jaLancado, estado_.param.casadecquant));
    lblJaLancado_->setVisible(jaLancado > Currency{});
    layout->addWidget(lblJaLancado_);

    lvwLotes_ = new QTreeWidget(this);
    lvwLotes_->setObjectName(QStringLiteral("lvwLotes"));
    lvwLotes_->setRootIsDecorated(false);
    lvwLotes_->setSelectionMode(QAbstractItemView::SingleSelection);
    lookups::Cria_lvwLISTA(lvwLotes_, QString::fromUtf8(kColunasLotes));
    layout->addWidget(lvwLotes_, 1);
    connect(lvwLotes_, &QTreeWidget::itemClicked, this,
            [this](QTreeWidgetItem* item) { escolheLote(item->text(0)); });

    auto* campos = new QGridLayout;
    txtLote_ = campo("txtLote", this);
    txtDataFabrico_ = campo("txtDataFabrico", this);
    txtDataValidade_ = campo("txtDataValidade", this);
    txtDataFabrico_->setPlaceholderText(QStringLiteral("aaaa-mm-dd"));
    txtDataValidade_->setPlaceholderText(QStringLiteral("aaaa-mm-dd"));
    auto* cmdPesquisaLote = botao("cmdPesquisaLote", QStringLiteral("&Pesquisar"), this);
    auto* cmdDataFabrico = botao("cmdDataFabrico", QStringLiteral("Teclado"), this);
    auto* cmdDataValidade = botao("cmdDataValidade", QStringLiteral("Teclado"), this);
    const struct {
        const char* rotulo;
        QLineEdit* caixa;
        QPushButton* accao;
    } linhas[] = {{"Lote", txtLote_, cmdPesquisaLote},
                  {"Data de Fabrico", txtDataFabrico_, cmdDataFabrico},
                  {"Data de Validade", txtDataValidade_, cmdDataValidade}};
    int i = 0;
    for (const auto& l : linhas) {
        campos->addWidget(new QLabel(QString::fromUtf8(l.rotulo), this), i, 0);
        campos->addWidget(l.caixa, i, 1);
        campos->addWidget(l.accao, i, 2);
        ++i;
    }
    layout->addLayout(campos);
    connect(cmdPesquisaLote, &QPushButton::clicked, this, [this] { pesquisaLote(); });
    connect(cmdDataFabrico, &QPushButton::clicked, this,
            [this] { pedeData(txtDataFabrico_, QStringLiteral("Data de Fabrico")); });
    connect(cmdDataValidade, &QPushButton::clicked, this,
            [this] { pedeData(txtDataValidade_, QStringLiteral("Data de Validade")); });

    auto* botoes = new QHBoxLayout;
    botoes->addStretch();
    auto* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    botoes->addWidget(cmdOK);
    botoes->addWidget(cmdCancelar);
    layout->addLayout(botoes);
    connect(cmdOK, &QPushButton::clicked, this, [this] { confirmar(); });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    carregaLotes(produto);
    aplicaFonteTactil(this);
    lvwLotes_->header()->setSectionResizeMode(QHeaderView::Stretch);
    resize(820, 600);
}

void frmLote::carregaLotes(const QString& produto) {
    const auto lotes = LotesDisponiveis(estado_.gConn, produto, ArmazemLinhasTab(estado_));
    if (!lotes) return;
    lotes_ = *lotes;
    for (const LoteDisponivel& l : lotes_) {
        lookups::ItemLista* item = lookups::adicionaLinha(
            lvwLotes_, {l.lote, l.dataFabrico, l.dataValidade,
                        NumeroParaTexto(l.saldo, estado_.param.casadecquant)});
        // Rows tall enough to be touched one at a time.
        item->setSizeHint(0, QSize(0, 52));
    }
}

void frmLote::escolheLote(const QString& lote) {
    txtLote_->setText(lote);
    txtDataFabrico_->clear();
    txtDataValidade_->clear();
    for (const LoteDisponivel& l : lotes_) {
        if (l.lote != lote) continue;
        txtDataFabrico_->setText(l.dataFabrico);
        txtDataValidade_->setText(l.dataValidade);
    }
}

void frmLote::pesquisaLote() {
    lookups::CampoCodigo campo{txtLote_->text(), {}};
    pesquisa_.LotesTabela(campo, true);
    if (!campo.codigo.isEmpty()) escolheLote(campo.codigo);
}

void frmLote::pedeData(QLineEdit* caixa, const QString& titulo) {
    const std::optional<QString> texto = teclado_.pedirTexto(titulo, caixa->text());
    if (texto) caixa->setText(texto->trimmed());
}

void frmLote::confirmar() {
    const LoteEscolhido lote{txtLote_->text().trimmed(), txtDataFabrico_->text().trimmed(),
                             txtDataValidade_->text().trimmed()};
    const QString invalido = ValidaLote(lote);
    if (!invalido.isEmpty()) {
        mensagens_.mensagem(invalido, Icone::Critico);
        return;
    }
    escolhido_ = lote;
    accept();
}

std::optional<LoteEscolhido> frmLote::escolher() {
    if (exec() != QDialog::Accepted) return std::nullopt;
    return escolhido_;
}

}  // namespace brasel::pos
