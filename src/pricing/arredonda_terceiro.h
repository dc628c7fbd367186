#pragma once

#include "app/estado.h"
#include "common/currency.h"
#include "pricing/arredonda.h"

#include <QString>

namespace brasel::pricing {

// The ten rounding pairs of a customer ("C") or supplier ("F"); the zero pairs (whole units,
// truncated) for a code without a row, another kind of party or a failed read.
ArredondamentosTerceiro LerArredondamentos(app::Estado& estado, const QString& TipoTerceiro,
                                           const QString& Codigo, db::Connection* conn = nullptr);

// Rounds an amount of kind `TipoValor` with the party's pair; `MaxDecimais` below 0 means the
// general decimals (casadec). 0 when the rounding leaves the range.
Currency Arredonda_Valores_cur(app::Estado& estado, const QString& TipoTerceiro,
                               const QString& Codigo, Currency Valor, int TipoValor,
                               db::Connection* conn = nullptr, int MaxDecimais = -1);

// The party's FormulaIVA: 1 computes each VAT slot on its total incidence, 0 (also when empty or
// missing) sums the lines' VAT.
int FormulaIVA_int(app::Estado& estado, const QString& TipoTerceiro, const QString& Codigo,
                   db::Connection* conn = nullptr);

}  // namespace brasel::pricing
