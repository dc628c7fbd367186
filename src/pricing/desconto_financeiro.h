#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "pricing/documento.h"

#include <QString>

#include <optional>

namespace brasel::pricing {

// The financial discount of a document whose merchandise less discount is `Base`. With both
// financial-discount tables empty: the customer's DescontoFinanceiroPERC of the base. Otherwise
// line by line over the selected lines of the document (type, number, year, customer and the
// current user's login, which tab lines hold): each line's value less its discount times the
// percent found for it, from the classification table when it has rows, else from the
// customer-and-product table. The value is rounded as a document discount (kind 8) of the customer.
// nullopt when a read fails or an amount leaves the range.
std::optional<DescontoFinanceiro> DescontoFinanceiro_Calcular(
    app::Estado& estado, const QString& Cliente, const QString& Tipo, const QString& Ano,
    const QString& Numero, Currency Base, db::Connection* conn = nullptr);

}  // namespace brasel::pricing
