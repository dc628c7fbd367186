#include "pos/ui/lista_marcacao.h"

#include <QFontMetrics>
#include <QHeaderView>
#include <QKeySequence>
#include <QShortcut>

#include <algorithm>

namespace brasel::pos {

namespace {

void inverteMarcados(QTreeWidget* lista) {
    for (QTreeWidgetItem* item : lista->selectedItems())
        item->setCheckState(0, item->checkState(0) == Qt::Checked ? Qt::Unchecked : Qt::Checked);
}

}  // namespace

void preparaListaMarcacao(QTreeWidget* lista) {
    lista->setSelectionMode(QAbstractItemView::ExtendedSelection);
    // The ticks are not the list's own check boxes: the row's touch inverts them, so a touch on
    // the box itself does not count twice.
    QObject::connect(lista, &QTreeWidget::itemClicked, lista,
                     [lista](QTreeWidgetItem*) { inverteMarcados(lista); });
    auto* espaco = new QShortcut(QKeySequence(Qt::Key_Space), lista);
    espaco->setContext(Qt::WidgetShortcut);
    QObject::connect(espaco, &QShortcut::activated, lista, [lista] { inverteMarcados(lista); });
}

void ajustaColunaMarcada(QTreeWidget* lista) {
    const QFontMetrics medida(lista->font());
    int largura = medida.horizontalAdvance(lista->headerItem()->text(0));
    for (int i = 0; i < lista->topLevelItemCount(); ++i)
        largura = std::max(largura, medida.horizontalAdvance(lista->topLevelItem(i)->text(0)));
    // The tick box of a finger-sized list is about two lines of text wide.
    lista->setColumnWidth(0, largura + 2 * medida.height() + 24);
}

}  // namespace brasel::pos
