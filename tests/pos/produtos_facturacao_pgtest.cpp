// Product buttons, product sets and the code box on a PostgreSQL company: the filters of the
// buttons, a set saved with a quote in its description, zero-filled codes and a price label.
#include "db/connections.h"
#include "db/schema/servidor.h"
#include "pos/codigo_barras.h"
#include "pos/produtos_facturacao.h"
#include "support/empresa_pg.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

class ProdutosFacturacaoPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        const QString produto = QStringLiteral(
            "insert into Produtos (Codigo,Descricao,Grupo,PrecoVenda1) values (?,?,?,?)");
        executa(produto, {QStringLiteral("A'1"), QStringLiteral("Bica"), QStringLiteral("01"),
                          QStringLiteral("0.80")});
        executa(produto, {QStringLiteral("000123"), QStringLiteral("Agua"), QStringLiteral("01"),
                          QStringLiteral("2.50")});
        executa(produto, {QStringLiteral("B2"), QStringLiteral("Cha"), QStringLiteral("01"),
                          QStringLiteral("1.00")});
    }

    void executa(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(e_.gConn.exec(sql, valores)) << e_.gConn.lastError().toStdString();
    }

    QStringList botoes(const char* utilizador, bool soConjuntos) {
        const auto lista = ProdutosDosBotoes(e_.gConn, QStringLiteral("TABGRUPOPRO"),
                                             QStringLiteral("01"), QString::fromUtf8(utilizador),
                                             QStringLiteral("2024-06-15"), soConjuntos);
        EXPECT_TRUE(lista) << e_.gConn.lastError().toStdString();
        QStringList codigos;
        for (const BotaoProduto& b : lista.value_or(QList<BotaoProduto>{}))
            codigos << b.codigo;
        return codigos;
    }

    testing::EmpresaPg empresa_{QLatin1Char('T')};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
};

TEST_F(ProdutosFacturacaoPg, SetsAndBlocksChooseTheButtons) {
    const ConjuntoProdutos verao{QStringLiteral("1"), QStringLiteral("Verão d'Ouro"),
                                 QStringLiteral("2024-06-01"), QStringLiteral("2024-06-30")};
    ASSERT_TRUE(GravarConjunto(e_, mensagens_, QStringLiteral("01"), verao,
                               {QStringLiteral("A'1"), QStringLiteral("000123")}, {}));
    ASSERT_TRUE(GravarConjunto(e_, mensagens_, QStringLiteral("01"), verao, {QStringLiteral("A'1")},
                               {QStringLiteral("000123")}));
    EXPECT_EQ(LerConjunto(e_.gConn, QStringLiteral("1"))->descricao, verao.descricao);
    EXPECT_EQ(ProximoConjunto(e_), QStringLiteral("2"));
    executa(
        QStringLiteral("insert into UtilConfig_Div (Utilizador,NomeForm,Chave) values (?,?,?)"),
        {QStringLiteral("02"), QString::fromLatin1(kNomeBloqueioProdutos), QStringLiteral("B2")});
    EXPECT_EQ(botoes("01", true), QStringList{QStringLiteral("A'1")});
    EXPECT_EQ(botoes("01", false),
              (QStringList{QStringLiteral("000123"), QStringLiteral("A'1"), QStringLiteral("B2")}));
    EXPECT_EQ(botoes("02", false), (QStringList{QStringLiteral("000123"), QStringLiteral("A'1")}));
}

TEST_F(ProdutosFacturacaoPg, CodeBoxReadsCodesAndLabels) {
    EXPECT_EQ(Zerar_Produto_str(e_.gConn, QStringLiteral("123"), true), QStringLiteral("000123"));
    EXPECT_EQ(ConverteCodigo(e_.gConn, QStringLiteral("F'1"), QStringLiteral("A'1"), true),
              QStringLiteral("A'1"));
    executa(QStringLiteral("update ParamGeral set controlOficial=1,Prefixo1Preco=?,"
                           "PrefixoPrecoCorte1=6,PrefixoPrecoCorte2=5,PrefixoPrecoDivisor=100"),
            {QStringLiteral("29")});
    const auto lido = cmdImputCodigoBarras(e_, mensagens_, QStringLiteral("29000123007509"), {});
    ASSERT_TRUE(lido);
    EXPECT_EQ(lido->produto, QStringLiteral("000123"));
    EXPECT_EQ(lido->quantidade, Currency(3));
    EXPECT_EQ(lido->preco, Currency::fromRaw(25000));
}

}  // namespace
}  // namespace brasel::pos
