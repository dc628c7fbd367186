#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QSqlRecord>

namespace brasel::app {

// Loads, in this order: the ParamGeral row, the user's UtilConfGeral row, the workstation's cash
// register (when `caixaPosto` is not blank after trimming it replaces the user's) and the heading
// lines of the user's warehouse. A missing column leaves its value as it was; a missing user row
// keeps the previous user's warehouse, cash register and document type.
void CarregaParametros(Estado& estado, MessagePort& mensagens, const QString& caixaPosto);

// Copies every ParamGeral column the record holds into `param`.
void lerParamGeral(const QSqlRecord& linha, Parametros& param, MessagePort& mensagens);

// 1 is true; 0 and -1 are false; any other number shows its message and is false.
bool IntToBool(long long valor, MessagePort& mensagens);

}  // namespace brasel::app
