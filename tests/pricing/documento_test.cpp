// Document arithmetic on the order screen's list: totals, the four VAT slots, the header amounts
// and a document discount spread over the lines.
#include "pricing/documento.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::V;

// A selected line as the order screen holds it after pricing.
LinhaLista linha(const char* bruto, const char* desconto, const char* iva, const char* codigo,
                 double taxa) {
    LinhaLista l;
    l.seleccionada = true;
    l.quantidade = V("1");
    l.preco = V(bruto);
    l.qtyPreco = V(bruto);
    l.valorDesconto = V(desconto);
    l.valorIva = V(iva);
    l.valorLinha = V(bruto) - V(desconto) + V(iva);
    l.ivaTabela = QString::fromLatin1(codigo);
    l.ivaTaxa = taxa;
    return l;
}

DefinicoesDocumento definicoes(int decimais, int modo, int formulaIVA = 0) {
    DefinicoesDocumento d;
    d.arredondamentos = ArredondamentosTerceiro::todos(decimais, modo);
    d.formulaIVA = formulaIVA;
    d.casadec = 4;
    return d;
}

TEST(CalculosGerais, TotalsOfTheSelectedLines) {
    ListaLinhas lista;
    lista.linhas = {linha("100", "10", "20.7", "N", 23), linha("50", "0", "6.5", "I", 13),
                    linha("40", "0", "9.2", "N", 23)};
    lista.linhas[2].seleccionada = false;                 // not ticked: stays out of everything
    lista.linhas.push_back(linha("5", "0", "0", "", 0));  // no VAT code: totals only
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo)));
    const TotaisDocumento& t = lista.totais;
    EXPECT_EQ(t.mercadoria, V("155"));
    EXPECT_EQ(t.desconto, V("10"));
    EXPECT_EQ(t.iva, V("27.2"));
    EXPECT_EQ(t.total, V("172.2"));
    EXPECT_EQ(t.slots[0].tabIva, QStringLiteral("N"));
    EXPECT_EQ(t.slots[0].incidencia, V("90"));
    EXPECT_EQ(t.slots[0].desconto, V("10"));
    EXPECT_EQ(t.slots[0].iva, V("20.7"));
    EXPECT_EQ(t.slots[1].tabIva, QStringLiteral("I"));
    EXPECT_EQ(t.slots[1].incidencia, V("50"));
    EXPECT_TRUE(t.slots[2].vazio());
    EXPECT_TRUE(t.slots[3].vazio());
}

TEST(CalculosGerais, OtherTaxesAndWithholding) {
    ListaLinhas lista;
    LinhaLista l = linha("100", "0", "23", "N", 23);
    l.outImpostosSujeitos = V("2");
    l.ivaOutImpostos = V("0.46");
    l.outImpostosNaoSujeitos = V("1.5");
    l.incidIRS = V("100");
    l.valorIRS = V("25");
    lista.linhas = {l};
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo)));
    const TotaisDocumento& t = lista.totais;
    EXPECT_EQ(t.mercadoria, V("102"));
    EXPECT_EQ(t.iva, V("23.46"));
    EXPECT_EQ(t.naoSujeitos, V("1.5"));
    EXPECT_EQ(t.valorIRS, V("25"));
    EXPECT_EQ(t.total, V("101.96"));  // 102 + 23.46 + 1.5 - 25
    EXPECT_EQ(t.slots[0].incidencia, V("102"));
    EXPECT_EQ(t.slots[0].iva, V("23.46"));
}

TEST(CalculosGerais, FormulaIVA1ComputesTheSlotOnItsIncidence) {
    // Three lines of 0.33 at 23 %: each line's VAT 0.0759 was rounded to 0.08.
    ListaLinhas lista;
    lista.linhas = {linha("0.33", "0", "0.08", "N", 23), linha("0.33", "0", "0.08", "N", 23),
                    linha("0.33", "0", "0.08", "N", 23)};
    ASSERT_TRUE(CalculosGerais(lista, definicoes(4, ArredondaNenhum, 0)));
    EXPECT_EQ(lista.totais.slots[0].iva, V("0.24"));
    ASSERT_TRUE(CalculosGerais(lista, definicoes(4, ArredondaNenhum, 1)));
    EXPECT_EQ(lista.totais.slots[0].iva, V("0.2277"));
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo, 1)));
    EXPECT_EQ(lista.totais.slots[0].iva, V("0.23"));
}

TEST(CalculosGerais, SlotRateIsTheLastLineReadRoundedToTwoDecimals) {
    ListaLinhas lista;
    lista.linhas = {linha("10", "0", "2.3", "N", 23), linha("10", "0", "2.35", "N", 23.456)};
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo)));
    EXPECT_DOUBLE_EQ(lista.totais.slots[0].taxa, 23.46);
}

