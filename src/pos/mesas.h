#pragma once

#include "app/estado.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <vector>

namespace brasel::pos {

// The table codes a user's ClientesDiv lists: slots of 11 characters whose first 10 hold the
// code. The number of slots is the length divided by 11, rounded to the nearest whole number,
// so the last code needs no separator after it (21 characters are two tables; so are 25, whose
// characters past the 22nd are ignored). Blank slots give no table.
QStringList MesasDoUtilizador(const QString& ClientesDiv);

// One button of the table picker.
struct BotaoMesa {
    QString codigo;
    QString caption;  // the description, with " [$]" once the provisional bill was printed
    bool ocupada = false;
    QByteArray fotoNormal;
    QByteArray fotoCompleta;

    // The picture of a free or an occupied table.
    const QByteArray& foto() const { return ocupada ? fotoCompleta : fotoNormal; }
};

// The current user's tables, in the order of their ClientesDiv; codes without a Clientes row are
// left out. A table is occupied while any user holds an open line on it.
std::vector<BotaoMesa> CarregarClientes(app::Estado& estado);

}  // namespace brasel::pos
