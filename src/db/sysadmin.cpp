#include "db/sysadmin.h"

#include "db/master_logins.h"
#include "db/query_helpers.h"

namespace brasel::db {

bool loginSysAdmin(Connection& conn) {
    if (!conn.isOpen()) return false;
    switch (conn.engine()) {
        case Engine::Sqlite: {
            const ConnectionParams& p = conn.params();
            const QString login =
                p.autenticacao == QStringLiteral("WIN") ? utilizadorSistema() : p.login;
            return MasterLogins(p.server.folder).sysAdmin(login);
        }
        case Engine::Postgres: {
            const auto linha = primeiraLinha(
                conn, QStringLiteral("select rolsuper or (rolcreatedb and rolcreaterole) from "
                                     "pg_roles where rolname=current_user"));
            return linha && linha->value(0).toBool();
        }
        case Engine::SqlServer:
            return false;
    }
    return false;
}

}  // namespace brasel::db
