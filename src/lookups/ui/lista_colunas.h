#pragma once

#include "lookups/colunas_lista.h"

#include <QStringList>
#include <QTreeWidget>
#include <QTreeWidgetItem>

#include <vector>

namespace brasel::lookups {

// Sets up a list from its column layout text: headers, widths (twips at the list's logical
// DPI), alignment, hidden columns; rows already in it are removed. Clicking a header sorts by
// that column (again: the other way), dates and values by their keys; until then rows keep the
// order they were added in. Returns the columns read.
std::vector<ColunaLista> Cria_lvwLISTA(QTreeWidget* lista, const QString& formato);

// A row of a list built by Cria_lvwLISTA: compares by the sort keys of DATA and VALOR columns.
class ItemLista : public QTreeWidgetItem {
  public:
    using QTreeWidgetItem::QTreeWidgetItem;
    bool operator<(const QTreeWidgetItem& outro) const override;
};

// Adds a row with one text per column (missing texts are empty), aligned as its column, with the
// sort keys of its DATA and VALOR cells.
ItemLista* adicionaLinha(QTreeWidget* lista, const QStringList& textos);

}  // namespace brasel::lookups
