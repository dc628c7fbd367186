// The tax engine on an embedded company: line rows, document rows and the questions about them.
#include "pricing/impostos.h"

#include "pricing/insere_teste.h"
#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::insere;
using teste::T;
using teste::V;

class ImpostosEmpresa : public ::testing::Test {
  protected:
    void SetUp() override {
        e.param.casadecpreco = 2;
        insere(e, "Clientes",
               {{"Codigo", T("M1")},
                {"Impostos", T("ECO§GAR§")},
                {"DecIvaLin", 2},
                {"ArreIvaLin", 1},
                {"DecIvaGeral", 1},
                {"ArreIvaGeral", 2}});
        insere(e, "Clientes", {{"Codigo", T("M2")}, {"Impostos", T("")}});
        insere(e, "Produtos",
               {{"Codigo", T("P1")}, {"PrecoVenda1", T("25")}, {"PrecoVenda2", T("20")}});
        insere(e, "ProdutosImpostos",
               {{"Produto", T("P1")},
                {"Codigo", T("ECO")},
                {"Incid_Iliquido", 1},
                {"Incid_Desconto", 1},
                {"Factor1", T("5")},
                {"ValorResulSujeitoIVA", 1},
                {"Processa", T("S")},
                {"ConvertePV1", 1}});
        insere(e, "ProdutosImpostos",
               {{"Produto", T("P1")},
                {"Codigo", T("GAR")},
                {"ValorUnitario", T("0.1")},
                {"Processa", T("S")},
                {"Act_UPC", T("S")}});
        insere(e, "ProdutosImpostos",
               {{"Produto", T("P1")},
                {"Codigo", T("INF")},
                {"Factor1", T("1")},
                {"Incid_Iliquido", 1},
                {"Processa", T("N")}});
        insere(e, "TabTipoMov", {{"codigo", T("FAC")}, {"AfectaSTK", T("S-")}});
        insere(e, "TabTipoMov", {{"codigo", T("VFA")}, {"AfectaSTK", T("E+")}});
    }

    void linha(const char* terceiro, const char* identifica, const char* ivaTabela,
               const char* numero = "") {
        insere(e, "MovProduto",
               {{"Codigo", T("P1")},
                {"Tipo", T("FAC")},
                {"Numero", T(numero)},
                {"Ano", T("2024")},
                {"CliFor", T("C")},
                {"Terceiro", T(terceiro)},
                {"QuantNormal", T("4")},
                {"Preco", T("25")},
                {"ValorIliq", T("100")},
                {"TotalDesconto", T("10")},
                {"IvaTabela", T(ivaTabela)},
                {"IvaTaxa", T("23")},
                {"Identifica", T(identifica)}});
    }
    std::int64_t numRegisto(const char* identifica) {
        auto q = e.gConn.exec(T("select NumRegisto from MovProduto where Identifica=?"),
                              {T(identifica)});
        return q && q->next() ? q->value(0).toLongLong() : 0;
    }
    int contaLinhas(const char* identifica) {
        auto q = e.gConn.exec(T("select count(*) from ImpostosMovProduto where Identifica=?"),
                              {T(identifica)});
        return q && q->next() ? q->value(0).toInt() : -1;
    }
    ChaveLinhaImposto chave(const char* identifica, const char* terceiro = "M1") {
        return {T("FAC"), T(""), T("2024"), T("C"), T(terceiro), T("P1"), T(identifica)};
    }

    testing::EmpresaTeste empresa;
    app::Estado& e = empresa.estado();
    Impostos impostos{e};
};

