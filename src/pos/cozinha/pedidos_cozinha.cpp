#include "pos/cozinha/pedidos_cozinha.h"

#include <algorithm>
#include <functional>

namespace brasel::pos::cozinha {

namespace {

// Applies `accao` to every row in one transaction: either all of them change or none.
bool emTransaccao(db::Sessao& sessao, const QList<qint64>& marcados,
                  const std::function<bool(db::Sessao&, qint64)>& accao) {
    db::WriteTransaction transaccao(sessao.gConn);
    if (!transaccao.active()) return false;
    for (qint64 n : marcados) {
        if (!accao(sessao, n)) return false;
    }
    return transaccao.commit();
}

}  // namespace

QStringList ColunasPedidosPorLibertar(const PedidoCopa& pedido, int casasQuantidade) {
    const QString quantidade =
        pedido.quantidade.toText(std::clamp(casasQuantidade, 0, 4)).replace(u'.', u',');
    return {pedido.mesa,
            pedido.descricaoMesa,
            pedido.produto,
            pedido.descricao,
            quantidade,
            pedido.obs,
            pedido.utilizador,
            pedido.dataSys,
            pedido.anulacao ? QStringLiteral("S") : QStringLiteral("N")};
}

QList<PedidoCopa> PedidosCozinha::lista() {
    return PedidosPorLibertar(sessao_).value_or(QList<PedidoCopa>{});
}

bool PedidosCozinha::liberta(const QList<qint64>& marcados, bool listaVazia) {
    if (listaVazia || !mensagens_.confirmar(QStringLiteral("Confirma a Impressão?"))) return false;
    return emTransaccao(sessao_, marcados, LibertaPedido);
}

bool PedidosCozinha::elimina(const QList<qint64>& marcados) {
    if (!mensagens_.confirmar(QStringLiteral("Confirma a Eliminação?"))) return false;
    return emTransaccao(sessao_, marcados, EliminaPedidoPorLibertar);
}

std::optional<QString> PedidosCozinha::editaObs(qint64 numRegisto, const QString& obs) {
    const std::optional<QString> nova = editor_.editar(obs);
    if (!nova || !AlteraObsPedido(sessao_, numRegisto, *nova)) return std::nullopt;
    return nova;
}

}  // namespace brasel::pos::cozinha
