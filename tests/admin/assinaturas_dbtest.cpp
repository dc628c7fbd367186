// brasel-admin's signing-key commands as a person runs them: a demo key made once, and the check
// of every signature chain of a company by an auditor who holds only the public key.
#include "admin/programa_admin.h"
#include "documents/assinatura_teste.h"
#include "documents/chave_assinatura.h"
#include "support/empresa_teste.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::admin {
namespace {

using documents::teste::assinaEGrava;

class AdminAssinaturas : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_TRUE(QFileInfo::exists(programaAdmin())) << programaAdmin().toStdString();
    }
    QString chave() const { return QDir(pasta.path()).filePath(QStringLiteral("demo.key")); }
    QStringList verificar(const QStringList& chaveUsada) const {
        return QStringList{QStringLiteral("verify-signatures"),
                           QStringLiteral("--server"),
                           empresa_.pasta(),
                           QStringLiteral("--company"),
                           QStringLiteral("0001"),
                           QStringLiteral("--login"),
                           testing::EmpresaTeste::login(),
                           QStringLiteral("--password"),
                           testing::EmpresaTeste::password()} +
               chaveUsada;
    }

    QTemporaryDir pasta;
    testing::EmpresaTeste empresa_;
    app::Estado& e = empresa_.estado();
};

TEST_F(AdminAssinaturas, GenerateKeyWritesTheKeyAndItsPublicHalfOnce) {
    const Resultado r =
        correrAdmin({QStringLiteral("generate-key"), QStringLiteral("--file"), chave()});
    ASSERT_EQ(r.codigo, 0) << r.erros.toStdString();
    EXPECT_TRUE(r.saida.contains(chave()));
    ASSERT_TRUE(documents::CarregaChave(chave()));
    EXPECT_TRUE(documents::ChaveRsa::doPemPublico(documents::ficheiroPemPublico(chave())));

    const Resultado outra =
        correrAdmin({QStringLiteral("generate-key"), QStringLiteral("--file"), chave()});
    EXPECT_EQ(outra.codigo, 1);
    EXPECT_TRUE(outra.erros.contains(QStringLiteral("já existe")));
    EXPECT_EQ(correrAdmin({QStringLiteral("generate-key")}).codigo, 2);
}

TEST_F(AdminAssinaturas, VerifySignaturesReportsTheFirstBrokenLinkOfEachChain) {
    ASSERT_EQ(
        correrAdmin({QStringLiteral("generate-key"), QStringLiteral("--file"), chave()}).codigo, 0);
    e.config.ficheiroChave = chave();
    e.config.numeroCertificado = QStringLiteral("0000");
    documents::teste::criaTipos(e.gConn);
    for (const char* n : {"00000001", "00000002", "00000003", "00000004"}) {
        ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QString::fromLatin1(n),
                                 QStringLiteral("2026-02-01"), QStringLiteral("10"))
                        .ok);
        ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("FS"), QString::fromLatin1(n),
                                 QStringLiteral("2026-02-01"), QStringLiteral("10"))
                        .ok);
    }
    ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("NS"), QStringLiteral("00000001"),
                             QStringLiteral("2026-02-01"), QStringLiteral("10"))
                    .ok);
    ASSERT_TRUE(assinaEGrava(e, e.gConn, QStringLiteral("VF"), QStringLiteral("00000001"),
                             QStringLiteral("2026-02-01"), QStringLiteral("10"), u'F')
                    .ok);
    const QStringList publica{QStringLiteral("--public"), documents::ficheiroPemPublico(chave())};

    const Resultado bom = correrAdmin(verificar(publica));
    EXPECT_EQ(bom.codigo, 0) << bom.erros.toStdString();
    EXPECT_TRUE(bom.saida.contains(QStringLiteral("9 documentos assinados conferem")))
        << bom.saida.toStdString();
    EXPECT_EQ(correrAdmin(verificar({QStringLiteral("--key"), chave()})).codigo, 0);

    // A total changed in FR1 and a signature changed in the supplier chain.
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("update MovCliente set TotalDoc=11 where Tipo='FR1' and "
                                    "Numero in ('00000002','00000004')")));
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update MovFornece set Hash='x' || Hash")));
    const Resultado mau = correrAdmin(verificar(publica));
    EXPECT_EQ(mau.codigo, 1);
    EXPECT_TRUE(mau.erros.contains(QStringLiteral("Tipo FR1 2026: documento 00000002 não confere")))
        << mau.erros.toStdString();
    EXPECT_FALSE(mau.erros.contains(QStringLiteral("00000004"))) << mau.erros.toStdString();
    EXPECT_FALSE(mau.erros.contains(QStringLiteral("Tipo FS")));
    EXPECT_TRUE(
        mau.erros.contains(QStringLiteral("Fornecedores, tipo VF 2026: documento 00000001")));
}

TEST_F(AdminAssinaturas, VerifySignaturesNeedsOneUsableKeyAndTheCompany) {
    ASSERT_EQ(
        correrAdmin({QStringLiteral("generate-key"), QStringLiteral("--file"), chave()}).codigo, 0);
    const QString pem = documents::ficheiroPemPublico(chave());
    const QStringList casos[] = {
        {},
        {QStringLiteral("--public"), pem, QStringLiteral("--key"), chave()},
        {QStringLiteral("--public"), chave()},
        {QStringLiteral("--key"), pem},
        {QStringLiteral("--public"), QDir(pasta.path()).filePath(QStringLiteral("nada.pem"))},
    };
    for (const QStringList& c : casos)
        EXPECT_EQ(correrAdmin(verificar(c)).codigo, 2) << c.join(u' ').toStdString();
    QStringList outraEmpresa = verificar({QStringLiteral("--public"), pem});
    outraEmpresa[4] = QStringLiteral("0002");
    EXPECT_EQ(correrAdmin(outraEmpresa).codigo, 2);
}

}  // namespace
}  // namespace brasel::admin
