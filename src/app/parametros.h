#pragma once

#include "common/currency.h"

#include <QString>

#include <array>
#include <cstdint>

namespace brasel::app {

// The kinds of amount that carry their own rounding rule and decimals, in the order of the
// ParamGeral column suffixes: cliarre<valor>, clidec<valor>, ...
enum class KindArre : int {
    valor,
    iva,
    desc,
    merlin,
    desclin,
    ivalin,
    mergeral,
    descgeral,
    ivageral,
    totalgeral
};
// The cash-document kinds: caiarre<mergeral>, ...
enum class KindCaixa : int { mergeral, descgeral, ivageral, totalgeral };

// The company's general parameters (the ParamGeral row), loaded at login. A column the database
// lacks leaves its member as it was.
struct Parametros {
    Currency taxajuromora;
    Currency impostoselo;
    QString tipojuromora;
    std::int32_t registosVisualizar = 0;
    QString tipoavencas;
    QString txivaavencas;
    Currency LimiteRecapitulativos;
    std::int32_t casadec = 2;
    std::int32_t casadecpreco = 2;
    std::int32_t casadecquant = 3;
    std::int32_t casadecquantOutUni = 3;
    std::int16_t ActualizaUPC = 0;
    QString cambiodef;
    QString cambioeuro;
    std::int16_t zerarclientes = 0;
    std::int16_t zerarfornece = 0;
    std::int16_t zerarproduto = 0;
    std::int16_t ControlaProdutoFornecedor = 0;
    std::array<std::int32_t, 10> cliarre{};  // indexed by KindArre
    std::array<std::int32_t, 10> clidec{};
    std::array<std::int32_t, 10> forarre{};
    std::array<std::int32_t, 10> fordec{};
    std::array<std::int32_t, 4> caiarre{};  // indexed by KindCaixa
    std::array<std::int32_t, 4> caidec{};
    std::int32_t banarre = 0;
    std::int32_t bandec = 0;
    QString MensagCli;
    QString Mensagfor;
    QString Mensagpro;
    QString MensagproPMC;
    QString controlaquant;
    QString docaberto;
    QString clidiversos;
    QString forndiversos;
    QString proddiversos;
    QString proddiversos2;
    QString ano;
    QString mes;
    QString controlaano;
    QString controlames;
    bool GridLine = false;
    bool ContinuaAdicionar = false;
    QString AfectaDep;
    QString AfectaLev;
    std::int16_t prontovestir = 0;
    // Captions of the product dimensions 1 to 7 (NomeEstacao .. NomeComprimento) at indexes 1..7.
    std::array<QString, 10> NomesDimensoes;
    QString AnoCalculo;
    bool ImpCabecalhos = false;
    std::int16_t controlespecifico = 0;
    std::int16_t controlOficial = 0;
};

}  // namespace brasel::app
