// Price tiers, discount tables, the seller, the tab set-up, the financial discount and the
// agreements, on an embedded company.
#include "pricing/desconto_financeiro.h"
#include "pricing/descontos_tabelas.h"
#include "pricing/precos.h"
#include "pricing/tab_descontos.h"

#include "pricing/insere_teste.h"
#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace brasel::pricing {
namespace {

using teste::configuraUtilizador;
using teste::insere;
using teste::T;
using teste::V;

class TabelasPrecos : public ::testing::Test {
  protected:
    void SetUp() override {
        e.param.casadec = 2;
        e.param.casadecpreco = 2;
        insere(e, "Produtos",
               {{"Codigo", T("P1")},
                {"PrecoVenda1", T("10")},
                {"PrecoVenda2", T("9")},
                {"PrecoVenda3", T("8.5")},
                {"DescontoVenda1", T("1")},
                {"DescontoVenda2", T("2")},
                {"DescontoVenda3", T("3")},
                {"DescontoCompra1", T("7")},
                {"ultprecocompra", T("4.25")},
                {"vendedorhabitual", T("VP")},
                {"DescontoTabelado", T("PRO")},
                {"Grupo", T("BEB")}});
        insere(e, "Clientes",
               {{"Codigo", T("M1")},
                {"PrecoStock", 3},
                {"Vendedor", T("VC")},
                {"Desconto1", T("10")},
                {"Desconto2", T("20")},
                {"Desconto3", T("30")},
                {"DescontoTabelado", T("CLI")},
                {"Grupo", T("G1")},
                {"decdescgeral", 2},
                {"arredescgeral", 1},
                {"DescontoFinanceiroPERC", T("2")}});
        insere(e, "Clientes",
               {{"Codigo", T("M2")}, {"TaxaAgravamento", T("10")}, {"PrecoStock", 1}});
        insere(e, "Fornece", {{"codigo", T("F1")}, {"desconto1", T("4")}, {"desconto2", T("5")}});
        insere(e, "TabDescontosTabelados", {{"Codigo", T("CLI")}, {"Desconto1", T("10")}});
        insere(e, "TabDescontosTabelados",
               {{"Codigo", T("PRO")}, {"Desconto1", T("5")}, {"Desconto2", T("5")}});
    }

