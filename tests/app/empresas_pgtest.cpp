// The company list of a PostgreSQL server: read-only and offline companies are marked.
#include "app/empresas.h"
#include "common/cls_encripta.h"
#include "db/connections.h"
#include "support/impressao_qt.h"
#include "support/servidor_pg.h"

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

TEST(CompanyListPg, ReadOnlyAndOfflineCompaniesAreMarked) {
    const auto pg = testing::servidorPg();
    if (!pg) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
    db::Connection master;
    QString password = pg->password;
    ASSERT_TRUE(db::Abre_Connexao(master, pg->servidor, QStringLiteral("Master"), pg->login,
                                  password, {}, QStringLiteral("SQL"), 30, 10, true));
    for (const char* nome : {"vendrolat801", "vendrolat802", "vendrolat803"}) {
        master.exec(QStringLiteral("drop database if exists ") + QLatin1String(nome));
        ASSERT_TRUE(master.exec(QStringLiteral("create database ") + QLatin1String(nome)));
    }
    ASSERT_TRUE(master.exec(
        QStringLiteral("alter database vendrolat802 set default_transaction_read_only=on")));
    ASSERT_TRUE(master.exec(QStringLiteral("alter database vendrolat803 allow_connections false")));
    const QList<LinhaEmpresa> linhas = Empresa_Validacoes::Carregar_Empresas_LVW(
        pg->servidor, pg->login,
        clsEncripta::Encripta(0, clsEncripta::chaveEmpresas(), pg->password), QStringLiteral("SQL"),
        {}, {});
    QMap<QString, LinhaEmpresa> porCodigo;
    for (const LinhaEmpresa& l : linhas)
        porCodigo.insert(l.codigo, l);
    ASSERT_TRUE(porCodigo.contains(QStringLiteral("T801")));
    EXPECT_FALSE(porCodigo[QStringLiteral("T801")].soLeitura);
    EXPECT_FALSE(porCodigo[QStringLiteral("T801")].desligada);
    EXPECT_TRUE(porCodigo[QStringLiteral("T802")].soLeitura);
    EXPECT_TRUE(porCodigo[QStringLiteral("T802")].nome.endsWith(QStringLiteral(" - (Só Leitura)")));
    EXPECT_TRUE(porCodigo[QStringLiteral("T803")].desligada);
    EXPECT_EQ(porCodigo[QStringLiteral("T803")].nome, QStringLiteral("Desligada"));
    master.exec(QStringLiteral("alter database vendrolat803 allow_connections true"));
    for (const char* nome : {"vendrolat801", "vendrolat802", "vendrolat803"}) {
        master.exec(QStringLiteral("drop database if exists ") + QLatin1String(nome));
    }
}

}  // namespace
}  // namespace brasel::app
