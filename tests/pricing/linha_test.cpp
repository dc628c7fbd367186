// The arithmetic of one line on settings already read: gross, cascaded discounts, VAT, value.
#include "pricing/linha.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

#include <limits>

namespace brasel::pricing {
namespace {

using teste::V;

const TaxaIva kNormal{false, 23.0, 0.0};
const TaxaIva kIncluido{true, 23.0, 0.0};

TEST(CalculaLinha, WorkedLines) {
    const auto dois = ArredondamentosTerceiro::todos(2, ArredondaProximo);
    struct Caso {
        const char* nome;
        std::optional<TaxaIva> iva;
        const char* preco;
        const char* quantidade;
        double d1, d2, d3;
        const char* bruto;
        const char* desconto;
        const char* iva_;
        const char* total;
    };
    const Caso casos[] = {
        {"plain", kNormal, "10", "3", 0, 0, 0, "30", "0", "6.9", "36.9"},
        {"cascade", kNormal, "100", "1", 10, 10, 10, "100", "27.1", "16.77", "89.67"},
        // The VAT is inside the price: the value stays 123.00, not 123.00 + 23.00.
        {"included", kIncluido, "123", "1", 0, 0, 0, "123", "0", "23", "123"},
        {"no code", std::nullopt, "10", "2", 50, 0, 0, "20", "10", "0", "10"},
        {"return", kNormal, "10.005", "-2", 0, 0, 0, "-20.01", "0", "-4.6", "-24.61"},
        {"tiny", kNormal, "0.0001", "0.0001", 0, 0, 0, "0", "0", "0", "0"},
    };
    for (const Caso& c : casos) {
        const auto v = CalculaLinha(dois, c.iva, V(c.preco), V(c.quantidade), c.d1, c.d2, c.d3, 2);
        ASSERT_TRUE(v.has_value()) << c.nome;
        EXPECT_EQ(v->bruto, V(c.bruto)) << c.nome;
        EXPECT_EQ(v->desconto, V(c.desconto)) << c.nome;
        EXPECT_EQ(v->iva, V(c.iva_)) << c.nome;
        EXPECT_EQ(v->total, V(c.total)) << c.nome;
    }
}

TEST(CalculaLinha, PartySettingsAndTheirLimit) {
    // A party without a row truncates every kind to whole units.
    const auto semLinha =
        CalculaLinha(ArredondamentosTerceiro{}, kNormal, V("10.75"), V("1"), 0, 0, 0, 2);
    ASSERT_TRUE(semLinha.has_value());
    EXPECT_EQ(semLinha->bruto, V("10"));
    EXPECT_EQ(semLinha->iva, V("2"));  // 2.30 truncated
    EXPECT_EQ(semLinha->total, V("12"));

    // The party asks for 3 decimals on the gross value; casadec 2 allows only 2: nearest at 2.
    ArredondamentosTerceiro tres = ArredondamentosTerceiro::todos(2, ArredondaProximo);
    tres.regras[MercadoriaLinha - 1] = {3, ArredondaTrunca};
    const auto limitado = CalculaLinha(tres, std::nullopt, V("1.2379"), V("1"), 0, 0, 0, 2);
    ASSERT_TRUE(limitado.has_value());
    EXPECT_EQ(limitado->bruto, V("1.24"));
    const auto permitido = CalculaLinha(tres, std::nullopt, V("1.2379"), V("1"), 0, 0, 0, 3);
    ASSERT_TRUE(permitido.has_value());
    EXPECT_EQ(permitido->bruto, V("1.237"));

    // VAT of a line rounded up by the party's line VAT setting.
    ArredondamentosTerceiro excesso = ArredondamentosTerceiro::todos(2, ArredondaProximo);
    excesso.regras[IvaLinha - 1] = {2, ArredondaExcesso};
    const auto cima = CalculaLinha(excesso, kNormal, V("0.31"), V("1"), 0, 0, 0, 2);
    ASSERT_TRUE(cima.has_value());
    EXPECT_EQ(cima->iva, V("0.08"));  // 0.0713 up, where nearest gives 0.07
}

TEST(CalculaLinha, OutOfRangeIsAFailure) {
    const Currency enorme = Currency::fromRaw(std::numeric_limits<std::int64_t>::max() / 2);
    EXPECT_FALSE(
        CalculaLinha(ArredondamentosTerceiro::todos(2, 1), kNormal, enorme, V("3"), 0, 0, 0, 2)
            .has_value());
}

}  // namespace
}  // namespace brasel::pricing
