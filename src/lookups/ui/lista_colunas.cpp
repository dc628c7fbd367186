#include "lookups/ui/lista_colunas.h"

#include <QHeaderView>

namespace brasel::lookups {

namespace {

// Where the header item keeps a column's kind, and a cell its sort key.
constexpr int kPapelTipo = Qt::UserRole + 1;
constexpr int kPapelChave = Qt::UserRole + 2;
constexpr char kOrdenacaoLigada[] = "braselOrdenacaoLigada";

Qt::Alignment alinhamentoQt(Alinhamento alinhamento) {
    switch (alinhamento) {
        case Alinhamento::Direita:
            return Qt::AlignRight | Qt::AlignVCenter;
        case Alinhamento::Centro:
            return Qt::AlignHCenter | Qt::AlignVCenter;
        case Alinhamento::Esquerda:
            break;
    }
    return Qt::AlignLeft | Qt::AlignVCenter;
}

void ordenaPeloCabecalho(QTreeWidget* lista, int coluna) {
    QHeaderView* cabecalho = lista->header();
    const bool mesmaColuna =
        cabecalho->isSortIndicatorShown() && cabecalho->sortIndicatorSection() == coluna;
    const Qt::SortOrder ordem = mesmaColuna && cabecalho->sortIndicatorOrder() == Qt::AscendingOrder
                                    ? Qt::DescendingOrder
                                    : Qt::AscendingOrder;
    cabecalho->setSortIndicatorShown(true);
    cabecalho->setSortIndicator(coluna, ordem);
    lista->sortItems(coluna, ordem);
}

}  // namespace

std::vector<ColunaLista> Cria_lvwLISTA(QTreeWidget* lista, const QString& formato) {
    const std::vector<ColunaLista> colunas = lerColunasLista(formato);
    lista->clear();
    lista->setSortingEnabled(false);
    lista->setRootIsDecorated(false);
    lista->setItemsExpandable(false);
    lista->setUniformRowHeights(true);
    lista->setAllColumnsShowFocus(true);
    lista->setSelectionMode(QAbstractItemView::SingleSelection);
    lista->setSelectionBehavior(QAbstractItemView::SelectRows);
    lista->setColumnCount(static_cast<int>(colunas.size()));

    QHeaderView* cabecalho = lista->header();
    cabecalho->setStretchLastSection(false);
    cabecalho->setSectionsClickable(true);
    cabecalho->setSortIndicatorShown(false);
    QTreeWidgetItem* titulos = lista->headerItem();
    const double dpi = lista->logicalDpiX();
    for (int i = 0; i < static_cast<int>(colunas.size()); ++i) {
        const ColunaLista& coluna = colunas[static_cast<std::size_t>(i)];
        titulos->setText(i, coluna.titulo);
        titulos->setTextAlignment(i, alinhamentoQt(coluna.alinhamento));
        titulos->setData(i, kPapelTipo, static_cast<int>(coluna.tipo));
        lista->setColumnHidden(i, coluna.oculta());
        if (!coluna.oculta()) lista->setColumnWidth(i, twipsParaPixeis(coluna.larguraTwips, dpi));
    }
    // A list may be rebuilt with other columns: the header click is connected once.
    if (!lista->property(kOrdenacaoLigada).toBool()) {
        QObject::connect(cabecalho, &QHeaderView::sectionClicked, lista,
                         [lista](int coluna) { ordenaPeloCabecalho(lista, coluna); });
        lista->setProperty(kOrdenacaoLigada, true);
    }
    return colunas;
}

bool ItemLista::operator<(const QTreeWidgetItem& outro) const {
    const QTreeWidget* lista = treeWidget();
    const int coluna = lista ? lista->sortColumn() : 0;
    const QVariant chave = data(coluna, kPapelChave);
    const QVariant chaveOutro = outro.data(coluna, kPapelChave);
    if (chave.isValid() && chaveOutro.isValid()) return chave.toString() < chaveOutro.toString();
    return QTreeWidgetItem::operator<(outro);
}

ItemLista* adicionaLinha(QTreeWidget* lista, const QStringList& textos) {
    auto* item = new ItemLista();
    const QTreeWidgetItem* titulos = lista->headerItem();
    for (int i = 0; i < lista->columnCount(); ++i) {
        const QString texto = textos.value(i);
        item->setText(i, texto);
        item->setTextAlignment(i, Qt::Alignment(titulos->textAlignment(i)));
        const auto tipo = static_cast<TipoColuna>(titulos->data(i, kPapelTipo).toInt());
        if (tipo != TipoColuna::Texto) item->setData(i, kPapelChave, chaveOrdenacao(tipo, texto));
    }
    lista->addTopLevelItem(item);
    return item;
}

}  // namespace brasel::lookups
