#pragma once

#include "app/estado.h"

#include <QString>

#include <vector>

namespace brasel::pos {

// One row of the group picker: a group, family or sub-family by the menu level.
struct GrupoEmenta {
    QString codigo;
    QString descricao;
};

// The rows of the menu level's table (nivelProdutos), by description; empty when the table
// cannot be read.
std::vector<GrupoEmenta> CarregarGrupos(app::Estado& estado, const QString& nivel);

// The description of one code of the level's table; "" when it has none.
QString DescricaoGrupo(app::Estado& estado, const QString& nivel, const QString& codigo);

}  // namespace brasel::pos
