#include "pos/cozinha/historico_copa.h"

#include "db/query_helpers.h"
#include "pricing/leitura.h"

#include <QSqlQuery>
#include <QSqlRecord>

namespace brasel::pos::cozinha {

namespace {

bool mete(db::Sessao& sessao, const PedidoCozinha& pedido, bool anulacao, db::Connection* conn) {
    db::Connection& c = sessao.ligacao(conn);
    const QString agora = db::Get_DataSysServer_InsertIntoSQL(sessao, &c);
    // A null QString binds SQL NULL: a cancellation's note, and any text left unset, must be
    // stored as '' for the queue's readers and for "ObsLinha=''" to find them.
    return c
        .exec(QStringLiteral("insert into HistoricoCopa (Produto,Descricao,Quantidade,Cliente,"
                             "ObsLinha,PodeImprimir,Utilizador,DataSys,ANULACAO) "
                             "values (?,?,?,?,?,0,?,?,?)"),
              {pricing::textoSql(pedido.produto), pricing::textoSql(pedido.descricao),
               pedido.quantidade.toText(), pricing::textoSql(pedido.mesa),
               pricing::textoSql(anulacao ? QString() : pedido.obs),
               pricing::textoSql(pedido.utilizador), agora,
               anulacao ? QStringLiteral("S") : QStringLiteral("N")})
        .has_value();
}

// Every reader takes the columns in this order; the order list adds the table's description.
const QString kColunas = QStringLiteral(
    "h.NumRegisto, h.Produto, h.Descricao, h.Quantidade, h.Cliente, h.ObsLinha, h.Utilizador, "
    "h.DataSys, h.ANULACAO");

PedidoCopa lePedido(const QSqlQuery& q, bool comDescricaoMesa) {
    PedidoCopa p;
    p.numRegisto = q.value(0).toLongLong();
    p.produto = q.value(1).toString();
    p.descricao = q.value(2).toString();
    p.quantidade = Currency::fromVariant(q.value(3));
    p.mesa = q.value(4).toString();
    p.obs = q.value(5).toString();
    p.utilizador = q.value(6).toString();
    p.dataSys = q.value(7).toString();
    p.anulacao = q.value(8).toString().trimmed().compare(u"S", Qt::CaseInsensitive) == 0;
    if (comDescricaoMesa) p.descricaoMesa = q.value(9).toString();
    return p;
}

std::optional<QList<PedidoCopa>> lePedidos(db::Sessao& sessao, const QString& sql, int podeImprimir,
                                           bool comDescricaoMesa) {
    auto q = sessao.gConn.exec(sql, {podeImprimir});
    if (!q) return std::nullopt;
    QList<PedidoCopa> pedidos;
    while (q->next())
        pedidos.append(lePedido(*q, comDescricaoMesa));
    return pedidos;
}

bool altera(db::Sessao& sessao, const QString& sql, const QVariantList& valores) {
    return sessao.gConn.exec(sql, valores).has_value();
}

}  // namespace

bool MetePedidoCozinha(db::Sessao& sessao, const PedidoCozinha& pedido, db::Connection* conn) {
    return mete(sessao, pedido, false, conn);
}

bool MeteAnulacaoCozinha(db::Sessao& sessao, const PedidoCozinha& pedido, db::Connection* conn) {
    return mete(sessao, pedido, true, conn);
}

bool ExistemPedidosPorLibertar(db::Sessao& sessao) {
    return sessao.gConn
        .firstRow(
            QStringLiteral("select PodeImprimir from HistoricoCopa where PodeImprimir=0 limit 1"))
        .has_value();
}

std::optional<QList<PedidoCopa>> PedidosPorLibertar(db::Sessao& sessao) {
    return lePedidos(sessao,
                     QStringLiteral("select ") + kColunas +
                         QStringLiteral(", c.Descricao from HistoricoCopa h "
                                        "left join Clientes c on c.Codigo=h.Cliente "
                                        "where h.PodeImprimir=? "
                                        "order by h.Cliente, h.DataSys, h.NumRegisto"),
                     0, true);
}

std::optional<QList<PedidoCopa>> PedidosLibertados(db::Sessao& sessao) {
    // NumRegisto last: two lines of one table ordered in the same second print in order.
    return lePedidos(sessao,
                     QStringLiteral("select ") + kColunas +
                         QStringLiteral(" from HistoricoCopa h where h.PodeImprimir=? "
                                        "order by h.Cliente, h.DataSys, h.NumRegisto"),
                     1, false);
}

bool LibertaPedido(db::Sessao& sessao, qint64 numRegisto) {
    return altera(sessao,
                  QStringLiteral("update HistoricoCopa set PodeImprimir=1 where NumRegisto=?"),
                  {numRegisto});
}

bool EliminaPedidoPorLibertar(db::Sessao& sessao, qint64 numRegisto) {
    return altera(sessao,
                  QStringLiteral("delete from HistoricoCopa where NumRegisto=? and PodeImprimir=0"),
                  {numRegisto});
}

bool AlteraObsPedido(db::Sessao& sessao, qint64 numRegisto, const QString& obs) {
    return altera(sessao, QStringLiteral("update HistoricoCopa set ObsLinha=? where NumRegisto=?"),
                  {obs, numRegisto});
}

bool ApagaPedidoImpresso(db::Sessao& sessao, qint64 numRegisto) {
    return altera(sessao,
                  QStringLiteral("delete from HistoricoCopa where PodeImprimir=1 and NumRegisto=?"),
                  {numRegisto});
}

}  // namespace brasel::pos::cozinha