TEST_F(ImpostosEmpresa, LineTaxesAreWrittenOnceAndOnlyForThePartysList) {
    linha("M1", "L1", "N");
    const LinhaAlvo alvo{T("FAC"), T(""), T("2024"), numRegisto("L1"), {}, T("P1"), false};
    ASSERT_TRUE(impostos.CalculaImposto(T("C"), T("M1"), alvo));
    ASSERT_TRUE(impostos.CalculaImposto(T("C"), T("M1"), alvo));  // again: replaced, not added
    EXPECT_EQ(contaLinhas("L1"), 2);                              // ECO and GAR, not INF
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovProduto(chave("L1")), V("4.9"));  // 4.5 + 0.4
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovProduto(chave("L1"), FiltroIva::ComIva), V("4.5"));
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovProduto(chave("L1"), FiltroIva::SemIva), V("0.4"));
    EXPECT_EQ(impostos.Get_IVA_ImpostosMovProduto(chave("L1")), V("1.04"));  // 1.035 up
    EXPECT_TRUE(impostos.Ver_Se_Tem_Impostos_Lancados(chave("L1")));
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovProduto_Como_Despesa(chave("L1")), Currency());

    // The same line found by its Identifica.
    const LinhaAlvo porIdentifica{T("FAC"), T(""), T("2024"), 0, T("L1"), T("P1"), false};
    ASSERT_TRUE(impostos.CalculaImposto(T("C"), T("M1"), porIdentifica));
    EXPECT_EQ(contaLinhas("L1"), 2);

    // A customer with an empty list gets no rows, even for a product with taxes.
    linha("M2", "L2", "N");
    ASSERT_TRUE(impostos.CalculaImposto(
        T("C"), T("M2"), {T("FAC"), T(""), T("2024"), numRegisto("L2"), {}, T("P1"), false}));
    EXPECT_EQ(contaLinhas("L2"), 0);
    EXPECT_FALSE(impostos.Ver_Se_Tem_Impostos_Lancados(chave("L2", "M2")));

    // A line that does not exist is a failure, not an empty success.
    EXPECT_FALSE(impostos.CalculaImposto(T("C"), T("M1"),
                                         {T("FAC"), T(""), T("2024"), 999999, {}, T("P1"), false}));

    ASSERT_TRUE(impostos.Delete_Produto_ImpostosMovProduto(numRegisto("L1")));
    EXPECT_EQ(contaLinhas("L1"), 0);
}

TEST_F(ImpostosEmpresa, VirtualLineAndTheScreenColumns) {
    const DadosLinhaImposto dados{V("4"), V("25"), V("100"), V("10"), T("N"), 23.0};
    const auto r = impostos.CalculaImposto_Virtual(T("C"), T("M1"), T("P1"), dados);
    ASSERT_TRUE(r.has_value());
    ASSERT_EQ(r->size(), 2u);
    const ColunasImpostos c = ColunasDaLinha(*r);
    EXPECT_EQ(c.sujeitos, V("4.5"));
    EXPECT_EQ(c.iva, V("1.04"));
    EXPECT_EQ(c.naoSujeitos, V("0.4"));
    EXPECT_EQ(contaLinhas(""), 0);  // nothing written
    const auto nenhum = impostos.CalculaImposto_Virtual(T("C"), T("M2"), T("P1"), dados);
    ASSERT_TRUE(nenhum.has_value());
    EXPECT_TRUE(nenhum->empty());
}

TEST_F(ImpostosEmpresa, DocumentRowsLeaveOutTaxesNotProcessed) {
    e.gConn.exec(T("update Clientes set Impostos=? where Codigo=?"), {T("ECO§GAR§INF§"), T("M1")});
    linha("M1", "D1", "N", "7");
    linha("M1", "D2", "R", "7");
    for (const char* id : {"D1", "D2"}) {
        ASSERT_TRUE(impostos.CalculaImposto(
            T("C"), T("M1"), {T("FAC"), T("7"), T("2024"), numRegisto(id), {}, T("P1"), false}));
    }
    EXPECT_EQ(contaLinhas("D1"), 3);  // INF stays on the line
    const ChaveDocumentoImposto doc{T("FAC"), T("7"), T("2024"), T("C"), T("M1")};
    ASSERT_TRUE(impostos.Calcula_Impostos_MovTerceiro(doc));
    ASSERT_TRUE(impostos.Calcula_Impostos_MovTerceiro(doc));  // rebuilt, not doubled
    auto q =
        e.gConn.exec(T("select CodigoImposto,Imposto,ValorIVA,TabIVA1,IncidIVA1,ValIVA1,"
                       "TabIVA2,IncidIVA2 from ImpostosMovTerceiro order by CodigoImposto"));
    ASSERT_TRUE(q.has_value());
    ASSERT_TRUE(q->next());
    EXPECT_EQ(q->value(0).toString(), T("ECO"));
    EXPECT_EQ(Currency::fromVariant(q->value(1)), V("9"));
    EXPECT_EQ(Currency::fromVariant(q->value(2)), V("2"));  // 2.08 truncated to 1 decimal
    EXPECT_EQ(q->value(3).toString(), T("N"));
    EXPECT_EQ(Currency::fromVariant(q->value(4)), V("4.5"));
    EXPECT_EQ(Currency::fromVariant(q->value(5)), V("1"));
    EXPECT_EQ(q->value(6).toString(), T("R"));
    ASSERT_TRUE(q->next());
    EXPECT_EQ(q->value(0).toString(), T("GAR"));
    EXPECT_EQ(Currency::fromVariant(q->value(1)), V("0.8"));
    EXPECT_TRUE(q->value(3).toString().isEmpty());
    EXPECT_FALSE(q->next());

    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovTerceiro(doc), V("9.8"));
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovTerceiro(doc, 1), V("4.5"));
    EXPECT_EQ(impostos.Get_IVA_ImpostosMovTerceiro(doc), V("2"));
    EXPECT_EQ(impostos.Get_IVA_ImpostosMovTerceiro(doc, 2), V("1"));
    EXPECT_EQ(impostos.Get_IVA_ImpostosMovTerceiro(doc, 5), Currency());
    ASSERT_TRUE(impostos.Delete_Produto_ImpostosMovTerceiro(doc));
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovTerceiro(doc), Currency());
}

