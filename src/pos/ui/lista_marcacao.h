#pragma once

#include <QTreeWidget>

namespace brasel::pos {

// A list of ticked rows for a finger: every row may be selected and a touch on a row (or Space
// on the selected ones) inverts the tick of the selected rows.
void preparaListaMarcacao(QTreeWidget* lista);
// Widens the first column to its codes and their large tick boxes; call after the rows are added
// and the other columns are sized.
void ajustaColunaMarcada(QTreeWidget* lista);

}  // namespace brasel::pos
