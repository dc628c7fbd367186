#pragma once

#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::documents {

// A document number as stored: zero-filled to 8 digits, so that text order is number order.
QString NumeroDocumento(qint64 numero);

// The type's last number (TabTipoMov.UltNumero, 0 when empty); nullopt when the type does not
// exist, its counter is not a number or the database refused.
std::optional<qint64> UltNumero_lng(db::Connection& conn, const QString& Tipo);

// Takes the next number of a movement type: UltNumero + 1, raised at once by an update that never
// lowers the counter. When another workstation took that number first, the next free one is
// taken. nullopt when the type does not exist, its counter is not a number or the database
// refused.
std::optional<QString> ProximoNumTabTipoMov(db::Connection& conn, const QString& Tipo);

// The first number of type `Tipo` in year `Ano`, not below UltNumero + 1 nor below `Minimo`
// (when given), that no header of `tabelaCabecalho` ("MovCliente" or "MovFornece") holds.
// Nothing is written. Before the closing lock this is only a proposal; inside it, the number.
std::optional<QString> NumeroLivre(db::Connection& conn, const QString& tabelaCabecalho,
                                   const QString& Tipo, const QString& Ano,
                                   const QString& Minimo = {});

// Inside the closing transaction: raises UltNumero to the number issued. A counter already past
// it (set by hand in the back office) is never lowered. False when the database refused.
bool GravaUltNumero(db::Connection& conn, const QString& Tipo, const QString& Numero);

// The header table of a party kind: "MovCliente" for "C", "MovFornece" for "F".
QString tabelaCabecalho(QChar TipoTerceiro);

}  // namespace brasel::documents
