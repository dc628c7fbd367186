// brasel-admin as a person runs it: its exit codes, its messages and what it leaves in an
// embedded server folder.
#include "admin/programa_admin.h"
#include "app/definicoes_posto.h"
#include "common/versao.h"
#include "db/connection.h"
#include "db/sessao.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::admin {
namespace {

// The arguments of a company command on `servidor` as the supervisor of the demo.
QStringList empresa(const char* comando, const QString& servidor) {
    return {QString::fromLatin1(comando), QStringLiteral("--server"),   servidor,
            QStringLiteral("--company"),  QStringLiteral("0001"),       QStringLiteral("--login"),
            QStringLiteral("SUPERVISOR"), QStringLiteral("--password"), QStringLiteral("s3gr'edo")};
}

// Runs a statement on the company as the supervisor.
bool executa(const QString& servidor, const QString& sql) {
    db::Connection conn;
    db::ConnectionParams p;
    p.server = *db::ServerAddress::parse(servidor);
    p.baseDados = db::nomeBaseDados(QStringLiteral("0001"));
    p.login = QStringLiteral("SUPERVISOR");
    p.password = QStringLiteral("s3gr'edo");
    p.autenticacao = QStringLiteral("SQL");
    p.semPooling = true;
    return conn.open(p) && conn.exec(sql).has_value();
}

class Admin : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_TRUE(QFileInfo::exists(programaAdmin())) << programaAdmin().toStdString();
    }
    QStringList empresa(const char* comando) { return admin::empresa(comando, pasta.path()); }

    QTemporaryDir pasta;
};

TEST_F(Admin, UsageMistakesExitWithTwoAndSayWhat) {
    struct Caso {
        QStringList argumentos;
        int codigo;
        const char* mensagem;
    };
    const QString p = pasta.path();
    const Caso casos[] = {
        {{}, 2, "Falta o comando"},
        {{QStringLiteral("--help")}, 0, "Utilização: brasel-admin"},
        {{QStringLiteral("check"), QStringLiteral("--help")}, 0, "create-login"},
        {{QStringLiteral("apagar")}, 2, "Comando desconhecido: apagar"},
        {{QStringLiteral("check"), QStringLiteral("--server"), p}, 2, "Falta a opção --company"},
        {{QStringLiteral("check"), QStringLiteral("--server")},
         2,
         "Falta o valor da opção --server"},
        {{QStringLiteral("create"), QStringLiteral("--sysadmin")}, 2, "não se aplica"},
        {{QStringLiteral("check"), QStringLiteral("--server="), QStringLiteral("--company=0001"),
          QStringLiteral("--login=A"), QStringLiteral("--password=B")},
         2,
         "Servidor inválido"},
        {{QStringLiteral("check"), QStringLiteral("--server"), p, QStringLiteral("--company=01"),
          QStringLiteral("--login=A"), QStringLiteral("--password=B")},
         2,
         "Código de empresa inválido"},
        {{QStringLiteral("create"), QStringLiteral("--server"), p, QStringLiteral("--company=0'01"),
          QStringLiteral("--login=A"), QStringLiteral("--password=B")},
         2,
         "Código de empresa inválido"},
    };
    for (const Caso& c : casos) {
        const Resultado r = correrAdmin(c.argumentos);
        EXPECT_EQ(r.codigo, c.codigo) << c.argumentos.join(QLatin1Char(' ')).toStdString();
        EXPECT_TRUE((r.saida + r.erros).contains(QString::fromUtf8(c.mensagem)))
            << c.argumentos.join(QLatin1Char(' ')).toStdString() << "\n"
            << (r.saida + r.erros).toStdString();
    }
}

TEST_F(Admin, DemoOnAFreshFolderIsReportedComplete) {
    Resultado r = correrAdmin(empresa("demo"));
    ASSERT_EQ(r.codigo, 0) << r.erros.toStdString();
    EXPECT_TRUE(r.saida.contains(QStringLiteral("Foi criado o login SUPERVISOR (administrador).")));
    EXPECT_TRUE(QFileInfo::exists(pasta.filePath(QStringLiteral("Vendrola0001.sqlite"))));

    r = correrAdmin(empresa("check"));
    EXPECT_EQ(r.codigo, 0) << r.erros.toStdString();
    EXPECT_TRUE(
        r.saida.contains(QStringLiteral("Empresa 0001 completa: versão ") + versaoTexto12()));

    // The waiters log in with the same password (no --demo-password was given).
    QStringList comoAna = empresa("check");
    comoAna[6] = QStringLiteral("ANA");
    EXPECT_EQ(correrAdmin(comoAna).codigo, 0);

    // A second load would duplicate the restaurant.
    r = correrAdmin(empresa("demo"));
    EXPECT_EQ(r.codigo, 1);
    EXPECT_TRUE(r.erros.contains(QStringLiteral("já tem dados")));
}

