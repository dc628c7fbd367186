#pragma once

#include "db/connection.h"

#include <QString>

namespace brasel::db {

// The selected company, the credentials in use and the connections to its database.
struct Sessao {
    QString gEmpresa;  // 4-character company code
    QString gNomeEmpresa;
    QString gServidor;  // server text (folder, postgresql://...)
    QString gLogin;
    QString gPassword;      // plain in memory; encrypted in the company list
    QString gAutenticacao;  // "SQL" or "WIN"

    Connection gConn;
    Connection gConnAux;
    Connection gConnLocks;
    Connection gConnContab;

    // The connection a routine works on: the one given, or gConn when none is given or it is
    // closed.
    Connection& ligacao(Connection* conn) {
        return conn != nullptr && conn->isOpen() ? *conn : gConn;
    }
};

// "Vendrola" + the company code.
QString nomeBaseDados(const QString& empresa);
// The company code of a database name, or "" when the name is not a company database
// ("Vendrola" followed by exactly four characters).
QString codigoEmpresa(const QString& nomeBaseDados);

}  // namespace brasel::db
