#pragma once

#include "common/currency.h"
#include "db/connection.h"

#include <QDate>
#include <QString>

#include <optional>

namespace brasel::documents {

// Why a customer's document may not be closed, and whether the supervisor may let it through
// (an exceeded credit limit on a type with Autorizacao "1"; overdue documents never).
struct RecusaCredito {
    QString texto;
    bool autorizavel = false;
};

// The customer's checks before a document of type `tipo` and total `totalDoc` is closed on
// `hoje`. Only documents that go on the customer's account are checked (AfectaCli "D+", not a
// transport document). With ControlaVencidos 1, a "D+" document of the customer with a balance
// left and due before `hoje` refuses; with a LimiteCredito above zero, the customer's balance
// (the "D+" balances less the "C+" ones) plus `totalDoc` above the limit refuses. A database
// failure refuses too, so nothing goes through unchecked. Amounts in the text have `casasDecimais`
// decimals.
std::optional<RecusaCredito> VerificaCreditoCliente(db::Connection& conn, const QString& cliente,
                                                    Currency totalDoc, const QString& tipo,
                                                    const QDate& hoje, int casasDecimais = 2);

}  // namespace brasel::documents
