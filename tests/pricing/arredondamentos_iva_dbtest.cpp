// Routines that read a party's rounding, VAT codes, surcharge, prompt-payment discount and
// exchange rates from an embedded company.
#include "pricing/arredonda_terceiro.h"
#include "pricing/cambio.h"
#include "pricing/iva.h"
#include "pricing/linha.h"
#include "pricing/terceiro_taxas.h"

#include "pricing/insere_teste.h"
#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::insere;
using teste::T;
using teste::V;

class PrecosBase : public ::testing::Test {
  protected:
    void SetUp() override {
        e.param.casadec = 2;
        e.param.casadecpreco = 2;
        insere(e, "Clientes",
               {{"Codigo", T("M1")},
                {"decmergeral", 1},
                {"arremergeral", 2},
                {"decivalin", 2},
                {"arreivalin", 1},
                {"decmerlin", 2},
                {"arremerlin", 1},
                {"decdesclin", 2},
                {"arredesclin", 1},
                {"deciva", 1},
                {"arreiva", 3},
                {"FormulaIVA", 1},
                {"TaxaAgravamento", T("10")},
                {"DescontoPP", T("2.5")}});
        insere(
            e, "Fornece",
            {{"codigo", T("F1")}, {"decmergeral", 3}, {"arremergeral", 3}, {"DescontoPP", T("4")}});
        insere(e, "TabIva", {{"codigo", T("N")}, {"Taxa", T("23")}, {"Incluido", 0}});
        insere(e, "TabIva", {{"codigo", T("I")}, {"Taxa", T("23")}, {"Incluido", 1}});
        insere(e, "TabIva", {{"codigo", T("RC")}, {"Taxa", T("0")}, {"TaxaInerente", T("23")}});
        insere(e, "Produtos", {{"Codigo", T("MED")}, {"Medic", 1}, {"IvaTaxaCompra", T("6")}});
        insere(e, "TabTipoMov",
               {{"codigo", T("FAC")}, {"AfectaCli", T("D+")}, {"AfectaFor", T("NA")}});
        insere(e, "TabTipoMov",
               {{"codigo", T("VD")}, {"AfectaCli", T("S+")}, {"AfectaFor", T("C+")}});
        insere(e, "Cambios", {{"codigo", T("USD")}, {"valor", T("1.25")}});
        insere(e, "Cambios", {{"codigo", T("GBP")}, {"valor", T("1.234567")}});
        e.param.cambiodef = T("EUR");
    }

    testing::EmpresaTeste empresa;
    app::Estado& e = empresa.estado();
};

TEST_F(PrecosBase, Arredonda_Valores_cur_ByPartyAndKind) {
    EXPECT_EQ(Arredonda_Valores_cur(e, T("C"), T("M1"), V("12.3456"), MercadoriaGeral), V("12.3"));
    EXPECT_EQ(Arredonda_Valores_cur(e, T("c"), T("M1"), V("12.3456"), MercadoriaGeral, nullptr, 0),
              V("12"));  // fewer decimals allowed: nearest at 0
    EXPECT_EQ(Arredonda_Valores_cur(e, T("F"), T("F1"), V("12.3451"), MercadoriaGeral, nullptr, 4),
              V("12.346"));
    // A code without a row, or another kind of party, truncates to whole units.
    EXPECT_EQ(Arredonda_Valores_cur(e, T("C"), T("NAO"), V("12.99"), MercadoriaGeral), V("12"));
    EXPECT_EQ(Arredonda_Valores_cur(e, T("X"), T("M1"), V("-12.99"), MercadoriaGeral), V("-12"));
    EXPECT_EQ(FormulaIVA_int(e, T("C"), T("M1")), 1);
    EXPECT_EQ(FormulaIVA_int(e, T("C"), T("NAO")), 0);
}

TEST_F(PrecosBase, IVA_Calcular_IVA_cur_IncludedAndMissingCodes) {
    Currency valor = V("123");
    EXPECT_EQ(IVA_Calcular_IVA_cur(e, T("I"), valor), V("23"));
    EXPECT_EQ(valor, V("100"));
    valor = V("100");
    EXPECT_EQ(IVA_Calcular_IVA_cur(e, T("N"), valor), V("23"));
    EXPECT_EQ(valor, V("100"));
    valor = V("50");
    EXPECT_EQ(IVA_Calcular_IVA_cur(e, T("ZZ"), valor), Currency());
    EXPECT_EQ(valor, V("50"));
}

