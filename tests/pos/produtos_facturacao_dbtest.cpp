// Which products get a button: dated sets (expired, overlapping), the user's blocks, the group
// filter; the set window's saving; and the kitchen flags.
#include "pos/produtos_cozinha.h"
#include "pos/produtos_facturacao.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

class ProdutosFacturacaoTeste : public ::testing::Test {
  protected:
    void executa(const QString& sql, const QVariantList& valores = {}) {
        ASSERT_TRUE(e_.gConn.exec(sql, valores)) << e_.gConn.lastError().toStdString();
    }
    void conjunto(const char* codigo, const char* produto, const char* inicio, const char* fim) {
        executa(QStringLiteral("insert into ProdutosFacturaREST (Codigo,Produto,Descricao,"
                               "DataInicial,DataFinal) values (?,?,?,?,?)"),
                {QString::fromUtf8(codigo), QString::fromUtf8(produto),
                 QStringLiteral("Conjunto ") + QString::fromUtf8(codigo), QString::fromUtf8(inicio),
                 QString::fromUtf8(fim)});
    }
    QStringList botoes(const char* grupo, const char* utilizador, bool soConjuntos,
                       const char* nivel = "TABGRUPOPRO") {
        const auto lista =
            ProdutosDosBotoes(e_.gConn, QString::fromUtf8(nivel), QString::fromUtf8(grupo),
                              QString::fromUtf8(utilizador), kHoje, soConjuntos);
        EXPECT_TRUE(lista);
        QStringList codigos;
        for (const BotaoProduto& b : lista.value_or(QList<BotaoProduto>{}))
            codigos << b.codigo;
        return codigos;
    }
    QStringList linhasDoConjunto(const char* codigo) {
        auto rs =
            e_.gConn.exec(QStringLiteral("select Produto,DataInicial,DataFinal,Utilizador from "
                                         "ProdutosFacturaREST where Codigo=? order by Produto"),
                          {QString::fromUtf8(codigo)});
        QStringList linhas;
        while (rs && rs->next())
            linhas << QStringList{rs->value(0).toString(), rs->value(1).toString(),
                                  rs->value(2).toString(), rs->value(3).toString()}
                          .join(u'|');
        return linhas;
    }

    const QString kHoje = QStringLiteral("2024-06-15");
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
};

TEST_F(ProdutosFacturacaoTeste, OnlyProductsOfASetValidTodayGetAButton) {
    conjunto("1", "S001", "2024-06-01", "2024-06-14");  // ended yesterday
    conjunto("2", "S002", "2024-06-15", "2024-06-15");  // today only
    conjunto("3", "S003", "2024-06-16", "2024-06-30");  // starts tomorrow
    conjunto("4", "S004", "2024-06-01", "2024-06-20");  // two overlapping sets
    conjunto("5", "S004", "2024-06-10", "2024-06-14");
    conjunto("6", "S006", "2024-06-10", "2024-06-14");  // only the expired one of two
    conjunto("7", "S006", "2024-06-15", "2024-07-01");
    EXPECT_EQ(botoes("03", "01", true), (QStringList{QStringLiteral("S004"), QStringLiteral("S002"),
                                                     QStringLiteral("S006")}));  // by description
    EXPECT_EQ(botoes("03", "01", false).size(), 9);
    struct Caso {
        const char* produto;
        bool activo;
    } casos[] = {{"S001", false}, {"S002", true}, {"S003", false},
                 {"S004", true},  {"S006", true}, {"S005", false}};
    for (const Caso& c : casos)
        EXPECT_EQ(ProdutoNumConjuntoValido(e_.gConn, QString::fromUtf8(c.produto), kHoje), c.activo)
            << c.produto;
}

TEST_F(ProdutosFacturacaoTeste, ProductsBlockedForTheUserHaveNoButton) {
    const QString sql = QStringLiteral(
        "insert into UtilConfig_Div (Utilizador,NomeForm,Chave,Conteudo,TipoConteudo) values "
        "(?,?,?,'1','String')");
    executa(sql, {QStringLiteral("02"), QString::fromLatin1(kNomeBloqueioProdutos),
                  QStringLiteral("B006")});
    executa(sql, {QStringLiteral("02"), QStringLiteral("OutraJanela"), QStringLiteral("B007")});
    const QStringList todos = botoes("01", "01", false);
    const QStringList doEmpregado = botoes("01", "02", false);
    EXPECT_TRUE(todos.contains(QStringLiteral("B006")));
    EXPECT_FALSE(doEmpregado.contains(QStringLiteral("B006")));
    EXPECT_TRUE(doEmpregado.contains(QStringLiteral("B007")));
    EXPECT_EQ(doEmpregado.size(), todos.size() - 1);
    EXPECT_TRUE(VerBloqueioUtilproduto(e_.gConn, QStringLiteral("02"), QStringLiteral("B006")));
    EXPECT_FALSE(VerBloqueioUtilproduto(e_.gConn, QStringLiteral("01"), QStringLiteral("B006")));
}

