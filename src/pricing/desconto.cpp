#include "pricing/desconto.h"

#include "pricing/arredonda.h"

namespace brasel::pricing {

Currency DescontoCascata(Currency valor, double desc1, double desc2, double desc3) {
    const Currency a1 = valor.percentOf(desc1);
    const Currency a2 = (valor - a1).percentOf(desc2);
    const Currency a3 = (valor - (a1 + a2)).percentOf(desc3);
    return a1 + a2 + a3;
}

Currency Desconto_Calcular_cur(Currency& Valor, double Desc1, double Desc2, double Desc3,
                               int Decimais, int casadec) {
    try {
        Valor = ArredondaValor(Valor, casadec, ArredondaProximo);
        return ArredondaValor(DescontoCascata(Valor, Desc1, Desc2, Desc3), Decimais,
                              ArredondaProximo);
    } catch (const CurrencyOverflow&) {
        return Currency();
    }
}

double DescontoVALOR_to_PERC(Currency PrecoA, Currency Quantidade, Currency PrecoB,
                             Currency Valor) {
    try {
        const Currency base = PrecoB * Quantidade;
        if (base.isZero()) return 0.0;
        const Currency diferenca = PrecoA * Quantidade + Valor - base;
        return Currency::mulDiv(diferenca, Currency(100), base).toDouble();
    } catch (const CurrencyOverflow&) {
        return 0.0;
    }
}

}  // namespace brasel::pricing
