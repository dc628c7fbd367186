#pragma once

#include "common/currency.h"
#include "db/connection.h"

#include <QString>

namespace brasel::db {

// The twelve values of one activity-log row.
struct EntradaLog {
    QString utilizador;
    QString modulo;
    QString accao;
    QString observa;
    QString descricao;
    Currency valor;
    QString tipo;
    QString numero;
    QString ano;
    QString produto;
    QString terceiro;
    QString dataSys;
};

// The company's log procedure: stores one LogGeral row on the caller's connection (and inside
// its transaction, when one is open). Texts longer than the procedure's parameters are cut to
// their size, as the server would.
bool MeteNoLogGeral(Connection& conn, const EntradaLog& entrada);

}  // namespace brasel::db
