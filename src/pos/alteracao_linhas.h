#pragma once

#include "db/connection.h"
#include "pos/perguntas_tab.h"
#include "pos/tab.h"

#include <cstdint>

namespace brasel::pos {

// Deletes a line of the tab (cmdEliminarpro): with the provisional bill printed, the
// supervisor's password comes first (unless the workstation does without it); then "Confirma a
// Eliminação ?". The kitchen gets a cancellation for a kitchen product, the line's production
// is undone and the row goes, all in one transaction. A tab left empty clears the table's
// printed-bill mark (" [$]"). False when nothing was deleted.
bool EliminarLinha(Tab& tab, PerguntasTab& perguntas, std::int64_t NumRegisto);

// Changes the quantity of a stored line (cmdAltQtyJaLancada): the same password gate,
// "Confirma a Alteração ?", the keypad for the new quantity (0 or nothing changes nothing);
// the line is then added again at the price it was sold at with the new quantity, replacing the
// stored one in the same transaction, so that a refused add keeps the old line. Returns the
// new line's NumRegisto, 0 when nothing changed.
std::int64_t AlterarQuantidade(Tab& tab, PerguntasTab& perguntas, std::int64_t NumRegisto);

// Takes a stored line off the tab inside the caller's transaction on `conn`: a cancellation for
// the kitchen when the product is a kitchen product, its production undone, its other taxes and
// its row deleted. False when the line is not the tab's or a write failed.
bool ApagaLinhaGravada(Tab& tab, std::int64_t NumRegisto, db::Connection& conn);

}  // namespace brasel::pos
