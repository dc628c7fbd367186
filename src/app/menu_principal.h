#pragma once

#include "app/estado.h"
#include "common/message_port.h"

#include <QDate>
#include <QStringList>

namespace brasel::app {

// What the main window does when it opens, after the login: the parameters again, the company's
// ParamGeral row (false, after "Empresa não está devidamente configurada!", when there is none:
// the program must end), the advisory configuration checks, and the workstation settings the
// main window keeps.
bool carregarMenuPrincipal(Estado& estado, MessagePort& mensagens);

// Whether the user may change the cash register (UtilConfGeral.AltCaixa "1").
bool alteraCaixaPermitido(Estado& estado);

// The panels of the status bar: company, date, user name - code, warehouse, cash register.
QStringList paineisBarraEstado(const Estado& estado, const QDate& hoje);

// The end of work in the main window: the user's in-use flag cleared and every connection closed.
void fecharMenuPrincipal(Estado& estado);

}  // namespace brasel::app
