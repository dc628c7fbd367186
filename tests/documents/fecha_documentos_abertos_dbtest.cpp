// Closing every open line of a party and type into one document without the order screen: the
// lines and the rows hanging from them numbered, the header and its cash movement, and the
// refusal of a fifth VAT code.
#include "documents/fecha_documentos_abertos.h"
#include "pricing/insere_teste.h"
#include "support/chave_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QDate>

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using pricing::teste::insere;
using pricing::teste::T;

class FechaDocumentosAbertosTeste : public ::testing::Test {
  protected:
    FechaDocumentosAbertosTeste() : e_(true) {
        testing::usaChaveTeste(estado());
        hoje_ = QDate::currentDate().toString(QStringLiteral("yyyy-MM-dd"));
    }
    app::Estado& estado() { return e_.estado(); }

    // An open line of 10.00 less 1.00 of discount with 2.07 of VAT, kept by `utilizador`.
    void linha(const char* cliFor, const char* terceiro, const char* tipo, const char* utilizador,
               const char* iva, const char* identifica) {
        insere(estado(), "MovProduto",
               {{"Codigo", T("B001")},
                {"Descricao", T("Linha")},
                {"Tipo", T(tipo)},
                {"Numero", T("")},
                {"Ano", T("")},
                {"CliFor", T(cliFor)},
                {"Terceiro", T(terceiro)},
                {"Utilizador", T(utilizador)},
                {"Fechado", T("N")},
                {"SelecFecha", 1},
                {"IvaTabela", T(iva)},
                {"IvaTaxa", T("23")},
                {"QuantNormal", T("1")},
                {"Preco", T("10")},
                {"ValorIliq", T("10")},
                {"TotalDesconto", T("1")},
                {"ValorIva", T("2.07")},
                {"Identifica", T(identifica)}});
    }
    qint64 contar(const QString& sql, const QVariantList& valores = {}) {
        auto r = estado().gConn.firstRow(sql, valores);
        return r ? r->value(0).toLongLong() : -1;
    }
    QString texto(const QString& sql, const QVariantList& valores = {}) {
        auto r = estado().gConn.firstRow(sql, valores);
        return r ? r->value(0).toString() : QStringLiteral("<nenhum>");
    }

    testing::EmpresaTeste e_;
    testing::MensagensGravadas m_;
    QString hoje_;
};

TEST_F(FechaDocumentosAbertosTeste, FechaAsLinhasDoUtilizadorENumeraOQueDelasDepende) {
    linha("C", "M02", "FT", "SUPERVISOR", "NO", "L1");
    linha("C", "M02", "FT", "SUPERVISOR", "NO", "L2");
    linha("C", "M02", "FT", "ANA", "NO", "L3");
    linha("C", "M02", "VD", "SUPERVISOR", "NO", "L4");
    insere(estado(), "ImpostosMovProduto",
           {{"Tipo", T("FT")},
            {"Numero", T("")},
            {"CliFor", T("C")},
            {"Terceiro", T("M02")},
            {"Produto", T("B001")},
            {"Identifica", T("L1")}});
    insere(estado(), "HistoricoGuias", {{"Identifica", T("L1")}, {"Numero", T("")}});
    insere(estado(), "ProdutosPacksHistorico", {{"Identifica", T("L2")}, {"numero", T("")}});

    const QString numero = FechaDocumentosAbertos(
        estado(), m_, estado().gConn,
        {u'C', QStringLiteral("M02"), QStringLiteral("FT"), QStringLiteral("SUPERVISOR"), {}});
    ASSERT_EQ(numero, QStringLiteral("00000001")) << m_.textos().join(u'|').toStdString();
    EXPECT_TRUE(m_.textos().isEmpty());
    const QString ano = hoje_.left(4);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='S' and "
                                    "Numero=? and Ano=? and Data=? and Hora<>''"),
                     {numero, ano, hoje_}),
              2);
    // ANA's line and the other type's stay open.
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='N'")), 2);
    EXPECT_EQ(
        contar(QStringLiteral("select count(*) from ImpostosMovProduto where Numero=?"), {numero}),
        1);
    EXPECT_EQ(
        contar(QStringLiteral("select count(*) from HistoricoGuias where Numero=?"), {numero}), 1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from ProdutosPacksHistorico where numero=?"),
                     {numero}),
              1);
    EXPECT_EQ(texto(QStringLiteral("select Observa from MovCliente where Tipo='FT'")),
              QStringLiteral("Processamento automático."));
    EXPECT_EQ(texto(QStringLiteral("select Modulo from MovCliente")), QStringLiteral("FC"));
    // Two lines of 10.00 - 1.00 + 2.07.
    EXPECT_EQ(Currency::parse(texto(QStringLiteral("select TotalDoc from MovCliente"))),
              Currency::parse(u"22.14"));
    EXPECT_FALSE(texto(QStringLiteral("select Hash from MovCliente")).isEmpty());
    EXPECT_EQ(texto(QStringLiteral("select UltNumero from TabTipoMov where codigo='FT'")), numero);
    // A type that does not touch the till leaves no cash row.
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCaixa")), 0);
}