TEST(CalculosGerais, EachTotalUsesItsOwnKind) {
    ListaLinhas lista;
    lista.linhas = {linha("10.126", "1.019", "2.0939", "N", 23)};
    DefinicoesDocumento d = definicoes(4, ArredondaNenhum);
    d.arredondamentos.regras[MercadoriaGeral - 1] = {1, ArredondaTrunca};
    d.arredondamentos.regras[DescontoGeral - 1] = {2, ArredondaExcesso};
    d.arredondamentos.regras[IvaGeral - 1] = {2, ArredondaProximo};
    d.arredondamentos.regras[TotalGeral - 1] = {0, ArredondaProximo};
    ASSERT_TRUE(CalculosGerais(lista, d));
    EXPECT_EQ(lista.totais.mercadoria, V("10.1"));
    EXPECT_EQ(lista.totais.desconto, V("1.02"));
    EXPECT_EQ(lista.totais.iva, V("2.09"));
    EXPECT_EQ(lista.totais.total, V("11"));  // 11.17 to whole units
}

TEST(CalculosGerais, AFifthVatCodeIsRefused) {
    ListaLinhas lista;
    for (const char* c : {"A", "B", "C", "D"}) {
        lista.linhas.push_back(linha("10", "0", "1", c, 10));
    }
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo)));
    EXPECT_FALSE(PodeJuntarIva(lista.totais, QStringLiteral("E")));
    EXPECT_TRUE(PodeJuntarIva(lista.totais, QStringLiteral("C")));
    EXPECT_TRUE(PodeJuntarIva(TotaisDocumento{}, QStringLiteral("E")));

    lista.linhas.push_back(linha("10", "0", "1", "E", 10));
    EXPECT_FALSE(CalculosGerais(lista, definicoes(2, ArredondaProximo)));
    EXPECT_EQ(lista.totais.total, Currency());
    EXPECT_TRUE(lista.totais.slots[0].vazio());
}

TEST(CalculosGerais, FinancialDiscountComesOffLast) {
    ListaLinhas lista;
    lista.linhas = {linha("60", "10", "11.5", "N", 23)};
    Currency baseVista;
    const auto doisPorCento = [&](Currency base) -> std::optional<DescontoFinanceiro> {
        baseVista = base;
        return DescontoFinanceiro{2.0, base.percentOf(2.0)};
    };
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo), doisPorCento));
    EXPECT_EQ(baseVista, V("50"));
    EXPECT_EQ(lista.totais.descontoFinanceiro, V("1"));
    EXPECT_DOUBLE_EQ(lista.totais.descontoFinanceiroPerc, 2.0);
    EXPECT_EQ(lista.totais.total, V("60.5"));  // 61.50 - 1.00

    const auto nenhum = [](Currency) -> std::optional<DescontoFinanceiro> {
        return DescontoFinanceiro{0.0, Currency()};
    };
    ASSERT_TRUE(CalculosGerais(lista, definicoes(2, ArredondaProximo), nenhum));
    EXPECT_EQ(lista.totais.total, V("61.5"));
}

TEST(CabecalhoDocumento, HeaderAmountsFromTheSlots) {
    ListaLinhas lista;
    lista.linhas = {linha("100", "10", "20.7", "N", 23), linha("50", "5", "5.85", "I", 13)};
    lista.linhas[0].valDescGeral = V("4");
    lista.linhas[1].valDescGeral = V("1.5");
    const DefinicoesDocumento d = definicoes(2, ArredondaProximo);
    ASSERT_TRUE(CalculosGerais(lista, d));
    const auto c = CabecalhoDocumento(lista, d);
    ASSERT_TRUE(c.has_value());
    EXPECT_EQ(c->tabiva[0], QStringLiteral("N"));
    EXPECT_EQ(c->valor[0], V("100"));  // incidence 90 + discount 10
    EXPECT_EQ(c->desconto[0], V("10"));
    EXPECT_EQ(c->valiva[0], V("20.7"));
    EXPECT_EQ(c->valor[1], V("50"));
    EXPECT_DOUBLE_EQ(c->taxiva[1], 13.0);
    EXPECT_TRUE(c->tabiva[2].isEmpty());
    EXPECT_EQ(c->ivaIntra[0], Currency());
    EXPECT_EQ(c->valorTotal, V("150"));
    EXPECT_EQ(c->descontoTotal, V("15"));
    EXPECT_EQ(c->iva, V("26.55"));
    EXPECT_EQ(c->totaldoc, V("161.55"));
    EXPECT_EQ(c->descfinval, V("5.5"));
}

