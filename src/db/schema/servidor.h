#pragma once

#include "db/connection.h"
#include "db/server_address.h"

#include <QString>

#include <optional>

namespace brasel::db::schema {

struct Credenciais {
    QString login;
    QString password;
};

// On PostgreSQL every login of the program belongs to this group role, which owns the company
// databases and everything in them: any login may then read and write every company.
inline const QString kGrupoUtilizadores = QStringLiteral("brasel_utilizadores");

// A company code: four letters or digits.
bool codigoEmpresaValido(const QString& codigo);
// A login name every engine takes as it is: a letter or "_" followed by letters, digits or "_",
// at most 63 characters.
bool nomeLoginValido(const QString& login);

// Creates a login, or gives an existing one the new password. Embedded server: the first login
// of a folder needs no administrator and is always one; later ones need `admin` to be an
// administrator of the folder. PostgreSQL: a role of the group above, made by `admin`; an
// administrator may also create databases and roles.
bool criarLogin(const ServerAddress& servidor, const Credenciais& admin, const QString& login,
                const QString& password, bool sysAdmin, QString* erro);

// Whether the server has a database for the company; nullopt when the server cannot be asked.
std::optional<bool> existeEmpresa(const ServerAddress& servidor, const Credenciais& admin,
                                  const QString& codigo, QString* erro);

// Creates the company's database with the whole schema, its one-row tables and the company's
// name (when given). `admin` must be an administrator of the server. Nothing is left behind
// when a step fails.
bool criarEmpresa(const ServerAddress& servidor, const Credenciais& admin, const QString& codigo,
                  const QString& nomeEmpresa, QString* erro);

// Opens `conn` on the company to change its schema or data: on PostgreSQL as the group role, so
// that whatever is created belongs to every login.
bool abrirEmpresa(Connection& conn, const ServerAddress& servidor, const Credenciais& credenciais,
                  const QString& codigo, QString* erro);

}  // namespace brasel::db::schema
