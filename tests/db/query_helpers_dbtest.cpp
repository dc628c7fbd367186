// The query helpers every window relies on, on a bare embedded database: quotes, fall-back to
// the main connection, failure values and the catalog questions.
#include "common/currency.h"
#include "db/connections.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>
#include "support/impressao_qt.h"

namespace brasel::db {
namespace {

class QueryHelpers : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_TRUE(pasta.isValid());
        ASSERT_TRUE(
            MasterLogins(pasta.path()).criar(QStringLiteral("caixa"), QStringLiteral("pw"), false));
        ConnectionParams p;
        p.server = *ServerAddress::parse(pasta.path());
        p.baseDados = QStringLiteral("Vendrola0001");
        p.criar = true;
        Connection criar;
        ASSERT_TRUE(criar.open(p));
        ASSERT_TRUE(criar.exec(QStringLiteral(
            "create table Artigos (NumRegisto INTEGER PRIMARY KEY AUTOINCREMENT, Codigo TEXT, "
            "Descricao TEXT, Preco NUMERIC(19,4), Data TEXT)")));
        criar.close();
        sessao.gServidor = pasta.path();
        sessao.gEmpresa = QStringLiteral("0001");
        sessao.gLogin = QStringLiteral("caixa");
        sessao.gPassword = QStringLiteral("pw");
        sessao.gAutenticacao = QStringLiteral("SQL");
        ASSERT_TRUE(Abre_Connexao_Local(sessao, sessao.gConn, 0, 60));
    }

    void insere(const QString& codigo, const QString& descricao,
                const QString& preco = QStringLiteral("0")) {
        ASSERT_TRUE(sessao.gConn.exec(
            QStringLiteral("insert into Artigos (Codigo, Descricao, Preco, Data) values (?,?,?,?)"),
            {codigo, descricao, preco, QStringLiteral("2026-03-07")}));
    }

    QTemporaryDir pasta;
    Sessao sessao;
};

TEST_F(QueryHelpers, SelectCampoReadsByKeyWholeTableAndNothing) {
    insere(QStringLiteral("A1"), QStringLiteral("Água das Pedras"));
    insere(QStringLiteral("B'2"), QStringLiteral("Vinho \"da casa\" d'Ouro"));
    // A key with a quote finds its row, and a text with quotes comes back unchanged.
    EXPECT_EQ(Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Descricao"),
                               QStringLiteral("Codigo"), QStringLiteral("B'2")),
              QStringLiteral("Vinho \"da casa\" d'Ouro"));
    // Empty key field and value: the first row of the whole table.
    EXPECT_EQ(Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo"), {}, {}),
              QStringLiteral("A1"));
    EXPECT_EQ(Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo"),
                               QStringLiteral("Codigo"), QStringLiteral("' or ''='")),
              QString());
    // The extra condition binds its own values after the key.
    EXPECT_EQ(
        Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo"),
                         QStringLiteral("Data"), QStringLiteral("2026-03-07"),
                         {QStringLiteral("and Descricao like ?"), {QStringLiteral("Vinho%")}}),
        QStringLiteral("B'2"));
    // A failing statement gives the failure value, not an error.
    EXPECT_EQ(Select_Campo_str(sessao, QStringLiteral("NaoExiste"), QStringLiteral("x"), {}, {}),
              QString());
}

TEST_F(QueryHelpers, ClosedOrMissingConnectionFallsBackToMain) {
    insere(QStringLiteral("A1"), QStringLiteral("Café"));
    Connection fechada;
    EXPECT_EQ(Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Descricao"),
                               QStringLiteral("Codigo"), QStringLiteral("A1"), {}, &fechada),
              QStringLiteral("Café"));
    EXPECT_TRUE(Testa_Connection(sessao, &fechada));
    EXPECT_TRUE(Ver_Se_Existe_Tabela_bln(sessao, nullptr, QStringLiteral("artigos")));
    // With the main connection closed too, every routine returns its failure value.
    sessao.gConn.close();
    EXPECT_FALSE(Testa_Connection(sessao));
    EXPECT_EQ(
        Select_Campo_str(sessao, QStringLiteral("Artigos"), QStringLiteral("Descricao"), {}, {}),
        QString());
    EXPECT_EQ(Select_Retorna_Campo_var(sessao, QStringLiteral("select 1 as n"), {},
                                       QStringLiteral("n"), nullptr, true),
              QVariant(0));
    EXPECT_FALSE(Ver_Se_Existe_Tabela_bln(sessao, nullptr, QStringLiteral("Artigos")));
}

TEST_F(QueryHelpers, RetornaCampoNoRowGivesZeroOrEmpty) {
    insere(QStringLiteral("A1"), QStringLiteral("Pão"), QStringLiteral("1.25"));
    const QString sql = QStringLiteral("select Preco, Descricao from Artigos where Codigo=?");
    EXPECT_EQ(Currency::fromVariant(Select_Retorna_Campo_var(sessao, sql, {QStringLiteral("A1")},
                                                             QStringLiteral("Preco"))),
              *Currency::parse(u"1.25"));
    EXPECT_EQ(Select_Retorna_Campo_var(sessao, sql, {QStringLiteral("Z")}, QStringLiteral("Preco"),
                                       nullptr, true),
              QVariant(0));
    EXPECT_EQ(
        Select_Retorna_Campo_var(sessao, sql, {QStringLiteral("Z")}, QStringLiteral("Descricao")),
        QVariant(QString()));
}

