// The company schema and the demo restaurant on a PostgreSQL server, made and checked by
// brasel-admin as on the embedded engine, then dropped.
#include "admin/programa_admin.h"
#include "common/versao.h"
#include "db/connections.h"
#include "db/schema/esquema.h"
#include "db/schema/servidor.h"
#include "db/sessao.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace brasel::db::schema {
namespace {

const QString kPasswordDemo = QStringLiteral("demo'pw");

class EsquemaPg : public ::testing::Test {
  protected:
    void SetUp() override {
        const auto pg = testing::servidorPg();
        if (!pg) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        servidor = *pg;
        empresa = QStringLiteral("S%1").arg(QCoreApplication::applicationPid() % 1000, 3, 10,
                                            QLatin1Char('0'));
        QString password = servidor.password;
        ASSERT_TRUE(Abre_Connexao(master, servidor.servidor, QStringLiteral("Master"),
                                  servidor.login, password, {}, QStringLiteral("SQL"), 30, 10,
                                  true))
            << master.lastError().toStdString();
        apagarEmpresa();
        for (const char* papel : {"supervisor", "ana", "rui"}) {
            if (!master.firstRow(QStringLiteral("select 1 from pg_roles where rolname=?"),
                                 {QLatin1String(papel)})) {
                papeisNovos << QLatin1String(papel);
            }
        }
    }

    void TearDown() override {
        if (!master.isOpen()) return;
        apagarEmpresa();
        for (const QString& papel : papeisNovos)
            master.exec(QStringLiteral("DROP ROLE IF EXISTS ") + papel);
    }

    void apagarEmpresa() {
        master.exec(QStringLiteral("DROP DATABASE IF EXISTS %1 WITH (FORCE)")
                        .arg(nomeBaseDados(empresa).toLower()));
    }

    QStringList argumentos(const char* comando, const QString& login, const QString& password) {
        return {QString::fromLatin1(comando),
                QStringLiteral("--server"),
                servidor.servidor,
                QStringLiteral("--company"),
                empresa,
                QStringLiteral("--login"),
                login,
                QStringLiteral("--password"),
                password};
    }

    testing::ServidorPg servidor;
    QString empresa;
    QStringList papeisNovos;
    Connection master;
};

TEST_F(EsquemaPg, DemoCompanyIsBuiltAndReportedCompleteForAdministratorAndWaiter) {
    admin::Resultado r = admin::correrAdmin(argumentos("demo", servidor.login, servidor.password)
                                            << QStringLiteral("--demo-password") << kPasswordDemo);
    ASSERT_EQ(r.codigo, 0) << r.erros.toStdString();
    r = admin::correrAdmin(argumentos("check", servidor.login, servidor.password));
    EXPECT_EQ(r.codigo, 0) << r.erros.toStdString();
    EXPECT_TRUE(r.saida.contains(QStringLiteral("completa: versão ") + versaoTexto12()));
    // A waiter's login reaches every table the group owns.
    r = admin::correrAdmin(argumentos("check", QStringLiteral("ANA"), kPasswordDemo));
    EXPECT_EQ(r.codigo, 0) << r.erros.toStdString();
    r = admin::correrAdmin(argumentos("check", QStringLiteral("ANA"), QStringLiteral("errada")));
    EXPECT_EQ(r.codigo, 1);
}

TEST_F(EsquemaPg, KeysQuotesAndUpgradeBehaveAsOnTheEmbeddedEngine) {
    const ServerAddress endereco = *ServerAddress::parse(servidor.servidor);
    const Credenciais admin{servidor.login, servidor.password};
    QString erro;
    ASSERT_TRUE(criarEmpresa(endereco, admin, empresa, QStringLiteral("Casa d'Ouro"), &erro))
        << erro.toStdString();
    EXPECT_FALSE(criarEmpresa(endereco, admin, empresa, {}, &erro));
    EXPECT_TRUE(erro.contains(QStringLiteral("já existe")));

    Connection conn;
    ASSERT_TRUE(abrirEmpresa(conn, endereco, admin, empresa, &erro)) << erro.toStdString();
    EXPECT_TRUE(verificarEsquema(conn).isEmpty());
    EXPECT_EQ(versaoBaseDados(conn), versaoTexto12());
    EXPECT_EQ(
        conn.firstRow(QStringLiteral("select NomeEmpresa from ParamGeral"))->value(0).toString(),
        QStringLiteral("Casa d'Ouro"));

    const QString insercao =
        QStringLiteral("insert into MovCliente (Tipo, Numero, Ano, Descricao) values (?,?,?,?)");
    EXPECT_TRUE(
        conn.exec(insercao, {QStringLiteral("VD"), QStringLiteral("00000001"),
                             QStringLiteral("2026"), QStringLiteral("'); drop table x; --")}));
    EXPECT_FALSE(conn.exec(insercao, {QStringLiteral("VD"), QStringLiteral("00000001"),
                                      QStringLiteral("2026"), QStringLiteral("b")}));
    EXPECT_EQ(
        conn.firstRow(QStringLiteral("select Descricao from MovCliente"))->value(0).toString(),
        QStringLiteral("'); drop table x; --"));
    // Flags answer to 1 and "1"; defaults fill what an insert leaves out.
    ASSERT_TRUE(
        conn.exec(QStringLiteral("insert into Produtos (Codigo, ImpCopa) values ('K', ?)"), {1}));
    EXPECT_TRUE(conn.firstRow(QStringLiteral("select 1 from Produtos where ImpCopa=? and Lote=''"),
                              {QStringLiteral("1")}));

    ASSERT_TRUE(conn.exec(QStringLiteral("alter table Produtos drop column Pesagem")));
    QStringList alteracoes;
    ASSERT_TRUE(actualizarEsquema(conn, &alteracoes, &erro)) << erro.toStdString();
    EXPECT_EQ(alteracoes, QStringList{QStringLiteral("Coluna acrescentada: Produtos.Pesagem")});
    EXPECT_TRUE(verificarEsquema(conn).isEmpty());
}

}  // namespace
}  // namespace brasel::db::schema
