#pragma once

#include "admin/consola.h"
#include "db/schema/servidor.h"

namespace brasel::admin {

// The check of a company: its version against the program's, every table and column of the
// schema, the one-row tables, the logins of its users, and the start-up configuration checks as
// the supervisor ("01") would meet them. Every problem is written to the error output; true
// when there is none.
bool verificarEmpresa(const db::ServerAddress& servidor, const db::schema::Credenciais& credenciais,
                      const QString& codigo, Consola& consola);

}  // namespace brasel::admin
