// Cascaded line discounts and the percentage that turns one price into another.
#include "pricing/desconto.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::V;

TEST(Desconto_Calcular_cur, DiscountsCascade) {
    struct Caso {
        const char* valor;
        double d1, d2, d3;
        int decimais;
        const char* valorArredondado;
        const char* desconto;
    };
    const Caso casos[] = {
        {"100", 10, 10, 10, 2, "100", "27.10"},  // 10 + 9 + 8.10, not 30
        {"100", 0, 0, 0, 2, "100", "0"},          {"100", 100, 50, 0, 2, "100", "100"},
        {"100.005", 10, 0, 0, 2, "100.01", "10"},  // the value is first taken to casadec
        {"33.33", 10, 0, 0, 2, "33.33", "3.33"},  {"33.33", 10, 0, 0, 4, "33.33", "3.333"},
        {"0.05", 10, 0, 0, 2, "0.05", "0.01"},  // 0.005 rounds half up
        {"-100", 10, 10, 0, 2, "-100", "-19"},    {"100", 12.5, 0, 0, 1, "100", "12.5"},
        {"100", -10, 0, 0, 2, "100", "-10"},  // a negative discount is a surcharge
    };
    for (const Caso& c : casos) {
        Currency valor = V(c.valor);
        EXPECT_EQ(Desconto_Calcular_cur(valor, c.d1, c.d2, c.d3, c.decimais, 2), V(c.desconto))
            << c.valor << " " << c.d1 << "/" << c.d2 << "/" << c.d3;
        EXPECT_EQ(valor, V(c.valorArredondado)) << c.valor;
    }
}

TEST(Desconto_Calcular_cur, EachStepIsTakenToFourDecimals) {
    // 0.0015 x 50 % = 0.00075 -> 0.0008 (even); what is left, 0.0007 x 50 % = 0.00035 -> 0.0004.
    EXPECT_EQ(DescontoCascata(V("0.0015"), 50, 50, 0), V("0.0012"));
    Currency valor = V("0.0015");
    EXPECT_EQ(Desconto_Calcular_cur(valor, 50, 50, 0, 4, 4), V("0.0012"));
}

TEST(Desconto_Calcular_cur, OutOfRangeGivesZero) {
    Currency valor = Currency::fromRaw(std::numeric_limits<std::int64_t>::max() / 2);
    EXPECT_EQ(Desconto_Calcular_cur(valor, 300, 0, 0, 2, 4), Currency());
    EXPECT_THROW(DescontoCascata(valor, 300, 0, 0), CurrencyOverflow);
}

TEST(DescontoVALOR_to_PERC, PercentBetweenTwoPrices) {
    struct Caso {
        const char* a;
        const char* q;
        const char* b;
        const char* v;
        double percentagem;
    };
    const Caso casos[] = {
        {"9", "2", "10", "0", -10.0}, {"10", "1", "10", "5", 50.0}, {"0", "3", "1", "1", -66.6667},
        {"10", "0", "10", "5", 0.0},  {"10", "1", "0", "5", 0.0},   {"12.5", "4", "10", "-10", 0.0},
    };
    for (const Caso& c : casos) {
        EXPECT_DOUBLE_EQ(DescontoVALOR_to_PERC(V(c.a), V(c.q), V(c.b), V(c.v)), c.percentagem)
            << c.a << " " << c.q << " " << c.b << " " << c.v;
    }
    const Currency enorme = Currency::fromRaw(std::numeric_limits<std::int64_t>::max());
    EXPECT_DOUBLE_EQ(DescontoVALOR_to_PERC(enorme, V("2"), V("1"), V("0")), 0.0);
}

}  // namespace
}  // namespace brasel::pricing
