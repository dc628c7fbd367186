// The supervisor's first login on a PostgreSQL server without its role: the role is made with
// the password typed (quotes and all), may administer the server, and reaches the company.
#include "app/login.h"
#include "common/ediv.h"
#include "db/connections.h"
#include "db/schema/servidor.h"
#include "support/apoio_arranque.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>
#include <QThread>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

// The role is one for the whole server: the tests that make it take turns.
const QString kVezPapelSupervisor =
    QStringLiteral("select pg_advisory_lock(hashtext('brasel supervisor'))");

class LoginPg : public ::testing::Test {
  protected:
    void SetUp() override {
        const auto pg = testing::servidorPg();
        if (!pg) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        servidor = *pg;
        QString password = servidor.password;
        ASSERT_TRUE(db::Abre_Connexao(master, servidor.servidor, QStringLiteral("Master"),
                                      servidor.login, password, {}, QStringLiteral("SQL"), 30, 10,
                                      true))
            << master.lastError().toStdString();
        ASSERT_TRUE(master.exec(kVezPapelSupervisor));
        // Another test may be using the role for a while; a server that keeps one cannot show
        // the first login.
        for (int espera = 0; existePapel() && espera < 120; ++espera)
            QThread::msleep(500);
        if (existePapel()) GTEST_SKIP() << "o servidor já tem o papel supervisor";
        meuPapel = true;
        empresa = QStringLiteral("L%1").arg(QCoreApplication::applicationPid() % 1000, 3, 10,
                                            QLatin1Char('0'));
        apagarEmpresa();
        QString erro;
        ASSERT_TRUE(db::schema::criarEmpresa(*db::ServerAddress::parse(servidor.servidor),
                                             {servidor.login, servidor.password}, empresa,
                                             QStringLiteral("Teste"), &erro))
            << erro.toStdString();
    }

    void TearDown() override {
        fecharLigacoes(estado);
        if (!master.isOpen()) return;
        if (meuPapel) {
            apagarEmpresa();
            master.exec(QStringLiteral("DROP ROLE IF EXISTS supervisor"));
        }
        master.close();
    }

    bool existePapel() {
        return master.firstRow(QStringLiteral("select 1 from pg_roles where rolname='supervisor'"))
            .has_value();
    }
    void apagarEmpresa() {
        master.exec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)")
                        .arg(db::nomeBaseDados(empresa).toLower()));
    }

    testing::DefinicoesTemporarias definicoes;
    testing::ServidorPg servidor;
    db::Connection master;
    bool meuPapel = false;
    QString empresa;
    Estado estado;
    testing::MensagensGravadas m;
};

TEST_F(LoginPg, SupervisorRoleIsCreatedWithThePasswordTyped) {
    estado.gServidor = servidor.servidor;
    estado.gEmpresa = empresa;
    estado.gLogin = servidor.login;
    estado.gPassword = servidor.password;
    estado.gAutenticacao = QStringLiteral("SQL");
    const QString typed = QStringLiteral("it's \"new\"; drop role x --\\");

    EXPECT_EQ(validarLogin(estado, QStringLiteral("supervisor"), typed, {}, m),
              ResultadoLogin::Entrou);
    EXPECT_EQ(m.textos(),
              QStringList{QStringLiteral("Foi criado o Utilizador SUPERVISOR no SQL.")});
    const auto papel = master.firstRow(QStringLiteral(
        "select rolcanlogin, rolcreatedb, rolcreaterole from pg_roles where rolname='supervisor'"));
    ASSERT_TRUE(papel);
    EXPECT_TRUE(papel->value(0).toBool() && papel->value(1).toBool() && papel->value(2).toBool());
    EXPECT_EQ(estado.gUtilizador, QStringLiteral("01"));
    EXPECT_TRUE(estado.gConn.isOpen() && estado.gConnAux.isOpen() && estado.gConnLocks.isOpen());
    const auto quem = estado.gConn.firstRow(QStringLiteral("select current_user"));
    ASSERT_TRUE(quem);
    EXPECT_EQ(quem->value(0).toString(), QStringLiteral("supervisor"));
    const auto linha = estado.gConn.firstRow(
        QStringLiteral("select Login, Password, UsoPOS from Utilizador where Codigo='01'"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toString(), QStringLiteral("Supervisor"));
    EXPECT_EQ(linha->value(1).toString(), EDiv::Encrypt(typed));
    EXPECT_EQ(linha->value(2).toInt(), 1);

    // The password typed is the role's: another one is refused without a word.
    fecharLigacoes(estado);
    m.limpar();
    EXPECT_EQ(validarLogin(estado, QStringLiteral("SUPERVISOR"), QStringLiteral("it's"), {}, m),
              ResultadoLogin::PasswordErrada);
    EXPECT_TRUE(m.mensagens().isEmpty());
}

}  // namespace
}  // namespace brasel::app
