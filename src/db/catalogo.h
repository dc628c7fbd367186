#pragma once

#include "db/connection.h"

#include <QString>
#include <QStringList>

namespace brasel::db {

// What the company list needs to know of a database of the server.
struct EstadoBaseDados {
    bool desligada = false;  // cannot be opened (offline, or refuses connections)
    bool soLeitura = false;
    qint64 tamanhoBytes = 0;
};

// The company databases of the server a "Master" connection is open on: names "Vendrola" + 4
// characters, in name order, as the program names them ("Vendrola0001").
QStringList basesDadosEmpresa(Connection& master);
EstadoBaseDados estadoBaseDados(Connection& master, const QString& nomeBaseDados);

}  // namespace brasel::db