TEST_F(ProdutosFacturacaoTeste, ButtonsFollowTheMenuLevel) {
    EXPECT_EQ(botoes("012", "01", false, "tabfampro"),
              (QStringList{QStringLiteral("B007"), QStringLiteral("B009"), QStringLiteral("B008"),
                           QStringLiteral("B006")}));
    EXPECT_TRUE(botoes("x' or '1'='1", "01", false).isEmpty());
}

TEST_F(ProdutosFacturacaoTeste, SavingASetKeepsTheTickedAndDropsOnlyTheUnticked) {
    conjunto("9", "S001", "2024-01-01", "2024-12-31");
    conjunto("9", "S002", "2024-01-01", "2024-12-31");
    conjunto("8", "S002", "2024-01-01", "2024-12-31");
    const ConjuntoProdutos c{QStringLiteral("9"), QStringLiteral("Sobremesas d'Verão"),
                             QStringLiteral("2024-06-01"), QStringLiteral("2024-09-30")};
    ASSERT_TRUE(GravarConjunto(e_, mensagens_, QStringLiteral("01"), c,
                               {QStringLiteral("S001"), QStringLiteral("S003")},
                               {QStringLiteral("S002"), QStringLiteral("S004")}));
    EXPECT_EQ(linhasDoConjunto("9"),
              (QStringList{QStringLiteral("S001|2024-06-01|2024-09-30|01"),
                           QStringLiteral("S003|2024-06-01|2024-09-30|01")}));
    EXPECT_EQ(linhasDoConjunto("8").size(), 1);
    const auto lido = LerConjunto(e_.gConn, QStringLiteral("9"));
    ASSERT_TRUE(lido);
    EXPECT_EQ(lido->descricao, c.descricao);

    const auto lista =
        CarregarProdutosConjunto(e_.gConn, QStringLiteral("TABGRUPOPRO"), QStringLiteral("9"));
    ASSERT_TRUE(lista);
    int marcados = 0;
    for (const LinhaConjunto& l : *lista) {
        if (!l.marcado) continue;
        ++marcados;
        EXPECT_EQ(l.nivel, QStringLiteral("Sobremesas")) << l.produto.toStdString();
        EXPECT_EQ(l.dataFinal, QStringLiteral("2024-09-30"));
    }
    EXPECT_EQ(marcados, 2);
    EXPECT_EQ(ProximoConjunto(e_), QStringLiteral("10"));
}

TEST_F(ProdutosFacturacaoTeste, IncompleteSetsAreRefusedAndChangeNothing) {
    conjunto("9", "S001", "2024-01-01", "2024-12-31");
    const ConjuntoProdutos casos[] = {
        {QStringLiteral("9"), QString(), QStringLiteral("2024-01-01"),
         QStringLiteral("2024-02-01")},
        {QString(), QStringLiteral("X"), QStringLiteral("2024-01-01"),
         QStringLiteral("2024-02-01")},
        {QStringLiteral("9"), QStringLiteral("X"), QString(), QStringLiteral("2024-02-01")},
        {QStringLiteral("9"), QStringLiteral("X"), QStringLiteral("2024-03-01"),
         QStringLiteral("2024-02-01")},
    };
    for (const ConjuntoProdutos& c : casos) {
        mensagens_.limpar();
        EXPECT_FALSE(
            GravarConjunto(e_, mensagens_, QStringLiteral("01"), c, {}, {QStringLiteral("S001")}));
        EXPECT_EQ(mensagens_.mensagens().size(), 1);
    }
    EXPECT_EQ(linhasDoConjunto("9").size(), 1);
}

TEST_F(ProdutosFacturacaoTeste, KitchenFlagsAreReadAndWrittenForEveryProduct) {
    auto flags = CarregarFlagsCozinha(e_.gConn, QStringLiteral("TabFamPro"));
    ASSERT_TRUE(flags);
    ASSERT_FALSE(flags->isEmpty());
    EXPECT_EQ(flags->first().codigo, QStringLiteral("B005"));  // family 011 first
    int naCozinha = 0;
    for (FlagCozinha& f : *flags) {
        if (f.codigo == u"B001" || f.codigo == u"P001") f.cozinha = !f.cozinha;
        naCozinha += f.cozinha;
    }
    ASSERT_TRUE(GravarFlagsCozinha(e_.gConn, *flags));
    const auto relidos = CarregarFlagsCozinha(e_.gConn, QStringLiteral("qualquer"));
    ASSERT_TRUE(relidos);
    int relidosNaCozinha = 0;
    for (const FlagCozinha& f : *relidos) {
        relidosNaCozinha += f.cozinha;
        if (f.codigo == u"B001") {
            EXPECT_TRUE(f.cozinha);
        }
    }
    EXPECT_EQ(relidosNaCozinha, naCozinha);
}

}  // namespace
}  // namespace brasel::pos