TEST_F(FechaDocumentosAbertosTeste, TipoQueMexeNaCaixaDeixaOMovimento) {
    linha("C", "M02", "VD", "SUPERVISOR", "NO", "L1");
    const QString numero = FechaDocumentosAbertos(
        estado(), m_, estado().gConn, {u'C', QStringLiteral("M02"), QStringLiteral("VD"), {}, {}});
    ASSERT_FALSE(numero.isEmpty()) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCaixa where Tipo='VD' and Numero=? "
                                    "and Afecta='R+' and ValorTotal=?"),
                     {numero, Currency::parse(u"11.07")->toText()}),
              1);
}

TEST_F(FechaDocumentosAbertosTeste, QuintoIvaRecusaENadaEscreve) {
    insere(estado(), "TabIva", {{"codigo", T("Z4")}, {"Taxa", T("5")}});
    insere(estado(), "TabIva", {{"codigo", T("Z5")}, {"Taxa", T("7")}});
    for (const char* iva : {"RD", "IT", "NO", "Z4", "Z5"})
        linha("C", "M02", "FT", "SUPERVISOR", iva, iva);
    EXPECT_TRUE(FechaDocumentosAbertos(estado(), m_, estado().gConn,
                                       {u'C', QStringLiteral("M02"), QStringLiteral("FT"), {}, {}})
                    .isEmpty());
    EXPECT_EQ(m_.textos(), QStringList{QStringLiteral("Existem mais do que 4 IVAS diferentes.\r\n"
                                                      "Não pode Encerrar este Documento!")});
    EXPECT_EQ(m_.mensagens()[0].icone, Icone::Exclamacao);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovProduto where Fechado='N' and "
                                    "Numero=''")),
              5);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente")), 0);
    EXPECT_EQ(texto(QStringLiteral("select UltNumero from TabTipoMov where codigo='FT'")),
              QStringLiteral("00000000"));
}

TEST_F(FechaDocumentosAbertosTeste, FornecedorVaiParaOsCabecalhosDeFornecedores) {
    insere(estado(), "TabTipoMov",
           {{"codigo", T("CP")},
            {"Descricao", T("Compra")},
            {"UltNumero", T("00000007")},
            {"Modulo", T("FF")},
            {"AfectaCli", T("NA")},
            {"AfectaFor", T("C+")},
            {"AfectaSTK", T("E+")},
            {"AfectaCaixa", T("NA")},
            {"ControloHash", 0}});
    insere(estado(), "Fornece", {{"codigo", T("F01")}, {"Descricao", T("Talho Central")}});
    linha("F", "F01", "CP", "SUPERVISOR", "NO", "L1");
    const QString numero = FechaDocumentosAbertos(
        estado(), m_, estado().gConn, {u'F', QStringLiteral("F01"), QStringLiteral("CP"), {}, {}});
    ASSERT_EQ(numero, QStringLiteral("00000008")) << m_.textos().join(u'|').toStdString();
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovFornece where Tipo='CP' and "
                                    "Numero=? and Modulo='FF' and Afecta='C+' and Codigo='F01'"),
                     {numero}),
              1);
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente")), 0);
}

TEST_F(FechaDocumentosAbertosTeste, SemLinhasAbertasNadaFaz) {
    EXPECT_TRUE(FechaDocumentosAbertos(estado(), m_, estado().gConn,
                                       {u'C', QStringLiteral("M02"), QStringLiteral("FT"), {}, {}})
                    .isEmpty());
    EXPECT_EQ(contar(QStringLiteral("select count(*) from MovCliente")), 0);
    EXPECT_TRUE(m_.textos().isEmpty());
}

}  // namespace
}  // namespace brasel::documents
