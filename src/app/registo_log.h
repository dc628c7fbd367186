#pragma once

#include "app/estado.h"
#include "db/procedimentos/mete_no_log_geral.h"

namespace brasel::app {

// Logs one action of the user unless the logged-in user's ActivaLogGeral is 0. The entry's user
// defaults to gUtilizador and its time to the server's; the connection to gConn. A failed log
// write never stops the operation that asked for it: the result only says whether a row was
// written.
bool RegistaLogGeral(Estado& estado, db::EntradaLog entrada, db::Connection* conn = nullptr);

}  // namespace brasel::app
