#pragma once

#include "db/connection.h"

#include <QList>
#include <QString>

namespace brasel::db::demo {

// A user of the demo restaurant: a row of Utilizador and a login of the server.
struct UtilizadorDemo {
    QString codigo;
    QString login;
    QString nome;
    bool supervisor = false;
};

// "01" SUPERVISOR (the supervisor, also an administrator of the server), "02" ANA and "03" RUI
// (waiters).
QList<UtilizadorDemo> utilizadoresDemo();

// The name the demo restaurant gets when none is given.
QString nomeRestauranteDemo();

// Whether the company already holds products, customers or users: the demo only goes into an
// empty company.
bool empresaComDados(Connection& conn);

// Fills an empty company with the demo restaurant, in one write transaction: the general
// parameters, a shop with its heading lines, a cash register, tables and the walk-in customer,
// the menu, VAT codes, document types, payment methods, the ticket printer and customer display,
// and the users with their settings (their stored passwords are `passwordUtilizadores` under
// the character cipher). On failure nothing is written and `erro` says why.
bool carregarRestauranteDemo(Connection& conn, const QString& passwordUtilizadores,
                             const QString& nomeEmpresa, QString* erro);

}  // namespace brasel::db::demo
