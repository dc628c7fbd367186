#include "common/settings_store.h"
#include "support/apoio_arranque.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel {
namespace {

const QString kBrasel = QStringLiteral("Brasel");
const QString kMontiva = QStringLiteral("Montiva");
const QString kSeccao = QStringLiteral("Brasel");

TEST(ArmazemDefinicoes, ChaveNuncaGravadaDaAOmissao) {
    testing::DefinicoesTemporarias pasta;
    EXPECT_EQ(
        GetSetting(kBrasel, kSeccao, QStringLiteral("ConfigRest_Font"), QStringLiteral("Arial")),
        QStringLiteral("Arial"));
    EXPECT_EQ(GetSetting(kBrasel, kSeccao, QStringLiteral("ConfigRest_Font")), QString());
    // Reading creates nothing: a refused second instance must leave the folder as it was.
    EXPECT_TRUE(QDir(pasta.pasta()).entryList(QDir::Files).isEmpty());
}

// Texts as people and windows type them: each must come back exactly, none may be taken apart
// as a list or a section.
TEST(ArmazemDefinicoes, ValoresVoltamIntactos) {
    testing::DefinicoesTemporarias pasta;
    const QString valores[] = {
        QString(),
        QStringLiteral("   espaços à volta  "),
        QStringLiteral("a,b, c"),
        QStringLiteral("@Variant(x)"),
        QStringLiteral("chave=valor; comentário # não"),
        QStringLiteral("[Secção]"),
        QStringLiteral("aspas \" e 'plicas'"),
        QStringLiteral("C:\\Programas\\Brasel\\fundo.bmp"),
        QStringLiteral("linha 1\nlinha 2"),
        QStringLiteral("ação € 日本"),
    };
    int n = 0;
    for (const QString& v : valores) {
        SCOPED_TRACE(v.toStdString());
        const QString chave = QStringLiteral("Chave%1").arg(++n);
        ASSERT_TRUE(SaveSetting(kBrasel, kSeccao, chave, v));
        EXPECT_EQ(GetSetting(kBrasel, kSeccao, chave, QStringLiteral("omissao")), v);
    }
}

TEST(ArmazemDefinicoes, AplicacoesESeccoesSeparadas) {
    testing::DefinicoesTemporarias pasta;
    const QString chave = QStringLiteral("Servidor1");
    const QString autenticacao = QStringLiteral("Autenticação");
    ASSERT_TRUE(SaveSetting(kMontiva, autenticacao, chave, QStringLiteral("montiva")));
    ASSERT_TRUE(SaveSetting(kBrasel, autenticacao, chave, QStringLiteral("brasel")));
    ASSERT_TRUE(SaveSetting(kBrasel, QStringLiteral("Config"), chave, QStringLiteral("config")));

    EXPECT_EQ(GetSetting(kMontiva, autenticacao, chave), QStringLiteral("montiva"));
    EXPECT_EQ(GetSetting(kBrasel, autenticacao, chave), QStringLiteral("brasel"));
    EXPECT_EQ(GetSetting(kBrasel, QStringLiteral("Config"), chave), QStringLiteral("config"));
    EXPECT_EQ(GetSetting(kMontiva, QStringLiteral("Config"), chave), QString());
    EXPECT_TRUE(QFile::exists(QDir(pasta.pasta()).filePath(QStringLiteral("Brasel.ini"))));
    EXPECT_TRUE(QFile::exists(QDir(pasta.pasta()).filePath(QStringLiteral("Montiva.ini"))));
}

TEST(ArmazemDefinicoes, PastaDaVariavelDeAmbiente) {
    testing::DefinicoesTemporarias posto1;
    const QString chave = QStringLiteral("ConfigRest_CAIXA");
    ASSERT_TRUE(SaveSetting(kBrasel, kSeccao, chave, QStringLiteral("01")));
    EXPECT_EQ(pastaDefinicoes(), posto1.pasta());
    {
        // A second workstation on the same machine sees none of the first one's settings.
        testing::DefinicoesTemporarias posto2;
        EXPECT_EQ(GetSetting(kBrasel, kSeccao, chave), QString());
        ASSERT_TRUE(SaveSetting(kBrasel, kSeccao, chave, QStringLiteral("02")));
    }
    EXPECT_EQ(GetSetting(kBrasel, kSeccao, chave), QStringLiteral("01"));
}

TEST(ArmazemDefinicoes, SemVariavelUsaAPastaDoUtilizador) {
    testing::VariavelAmbiente semPasta("BRASEL_SETTINGS_DIR", QByteArray());
    EXPECT_TRUE(pastaDefinicoes().endsWith(QStringLiteral("/Brasel")));
    EXPECT_GT(pastaDefinicoes().size(), QStringLiteral("/Brasel").size());
}

TEST(ArmazemDefinicoes, ApagarVoltaAOmissao) {
    testing::DefinicoesTemporarias pasta;
    const QString chave = QStringLiteral("NivelEmenta");
    ASSERT_TRUE(SaveSetting(kBrasel, kSeccao, chave, QStringLiteral("TABFAMPRO")));
    ASSERT_TRUE(DeleteSetting(kBrasel, kSeccao, chave));
    EXPECT_EQ(GetSetting(kBrasel, kSeccao, chave, QStringLiteral("TABGRUPOPRO")),
              QStringLiteral("TABGRUPOPRO"));
}

// Another program of the same user (the suite's back office shares the server list) may write
// the file at any moment: every read must see the file as it is now.
TEST(ArmazemDefinicoes, LeOFicheiroAlteradoPorOutroPrograma) {
    testing::DefinicoesTemporarias pasta;
    const QString chave = QStringLiteral("Login1");
    ASSERT_TRUE(SaveSetting(kMontiva, QStringLiteral("Sec"), chave, QStringLiteral("antes")));
    ASSERT_EQ(GetSetting(kMontiva, QStringLiteral("Sec"), chave), QStringLiteral("antes"));

    QFile f(QDir(pasta.pasta()).filePath(QStringLiteral("Montiva.ini")));
    ASSERT_TRUE(f.open(QIODevice::WriteOnly | QIODevice::Truncate));
    f.write("[Sec]\nLogin1=depois do outro programa\n");
    f.close();
    EXPECT_EQ(GetSetting(kMontiva, QStringLiteral("Sec"), chave),
              QStringLiteral("depois do outro programa"));
}

TEST(ArmazemDefinicoes, PastaImpossivelDaFalha) {
    QTemporaryDir base;
    const QString ficheiro = QDir(base.path()).filePath(QStringLiteral("ficheiro"));
    QFile f(ficheiro);
    ASSERT_TRUE(f.open(QIODevice::WriteOnly));
    f.close();
    // A folder below a plain file can never be made, not even by root.
    testing::VariavelAmbiente variavel("BRASEL_SETTINGS_DIR",
                                       (ficheiro + QStringLiteral("/sub")).toUtf8());
    EXPECT_FALSE(SaveSetting(kBrasel, kSeccao, QStringLiteral("X"), QStringLiteral("1")));
    EXPECT_EQ(GetSetting(kBrasel, kSeccao, QStringLiteral("X"), QStringLiteral("0")),
              QStringLiteral("0"));
}

}  // namespace
}  // namespace brasel
