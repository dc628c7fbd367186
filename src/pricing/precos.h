#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QString>

#include <optional>

namespace brasel::pricing {

// The price of a product for a customer ("C") or supplier ("F"). Customer side, by the user's
// Precario: "P" the user's tier, "C" the customer's tier (tier 1 for an empty customer code),
// anything else no price (tier 0, price 0); the result then gets the customer's surcharge and
// is rounded to the price decimals (TaxaAgravamento_cur). Supplier side: the last purchase price.
// `Escalao` receives the tier used; a tier outside 1..7 gives price 0 and tier 0.
Currency GET_PrecosProdutos_cur(app::Estado& estado, const QString& TipoTerceiro,
                                const QString& Terceiro, const QString& Produto, int& Escalao,
                                db::Connection* conn = nullptr);

// The seller of a line, by the user's VendDef: "P" the product's usual seller, "C" the
// customer's, "U" the user's own; an empty result falls back to the customer's.
QString GET_Vendedor_str(app::Estado& estado, const QString& Cliente, const QString& Produto,
                         db::Connection* conn = nullptr);

// What the order screen sets for a tab when its table is opened.
struct ConfiguracaoTab {
    QString escalao;             // price tier "1".."7"; "" leaves the screen's default
    QString vendedor;            // default seller; "" when none is configured
    double descontoGeral = 0.0;  // default general discount percent
    QString altTipoMov;
    QString portaTalao;  // "COM" or "LPT"
    QString impressora;
    QString tipoImpTalao;
};

// The tab set-up from the user's UtilConfGeral row and the table's Clientes row; nullopt
// (nothing to set) when either is missing.
std::optional<ConfiguracaoTab> ConfigUtil(app::Estado& estado, const QString& Cliente,
                                          db::Connection* conn = nullptr);

}  // namespace brasel::pricing
