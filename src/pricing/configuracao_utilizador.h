#pragma once

#include "app/estado.h"

#include <QString>

#include <array>
#include <optional>

namespace brasel::pricing {

// The pricing columns of the current user's UtilConfGeral row.
struct ConfigUtilizador {
    QString precario;               // "P" user's tier, "C" customer's tier, other: no price
    int pvp = 0;                    // the user's tier
    QString descontos;              // "P", "C", "T" or "Z"
    std::array<int, 3> posicoes{};  // which discount (1..3) fills each line position
    QString descFFpro;              // supplier side: "P" the product's purchase discounts
    QString vendDef;                // "P", "C" or "U"
    QString vendedorUtil;
    QString descGeral;  // "1".."3" or "D"
    QString altTipoMov;
    QString portaTalao;
    QString impressora;
    QString tipoImpTalao;
};

// The row of estado.gUtilizador; nullopt when the user has none.
std::optional<ConfigUtilizador> LerConfigUtilizador(app::Estado& estado,
                                                    db::Connection* conn = nullptr);

}  // namespace brasel::pricing
