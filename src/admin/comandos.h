#pragma once

#include "admin/argumentos.h"
#include "admin/consola.h"

namespace brasel::admin {

enum Saida { kSucesso = 0, kFalha = 1, kUtilizacao = 2 };

// Runs one request and says how the process ends.
int executar(const Pedido& pedido, Consola& consola);

}  // namespace brasel::admin
