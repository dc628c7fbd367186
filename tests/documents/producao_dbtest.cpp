// Production at sale on an embedded company: the raw materials go out and the finished product
// comes in under their own document numbers, linked to the sale line, and all of it is undone
// with the sale line.
#include "documents/producao.h"

#include "documents/lanca_mov_produto.h"
#include "documents/movimentos_teste.h"
#include "documents/numeracao.h"
#include "pricing/insere_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using pricing::teste::insere;
using pricing::teste::T;
using teste::C;
using teste::grava;
using teste::movimento;

const QString kIncompletas = QStringLiteral("As Configurações para produção, estão Incompletas!");

class ProducaoEmpresa : public ::testing::Test {
  protected:
    void SetUp() override {
        insere(e, "Produtos",
               {{"Codigo", T("PA")}, {"Descricao", T("Sangria")}, {"precomediocusto", T("3")}});
        insere(e, "Produtos",
               {{"Codigo", T("M1")}, {"Descricao", T("Vinho")}, {"precomediocusto", T("1.5")}});
        insere(e, "Produtos",
               {{"Codigo", T("M2")},
                {"Descricao", T("Fruta")},
                {"precomediocusto", T("0.4")},
                {"ctrlexistencia", 1}});
        insere(e, "Nomenclatura",
               {{"ProdutoAcabado", T("PA")},
                {"ProdutoPrima", T("M1")},
                {"Quantidade", T("0.5")},
                {"armazem", T("")}});
        insere(e, "Nomenclatura",
               {{"ProdutoAcabado", T("PA")},
                {"ProdutoPrima", T("M2")},
                {"Quantidade", T("0.25")},
                {"armazem", T("003")}});
        insere(e, "ConfigProd",
               {{"TipoSaida", T("PRS")},
                {"TipoEnt", T("PRE")},
                {"Fornece", T("PROD")},
                {"cliente", T("PROD")}});
        insere(e, "TabTipoMov", {{"codigo", T("PRS")}, {"UltNumero", T("00000041")}});
        insere(e, "TabTipoMov", {{"codigo", T("PRE")}, {"UltNumero", T("00000000")}});
    }

    void existencias() { grava(e, movimento("M2", "E+", "10", "0.4", "003", "2026-01-01")); }

    static DestinoProducao destino(const char* chave) {
        return {QStringLiteral("VD"), QString(), QStringLiteral("2026-03-02"),
                QString::fromLatin1(chave)};
    }

    bool produzir(const char* quant, const char* chave, db::Connection* conn = nullptr) {
        return Producao_Lanca(e, QStringLiteral("PA"), C(quant), destino(chave),
                              QStringLiteral("001"), mensagens, conn);
    }

