// The company list of an embedded server: names, filters, marks and refused credentials.
#include "app/empresas.h"
#include "common/cls_encripta.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <QFile>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;

QList<LinhaEmpresa> lista(const EmpresaTeste& empresa, const QString& nome = {},
                          const QString& ano = {},
                          const QString& password = EmpresaTeste::password()) {
    return Empresa_Validacoes::Carregar_Empresas_LVW(
        empresa.pasta(), EmpresaTeste::login(),
        clsEncripta::Encripta(0, clsEncripta::chaveEmpresas(), password), QStringLiteral("SQL"),
        nome, ano);
}

TEST(CompanyList, ListsFiltersAndMarks) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update ParamGeral set NomeEmpresa=?, Ano='2026'"),
                             {QStringLiteral("Tasca d'Avó")}));
    // Files that are not companies by their name are left out.
    QFile(empresa.pasta() + QStringLiteral("/Vendrola01.sqlite")).open(QIODevice::WriteOnly);
    QFile(empresa.pasta() + QStringLiteral("/Outra0000002.sqlite")).open(QIODevice::WriteOnly);

    QList<LinhaEmpresa> linhas = lista(empresa);
    ASSERT_EQ(linhas.size(), 1);
    EXPECT_EQ(linhas[0].codigo, QStringLiteral("0001"));
    EXPECT_EQ(linhas[0].nome, QStringLiteral("Tasca d'Avó"));
    EXPECT_EQ(linhas[0].ano, QStringLiteral("2026"));
    EXPECT_FALSE(linhas[0].versao.isEmpty());
    EXPECT_TRUE(linhas[0].tamanho.endsWith(QStringLiteral(" Mb")));

    EXPECT_EQ(lista(empresa, QStringLiteral("avó")).size(), 1);
    EXPECT_EQ(lista(empresa, QStringLiteral("Pizzaria")).size(), 0);
    EXPECT_EQ(lista(empresa, {}, QStringLiteral("2025")).size(), 0);
    EXPECT_EQ(lista(empresa, {}, {}, QStringLiteral("errada")).size(), 0);

    // Without a company name, the first heading line of the warehouses names it.
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update ParamGeral set NomeEmpresa=''")));
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update armazens set linha1=?"),
                             {QStringLiteral("Restaurante Central")}));
    EXPECT_EQ(lista(empresa)[0].nome, QStringLiteral("Restaurante Central"));

    const QString ficheiro = empresa.pasta() + QStringLiteral("/Vendrola0001.sqlite");
    e.gConn.close();
    QFile::setPermissions(ficheiro, QFile::ReadOwner | QFile::ReadUser);
    // The superuser writes everywhere: the marks are then proven on PostgreSQL only.
    if (QFileInfo(ficheiro).isWritable()) return;
    EXPECT_TRUE(lista(empresa)[0].nome.endsWith(QStringLiteral(" - (Só Leitura)")));
    QFile::setPermissions(ficheiro, QFileDevice::Permissions());
    const LinhaEmpresa desligada = lista(empresa)[0];
    EXPECT_EQ(desligada.nome, QStringLiteral("Desligada"));
    EXPECT_TRUE(desligada.desligada);
    QFile::setPermissions(ficheiro, QFile::ReadOwner | QFile::WriteOwner);
}

}  // namespace
}  // namespace brasel::app
