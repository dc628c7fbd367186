#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QString>

#include <optional>

namespace brasel::pricing {

// A row of TabIva.
struct TaxaIva {
    bool incluido = false;      // prices of this code include VAT
    double taxa = 0.0;          // percent
    double taxaInerente = 0.0;  // percent of the inherent (reverse-charge) VAT
};

// The VAT on `valor` at the code's rate, to four decimals. When the code includes VAT, `valor`
// is first replaced by the base without it (123.00 at 23 % becomes 100.00, VAT 23.00). No party
// rounding happens here. Raises CurrencyOverflow out of range.
Currency CalculaIva(const TaxaIva& codigo, Currency& valor);

// The TabIva row of a code; nullopt when there is none or the read fails.
std::optional<TaxaIva> LerTaxaIva(app::Estado& estado, const QString& codigo,
                                  db::Connection* conn = nullptr);

// CalculaIva on the code read from TabIva; a code without a row gives VAT 0 and leaves `Valor`.
Currency IVA_Calcular_IVA_cur(app::Estado& estado, const QString& CodigoIva, Currency& Valor,
                              db::Connection* conn = nullptr);

// The price without VAT. A product priced like a medicine (Medic '1') takes off its purchase VAT
// rate and is not rounded; otherwise a code that includes VAT takes off its rate and the result
// is rounded to nearest at `Decimais` (below 0: the price decimals). A code that does not include
// VAT, or none, leaves the price as it is.
Currency Preco_Sem_IVA_cur(app::Estado& estado, const QString& Produto, Currency Preco,
                           const QString& CodigoIva, db::Connection* conn = nullptr,
                           int Decimais = -1);

// The inherent VAT of `Valor` for a code with a TaxaInerente, rounded with the VAT pair of the
// customer ("C"), the supplier ("F") or of cash documents ("CX"); 0 for a code without one.
Currency IVA_IntraComunitario_cur(app::Estado& estado, const QString& CodigoIva, Currency Valor,
                                  const QString& TipoTerceiro, const QString& Codigo,
                                  db::Connection* conn = nullptr);

}  // namespace brasel::pricing
