#pragma once

#include <QTreeWidget>

namespace brasel::app {

// The lists of the way in, for a finger: taller rows, one column taking the spare width and the
// others as wide as their texts (the design widths are too narrow for the touch font).
void preparaListaTactil(QTreeWidget* lista, int colunaElastica);
// Call after the rows are added.
void ajustaColunasTactil(QTreeWidget* lista, int colunaElastica);

}  // namespace brasel::app
