#pragma once

#include "pos/perguntas_tab.h"
#include "pos/tab.h"

namespace brasel::pos {

// Moves the tab to another table (cmdAltCliente): with lines on the tab, the table picker
// chooses the table; a walk-in or cash-only customer is refused unless the tab's type is a cash
// sale ("S+"); on "Transportar Produtos?" the lines go to the new table. The new table is then
// opened. False when nothing changed.
bool MudarMesa(Tab& tab, PerguntasTab& perguntas);

// Changes the tab's movement type (cmdAlterarTipo): the type picker chooses it; a cash-only
// customer takes only types whose AfectaCli is "S+", "S-" or "NA". On "Transportar Produtos?"
// the lines take the new type and its effects. The tab is then kept under the new type. False
// when nothing changed.
bool MudarTipo(Tab& tab, PerguntasTab& perguntas);

}  // namespace brasel::pos
