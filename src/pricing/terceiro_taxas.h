#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QString>

#include <optional>

namespace brasel::pricing {

// The prompt-payment discount percent of a positive amount: the customer's DescontoPP when the
// document type's AfectaCli is "D+", the supplier's when its AfectaFor is "C+"; nothing
// otherwise (or for a party or type without a row).
std::optional<double> DescontoPP_Percentagem_cur(app::Estado& estado, const QString& TipoTerceiro,
                                                 const QString& Codigo, Currency Valor,
                                                 const QString& TipoMov,
                                                 db::Connection* conn = nullptr);

// `Valor` with the customer's surcharge (TaxaAgravamento percent) added, rounded to nearest at
// the price decimals; a customer without a row or a rate is only rounded. Out of range: `Valor`.
Currency TaxaAgravamento_cur(app::Estado& estado, const QString& Cliente, Currency Valor,
                             db::Connection* conn = nullptr);

}  // namespace brasel::pricing
