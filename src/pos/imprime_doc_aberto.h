#pragma once

#include "pos/tab.h"

#include <QString>

#include <optional>

namespace brasel::pos {

// The print-open-tab button: the table's open lines of the user are copied, each linked to its
// original by IdentificaRelacionado, to the workstation's table-bill type (TipoImprimeMesa) and
// closed there into a signed document under the closing lock; the table is marked as billed
// (JaImprimiuTalao, stored lines then need the supervisor) and the bill printed on the user's
// receipt printer. The tab's own lines stay open. Gives the bill's number; nullopt when the
// setting or the type is missing, the person says no, or the writing failed (all rolled back),
// each with its message.
std::optional<QString> ImprimeDocAberto(Tab& tab);

}  // namespace brasel::pos
