#pragma once

#include "db/connection.h"

#include <QString>

#include <optional>

namespace brasel::documents {

// A document number as stored: zero-filled to 8 digits, so that text order is number order.
QString NumeroDocumento(qint64 numero);

// Takes the next number of a movement type: UltNumero + 1, raised at once by an update that never
// lowers the counter. When another workstation took that number first, the next free one is
// taken. nullopt when the type does not exist, its counter is not a number or the database
// refused.
std::optional<QString> ProximoNumTabTipoMov(db::Connection& conn, const QString& Tipo);

}  // namespace brasel::documents
