#pragma once

#include "common/currency.h"

#include <array>

namespace brasel::pricing {

// Rounding modes of the arre... settings.
enum ModoArredondamento : int {
    ArredondaProximo = 1,  // nearest, halfway values toward positive infinity
    ArredondaTrunca = 2,   // drop the digits past the decimals (toward zero)
    ArredondaExcesso = 3,  // any dropped digit raises the last kept one (away from zero)
    ArredondaNenhum = 4,   // leave the value as it is
};

// Rounds `Valor` to `Decimais` decimals (0 to 4; fewer than 0 count as 0) in mode `Modo`. Any
// mode other than 1, 3 and 4 truncates. A value that already has no more than `Decimais`
// decimals comes back unchanged. Truncating and rounding up work on the magnitude, so a
// negative amount is the mirror of the positive one: -1.0512 truncates to -1.05 and rounds up
// to -1.06, as a credit note mirrors its invoice. A result out of range raises CurrencyOverflow
// like the rest of the money arithmetic.
Currency ArredondaValor(Currency Valor, int Decimais, int Modo);

// The kind of amount a party's settings round (`TipoValor`, 1 to 10).
enum TipoValor : int {
    ValorSlot = 1,        // gross value of a VAT slot (decvalor, arrevalor)
    DescontoSlot = 2,     // discount of a VAT slot (decdesc, arredesc)
    IvaSlot = 3,          // VAT of a VAT slot (deciva, arreiva)
    MercadoriaLinha = 4,  // gross value of a line (decmerlin, arremerlin)
    DescontoLinha = 5,    // discount of a line (decdesclin, arredesclin)
    IvaLinha = 6,         // VAT of a line (decivalin, arreivalin)
    MercadoriaGeral = 7,  // document merchandise total (decmergeral, arremergeral)
    DescontoGeral = 8,    // document discount total (decdescgeral, arredescgeral)
    IvaGeral = 9,         // document VAT total (decivageral, arreivageral)
    TotalGeral = 10,      // document total (dectotalgeral, arretotalgeral)
};

struct RegraArredondamento {
    int decimais = 0;
    int modo = 0;
};

// The ten pairs of a customer's or supplier's record. A party without a row keeps the zero
// pairs: whole units, truncated.
struct ArredondamentosTerceiro {
    std::array<RegraArredondamento, 10> regras{};

    // The pair of a kind; a kind outside 1..10 has the zero pair.
    RegraArredondamento regra(int tipoValor) const;
    // Every kind with the same pair (tests and cash documents).
    static ArredondamentosTerceiro todos(int decimais, int modo);
};

// Rounds an amount of kind `tipoValor` with the party's pair, unless the party wants more
// decimals than `maxDecimais` allows: then it is rounded to nearest at `maxDecimais`.
Currency Arredonda(const ArredondamentosTerceiro& terceiro, int tipoValor, Currency valor,
                   int maxDecimais);

}  // namespace brasel::pricing
