#include "pricing/arredonda.h"

#include <cstdint>
#include <limits>

namespace brasel::pricing {

namespace {

__int128 floorDiv(__int128 a, __int128 b) {
    __int128 q = a / b;
    if ((a % b != 0) && ((a < 0) != (b < 0))) --q;
    return q;
}

Currency deUnidades(__int128 unidades, std::int64_t passo) {
    const __int128 raw = unidades * passo;
    if (raw > std::numeric_limits<std::int64_t>::max() ||
        raw < std::numeric_limits<std::int64_t>::min()) {
        throw CurrencyOverflow();
    }
    return Currency::fromRaw(static_cast<std::int64_t>(raw));
}

}  // namespace

Currency ArredondaValor(Currency Valor, int Decimais, int Modo) {
    if (Modo == ArredondaNenhum || Decimais >= 4) return Valor;
    if (Decimais < 0) Decimais = 0;
    std::int64_t passo = 1;
    for (int k = Decimais; k < 4; ++k)
        passo *= 10;
    const __int128 raw = Valor.raw();
    if (raw % passo == 0) return Valor;
    if (Modo == ArredondaProximo) return deUnidades(floorDiv(raw + passo / 2, passo), passo);
    const __int128 magnitude = raw < 0 ? -raw : raw;
    __int128 unidades = magnitude / passo;
    if (Modo == ArredondaExcesso) ++unidades;
    return deUnidades(raw < 0 ? -unidades : unidades, passo);
}

RegraArredondamento ArredondamentosTerceiro::regra(int tipoValor) const {
    if (tipoValor < 1 || tipoValor > static_cast<int>(regras.size())) return {};
    return regras[static_cast<std::size_t>(tipoValor - 1)];
}

ArredondamentosTerceiro ArredondamentosTerceiro::todos(int decimais, int modo) {
    ArredondamentosTerceiro t;
    t.regras.fill(RegraArredondamento{decimais, modo});
    return t;
}

Currency Arredonda(const ArredondamentosTerceiro& terceiro, int tipoValor, Currency valor,
                   int maxDecimais) {
    const RegraArredondamento r = terceiro.regra(tipoValor);
    if (maxDecimais >= r.decimais) return ArredondaValor(valor, r.decimais, r.modo);
    return ArredondaValor(valor, maxDecimais, ArredondaProximo);
}

}  // namespace brasel::pricing
