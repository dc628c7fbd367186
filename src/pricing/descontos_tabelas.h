#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QString>

#include <array>

namespace brasel::pricing {

// The three line discounts (percent) of a product for a party; 0 where nothing applies.
using DescontosLinha = std::array<double, 3>;

// The discounts of a product for a customer ("C") or supplier ("F"), by the user's Descontos:
// "P" the product's sale discounts and "C" the customer's, each placed in the line's position k
// by the number the user's Desconto k holds (1..3; anything else leaves the position at 0); "T"
// the discount sets (DescontosTabelados); "Z" the thresholds (DescontosPatamares) at `Preco` for
// document type `TipoMovimento`. Supplier side: "T" and "Z" the product's discount set;
// otherwise the product's purchase discounts when the user's DescFFpro is "P", the supplier's
// discounts when not, placed the same way.
DescontosLinha GET_DescontosProdutos(app::Estado& estado, const QString& TipoTerceiro,
                                     const QString& Terceiro, const QString& Produto,
                                     Currency Preco, const QString& TipoMovimento,
                                     db::Connection* conn = nullptr);

// For a user whose Descontos is "T": the customer's and the product's discount sets are each
// applied to 100000; the one giving the smaller discount wins, the product's on a tie. A party
// without a set code, or with a code that has no row, takes no part; with neither, no discount.
DescontosLinha DescontosTabelados(app::Estado& estado, const QString& Terceiro,
                                  const QString& Produto, db::Connection* conn = nullptr);

// The threshold discounts: for a customer, the first TabPatamaresDescontos row of the
// customer's classification key, the product's discount code and the document type whose price
// band holds `Preco`; for a supplier, the product's discount set. 0 where nothing matches.
DescontosLinha DescontosPatamares(app::Estado& estado, const QString& TipoTerceiro,
                                  const QString& Terceiro, const QString& Produto, Currency Preco,
                                  const QString& TipoMovimento, db::Connection* conn = nullptr);

}  // namespace brasel::pricing
