#pragma once

#include "common/currency.h"

namespace brasel::pricing {

// The three cascaded discounts of `valor`, each taken to four decimals before the next applies
// to what is left, summed. Raises CurrencyOverflow out of range.
Currency DescontoCascata(Currency valor, double desc1, double desc2, double desc3);

// The amount of three cascaded percentage discounts on `Valor`: each applies to what the ones
// before it left, so 10, 10 and 10 on 100.00 take 10.00 + 9.00 + 8.10 = 27.10. `Valor` is first
// rounded to nearest at `casadec` decimals and comes back so rounded; each discount is taken to
// four decimals as it goes and their sum is rounded to nearest at `Decimais`. An amount out of
// range gives 0 (and `Valor` as far as it got).
Currency Desconto_Calcular_cur(Currency& Valor, double Desc1, double Desc2, double Desc3,
                               int Decimais, int casadec);

// The percentage of discount that turns `PrecoB` x `Quantidade` into `PrecoA` x `Quantidade`
// plus `Valor`: 100 x (A x Q + V - B x Q) / (B x Q), to four decimals; 0 when B x Q is 0 or out
// of range.
double DescontoVALOR_to_PERC(Currency PrecoA, Currency Quantidade, Currency PrecoB, Currency Valor);

}  // namespace brasel::pricing
