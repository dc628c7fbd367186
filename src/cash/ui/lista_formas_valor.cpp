#include "cash/ui/lista_formas_valor.h"

#include <QHeaderView>

namespace brasel::cash {

namespace {

QTableWidgetItem* celula(const QString& texto, bool editavel = false) {
    auto* item = new QTableWidgetItem(texto);
    Qt::ItemFlags flags = Qt::ItemIsSelectable | Qt::ItemIsEnabled;
    if (editavel) flags |= Qt::ItemIsEditable;
    item->setFlags(flags);
    return item;
}

}  // namespace

ListaFormasValor::ListaFormasValor(const QString& tituloValor, int casadec, QWidget* pai)
    : QTableWidget(0, 4, pai), casadec_(casadec) {
    setObjectName(QStringLiteral("lvwFormas"));
    setHorizontalHeaderLabels({QStringLiteral("Nº Interno"), QStringLiteral("Código"),
                               QStringLiteral("Forma de Pagamento"), tituloValor});
    setColumnHidden(NumInterno, true);
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setEditTriggers(QAbstractItemView::DoubleClicked | QAbstractItemView::EditKeyPressed |
                    QAbstractItemView::AnyKeyPressed);
    verticalHeader()->hide();
    verticalHeader()->setDefaultSectionSize(56);
    horizontalHeader()->setSectionResizeMode(Descricao, QHeaderView::Stretch);
    setColumnWidth(Codigo, 110);
    setColumnWidth(Valor, 200);
    connect(this, &QTableWidget::itemChanged, this, [this](QTableWidgetItem* item) {
        if (item->column() == Valor) Q_EMIT valorAlterado();
    });
}

void ListaFormasValor::preenche(const std::vector<FormaPagamento>& formas,
                                const QHash<QString, Currency>& valores) {
    const QSignalBlocker bloqueio(this);
    setRowCount(static_cast<int>(formas.size()));
    for (int i = 0; i < rowCount(); ++i) {
        const FormaPagamento& f = formas[static_cast<std::size_t>(i)];
        setItem(i, NumInterno, celula(QString::number(f.numRegisto)));
        setItem(i, Codigo, celula(f.codigo));
        setItem(i, Descricao, celula(f.descricao));
        auto* valor = celula(QString(), true);
        valor->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
        setItem(i, Valor, valor);
        mostraValor(i, valores.value(f.codigo));
    }
    selectRow(0);
}

void ListaFormasValor::mostraValor(int linha, Currency valor) {
    item(linha, Valor)->setText(valor.toText(casadec_));
}

void ListaFormasValor::pedeValor(pos::PedeValor& teclado) {
    const int linha = currentRow();
    if (linha < 0) return;
    const auto valor = teclado.pedirValor(item(linha, Descricao)->text());
    if (valor) mostraValor(linha, *valor);
}

std::optional<Currency> ListaFormasValor::valor(int linha) const {
    const pos::ValorTeclado v = pos::lerValorTeclado(item(linha, Valor)->text());
    if (!v.valido) return std::nullopt;
    return v.valor.value_or(Currency());
}

std::optional<Currency> ListaFormasValor::total() const {
    try {
        Currency soma;
        for (int i = 0; i < rowCount(); ++i) {
            const auto v = valor(i);
            if (!v) return std::nullopt;
            soma += *v;
        }
        return soma;
    } catch (const CurrencyOverflow&) {
        return std::nullopt;
    }
}

}  // namespace brasel::cash