    testing::EmpresaTeste empresa;
    app::Estado& e = empresa.estado();
};

TEST_F(TabelasPrecos, GET_PrecosProdutos_cur_ByTier) {
    struct Caso {
        const char* precario;
        int pvp;
        const char* tipo;
        const char* terceiro;
        const char* preco;
        int escalao;
    };
    const Caso casos[] = {
        {"P", 2, "C", "M1", "9", 2},  {"C", 0, "C", "M1", "8.5", 3},  {"C", 0, "C", "", "10", 1},
        {"D", 2, "C", "M1", "0", 0},  {"X", 2, "C", "M1", "0", 0},    {"P", 9, "C", "M1", "0", 0},
        {"P", 1, "C", "M2", "11", 1}, {"P", 1, "F", "F1", "4.25", 0},
    };
    for (const Caso& c : casos) {
        configuraUtilizador(e, {{"Precario", T(c.precario)}, {"PVP", c.pvp}});
        int escalao = -1;
        EXPECT_EQ(GET_PrecosProdutos_cur(e, T(c.tipo), T(c.terceiro), T("P1"), escalao), V(c.preco))
            << c.precario << " " << c.terceiro;
        EXPECT_EQ(escalao, c.escalao) << c.precario << " " << c.terceiro;
    }
}

TEST_F(TabelasPrecos, ConfigUtilAndSeller) {
    configuraUtilizador(e, {{"Precario", T("C")},
                            {"VendDef", T("C")},
                            {"DescGERAL", T("2")},
                            {"PortaTalao", T("COM")},
                            {"vendedorUtil", T("VU")}});
    auto c = ConfigUtil(e, T("M1"));
    ASSERT_TRUE(c.has_value());
    EXPECT_EQ(c->escalao, T("3"));
    EXPECT_EQ(c->vendedor, T("VC"));
    EXPECT_DOUBLE_EQ(c->descontoGeral, 20.0);
    EXPECT_EQ(c->portaTalao, T("COM"));
    EXPECT_FALSE(ConfigUtil(e, T("NAO")).has_value());

    configuraUtilizador(e, {{"Precario", T("P")},
                            {"PVP", 5},
                            {"VendDef", T("U")},
                            {"DescGERAL", T("D")},
                            {"vendedorUtil", T("VU")}});
    c = ConfigUtil(e, T("M1"));
    ASSERT_TRUE(c.has_value());
    EXPECT_EQ(c->escalao, T("5"));
    EXPECT_EQ(c->vendedor, T("VU"));
    EXPECT_DOUBLE_EQ(c->descontoGeral, 0.0);

    const struct {
        const char* vendDef;
        const char* cliente;
        const char* vendedor;
    } vendedores[] = {{"P", "M1", "VP"}, {"C", "M1", "VC"}, {"U", "M1", "VU"},
                      {"", "M1", "VC"},  {"P", "M2", "VP"}, {"U", "NAO", "VU"}};
    for (const auto& v : vendedores) {
        configuraUtilizador(e, {{"VendDef", T(v.vendDef)}, {"vendedorUtil", T("VU")}});
        EXPECT_EQ(GET_Vendedor_str(e, T(v.cliente), T("P1")), T(v.vendedor)) << v.vendDef;
    }
    configuraUtilizador(e, {{"VendDef", T("U")}, {"vendedorUtil", T("")}});
    EXPECT_EQ(GET_Vendedor_str(e, T("M1"), T("P1")), T("VC"));  // empty falls back
}

TEST_F(TabelasPrecos, GET_DescontosProdutos_PlacesDiscountsByTheUsersNumbers) {
    const struct {
        const char* descontos;
        int p1, p2, p3;
        const char* tipo;
        const char* terceiro;
        DescontosLinha esperado;
    } casos[] = {
        {"P", 1, 2, 3, "C", "M1", {1, 2, 3}},   {"P", 3, 0, 1, "C", "M1", {3, 0, 1}},
        {"C", 2, 2, 9, "C", "M1", {20, 20, 0}}, {"T", 0, 0, 0, "C", "M1", {5, 5, 0}},
        {"P", 1, 2, 0, "F", "F1", {4, 5, 0}},   {"Q", 1, 2, 3, "C", "M1", {0, 0, 0}},
    };
    for (const auto& c : casos) {
        configuraUtilizador(e, {{"Descontos", T(c.descontos)},
                                {"Desconto1", c.p1},
                                {"Desconto2", c.p2},
                                {"Desconto3", c.p3}});
        EXPECT_EQ(GET_DescontosProdutos(e, T(c.tipo), T(c.terceiro), T("P1"), V("10"), T("FAC")),
                  c.esperado)
            << c.descontos << " " << c.tipo;
    }
    configuraUtilizador(e, {{"Descontos", T("P")}, {"DescFFpro", T("P")}, {"Desconto1", 1}});
    EXPECT_EQ(GET_DescontosProdutos(e, T("F"), T("F1"), T("P1"), V("10"), T("FAC")),
              (DescontosLinha{7, 0, 0}));
}

TEST_F(TabelasPrecos, DescontosTabelados_SmallerDiscountWinsProductOnTie) {
    configuraUtilizador(e, {{"Descontos", T("T")}});
    // 10000 (customer) against 9750 (product): the product's set.
    EXPECT_EQ(DescontosTabelados(e, T("M1"), T("P1")), (DescontosLinha{5, 5, 0}));
    e.gConn.exec(T("update TabDescontosTabelados set Desconto1=9.75, Desconto2=0 where Codigo=?"),
                 {T("PRO")});
    e.gConn.exec(T("update TabDescontosTabelados set Desconto1=3 where Codigo=?"), {T("CLI")});
    EXPECT_EQ(DescontosTabelados(e, T("M1"), T("P1")), (DescontosLinha{3, 0, 0}));
    e.gConn.exec(T("update TabDescontosTabelados set Desconto1=9.75 where Codigo=?"), {T("CLI")});
    e.gConn.exec(T("update TabDescontosTabelados set Desconto2=0.001 where Codigo=?"), {T("PRO")});
    EXPECT_EQ(DescontosTabelados(e, T("M1"), T("P1")), (DescontosLinha{9.75, 0, 0}));
    e.gConn.exec(T("update TabDescontosTabelados set Desconto2=0 where Codigo=?"), {T("PRO")});
    EXPECT_EQ(DescontosTabelados(e, T("M1"), T("P1"))[1], 0.0);  // a tie: the product's
    // A customer without a set does not win with "no discount".
    EXPECT_EQ(DescontosTabelados(e, T("M2"), T("P1")), (DescontosLinha{9.75, 0, 0}));
    configuraUtilizador(e, {{"Descontos", T("P")}});
    EXPECT_EQ(DescontosTabelados(e, T("M1"), T("P1")), (DescontosLinha{0, 0, 0}));
}

TEST_F(TabelasPrecos, DescontosPatamares_PriceBands) {
    insere(e, "TabPatamaresDescontos",
           {{"TipoPatamarCliente", T("TabGrupoCli")},
            {"PatamarCliente", T("G1")},
            {"CodigoDesconto", T("PRO")},
            {"TipoMovimento", T("FAC")},
            {"LimiteMinimoPreco", T("0")},
            {"LimiteMaximoPreco", T("9.99")},
            {"DescontoVenda1", T("2")}});
    insere(e, "TabPatamaresDescontos",
           {{"TipoPatamarCliente", T("TabGrupoCli")},
            {"PatamarCliente", T("G1")},
            {"CodigoDesconto", T("PRO")},
            {"TipoMovimento", T("FAC")},
            {"LimiteMinimoPreco", T("10")},
            {"LimiteMaximoPreco", T("50")},
            {"DescontoVenda1", T("4")},
            {"DescontoVenda3", T("1")}});
    const auto z = [&](const char* preco, const char* tipo = "FAC") {
        return DescontosPatamares(e, T("C"), T("M1"), T("P1"), V(preco), T(tipo));
    };
    EXPECT_EQ(z("5"), (DescontosLinha{2, 0, 0}));
    EXPECT_EQ(z("10"), (DescontosLinha{4, 0, 1}));
    EXPECT_EQ(z("50"), (DescontosLinha{4, 0, 1}));
    EXPECT_EQ(z("9.995"), (DescontosLinha{0, 0, 0}));  // between the bands
    EXPECT_EQ(z("50.01"), (DescontosLinha{0, 0, 0}));
    EXPECT_EQ(z("10", "VD"), (DescontosLinha{0, 0, 0}));
    EXPECT_EQ(DescontosPatamares(e, T("F"), T("F1"), T("P1"), V("1"), T("FAC")),
              (DescontosLinha{5, 5, 0}));
    configuraUtilizador(e, {{"Descontos", T("Z")}});
    EXPECT_EQ(GET_DescontosProdutos(e, T("C"), T("M1"), T("P1"), V("20"), T("FAC")),
              (DescontosLinha{4, 0, 1}));
}

TEST_F(TabelasPrecos, DescontoFinanceiro_FromTheCustomerOrLineByLine) {
    auto d = DescontoFinanceiro_Calcular(e, T("M1"), T("FAC"), T("2024"), T(""), V("50"));
    ASSERT_TRUE(d.has_value());
    EXPECT_DOUBLE_EQ(d->percentagem, 2.0);
    EXPECT_EQ(d->valor, V("1"));

    const auto linha = [&](const char* produto, const char* iliq, const char* desc, int sel) {
        insere(e, "MovProduto",
               {{"Codigo", T(produto)},
                {"Tipo", T("FAC")},
                {"Numero", T("")},
                {"Ano", T("2024")},
                {"CliFor", T("C")},
                {"Terceiro", T("M1")},
                {"Utilizador", e.gLogin},
                {"ValorIliq", T(iliq)},
                {"TotalDesconto", T(desc)},
                {"SelecFecha", sel},
                {"Fechado", T("N")}});
    };
    linha("P1", "100", "10", 1);
    linha("P1", "40", "0", 0);  // not ticked
    linha("P2", "30", "0", 1);
    insere(e, "TabDescontosFinanceiros",
           {{"Cliente", T("M1")}, {"Produto", T("P1")}, {"DescontoFinanceiro", T("5")}});
    d = DescontoFinanceiro_Calcular(e, T("M1"), T("FAC"), T("2024"), T(""), V("160"));
    ASSERT_TRUE(d.has_value());
    EXPECT_EQ(d->valor, V("4.5"));  // 5 % of 90; P2 has no row

    insere(e, "TabDescontosFinanceirosPatamares",
           {{"GrupoCli", T("G1")}, {"GrupoPro", T("BEB")}, {"DescontoFinanceiro", T("1.5")}});
    d = DescontoFinanceiro_Calcular(e, T("M1"), T("FAC"), T("2024"), T(""), V("160"));
    ASSERT_TRUE(d.has_value());
    EXPECT_EQ(d->valor, V("1.35"));  // the classification table wins when it has rows
}

class Acordos : public TabelasPrecos {
  protected:
    void acordo(const teste::Colunas& extra) {
        teste::Colunas c{
            {"cliente", T("M1")}, {"produto", T("P1")}, {"armazem", T("A1;B_2;")}, {"Tipo", T("")}};
        c.insert(c.end(), extra.begin(), extra.end());
        for (const char* hora : {"HoraIni", "HoraFim"}) {
            const bool dada = std::any_of(extra.begin(), extra.end(), [&](const auto& par) {
                return qstrcmp(par.first, hora) == 0;
            });
            if (!dada) c.emplace_back(hora, T("00:00"));
        }
        insere(e, "tabdescontos", c);
    }
    AcordoDescontos procura(const char* armazem, const char* quando,
                            const SaldoProduto& saldo = {}) {
        return TabDescontos_Procura(e, T("M1"), T("P1"), T(armazem), T("FAC"),
                                    QDateTime::fromString(T(quando), Qt::ISODate), saldo);
    }
};

TEST_F(Acordos, NewestAgreementWhoseDatesAndHoursHold) {
    acordo({{"DataInicial", T("2024-01-01")},
            {"DataFinal", T("2024-12-31")},
            {"PrecoDesc", T("P")},
            {"PrecoDigit", T("7.5")},
            {"PrecoPro", 2}});
    acordo({{"DataInicial", T("2024-06-01")},
            {"DataFinal", T("2024-06-30")},
            {"HoraIni", T("12:00")},
            {"HoraFim", T("15:00")},
            {"PrecoDesc", T("P")},
            {"PrecoPro", 3}});
    acordo({{"DataInicial", T("")},
            {"DataFinal", T("")},
            {"PrecoDesc", T("D")},
            {"DescCli", 1},
            {"DescontoValor", T("1.5")}});

    auto a = procura("A1", "2024-06-10T13:00:00");
    EXPECT_TRUE(a.encontrado);
    EXPECT_EQ(a.preco, V("8.5"));  // tier 3 of the June agreement
    EXPECT_EQ(a.escalao, 3);
    a = procura("A1", "2024-06-10T16:00:00");  // outside the June hours
    EXPECT_EQ(a.preco, V("7.5"));              // a typed price wins over its tier
    EXPECT_EQ(a.escalao, 0);
    a = procura("A1", "2025-02-01T10:00:00");  // only the undated one holds
    EXPECT_EQ(a.tipo, T("D"));
    EXPECT_EQ(a.descontos, (DescontosLinha{10, 20, 30}));
    EXPECT_EQ(a.descontoValor, V("1.5"));
    EXPECT_FALSE(procura("A", "2024-06-10T13:00:00").encontrado);   // "A" is not "A1"
    EXPECT_FALSE(procura("B%", "2024-06-10T13:00:00").encontrado);  // wildcards are literal
    EXPECT_TRUE(procura("B_2", "2025-02-01T10:00:00").encontrado);

    e.gConn.exec(T("update ParamGeral set TabDescontosMandaDataVazia=1"));
    EXPECT_EQ(procura("A1", "2024-06-10T13:00:00").tipo, T("D"));
}

TEST_F(Acordos, ControloQuantNeedsStock) {
    acordo({{"DataInicial", T("2024-01-01")},
            {"DataFinal", T("2024-12-31")},
            {"ControloQuant", 1},
            {"PrecoDesc", T("T")},
            {"PrecoDigit", T("6")},
            {"Desc1Digit", T("3")},
            {"DescPro", 0}});
    const auto comStock = [](const QString&, const QString&) -> std::optional<Currency> {
        return Currency(5);
    };
    const auto semStock = [](const QString&, const QString&) -> std::optional<Currency> {
        return Currency();
    };
    const auto a = procura("A1", "2024-03-01T10:00:00", comStock);
    EXPECT_TRUE(a.encontrado);
    EXPECT_EQ(a.preco, V("6"));
    EXPECT_EQ(a.descontos, (DescontosLinha{3, 0, 0}));
    EXPECT_FALSE(procura("A1", "2024-03-01T10:00:00", semStock).encontrado);
    EXPECT_FALSE(procura("A1", "2024-03-01T10:00:00").encontrado);
}

}  // namespace
}  // namespace brasel::pricing