TEST_F(QueryHelpers, CatalogQuestionsAndAddedColumn) {
    EXPECT_TRUE(
        Existe_Coluna_bln(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("preco")));
    EXPECT_FALSE(
        Existe_Coluna_bln(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Obs")));
    EXPECT_TRUE(
        Adiciona_Coluna(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Obs TEXT")));
    EXPECT_TRUE(
        Existe_Coluna_bln(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Obs")));
    EXPECT_FALSE(
        Adiciona_Coluna(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Obs TEXT")));
    EXPECT_FALSE(Ver_Se_Existe_Tabela_bln(sessao, nullptr, QStringLiteral("LockLinRecMesa1")));
}

TEST_F(QueryHelpers, RecordsetVazio) {
    auto vazio = sessao.gConn.exec(QStringLiteral("select * from Artigos"));
    ASSERT_TRUE(vazio);
    EXPECT_TRUE(RecordsetVazio_bln(*vazio));
    insere(QStringLiteral("A1"), QStringLiteral("Pão"));
    auto cheio = sessao.gConn.exec(QStringLiteral("select Codigo from Artigos"));
    ASSERT_TRUE(cheio);
    EXPECT_FALSE(RecordsetVazio_bln(*cheio));
    EXPECT_EQ(cheio->value(0).toString(), QStringLiteral("A1"));  // left on the first row
    QSqlQuery inactiva;
    EXPECT_TRUE(RecordsetVazio_bln(inactiva));
}

TEST_F(QueryHelpers, NextCodes) {
    EXPECT_EQ(ProximoCodigoNumerico(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
              QStringLiteral("1"));
    EXPECT_EQ(
        GetProximoCodigo(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
        QStringLiteral("1"));
    for (const char* codigo : {"9", "10", "abc", "7x", " 12 ", "-3", "+-4"}) {
        insere(QString::fromLatin1(codigo), QStringLiteral("d"));
    }
    // Numeric codes compare by value: 12 is the largest, "abc" and "7x" are not numbers.
    EXPECT_EQ(ProximoCodigoNumerico(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
              QStringLiteral("13"));
    EXPECT_EQ(ProximoCodigoNumerico(sessao, QStringLiteral("Artigos"), QStringLiteral("Codigo"),
                                    {QStringLiteral("and Codigo<>?"), {QStringLiteral(" 12 ")}}),
              QStringLiteral("11"));
    // The largest code as stored text is "abc", which reads as 0.
    EXPECT_EQ(
        GetProximoCodigo(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
        QStringLiteral("1"));
    ASSERT_TRUE(
        sessao.gConn.exec(QStringLiteral("delete from Artigos where Codigo in ('abc','7x')")));
    EXPECT_EQ(
        GetProximoCodigo(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
        QStringLiteral("10"));
}

TEST_F(QueryHelpers, ServerTimeAndDateText) {
    const QDateTime antes = QDateTime::currentDateTime().addSecs(-2);
    const QDateTime servidor = Get_DataSysServer(sessao);
    EXPECT_GE(servidor, antes);
    EXPECT_LE(servidor, QDateTime::currentDateTime().addSecs(2));
    EXPECT_EQ(Get_DataServer(sessao), servidor.toString(QStringLiteral("dd-MM-yyyy")));
    EXPECT_EQ(Get_DataSysServer_InsertIntoSQL(sessao).size(), 19);
    sessao.gConn.close();
    EXPECT_TRUE(Get_DataSysServer(sessao).isValid());  // the workstation's clock

    ASSERT_TRUE(Abre_Connexao_Local(sessao, sessao.gConn, 0, 60));
    insere(QStringLiteral("A1"), QStringLiteral("Pão"));
    const auto linha = primeiraLinha(
        sessao.gConn, QStringLiteral("select ") + Select_Retorna_GData(QStringLiteral("Data")) +
                          QStringLiteral(" from Artigos"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(QStringLiteral("DataM")).toString(), QStringLiteral("07-03-2026"));
}

TEST_F(QueryHelpers, TransactionGuardRollsBackUnlessCommitted) {
    {
        WriteTransaction tx(sessao.gConn);
        ASSERT_TRUE(tx.active());
        insere(QStringLiteral("X"), QStringLiteral("perdido"));
        // Transactions are never nested.
        WriteTransaction outra(sessao.gConn);
        EXPECT_FALSE(outra.active());
    }
    EXPECT_EQ(
        GetProximoCodigo(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
        QStringLiteral("1"));
    {
        WriteTransaction tx(sessao.gConn);
        insere(QStringLiteral("5"), QStringLiteral("guardado"));
        EXPECT_TRUE(tx.commit());
    }
    EXPECT_EQ(
        GetProximoCodigo(sessao, nullptr, QStringLiteral("Artigos"), QStringLiteral("Codigo")),
        QStringLiteral("6"));
}

}  // namespace
}  // namespace brasel::db
