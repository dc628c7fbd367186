#pragma once

#include "app/estado.h"
#include "common/message_port.h"
#include "devices/linha_serie.h"
#include "pos/cozinha/historico_copa.h"

namespace brasel::pos::cozinha {

// Sends a line just stored on a tab where it is made: a kitchen product (Produtos.ImpCopa 1)
// into the kitchen queue on `conn` (the caller's transaction, gConn when none), any other
// product to the bar's ticket printer (ConfigRest_ImpTalaoBar) at once.
// False when the kitchen row could not be written (the caller undoes its line), or when the bar
// ticket did not go out; the person is then told to warn the bar, since bar tickets are not
// kept. A workstation without a bar printer prints nothing and that is no failure.
bool EnviaPedido(app::Estado& estado, devices::LinhaSerie& linha, const PedidoCozinha& pedido,
                 bool produtoCozinha, MessagePort& mensagens, db::Connection* conn = nullptr);

}  // namespace brasel::pos::cozinha
