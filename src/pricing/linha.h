#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "pricing/arredonda.h"
#include "pricing/iva.h"

#include <QString>

#include <optional>

namespace brasel::pricing {

// The amounts of one line, each rounded with the party's line settings.
struct ValoresLinha {
    Currency bruto;       // quantity x price (kind 4, then to nearest at casadec)
    Currency desconto;    // the three cascaded discounts (kind 5)
    Currency incidencia;  // what the VAT is charged on: gross - discount, without VAT
    Currency iva;         // kind 6
    Currency total;       // incidence + VAT, to nearest at casadec
};

// The line arithmetic on settings already read. `iva` empty means a code without a row (no VAT).
// For a code whose prices include VAT, the VAT is taken out of gross - discount and the total is
// that amount again, not the amount plus a second VAT. nullopt when an amount leaves the range.
std::optional<ValoresLinha> CalculaLinha(const ArredondamentosTerceiro& terceiro,
                                         const std::optional<TaxaIva>& iva, Currency Preco,
                                         Currency Quantidade, double Desc1, double Desc2,
                                         double Desc3, int casadec);

// The value of a line including VAT for the party ("C" or "F") and the VAT code, read from the
// database; 0 when the arithmetic fails.
Currency Linha_Calcular_cur(app::Estado& estado, const QString& TipoTerceiro,
                            const QString& Terceiro, Currency Preco, Currency Quantidade,
                            double Desc1, double Desc2, double Desc3, const QString& CodigoIva,
                            db::Connection* conn = nullptr);

}  // namespace brasel::pricing
