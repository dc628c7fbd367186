#include "pos/cozinha/envio_pedido.h"

#include "app/definicoes_posto.h"
#include "pos/cozinha/impressao_cozinha.h"

namespace brasel::pos::cozinha {

bool EnviaPedido(app::Estado& estado, devices::LinhaSerie& linha, const PedidoCozinha& pedido,
                 bool produtoCozinha, MessagePort& mensagens, db::Connection* conn) {
    if (produtoCozinha) return MetePedidoCozinha(estado, pedido, conn);
    const ResultadoTalao r = ImprimeTalaoBar(
        estado.ligacao(conn), linha, app::posto::ConfigRest_ImpTalaoBar.ler(), pedido, false);
    if (r == ResultadoTalao::Impresso || r == ResultadoTalao::NaoConfigurada) return true;
    mensagens.mensagem(QStringLiteral("O talão do bar não foi impresso: ") +
                           pedido.quantidade.toPlainText() + QStringLiteral(" - ") +
                           pedido.descricao + QStringLiteral(" (mesa ") + pedido.mesa +
                           QStringLiteral(").\nAvise o bar."),
                       Icone::Exclamacao, QStringLiteral("A T E N Ç Ã O !"));
    return false;
}

}  // namespace brasel::pos::cozinha
