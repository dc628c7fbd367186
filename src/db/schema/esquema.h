#pragma once

#include "db/connection.h"

#include <QString>
#include <QStringList>

namespace brasel::db::schema {

// Brings the company database open on `conn` to the definition, in one write transaction:
// creates the missing tables (the one-row tables with their row), adds the missing columns and
// keys, marks the company converted and stamps Actualiza.Versao with the program's version.
// A database stamped by a newer program is left untouched. What was changed is appended to
// `alteracoes`; on failure nothing is changed and `erro` says why.
bool actualizarEsquema(Connection& conn, QStringList* alteracoes, QString* erro);

// What the database lacks against the definition: missing tables and columns, and one-row
// tables that do not hold exactly one row. Empty when the schema is complete.
QStringList verificarEsquema(Connection& conn);

// Actualiza.Versao, or "" when the table or its row is missing.
QString versaoBaseDados(Connection& conn);

}  // namespace brasel::db::schema