TEST_F(Admin, CheckNamesWhatIsMissingAndUpgradeMendsTheSchema) {
    struct Caso {
        QString estrago;
        const char* mensagem;
        int saidaUpgrade;
        bool resolvido;
    };
    const Caso casos[] = {
        {QStringLiteral("alter table Clientes drop column TipoCli"),
         "Falta a coluna Clientes.TipoCli", 0, true},
        {QStringLiteral("drop table PontosCreditos"), "Falta a tabela PontosCreditos", 0, true},
        {QStringLiteral("update Actualiza set Versao='000000010000'"),
         "Requer que seja efectuada a Actualização", 0, true},
        // A newer program's database is not touched.
        {QStringLiteral("update Actualiza set Versao='999900000000'"), "Encontra-se Desactualizada",
         1, false},
        {QStringLiteral("delete from localizacao"), "Não tem Localizações definidas!", 0, false},
        {QStringLiteral("delete from utilconfgeral where utilizador='03'"),
         "Tem que Configurar o Utilizador -> 03 !", 0, false},
        {QStringLiteral("update Utilizador set Login='PEDRO' where Codigo='02'"),
         "O utilizador 02 (PEDRO) não tem login no servidor.", 0, false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.estrago.toStdString());
        QTemporaryDir servidor;
        ASSERT_EQ(correrAdmin(admin::empresa("demo", servidor.path())).codigo, 0);
        ASSERT_TRUE(executa(servidor.path(), c.estrago));
        Resultado r = correrAdmin(admin::empresa("check", servidor.path()));
        EXPECT_EQ(r.codigo, 1);
        EXPECT_TRUE(r.erros.contains(QString::fromUtf8(c.mensagem))) << r.erros.toStdString();
        EXPECT_TRUE(r.erros.contains(QStringLiteral("A empresa 0001 não está completa.")));
        r = correrAdmin(admin::empresa("upgrade", servidor.path()));
        EXPECT_EQ(r.codigo, c.saidaUpgrade) << r.erros.toStdString();
        EXPECT_EQ(correrAdmin(admin::empresa("check", servidor.path())).codigo == 0, c.resolvido);
    }
}

