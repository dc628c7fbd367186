#pragma once

#include "lookups/pesquisa_tabelas.h"

#include <QLabel>
#include <QLineEdit>

#include <functional>

namespace brasel::lookups {

// Runs a lookup on a window's code box and the label of its description:
//   pesquisaNoCampo(txtCaixa, lblCaixa, [&](CampoCodigo& c) { pesquisa.Caixas(c, forcar); });
void pesquisaNoCampo(QLineEdit* codigo, QLabel* descricao,
                     const std::function<void(CampoCodigo&)>& pesquisa);

}  // namespace brasel::lookups
