// The tax of one line from a product's tax definition, and the order screen's three columns.
#include "pricing/impostos_calculo.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::V;

DefinicaoImposto porFactores(double f1, double f2, double f3, bool desconto = false) {
    DefinicaoImposto d;
    d.codigo = QStringLiteral("ECO");
    d.incidIliquido = true;
    d.incidDesconto = desconto;
    d.factores = {f1, f2, f3};
    d.processa = QStringLiteral("S");
    return d;
}

const DadosLinhaImposto kLinha{V("4"), V("25"), V("100"), V("10"), QStringLiteral("N"), 23.0};
const RegraArredondamento kDuas{2, ArredondaProximo};

TEST(CalculaUmImposto, BaseAndFactors) {
    struct Caso {
        const char* nome;
        DefinicaoImposto d;
        const char* incidencia;
        const char* imposto;
    };
    const Caso casos[] = {
        {"one factor", porFactores(5, 0, 0), "100", "5"},
        {"factors chain", porFactores(10, 50, 0), "100", "5"},
        {"empty factor skipped", porFactores(0, 0, 3), "100", "3"},
        {"no factor", porFactores(0, 0, 0), "100", "0"},
        {"less discount", porFactores(5, 0, 0, true), "90", "4.5"},
        {"rounded", porFactores(3.333, 0, 0), "100", "3.33"},
    };
    for (const Caso& c : casos) {
        const auto r = CalculaUmImposto(c.d, kLinha, kDuas);
        ASSERT_TRUE(r.has_value()) << c.nome;
        EXPECT_EQ(r->incidencia, V(c.incidencia)) << c.nome;
        EXPECT_EQ(r->imposto, V(c.imposto)) << c.nome;
        EXPECT_TRUE(r->tabIva.isEmpty()) << c.nome;
        EXPECT_EQ(r->valorIva, Currency()) << c.nome;
    }
    DefinicaoImposto semBase = porFactores(5, 0, 0, true);
    semBase.incidIliquido = false;  // a discount is never taken off a missing base
    EXPECT_EQ(CalculaUmImposto(semBase, kLinha, kDuas)->imposto, Currency());
}

TEST(CalculaUmImposto, PerUnitVatAndFreeLines) {
    DefinicaoImposto unidade;
    unidade.codigo = QStringLiteral("GAR");
    unidade.valorUnitario = V("0.1");
    unidade.sujeitoIva = true;
    unidade.processa = QStringLiteral("S");
    const auto r = CalculaUmImposto(unidade, kLinha, kDuas);
    ASSERT_TRUE(r.has_value());
    EXPECT_EQ(r->incidencia, V("4"));
    EXPECT_EQ(r->imposto, V("0.4"));
    EXPECT_EQ(r->valorIva, V("0.09"));  // 0.092
    EXPECT_EQ(r->tabIva, QStringLiteral("N"));
    EXPECT_DOUBLE_EQ(r->taxaIva, 23.0);

    DadosLinhaImposto gratis = kLinha;
    gratis.preco = Currency();
    EXPECT_FALSE(CalculaUmImposto(unidade, gratis, kDuas).has_value());
    unidade.calculaPrecoZero = true;
    EXPECT_TRUE(CalculaUmImposto(unidade, gratis, kDuas).has_value());

    // A truncating party cuts the factor tax instead of rounding it.
    EXPECT_EQ(CalculaUmImposto(porFactores(3.333, 0, 0), kLinha, {1, ArredondaTrunca})->imposto,
              V("3.3"));
    EXPECT_EQ(ImpostoUnitario(unidade, V("25")), V("0.1"));
    EXPECT_EQ(ImpostoUnitario(porFactores(5, 0, 0), V("25")), V("1.25"));
}

TEST(ColunasDaLinha, SplitsByVatAndLeavesOutUnprocessed) {
    ImpostoLinha sujeito;
    sujeito.imposto = V("2");
    sujeito.valorIva = V("0.46");
    sujeito.tabIva = QStringLiteral("N");
    sujeito.processa = QStringLiteral("S");
    ImpostoLinha isento;
    isento.imposto = V("1.5");
    isento.processa = QStringLiteral("S");
    ImpostoLinha fora = sujeito;
    fora.processa = QStringLiteral("N");
    const ColunasImpostos c = ColunasDaLinha({sujeito, isento, fora});
    EXPECT_EQ(c.sujeitos, V("2"));
    EXPECT_EQ(c.iva, V("0.46"));
    EXPECT_EQ(c.naoSujeitos, V("1.5"));
}

TEST(CodigosImpostos, SplitsThePartyList) {
    EXPECT_EQ(CodigosImpostos(QStringLiteral("ECO§GAR§")),
              (QStringList{QStringLiteral("ECO"), QStringLiteral("GAR")}));
    EXPECT_EQ(CodigosImpostos(QStringLiteral("ECO")), QStringList{QStringLiteral("ECO")});
    EXPECT_TRUE(CodigosImpostos(QStringLiteral("§ §")).isEmpty());
    EXPECT_TRUE(CodigosImpostos(QString()).isEmpty());
}

}  // namespace
}  // namespace brasel::pricing