TEST_F(Admin, LoginsAndCompaniesNeedAnAdministrator) {
    const QString p = pasta.path();
    auto login = [&](const QString& nome, const QString& pw, const QStringList& extra) {
        QStringList a{QStringLiteral("create-login"),
                      QStringLiteral("--server"),
                      p,
                      QStringLiteral("--login"),
                      nome,
                      QStringLiteral("--password"),
                      pw};
        return correrAdmin(a + extra);
    };
    // The first login of a folder is its administrator; later ones need one.
    EXPECT_EQ(login(QStringLiteral("CHEFE"), QStringLiteral("c"), {}).codigo, 0);
    EXPECT_EQ(login(QStringLiteral("EMPREGADO"), QStringLiteral("e"), {}).codigo, 2);
    EXPECT_EQ(login(QStringLiteral("EMPREGADO"), QStringLiteral("e"),
                    {QStringLiteral("--admin-login"), QStringLiteral("CHEFE"),
                     QStringLiteral("--admin-password"), QStringLiteral("errada")})
                  .codigo,
              1);
    EXPECT_EQ(login(QStringLiteral("EMPREGADO"), QStringLiteral("e"),
                    {QStringLiteral("--admin-login"), QStringLiteral("CHEFE"),
                     QStringLiteral("--admin-password"), QStringLiteral("c")})
                  .codigo,
              0);
    EXPECT_EQ(login(QStringLiteral("um;drop"), QStringLiteral("e"),
                    {QStringLiteral("--admin-login"), QStringLiteral("CHEFE"),
                     QStringLiteral("--admin-password"), QStringLiteral("c")})
                  .codigo,
              1);

    auto criar = [&](const QString& nome, const QString& pw) {
        return correrAdmin({QStringLiteral("create"), QStringLiteral("--server"), p,
                            QStringLiteral("--company"), QStringLiteral("0002"),
                            QStringLiteral("--login"), nome, QStringLiteral("--password"), pw,
                            QStringLiteral("--name"), QStringLiteral("Café d'Ali")});
    };
    Resultado r = criar(QStringLiteral("EMPREGADO"), QStringLiteral("e"));
    EXPECT_EQ(r.codigo, 1);
    EXPECT_TRUE(r.erros.contains(QStringLiteral("não é administrador"))) << r.erros.toStdString();
    EXPECT_FALSE(QFileInfo::exists(QDir(p).filePath(QStringLiteral("Vendrola0002.sqlite"))));
    EXPECT_EQ(criar(QStringLiteral("CHEFE"), QStringLiteral("c")).codigo, 0);
    r = criar(QStringLiteral("CHEFE"), QStringLiteral("c"));
    EXPECT_EQ(r.codigo, 1);
    EXPECT_TRUE(r.erros.contains(QStringLiteral("já existe")));
    // Without the restaurant's configuration the new company is not yet complete.
    r = correrAdmin({QStringLiteral("check"), QStringLiteral("--server"), p,
                     QStringLiteral("--company"), QStringLiteral("0002"), QStringLiteral("--login"),
                     QStringLiteral("EMPREGADO"), QStringLiteral("--password"),
                     QStringLiteral("e")});
    EXPECT_EQ(r.codigo, 1);
    EXPECT_TRUE(r.erros.contains(QStringLiteral("Não tem Localizações definidas!")));
    // A wrong password opens nothing.
    r = correrAdmin({QStringLiteral("check"), QStringLiteral("--server"), p,
                     QStringLiteral("--company"), QStringLiteral("0002"), QStringLiteral("--login"),
                     QStringLiteral("CHEFE"), QStringLiteral("--password"), QStringLiteral("x")});
    EXPECT_EQ(r.codigo, 1);
    EXPECT_TRUE(r.erros.contains(QStringLiteral("Não foi possível abrir a empresa 0002")));
}

}  // namespace
}  // namespace brasel::admin

namespace brasel::admin {
namespace {

TEST(AdminServidores, AddServerKeepsOneEntryPerServerAndAtMostTwenty) {
    QTemporaryDir definicoes;
    qputenv("BRASEL_SETTINGS_DIR", definicoes.path().toUtf8());
    const auto acrescenta = [](const QString& servidor, const QString& password) {
        return correrAdmin({QStringLiteral("add-server"), QStringLiteral("--server"), servidor,
                            QStringLiteral("--login"), QStringLiteral("SUPERVISOR"),
                            QStringLiteral("--password"), password});
    };
    EXPECT_EQ(acrescenta(QStringLiteral("/srv/a"), QStringLiteral("um")).codigo, 0);
    EXPECT_EQ(acrescenta(QStringLiteral("/srv/a"), QStringLiteral("dois, \"três\"")).codigo, 0);
    app::ListaServidores lista = app::lerServidores();
    EXPECT_EQ(lista[0].servidor, QStringLiteral("/srv/a"));
    EXPECT_EQ(lista[0].password(), QStringLiteral("dois, \"três\""));
    EXPECT_FALSE(lista[1].emUso());
    for (int n = 2; n <= 20; ++n) {
        ASSERT_EQ(acrescenta(QStringLiteral("/srv/%1").arg(n), QStringLiteral("x")).codigo, 0);
    }
    const Resultado cheio = acrescenta(QStringLiteral("/srv/21"), QStringLiteral("x"));
    EXPECT_EQ(cheio.codigo, 1);
    EXPECT_TRUE(cheio.erros.contains(QStringLiteral("vinte")));
    EXPECT_EQ(correrAdmin({QStringLiteral("add-server"), QStringLiteral("--server"),
                           QStringLiteral("/srv/a"), QStringLiteral("--auth"),
                           QStringLiteral("KERBEROS")})
                  .codigo,
              2);
    qunsetenv("BRASEL_SETTINGS_DIR");
}

}  // namespace
}  // namespace brasel::admin
