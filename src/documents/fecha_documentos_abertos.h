#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "db/connection.h"

#include <QChar>
#include <QString>

namespace brasel::documents {

// Which open lines to close into one document.
struct DocumentosAbertos {
    QChar tipoTerceiro = u'C';  // "C" customer (MovCliente), "F" supplier (MovFornece)
    QString terceiro;
    QString tipo;
    QString utilizador;  // the login whose lines close; "" every user's
    QString data;        // "yyyy-MM-dd"; "" today
};

// Closes every open line of a party and type into one numbered, signed document without the
// order screen: the lines' VAT in four slots (a fifth code refuses with its message and writes
// nothing), the next free number of the type, the lines and their guide, tax and pack rows
// numbered, the header ("Processamento automático.") and, when the type touches the till, its
// cash movement. Runs inside the caller's transaction on `conn` when one is open (the caller
// then holds the closing lock), else in one of its own under the lock. Returns the document
// number; "" when nothing was closed (no open line, a refusal or a failure, all rolled back by
// the transaction).
QString FechaDocumentosAbertos(app::Estado& estado, MessagePort& mensagens, db::Connection& conn,
                               const DocumentosAbertos& pedido);

}  // namespace brasel::documents
