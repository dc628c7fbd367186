#pragma once

#include "app/empresas.h"
#include "app/estado.h"
#include "common/message_port.h"

#include <QList>
#include <QString>

namespace brasel::app {

// The company selection: the companies of every listed server, and entering one of them.

// The companies of the servers in use (entries 1 to 20), filtered by name and year. A
// workstation without servers first imports the old list from the folder of its command line.
QList<LinhaEmpresa> listarEmpresas(const QString& filtroNome, const QString& filtroAno,
                                   const QString& linhaComando);

// The rows whose code or name contains `texto` (without regard to case), in list order; every
// row for a blank text.
QList<int> procurarEmpresas(const QList<LinhaEmpresa>& linhas, const QString& texto);

enum class ResultadoEmpresa {
    Login,  // gConn is open on the company: the login window follows
    Ficar,  // refused with its message; the company list stays
};

// Company OK: the row becomes the selected company and its credentials (the password out of
// the company-list cipher); the database version is checked, the updater is asked, gConn is
// opened and the company must have been converted.
ResultadoEmpresa entrarEmpresa(Estado& estado, const LinhaEmpresa& linha, MessagePort& mensagens);

}  // namespace brasel::app
