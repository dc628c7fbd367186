#include "cash/ui/frm_lanc_mov_caixa.h"

#include "cash/registo_caixa.h"
#include "common/number_text.h"
#include "common/ui/estilo_tactil.h"
#include "pos/ui/frm_teclado.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QPushButton>
#include <QVBoxLayout>

namespace brasel::cash {

namespace {

enum Coluna { NumInterno, Codigo, Descricao, Parcial };

QPushButton* botao(const char* nome, const QString& texto, QWidget* pai) {
    auto* b = new QPushButton(texto, pai);
    b->setObjectName(QString::fromLatin1(nome));
    b->setMinimumSize(180, 72);
    return b;
}

QTableWidgetItem* celula(const QString& texto, bool editavel = false) {
    auto* item = new QTableWidgetItem(texto);
    Qt::ItemFlags flags = Qt::ItemIsSelectable | Qt::ItemIsEnabled;
    if (editavel) flags |= Qt::ItemIsEditable;
    item->setFlags(flags);
    return item;
}

}  // namespace

frmLancMovCaixa::frmLancMovCaixa(app::Estado& estado, MessagePort& mensagens, QWidget* pai,
                                 pos::PedeValor* teclado)
    : QDialog(pai),
      estado_(estado),
      mensagens_(mensagens),
      tecladoProprio_(teclado ? nullptr
                              : std::make_unique<pos::TecladoJanela>(mensagens, nullptr, this)),
      teclado_(teclado ? *teclado : *tecladoProprio_) {
    setObjectName(QStringLiteral("frmLancMovCaixa"));
    setWindowTitle(QStringLiteral("Formas de Pagamento"));

    lvwFormas_ = new QTableWidget(0, 4, this);
    lvwFormas_->setObjectName(QStringLiteral("lvwFormas"));
    lvwFormas_->setHorizontalHeaderLabels({QStringLiteral("Nº Interno"), QStringLiteral("Código"),
                                           QStringLiteral("Forma de Pagamento"),
                                           QStringLiteral("Parcial")});
    lvwFormas_->setColumnHidden(NumInterno, true);
    lvwFormas_->setSelectionBehavior(QAbstractItemView::SelectRows);
    lvwFormas_->setSelectionMode(QAbstractItemView::SingleSelection);
    lvwFormas_->setEditTriggers(QAbstractItemView::DoubleClicked |
                                QAbstractItemView::EditKeyPressed |
                                QAbstractItemView::AnyKeyPressed);
    lvwFormas_->verticalHeader()->hide();
    lvwFormas_->verticalHeader()->setDefaultSectionSize(56);
    lvwFormas_->horizontalHeader()->setSectionResizeMode(Descricao, QHeaderView::Stretch);
    lvwFormas_->setColumnWidth(Codigo, 110);
    lvwFormas_->setColumnWidth(Parcial, 180);
    connect(lvwFormas_, &QTableWidget::itemChanged, this, [this](QTableWidgetItem* item) {
        if (item->column() == Parcial) CalculaTot();
    });

    lblTotalDoc_ = new QLabel(this);
    lblTotalDoc_->setObjectName(QStringLiteral("lblTotalDoc"));
    lblTotalDoc_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblResto_ = new QLabel(this);
    lblResto_->setObjectName(QStringLiteral("lblResto"));
    lblResto_->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    lblResto_->setFrameShape(QFrame::Panel);
    lblResto_->setFrameShadow(QFrame::Sunken);

    auto* cmdValor = botao("cmdValor", QStringLiteral("&Valor..."), this);
    auto* cmdTudo = botao("cmdTudo", QStringLiteral("&Tudo"), this);
    auto* cmdOK = botao("cmdOK", QStringLiteral("&OK"), this);
    auto* cmdCancelar = botao("cmdCancelar", QStringLiteral("&Cancelar"), this);
    connect(cmdValor, &QPushButton::clicked, this, [this] { pedeValor(); });
    connect(cmdTudo, &QPushButton::clicked, this, [this] { tudo(); });
    connect(cmdOK, &QPushButton::clicked, this, [this] { confirma(); });
    connect(cmdCancelar, &QPushButton::clicked, this, &QDialog::reject);

    auto* lado = new QVBoxLayout;
    lado->addWidget(new QLabel(QStringLiteral("Total do Documento"), this));
    lado->addWidget(lblTotalDoc_);
    lado->addWidget(new QLabel(QStringLiteral("Resto"), this));
    lado->addWidget(lblResto_);
    lado->addSpacing(16);
    lado->addWidget(cmdValor);
    lado->addWidget(cmdTudo);
    lado->addStretch();
    lado->addWidget(cmdOK);
    lado->addWidget(cmdCancelar);
    auto* layout = new QHBoxLayout(this);
    layout->addWidget(lvwFormas_, 1);
    layout->addLayout(lado);
    aplicaFonteTactil(this);
    resize(900, 560);
}

frmLancMovCaixa::~frmLancMovCaixa() = default;

std::optional<std::vector<ParcialPagamento>> frmLancMovCaixa::Carregar(Currency totalDoc) {
    totalDoc_ = totalDoc;
    resultado_.clear();
    if (!preencheLista()) {
        mensagens_.mensagem(QStringLiteral("Processo Incompleto!"), Icone::Critico);
        return std::nullopt;
    }
    lblTotalDoc_->setText(NumeroParaTexto(totalDoc_, estado_.param.casadec));
    CalculaTot();
    if (exec() != QDialog::Accepted) return std::nullopt;
    return resultado_;
}

bool frmLancMovCaixa::preencheLista() {
    const auto formas = FormasPagamento(estado_.gConn);
    if (!formas || formas->empty()) return false;
    const QSignalBlocker bloqueio(lvwFormas_);
    lvwFormas_->setRowCount(static_cast<int>(formas->size()));
    for (int i = 0; i < lvwFormas_->rowCount(); ++i) {
        const FormaPagamento& f = (*formas)[static_cast<std::size_t>(i)];
        lvwFormas_->setItem(i, NumInterno, celula(QString::number(f.numRegisto)));
        lvwFormas_->setItem(i, Codigo, celula(f.codigo));
        lvwFormas_->setItem(i, Descricao, celula(f.descricao));
        auto* parcial = celula(QString(), true);
        parcial->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
        lvwFormas_->setItem(i, Parcial, parcial);
        mostraParte(i, Currency());
    }
    lvwFormas_->selectRow(0);
    return true;
}

void frmLancMovCaixa::mostraParte(int linha, Currency valor) {
    // Without grouping, so that the cell reads back as typed.
    lvwFormas_->item(linha, Parcial)->setText(valor.toText(estado_.param.casadec));
}

std::optional<std::vector<ParcialPagamento>> frmLancMovCaixa::partes() const {
    std::vector<ParcialPagamento> lista;
    for (int i = 0; i < lvwFormas_->rowCount(); ++i) {
        const pos::ValorTeclado v = pos::lerValorTeclado(lvwFormas_->item(i, Parcial)->text());
        if (!v.valido) return std::nullopt;
        lista.push_back({lvwFormas_->item(i, Codigo)->text(), v.valor.value_or(Currency())});
    }
    return lista;
}

std::optional<Currency> frmLancMovCaixa::CalculaTot() {
    const auto lista = partes();
    if (!lista) return std::nullopt;
    try {
        Currency resto = totalDoc_;
        for (const ParcialPagamento& p : *lista)
            resto -= p.valor;
        lblResto_->setText(NumeroParaTexto(resto, estado_.param.casadec));
        return resto;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

void frmLancMovCaixa::tudo() {
    const int linha = lvwFormas_->currentRow();
    const auto resto = CalculaTot();
    if (linha < 0 || !resto) return;
    const auto lista = partes();
    try {
        mostraParte(linha, (*lista)[static_cast<std::size_t>(linha)].valor + *resto);
    } catch (const CurrencyOverflow&) {
        return;
    }
    CalculaTot();
}

void frmLancMovCaixa::pedeValor() {
    const int linha = lvwFormas_->currentRow();
    if (linha < 0) return;
    const auto valor = teclado_.pedirValor(lvwFormas_->item(linha, Descricao)->text());
    if (!valor) return;
    mostraParte(linha, *valor);
    CalculaTot();
}

void frmLancMovCaixa::confirma() {
    const auto lista = partes();
    if (!lista) {
        mensagens_.mensagem(QStringLiteral("Valor Inválido!"), Icone::Critico);
        return;
    }
    const auto resto = CalculaTot();
    if (!resto || !resto->isZero()) {
        mensagens_.mensagem(QStringLiteral("Não Atribuiu o Valor Total do Documento!"),
                            Icone::Critico);
        return;
    }
    resultado_ = *lista;
    accept();
}

}  // namespace brasel::cash
