#pragma once

#include "common/currency.h"
#include "db/sessao.h"

#include <QList>
#include <QString>
#include <QtGlobal>

#include <optional>

namespace brasel::pos::cozinha {

// The kitchen queue (HistoricoCopa): one row per ordered or cancelled kitchen line. A row is
// queued (PodeImprimir 0), released by a waiter (1), then printed and deleted by the poll.

// A line sent to the kitchen: what the order screen knows when it stores or deletes a line.
struct PedidoCozinha {
    QString produto;
    QString descricao;
    Currency quantidade;
    QString mesa;        // the tab's table code (Cliente)
    QString obs;         // the line note; never stored for a cancellation
    QString utilizador;  // login of the waiter
};

// One stored row.
struct PedidoCopa {
    qint64 numRegisto = 0;
    QString produto;
    QString descricao;
    Currency quantidade;
    QString mesa;
    QString obs;
    QString utilizador;  // login
    QString dataSys;     // "yyyy-mm-dd HH:MM:SS", server time of the order
    bool anulacao = false;
    QString descricaoMesa;  // the table's Clientes.Descricao (read only by the order list)
};

// Queues an order (ANULACAO "N") or a cancellation ("S", empty note) as not yet released, at the
// server's time, on `conn` (gConn when none is given) so that the caller's transaction can hold
// it together with its line. False when the row could not be written.
bool MetePedidoCozinha(db::Sessao& sessao, const PedidoCozinha& pedido,
                       db::Connection* conn = nullptr);
bool MeteAnulacaoCozinha(db::Sessao& sessao, const PedidoCozinha& pedido,
                         db::Connection* conn = nullptr);

// Whether some row waits to be released (the order screen lights cmdPedidosCozinha then).
// False also when the database cannot be asked.
bool ExistemPedidosPorLibertar(db::Sessao& sessao);

// The rows waiting for release, by table and time, with the table's description; nullopt when
// the database cannot be read.
std::optional<QList<PedidoCopa>> PedidosPorLibertar(db::Sessao& sessao);
// The released rows, by table and time: the print order of the poll.
std::optional<QList<PedidoCopa>> PedidosLibertados(db::Sessao& sessao);

// Releases one waiting row for printing; false when it failed.
bool LibertaPedido(db::Sessao& sessao, qint64 numRegisto);
// Drops one row that is still waiting (a row released meanwhile by another workstation stays:
// it is already on its way to the kitchen).
bool EliminaPedidoPorLibertar(db::Sessao& sessao, qint64 numRegisto);
// Replaces the note of a row.
bool AlteraObsPedido(db::Sessao& sessao, qint64 numRegisto, const QString& obs);
// Removes a released row once its ticket was written.
bool ApagaPedidoImpresso(db::Sessao& sessao, qint64 numRegisto);

}  // namespace brasel::pos::cozinha
