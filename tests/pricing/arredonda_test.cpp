// The rounding primitive and the party rounding pairs: every amount of a document goes through
// them, so each mode is held to its examples, to negative amounts and to single 0.0001 steps.
#include "pricing/arredonda.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

#include <limits>

namespace brasel::pricing {
namespace {

using teste::V;

struct Caso {
    const char* valor;
    int decimais;
    int modo;
    const char* esperado;
};

TEST(ArredondaValor, ModesOnTheirExamples) {
    const Caso casos[] = {
        // mode 1: nearest, halves toward positive infinity (not to even)
        {"1.125", 2, 1, "1.13"},
        {"1.135", 3, 1, "1.135"},
        {"2.5", 0, 1, "3"},
        {"-2.5", 0, 1, "-2"},
        {"-1.125", 2, 1, "-1.12"},
        {"0.125", 2, 1, "0.13"},
        {"4.5", 0, 1, "5"},
        {"1.1245", 2, 1, "1.12"},
        {"1.2345", 3, 1, "1.235"},
        {"-1.2345", 3, 1, "-1.234"},
        {"0.25", 0, 1, "0"},
        {"-0.5", 0, 1, "0"},
        // mode 2: truncate toward zero
        {"1.0512", 2, 2, "1.05"},
        {"0.999", 2, 2, "0.99"},
        {"-1.0512", 2, 2, "-1.05"},
        {"-0.999", 0, 2, "0"},
        // mode 3: any dropped digit raises the last kept one, away from zero
        {"1.0512", 2, 3, "1.06"},
        {"0.999", 2, 3, "1.00"},
        {"0.995", 2, 3, "1.00"},
        {"-1.0512", 2, 3, "-1.06"},
        {"-0.999", 2, 3, "-1.00"},
        {"1.05", 2, 3, "1.05"},
        // mode 4 and unknown modes
        {"1.2345", 0, 4, "1.2345"},
        {"1.0599", 2, 0, "1.05"},
        {"1.0599", 2, 5, "1.05"},
        {"-1.0599", 2, -1, "-1.05"},
        // already within the decimals; out-of-range decimals
        {"7", 0, 1, "7"},
        {"7", 0, 2, "7"},
        {"7", 0, 3, "7"},
        {"-7", 2, 3, "-7"},
        {"1.2345", 4, 2, "1.2345"},
        {"1.2345", 9, 3, "1.2345"},
        {"2.5", -1, 1, "3"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(ArredondaValor(V(c.valor), c.decimais, c.modo), V(c.esperado))
            << c.valor << " dec " << c.decimais << " mode " << c.modo;
    }
}

TEST(ArredondaValor, SingleStepsOfTheFourthDecimal) {
    const Caso casos[] = {
        {"0.0001", 3, 1, "0"},       {"0.0005", 3, 1, "0.001"}, {"-0.0005", 3, 1, "0"},
        {"-0.0006", 3, 1, "-0.001"}, {"0.0001", 3, 3, "0.001"}, {"-0.0001", 3, 3, "-0.001"},
        {"0.0001", 3, 2, "0"},       {"-0.0001", 3, 2, "0"},    {"0.0001", 0, 3, "1"},
        {"0.9999", 0, 2, "0"},       {"0.9999", 0, 1, "1"},     {"-0.0001", 0, 1, "0"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(ArredondaValor(V(c.valor), c.decimais, c.modo), V(c.esperado))
            << c.valor << " dec " << c.decimais << " mode " << c.modo;
    }
}

TEST(ArredondaValor, AmountsBeyondWhatADoubleHolds) {
    // 2^53 + 1 ten-thousandths: a double cannot tell it from its neighbour.
    const Caso casos[] = {
        {"900719925474.0993", 2, 1, "900719925474.1"},
        {"900719925474.0993", 2, 2, "900719925474.09"},
        {"900719925474.0993", 3, 3, "900719925474.1"},
        {"900719925474.0993", 3, 1, "900719925474.099"},
        {"-900719925474.0993", 3, 2, "-900719925474.099"},
        {"900719925474.0995", 3, 1, "900719925474.1"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(ArredondaValor(V(c.valor), c.decimais, c.modo), V(c.esperado))
            << c.valor << " dec " << c.decimais << " mode " << c.modo;
    }
    const Currency maximo = Currency::fromRaw(std::numeric_limits<std::int64_t>::max());
    EXPECT_THROW(ArredondaValor(maximo, 2, 3), CurrencyOverflow);
    EXPECT_EQ(ArredondaValor(maximo, 2, 2), V("922337203685477.58"));
}

// The digit recipe of mode 1, step by step: add 0.0001 when the last decimal digit is 5, then
// round to the decimals with ties to even. The integer rounding must agree everywhere.
Currency receitaModo1(Currency valor, int decimais) {
    std::int64_t passo = 1;
    for (int k = decimais; k < 4; ++k)
        passo *= 10;
    const std::int64_t raw = valor.raw();
    std::int64_t inteiro = raw / 10000;
    if (raw % 10000 < 0) --inteiro;
    std::int64_t fraccao = raw - inteiro * 10000;
    if (fraccao % passo == 0) return valor;
    while (fraccao % 10 == 0)
        fraccao /= 10;
    std::int64_t ajustado = raw;
    if (fraccao % 10 == 5) ajustado += 1;
    const Currency meio = Currency::fromRaw(ajustado);
    const QString texto = meio.toText(decimais);
    return *Currency::parse(texto);
}

TEST(ArredondaValor, Mode1AgreesWithTheDigitRecipe) {
    for (int decimais = 0; decimais <= 3; ++decimais) {
        for (std::int64_t raw = -30000; raw <= 30000; raw += 7) {
            const Currency v = Currency::fromRaw(raw);
            ASSERT_EQ(ArredondaValor(v, decimais, 1), receitaModo1(v, decimais))
                << v.toPlainText().toStdString() << " dec " << decimais;
        }
    }
}

TEST(ArredondaValor, NegativesMirrorPositivesInModes2And3) {
    for (int modo : {2, 3}) {
        for (int decimais = 0; decimais <= 3; ++decimais) {
            for (std::int64_t raw = 1; raw <= 20000; raw += 13) {
                const Currency v = Currency::fromRaw(raw);
                ASSERT_EQ(ArredondaValor(-v, decimais, modo), -ArredondaValor(v, decimais, modo))
                    << raw << " dec " << decimais << " mode " << modo;
            }
        }
    }
}

TEST(Arredonda, PartyPairOrNearestAtTheMaximumDecimals) {
    ArredondamentosTerceiro t;
    t.regras[MercadoriaGeral - 1] = {3, ArredondaTrunca};
    t.regras[IvaLinha - 1] = {2, ArredondaExcesso};
    struct CasoTerceiro {
        int tipo;
        const char* valor;
        int maxDecimais;
        const char* esperado;
    };
    const CasoTerceiro casos[] = {
        {MercadoriaGeral, "1.2379", 3, "1.237"},  // the party's truncation at 3
        {MercadoriaGeral, "1.2379", 4, "1.237"},
        {MercadoriaGeral, "1.2379", 2, "1.24"},  // fewer allowed: nearest at 2
        {IvaLinha, "0.0759", 2, "0.08"},
        {IvaLinha, "0.0701", 2, "0.08"},
        {TotalGeral, "12.99", 2, "12"},  // a zero pair truncates to whole units
        {11, "12.99", 2, "12"},
        {0, "-12.99", 2, "-12"},
    };
    for (const CasoTerceiro& c : casos) {
        EXPECT_EQ(Arredonda(t, c.tipo, V(c.valor), c.maxDecimais), V(c.esperado))
            << "kind " << c.tipo << " " << c.valor;
    }
}

}  // namespace
}  // namespace brasel::pricing