TEST_F(ImpostosEmpresa, AFifthVatCodeWritesNoDocumentRows) {
    int n = 0;
    for (const char* iva : {"A", "B", "C", "D", "E"}) {
        const QByteArray id = QByteArray("V") + QByteArray::number(++n);
        linha("M1", id.constData(), iva, "8");
        ASSERT_TRUE(impostos.CalculaImposto(
            T("C"), T("M1"),
            {T("FAC"), T("8"), T("2024"), numRegisto(id.constData()), {}, T("P1"), false}));
    }
    const ChaveDocumentoImposto doc{T("FAC"), T("8"), T("2024"), T("C"), T("M1")};
    EXPECT_FALSE(impostos.Calcula_Impostos_MovTerceiro(doc));
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovTerceiro(doc), Currency());
}

TEST_F(ImpostosEmpresa, PricesWithTaxesAndEntryCosts) {
    EXPECT_EQ(impostos.PrecoVenda_ComImposto_cur(T("P1"), 1), V("26.25"));  // ECO only on tier 1
    EXPECT_EQ(impostos.PrecoVenda_ComImposto_cur(T("P1"), 2), V("20"));
    EXPECT_EQ(impostos.PrecoVenda_ComImposto_cur(T("P1"), 8), Currency());
    EXPECT_EQ(impostos.PrecoVenda_ComImposto_Apenas_Para_Etiquetas_cur(T("P1"), 2), V("21.3"));
    EXPECT_EQ(impostos.Produto_Valor_Imposto_cur(T("P1"), V("20")), V("1.3"));  // 1 + 0.1 + 0.2
    EXPECT_EQ(impostos.Produto_Descricoes_Impostos_str(T("P1")), T("ECO/GAR/INF"));
    EXPECT_EQ(impostos.Produto_Descricoes_Impostos_str(T("P9")), T(""));

    insere(e, "Fornece",
           {{"codigo", T("F1")},
            {"FornecedorIRS", 1},
            {"DecIvaLin", 2},
            {"ArreIvaLin", 1},
            {"TaxaIRS_Integra", T("11.5")},
            {"Impostos", T("GAR§")}});
    insere(e, "Fornece",
           {{"codigo", T("F2")}, {"FornecedorIRS", 0}, {"TaxaIRS_Integra", T("11.5")}});
    EXPECT_DOUBLE_EQ(impostos.CalculaImposto_IRS_Integracao(T("F1")), 11.5);
    EXPECT_DOUBLE_EQ(impostos.CalculaImposto_IRS_Integracao(T("F2")), 0.0);

    insere(e, "MovProduto",
           {{"Codigo", T("P1")},
            {"Tipo", T("VFA")},
            {"Numero", T("1")},
            {"Ano", T("2024")},
            {"CliFor", T("F")},
            {"Terceiro", T("F1")},
            {"QuantNormal", T("3")},
            {"Preco", T("2")},
            {"ValorIliq", T("6")},
            {"Identifica", T("C1")}});
    ASSERT_TRUE(impostos.CalculaImposto(T("F"), T("F1"),
                                        {T("VFA"), T("1"), T("2024"), 0, T("C1"), T("P1"), false}));
    const ChaveLinhaImposto compra{T("VFA"), T("1"), T("2024"), T("F"), T("F1"), T("P1"), T("C1")};
    EXPECT_EQ(impostos.Get_Imposto_ImpostosMovProduto_Como_Despesa(compra), V("0.3"));
}

}  // namespace
}  // namespace brasel::pricing
