// Opening company databases on the embedded engine: authentication, logins, names and the
// engine's own time-outs.
#include "common/cls_encripta.h"
#include "db/connections.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"
#include "db/sysadmin.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>
#include "support/impressao_qt.h"

namespace brasel::db {
namespace {

class Ligacoes : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_TRUE(pasta.isValid());
        MasterLogins logins(pasta.path());
        ASSERT_TRUE(logins.criar(QStringLiteral("Ana"), QStringLiteral("segredo'1"), false));
        ASSERT_TRUE(logins.criar(QStringLiteral("admin"), QStringLiteral("x"), true));
        ASSERT_TRUE(logins.criar(utilizadorSistema(), QString(), false));
        ConnectionParams p;
        p.server = *ServerAddress::parse(pasta.path());
        p.baseDados = QStringLiteral("Vendrola0001");
        p.criar = true;
        Connection criar;
        ASSERT_TRUE(criar.open(p));
    }

    bool abre(Connection& conn, const QString& login, QString password, const QString& autenticacao,
              const QString& base = QStringLiteral("Vendrola0001")) {
        return Abre_Connexao(conn, pasta.path(), base, login, password, QString(), autenticacao, 0,
                             60);
    }

    QTemporaryDir pasta;
};

TEST_F(Ligacoes, AuthenticationModes) {
    struct Caso {
        const char* login;
        const char* password;
        const char* autenticacao;
        bool abre;
    };
    const Caso casos[] = {
        {"Ana", "segredo'1", "SQL", true},
        {"ANA", "segredo'1", "sql", true},  // logins and the mode compare without case
        {"Ana", "segredo'1", "", true},     // empty is SQL
        {"Ana", "errada", "SQL", false},
        {"Rui", "segredo'1", "SQL", false},  // no such login
        {"Ana", "segredo'1", "XYZ", false},  // an unknown mode opens nothing
        {"qualquer", "", "win", true},       // the system user, whatever login is typed
    };
    for (const Caso& c : casos) {
        Connection conn;
        EXPECT_EQ(abre(conn, QString::fromLatin1(c.login), QString::fromLatin1(c.password),
                       QString::fromLatin1(c.autenticacao)),
                  c.abre)
            << c.login << " " << c.autenticacao;
        EXPECT_EQ(conn.isOpen(), c.abre);
    }
}

TEST_F(Ligacoes, EmptyServerAndMissingCompanyRefused) {
    Connection conn;
    QString password = QStringLiteral("x");
    EXPECT_FALSE(Abre_Connexao(conn, QStringLiteral("   "), QStringLiteral("Vendrola0001"),
                               QStringLiteral("admin"), password, {}, QStringLiteral("SQL"), 0,
                               60));
    EXPECT_FALSE(abre(conn, QStringLiteral("admin"), QStringLiteral("x"), QStringLiteral("SQL"),
                      QStringLiteral("Vendrola0002")));
    // A failed open leaves no file behind: the company was not created by trying it.
    EXPECT_FALSE(QFileInfo::exists(sqliteFilePath(pasta.path(), QStringLiteral("Vendrola0002"))));
}

TEST_F(Ligacoes, EncryptedPasswordIsDecryptedIntoTheArgument) {
    const QString cifrada =
        clsEncripta::Encripta(0, clsEncripta::chaveEmpresas(), QStringLiteral("segredo'1"));
    QString password;
    Connection conn;
    EXPECT_TRUE(Abre_Connexao(conn, pasta.path(), QStringLiteral("Vendrola0001"),
                              QStringLiteral("Ana"), password, cifrada, QStringLiteral("SQL"), 0,
                              60));
    EXPECT_EQ(password, QStringLiteral("segredo'1"));
}

TEST_F(Ligacoes, CompanyNamesAreTwelveCharacters) {
    EXPECT_EQ(nomeBaseDados(QStringLiteral("0001")), QStringLiteral("Vendrola0001"));
    EXPECT_EQ(codigoEmpresa(QStringLiteral("Vendrola0001")), QStringLiteral("0001"));
    EXPECT_EQ(codigoEmpresa(QStringLiteral("vendrolaABCD")), QStringLiteral("ABCD"));
    EXPECT_EQ(codigoEmpresa(QStringLiteral("Vendrola001")), QString());
    EXPECT_EQ(codigoEmpresa(QStringLiteral("Vendrola00012")), QString());
    EXPECT_EQ(codigoEmpresa(QStringLiteral("Outra0000001")), QString());
}

TEST_F(Ligacoes, ServerTextChoosesTheEngine) {
    EXPECT_FALSE(ServerAddress::parse(QStringLiteral("")));
    EXPECT_EQ(ServerAddress::parse(QStringLiteral("/srv/brasel"))->engine, Engine::Sqlite);
    EXPECT_EQ(ServerAddress::parse(QStringLiteral("sqlite:/srv/b"))->folder,
              QStringLiteral("/srv/b"));
    const auto pg = ServerAddress::parse(QStringLiteral("postgresql://db.local:5433"));
    ASSERT_TRUE(pg);
    EXPECT_EQ(pg->engine, Engine::Postgres);
    EXPECT_EQ(pg->host, QStringLiteral("db.local"));
    EXPECT_EQ(pg->port, 5433);
    EXPECT_EQ(ServerAddress::parse(QStringLiteral("postgresql://db"))->port, 5432);
}

TEST_F(Ligacoes, LocalConnectionUsesTheSessionCredentials) {
    Sessao sessao;
    sessao.gServidor = pasta.path();
    sessao.gEmpresa = QStringLiteral("0001");
    sessao.gLogin = QStringLiteral("admin");
    sessao.gPassword = QStringLiteral("x");
    sessao.gAutenticacao = QStringLiteral("SQL");
    Connection semPool;
    EXPECT_TRUE(Abre_Connexao_Local(sessao, semPool, 0, 60, true));
    EXPECT_TRUE(semPool.params().semPooling);
    EXPECT_TRUE(loginSysAdmin(semPool));
    EXPECT_TRUE(Fecha_Conneccao(semPool));
    EXPECT_FALSE(semPool.isOpen());
    sessao.gLogin = QStringLiteral("Ana");
    sessao.gPassword = QStringLiteral("segredo'1");
    Connection conn;
    EXPECT_TRUE(Abre_Connexao_Local(sessao, conn, 0, 60));
    EXPECT_FALSE(loginSysAdmin(conn));
}

TEST_F(Ligacoes, PooledSessionIsReusedAndStillWorks) {
    Connection a;
    ASSERT_TRUE(abre(a, QStringLiteral("admin"), QStringLiteral("x"), QStringLiteral("SQL")));
    ASSERT_TRUE(a.exec(QStringLiteral("create table T (x TEXT)")));
    const QString nome = a.database().connectionName();
    a.close();
    Connection b;
    ASSERT_TRUE(abre(b, QStringLiteral("admin"), QStringLiteral("x"), QStringLiteral("SQL")));
    EXPECT_EQ(b.database().connectionName(), nome);
    EXPECT_TRUE(b.exec(QStringLiteral("insert into T values (?)"), {QStringLiteral("ok")}));
    // Another password never takes a pooled session.
    Connection c;
    EXPECT_FALSE(abre(c, QStringLiteral("admin"), QStringLiteral("y"), QStringLiteral("SQL")));
}

}  // namespace
}  // namespace brasel::db