// A line of `preco` at `taxa` % VAT with its own discounts, selected.
LinhaLista linhaParaDesconto(const char* preco, double taxa, double d1 = 0, double irs = 0) {
    LinhaLista l;
    l.seleccionada = true;
    l.quantidade = V("1");
    l.preco = V(preco);
    l.qtyPreco = V(preco);
    l.ivaTaxa = taxa;
    l.ivaTabela = taxa > 0 ? QStringLiteral("N") : QStringLiteral("Z");
    l.desc1 = d1;
    l.taxaIRS = irs;
    return l;
}

TEST(CalcularDescontos, PercentageOnTheValueAfterLineDiscounts) {
    ListaLinhas lista;
    lista.linhas = {linhaParaDesconto("100", 23, 10, 25)};
    ASSERT_TRUE(CalcularDescontos(lista, Currency(), 10, definicoes(2, ArredondaProximo)));
    const LinhaLista& l = lista.linhas[0];
    EXPECT_EQ(l.valDescGeral, V("9"));
    EXPECT_EQ(l.valorDesconto, V("19"));
    EXPECT_EQ(l.incidIRS, V("81"));
    EXPECT_EQ(l.valorIRS, V("20.25"));
    EXPECT_EQ(l.valorIva, V("18.63"));
    EXPECT_EQ(l.valorLinha, V("99.63"));
}

TEST(CalcularDescontos, AnAmountIsSharedSoTheTotalFallsByIt) {
    ListaLinhas lista;
    lista.linhas = {linhaParaDesconto("100", 23), linhaParaDesconto("50", 0),
                    linhaParaDesconto("30", 23)};
    lista.linhas[2].seleccionada = false;
    const DefinicoesDocumento d = definicoes(4, ArredondaNenhum);
    ASSERT_TRUE(CalcularDescontos(lista, Currency(), 0, d));
    ASSERT_TRUE(CalculosGerais(lista, d));
    const Currency antes = lista.totais.total;
    EXPECT_EQ(antes, V("173"));

    ASSERT_TRUE(CalcularDescontos(lista, V("12.3"), 0, d));
    ASSERT_TRUE(CalculosGerais(lista, d));
    EXPECT_EQ(lista.linhas[0].valDescGeral, V("7.1098"));  // 12.30 x 100 / 173
    EXPECT_EQ(lista.linhas[1].valDescGeral, V("3.5549"));
    EXPECT_EQ(lista.linhas[2].valDescGeral, Currency());  // not ticked: untouched
    const Currency queda = antes - lista.totais.total;
    EXPECT_LE((queda - V("12.3")).raw(), 2);
    EXPECT_GE((queda - V("12.3")).raw(), -2);

    // Typing the same amount again gives the same lines, not a share of the reduced total.
    const std::vector<LinhaLista> primeira = lista.linhas;
    ASSERT_TRUE(CalcularDescontos(lista, V("12.3"), 0, d));
    for (std::size_t i = 0; i < primeira.size(); ++i) {
        EXPECT_EQ(lista.linhas[i].valDescGeral, primeira[i].valDescGeral) << i;
        EXPECT_EQ(lista.linhas[i].valorLinha, primeira[i].valorLinha) << i;
    }
}

TEST(CalcularDescontos, AppliedPricesWhenTheScreenUsesThem) {
    ListaLinhas lista;
    lista.linhas = {linhaParaDesconto("100", 0)};
    lista.linhas[0].precoAplicado = V("80");
    DefinicoesDocumento d = definicoes(2, ArredondaProximo);
    d.precoAplicado = true;
    ASSERT_TRUE(CalcularDescontos(lista, Currency(), 50, d));
    EXPECT_EQ(lista.linhas[0].valDescGeral, V("40"));
    EXPECT_EQ(lista.linhas[0].valorLinha, V("40"));
}

TEST(CalcularDescontos, OutOfRangeLeavesTheLines) {
    ListaLinhas lista;
    lista.linhas = {linhaParaDesconto("100", 23)};
    lista.linhas[0].quantidade = Currency::fromRaw(std::numeric_limits<std::int64_t>::max() / 2);
    const std::int64_t antes = lista.linhas[0].valorLinha.raw();
    EXPECT_FALSE(CalcularDescontos(lista, Currency(), 10, definicoes(2, ArredondaProximo)));
    EXPECT_EQ(lista.linhas[0].valorLinha.raw(), antes);
}

}  // namespace
}  // namespace brasel::pricing
