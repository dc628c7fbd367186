#pragma once

#include "pos/perguntas_tab.h"
#include "pos/tab.h"

#include <QString>

namespace brasel::pos {

// The pending values the order screen's buttons set for the next product; each returns the
// caption its button shows afterwards.

// cmdQty: a positive number on the keypad becomes the pending quantity ("Qty Alt."); anything
// else brings the quantity back to one unit ("Qty").
QString PedeQuantidadePendente(Tab& tab, PerguntasTab& perguntas);
// cmdPreco: a number on the keypad, 0 included, becomes the pending price ("Preço Alt."); an
// empty answer forgets it ("Preço").
QString PedePrecoPendente(Tab& tab, PerguntasTab& perguntas);
// cmdObserva: the text typed on the keyboard becomes the pending line note (kept as typed,
// quotes included); giving up keeps the note there was.
void PedeObservacaoPendente(Tab& tab, PerguntasTab& perguntas);

}  // namespace brasel::pos