    int conta(const QString& sql, const QVariantList& valores = {}) {
        const auto r = e.gConn.firstRow(sql, valores);
        return r ? r->value(0).toInt() : -1;
    }
    int linhasProducao() {
        return conta(QStringLiteral("select count(*) from MovProduto where Tipo in ('PRS','PRE')"));
    }
    int ligacoes() { return conta(QStringLiteral("select count(*) from MovProduto_Ligacoes")); }
    QString ultNumero(const char* tipo) {
        return e.gConn
            .firstRow(QStringLiteral("select UltNumero from TabTipoMov where codigo=?"),
                      {QString::fromLatin1(tipo)})
            ->value(0)
            .toString();
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
    testing::MensagensGravadas mensagens;
};

TEST_F(ProducaoEmpresa, ASoldFinishedProductPostsItsProductionLinkedToTheSaleLine) {
    existencias();
    ASSERT_TRUE(produzir("2", "{VENDA-1}")) << mensagens.textos().join(u'|').toStdString();
    EXPECT_TRUE(mensagens.mensagens().isEmpty());

    struct Esperada {
        const char* codigo;
        const char* afecta;
        const char* quant;
        const char* preco;
        const char* tipo;
        const char* numero;
        const char* armazem;
        const char* cliFor;
    };
    // Warehouse order: the component without a warehouse of its own comes first and takes the
    // sale's, 001.
    const Esperada esperadas[] = {
        {"M1", "S+", "1", "1.5", "PRS", "00000042", "001", "C"},
        {"M2", "S+", "0.5", "0.4", "PRS", "00000042", "003", "C"},
        {"PA", "E+", "2", "3", "PRE", "00000001", "001", "F"},
    };
    auto rs = e.gConn.exec(QStringLiteral(
        "select m.Codigo, m.AfectaStk, m.QuantNormal, m.Preco, m.Tipo, m.Numero, m.Armazem, "
        "m.CliFor, m.Terceiro, m.Fechado, m.ObsLinha, m.Data, l.Destino_Tipo, l.Destino_Numero, "
        "l.Destino_Data, l.Quantidade, l.Origem_Tipo, l.Origem_Numero from MovProduto m join "
        "MovProduto_Ligacoes l on l.Origem_Identifica=m.Identifica where "
        "l.Destino_Identifica='{VENDA-1}' order by m.NumRegisto"));
    ASSERT_TRUE(rs);
    for (const Esperada& x : esperadas) {
        ASSERT_TRUE(rs->next()) << x.codigo;
        EXPECT_EQ(rs->value(0).toString(), QString::fromLatin1(x.codigo));
        EXPECT_EQ(rs->value(1).toString(), QString::fromLatin1(x.afecta)) << x.codigo;
        EXPECT_EQ(Currency::fromVariant(rs->value(2)), C(x.quant)) << x.codigo;
        EXPECT_EQ(Currency::fromVariant(rs->value(3)), C(x.preco)) << x.codigo;
        EXPECT_EQ(rs->value(4).toString(), QString::fromLatin1(x.tipo)) << x.codigo;
        EXPECT_EQ(rs->value(5).toString(), QString::fromLatin1(x.numero)) << x.codigo;
        EXPECT_EQ(rs->value(6).toString(), QString::fromLatin1(x.armazem)) << x.codigo;
        EXPECT_EQ(rs->value(7).toString(), QString::fromLatin1(x.cliFor)) << x.codigo;
        EXPECT_EQ(rs->value(8).toString(), QStringLiteral("PROD"));
        EXPECT_EQ(rs->value(9).toString(), QStringLiteral("S"));
        EXPECT_EQ(rs->value(10).toString(), QStringLiteral("LANC. AUTO. DE PRODUTOS"));
        EXPECT_EQ(rs->value(11).toString(), QStringLiteral("2026-03-02"));
        EXPECT_EQ(rs->value(12).toString(), QStringLiteral("VD"));
        EXPECT_EQ(rs->value(13).toString(), QString());
        EXPECT_EQ(rs->value(14).toString(), QStringLiteral("2026-03-02"));
        EXPECT_EQ(Currency::fromVariant(rs->value(15)), C(x.quant)) << x.codigo;
        EXPECT_EQ(rs->value(16).toString(), QString::fromLatin1(x.tipo)) << x.codigo;
        EXPECT_EQ(rs->value(17).toString(), QString::fromLatin1(x.numero)) << x.codigo;
    }
    EXPECT_FALSE(rs->next());
    EXPECT_EQ(ultNumero("PRS"), QStringLiteral("00000042"));
    EXPECT_EQ(ultNumero("PRE"), QStringLiteral("00000001"));

    // The next production takes the next numbers.
    ASSERT_TRUE(produzir("1", "{VENDA-2}"));
    EXPECT_EQ(ultNumero("PRS"), QStringLiteral("00000043"));
    EXPECT_EQ(ultNumero("PRE"), QStringLiteral("00000002"));
    EXPECT_EQ(linhasProducao(), 6);
}

TEST_F(ProducaoEmpresa, UndoingTheSaleLineTakesItsWholeProductionAwayAndNothingElse) {
    existencias();
    ASSERT_TRUE(produzir("2", "{PROVISORIA}"));
    ASSERT_TRUE(produzir("1", "{OUTRA}"));
    db::ValoresMovPro venda = teste::linhaVenda("PA", "2", "6");
    ASSERT_TRUE(LancaMovProduto(e, venda));
    ASSERT_TRUE(Producao_ActualizaDestino(e, QStringLiteral("{PROVISORIA}"), venda.Identifica));
    EXPECT_EQ(conta(QStringLiteral("select count(*) from MovProduto_Ligacoes where "
                                   "Destino_Identifica=?"),
                    {venda.Identifica}),
              3);
    const std::int64_t vendaNum =
        e.gConn
            .firstRow(QStringLiteral("select NumRegisto from MovProduto where Identifica=?"),
                      {venda.Identifica})
            ->value(0)
            .toLongLong();

    ASSERT_TRUE(Producao_Anula(e, vendaNum));
    EXPECT_EQ(linhasProducao(), 3);
    EXPECT_EQ(ligacoes(), 3);
    EXPECT_EQ(conta(QStringLiteral("select count(*) from MovProduto_Ligacoes where "
                                   "Destino_Identifica='{OUTRA}'")),
              3);
    EXPECT_EQ(conta(QStringLiteral("select count(*) from MovProduto where NumRegisto=?"),
                    {QVariant::fromValue<qlonglong>(vendaNum)}),
              1);
    EXPECT_EQ(conta(QStringLiteral("select count(*) from MovProduto where Codigo='M2' and "
                                   "AfectaStk='E+' and Tipo=''")),
              1);
    // Undoing again finds nothing more.
    ASSERT_TRUE(Producao_Anula(e, vendaNum));
    EXPECT_EQ(linhasProducao(), 3);
}

TEST_F(ProducaoEmpresa, LinesAndLinksWithoutAKeyAreNeverTakenForAnotherLinesProduction) {
    ASSERT_TRUE(e.gConn.exec(QStringLiteral(
        "insert into MovProduto (Codigo, Identifica, Tipo) values ('M1','','PRS')")));
    ASSERT_TRUE(e.gConn.exec(QStringLiteral(
        "insert into MovProduto_Ligacoes (Origem_Identifica, Destino_Identifica) values ('','')")));
    const std::int64_t semChave =
        e.gConn.firstRow(QStringLiteral("select max(NumRegisto) from MovProduto"))
            ->value(0)
            .toLongLong();
    EXPECT_TRUE(Producao_Anula(e, semChave));
    EXPECT_TRUE(Producao_AnulaIdentifica(e, QString()));
    EXPECT_TRUE(Producao_ActualizaDestino(e, QString(), QStringLiteral("{X}")));
    EXPECT_EQ(linhasProducao(), 1);
    EXPECT_EQ(ligacoes(), 1);
    EXPECT_EQ(conta(QStringLiteral(
                  "select count(*) from MovProduto_Ligacoes where Destino_Identifica=''")),
              1);
}

TEST_F(ProducaoEmpresa, AProductWithoutABillOfMaterialsProducesNothing) {
    EXPECT_TRUE(Producao_Lanca(e, QStringLiteral("M1"), C("3"), destino("{V}"),
                               QStringLiteral("001"), mensagens));
    EXPECT_TRUE(mensagens.mensagens().isEmpty());
    EXPECT_EQ(linhasProducao(), 0);
    EXPECT_EQ(ultNumero("PRS"), QStringLiteral("00000041"));
}

TEST_F(ProducaoEmpresa, IncompleteSettingsPostNothing) {
    existencias();
    const char* const mudancas[] = {
        "update ConfigProd set cliente=''",
        "update ConfigProd set Fornece=' '",
        "update ConfigProd set TipoSaida=''",
        "update ConfigProd set TipoEnt=''",
        "delete from ConfigProd",
    };
    for (const char* mudanca : mudancas) {
        SCOPED_TRACE(mudanca);
        e.gConn.exec(QStringLiteral("delete from ConfigProd"));
        insere(e, "ConfigProd",
               {{"TipoSaida", T("PRS")},
                {"TipoEnt", T("PRE")},
                {"Fornece", T("PROD")},
                {"cliente", T("PROD")}});
        ASSERT_TRUE(e.gConn.exec(QString::fromLatin1(mudanca)));
        mensagens.limpar();
        EXPECT_FALSE(produzir("1", "{V}"));
        EXPECT_EQ(mensagens.textos(), QStringList{kIncompletas});
        EXPECT_EQ(linhasProducao(), 0);
        EXPECT_EQ(ligacoes(), 0);
        EXPECT_EQ(ultNumero("PRS"), QStringLiteral("00000041"));
    }
}

// A raw material without stock refuses its exit after the first one was posted: the production
// fails whole, in a transaction of its own or in the caller's.
TEST_F(ProducaoEmpresa, AFailedExitLeavesNoProductionBehind) {
    for (const bool transaccaoDoChamador : {false, true}) {
        SCOPED_TRACE(transaccaoDoChamador);
        mensagens.limpar();
        std::optional<db::WriteTransaction> t;
        if (transaccaoDoChamador) t.emplace(e.gConn);
        EXPECT_FALSE(produzir("2", "{VENDA}"));
        EXPECT_EQ(
            mensagens.textos(),
            QStringList{QStringLiteral("Não foi possível Produzir do Produto [ PA ] [ Sangria ]")});
        EXPECT_EQ(linhasProducao(), 0);
        EXPECT_EQ(ligacoes(), 0);
        if (t) {
            EXPECT_TRUE(t->commit());
        }
        EXPECT_EQ(linhasProducao(), 0);
    }
}

TEST(ProximoNumero, TakesTheNumberAfterTheCounterAndRaisesIt) {
    testing::EmpresaTeste empresa(true);
    db::Connection& conn = empresa.estado().gConn;
    struct Caso {
        const char* ultNumero;
        std::optional<QString> esperado;
    };
    const Caso casos[] = {
        {"00000000", QStringLiteral("00000001")},
        {"00000099", QStringLiteral("00000100")},
        {"", QStringLiteral("00000001")},
        {"ABC", std::nullopt},
    };
    for (const Caso& c : casos) {
        conn.exec(QStringLiteral("delete from TabTipoMov where codigo='NUM'"));
        conn.exec(QStringLiteral("insert into TabTipoMov (codigo, UltNumero) values ('NUM', ?)"),
                  {QString::fromLatin1(c.ultNumero)});
        EXPECT_EQ(ProximoNumTabTipoMov(conn, QStringLiteral("NUM")), c.esperado) << c.ultNumero;
        if (c.esperado) {
            EXPECT_EQ(
                conn.firstRow(QStringLiteral("select UltNumero from TabTipoMov where codigo='NUM'"))
                    ->value(0)
                    .toString(),
                *c.esperado);
        }
    }
    EXPECT_EQ(ProximoNumTabTipoMov(conn, QStringLiteral("NAOHA")), std::nullopt);
}

}  // namespace
}  // namespace brasel::documents