TEST_F(PrecosBase, Preco_Sem_IVA_cur) {
    EXPECT_EQ(Preco_Sem_IVA_cur(e, T("MED"), V("10.5"), T("N")), V("9.9057"));  // not rounded
    EXPECT_EQ(Preco_Sem_IVA_cur(e, T("OUTRO"), V("10.5"), T("I")), V("8.54"));
    EXPECT_EQ(Preco_Sem_IVA_cur(e, T("OUTRO"), V("10.5"), T("I"), nullptr, 4), V("8.5366"));
    EXPECT_EQ(Preco_Sem_IVA_cur(e, T("OUTRO"), V("10.555"), T("N")), V("10.555"));
    EXPECT_EQ(Preco_Sem_IVA_cur(e, T("OUTRO"), V("10.555"), T("ZZ")), V("10.555"));
}

TEST_F(PrecosBase, IVA_IntraComunitario_cur) {
    e.param.caidec[static_cast<std::size_t>(app::KindCaixa::ivageral)] = 0;
    e.param.caiarre[static_cast<std::size_t>(app::KindCaixa::ivageral)] = 1;
    EXPECT_EQ(IVA_IntraComunitario_cur(e, T("RC"), V("10.01"), T("C"), T("M1")), V("2.4"));
    EXPECT_EQ(IVA_IntraComunitario_cur(e, T("RC"), V("10.01"), T("CX"), {}), V("2"));
    EXPECT_EQ(IVA_IntraComunitario_cur(e, T("N"), V("10.01"), T("C"), T("M1")), Currency());
}

TEST_F(PrecosBase, Linha_Calcular_cur) {
    EXPECT_EQ(Linha_Calcular_cur(e, T("C"), T("M1"), V("100"), V("1"), 10, 10, 10, T("N")),
              V("89.67"));
    EXPECT_EQ(Linha_Calcular_cur(e, T("C"), T("M1"), V("123"), V("1"), 0, 0, 0, T("I")), V("123"));
    EXPECT_EQ(Linha_Calcular_cur(e, T("C"), T("M1"), V("10"), V("2"), 0, 0, 0, T("ZZ")), V("20"));
}

TEST_F(PrecosBase, TaxaAgravamento_cur) {
    EXPECT_EQ(TaxaAgravamento_cur(e, T("M1"), V("9.99")), V("10.99"));  // 10.989
    EXPECT_EQ(TaxaAgravamento_cur(e, T("NAO"), V("9.995")), V("10"));   // only rounded
}

TEST_F(PrecosBase, DescontoPP_Percentagem_cur) {
    EXPECT_EQ(DescontoPP_Percentagem_cur(e, T("C"), T("M1"), V("10"), T("FAC")), 2.5);
    EXPECT_FALSE(DescontoPP_Percentagem_cur(e, T("C"), T("M1"), V("10"), T("VD")).has_value());
    EXPECT_FALSE(DescontoPP_Percentagem_cur(e, T("C"), T("M1"), V("0"), T("FAC")).has_value());
    EXPECT_EQ(DescontoPP_Percentagem_cur(e, T("F"), T("F1"), V("10"), T("VD")), 4.0);
    EXPECT_FALSE(DescontoPP_Percentagem_cur(e, T("F"), T("F1"), V("10"), T("FAC")).has_value());
}

TEST_F(PrecosBase, ConverteCambio_SEIS_Decimais) {
    const auto texto = [&](const char* valor, const char* moeda, const char* sentido) {
        const auto r = ConverteCambio_SEIS_Decimais(e, V(valor), T(moeda), T(sentido));
        return r ? r->toText() : T("falhou");
    };
    EXPECT_EQ(texto("100", "USD", "+"), T("125.000000"));
    EXPECT_EQ(texto("100", "USD", "-"), T("80.000000"));
    EXPECT_EQ(texto("3", "GBP", "+"), T("3.703701"));
    EXPECT_EQ(texto("1", "GBP", "-"), T("0.810001"));  // 0.81000059...
    EXPECT_EQ(texto("100", "eur", "+"), T("100.000000"));
    EXPECT_EQ(texto("100", "", "+"), T("100.000000"));
    EXPECT_EQ(texto("100", "JPY", "+"), T("100.000000"));  // no rate: unconverted
    EXPECT_EQ(texto("100", "USD", "x"), T("100.000000"));
}

}  // namespace
}  // namespace brasel::pricing
