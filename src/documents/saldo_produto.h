#pragma once

#include "common/currency.h"
#include "db/procedimentos/saldo_produto_sp.h"
#include "db/sessao.h"

#include <optional>

namespace brasel::documents {

// The balance procedure a set of keys is asked of.
enum class ProcedimentoSaldo {
    SaldoProduto,  // any product attribute, or keys no narrower procedure covers
    Pro,
    ProLote,
    ProArm,
    ProArmLoc,
    ProArmLocLote,
    ProArmLocLote_DtFabricoValidade,
};

// The choice rule: the general procedure when any attribute (station, sex, reference, model,
// colour, size, length, supplier) is given; otherwise the narrowest procedure that takes every
// given key among warehouse, location and lot (the two dates count only with all three), and the
// general one, with "%" for the rest, when none takes them all (a lot in one warehouse without a
// location).
ProcedimentoSaldo EscolheProcedimentoSaldo(const db::ChavesSaldo& chaves);

// The stock balance of a product for the given keys, through the procedure the rule chooses, on
// `conn` (gConn when none); nullopt when it cannot be read.
std::optional<Currency> SaldoProduto_SP(db::Sessao& sessao, const db::ChavesSaldo& chaves,
                                        db::Connection* conn = nullptr);

}  // namespace brasel::documents
