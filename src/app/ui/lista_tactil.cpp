#include "app/ui/lista_tactil.h"

#include <QHeaderView>

namespace brasel::app {

namespace {

constexpr int kAlturaLinha = 44;

}  // namespace

void preparaListaTactil(QTreeWidget* lista, int colunaElastica) {
    lista->header()->setSectionResizeMode(colunaElastica, QHeaderView::Stretch);
}

void ajustaColunasTactil(QTreeWidget* lista, int colunaElastica) {
    for (int i = 0; i < lista->topLevelItemCount(); ++i)
        lista->topLevelItem(i)->setSizeHint(0, QSize(0, kAlturaLinha));
    for (int i = 0; i < lista->columnCount(); ++i) {
        if (i != colunaElastica && !lista->isColumnHidden(i)) lista->resizeColumnToContents(i);
    }
}

}  // namespace brasel::app
