#pragma once

#include "app/estado.h"

namespace brasel::app {

// Inside an open write transaction on `conn`: takes the closing lock (the LockFacCli row), which
// the database holds until that transaction ends, so a second workstation closing a document
// waits here.
bool BloqueiaDocumentos(db::Connection& conn);
// The same with the LockCli row, around the saving of a points credit note.
bool BloqueiaClientes(db::Connection& conn);

// The per-table lock table of a restaurant table, as an identifier safe for any table code.
QString nomeTabelaLockMesa(const QString& mesa);
// Drops the lock table of a restaurant table on gConnLocks when it exists; errors are ignored.
void ApagaLockMesa(Estado& estado, const QString& mesa);

}  // namespace brasel::app
