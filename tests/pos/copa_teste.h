#pragma once

// Shared by the kitchen tests: queue rows the way the order screen does, and read the queue back.
#include "db/sessao.h"
#include "pos/cozinha/historico_copa.h"

#include <QList>
#include <QSqlQuery>
#include <QString>
#include <QVariant>

namespace brasel::pos::cozinha::teste {

// Queues one line (order or cancellation) of `mesa` by ANA and gives its NumRegisto back (0 when
// it failed); `dataSys` replaces the server time when given, to fix the print order.
inline qint64 enfileira(db::Sessao& s, const QString& mesa, const QString& produto,
                        const QString& obs = {}, bool anulacao = false,
                        const QString& dataSys = {}) {
    PedidoCozinha p{produto,     QStringLiteral("Descrição de ") + produto,
                    Currency(1), mesa,
                    obs,         QStringLiteral("ANA")};
    const bool ok = anulacao ? MeteAnulacaoCozinha(s, p) : MetePedidoCozinha(s, p);
    if (!ok) return 0;
    auto r = s.gConn.firstRow(QStringLiteral("select max(NumRegisto) from HistoricoCopa"));
    const qint64 n = r ? r->value(0).toLongLong() : 0;
    if (!dataSys.isEmpty()) {
        s.gConn.exec(QStringLiteral("update HistoricoCopa set DataSys=? where NumRegisto=?"),
                     {dataSys, n});
    }
    return n;
}

// The NumRegisto of the rows in state `podeImprimir` (0 queued, 1 released), in key order.
inline QList<qint64> naFila(db::Sessao& s, int podeImprimir) {
    QList<qint64> r;
    auto q = s.gConn.exec(QStringLiteral("select NumRegisto from HistoricoCopa "
                                         "where PodeImprimir=? order by NumRegisto"),
                          {podeImprimir});
    while (q && q->next())
        r.append(q->value(0).toLongLong());
    return r;
}

inline bool libertaTodos(db::Sessao& s) {
    return s.gConn.exec(QStringLiteral("update HistoricoCopa set PodeImprimir=1")).has_value();
}

}  // namespace brasel::pos::cozinha::teste
