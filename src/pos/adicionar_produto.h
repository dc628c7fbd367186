#pragma once

#include "pos/perguntas_tab.h"
#include "pos/tab.h"

#include <QString>

#include <cstdint>

namespace brasel::pos {

// The text the posting logs each open line with.
inline constexpr const char* kTextoLogFacturacao = "Facturação Clientes (Rest)";

// The warehouse a tab's lines are posted to: ParamGeral.armazem, the user's when it is empty.
QString ArmazemLinhasTab(app::Estado& estado);

// A product button pressed (lvwListaProdutos): ignored while another product is being added or
// when the tab has no table or type; otherwise adds the pending product (or `codigo`) with the
// pending quantity (one unit when none). With `substitui`, the new line replaces that stored
// line of the tab (a quantity changed). Returns the new line's NumRegisto, 0 when nothing was
// added.
std::int64_t PremirProduto(Tab& tab, PerguntasTab& perguntas, const QString& codigo,
                           std::int64_t substitui = 0);

// Adds one line of product `codigo` to the tab. `texto` is the code as typed or scanned (a
// registered barcode may ask price and quantity); a button press passes the code. Every check
// and question comes first (situation, storage location, VAT limit, reference, stock, lot,
// price, barcode form, VAT, scale); then, in one transaction, the product's production at sale, the
// line, its other taxes and, for a kitchen product, its kitchen order are written, so that a
// refusal at any step leaves no line, no production and no kitchen order. A bar product's ticket
// prints once the line is stored. The customer display shows the line; the pending values are
// cleared. With `substitui`, that stored line leaves the tab in the same transaction
// (ApagaLinhaGravada). Returns the new line's NumRegisto, 0 when refused.
std::int64_t AdicionarProduto(Tab& tab, PerguntasTab& perguntas, const QString& codigo,
                              const QString& texto = {}, std::int64_t substitui = 0);

}  // namespace brasel::pos
