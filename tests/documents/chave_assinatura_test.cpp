// The signing key file and the signatures made with it: what a deployment's file must hold, what
// a broken one does, and that the signatures are the ones anyone can check with the public half.
#include "documents/chave_assinatura.h"
#include "documents/assinatura.h"
#include "support/chave_teste.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

QStringList linhasDe(const QString& caminho) {
    QFile f(caminho);
    if (!f.open(QIODevice::ReadOnly)) return {};
    return QString::fromLatin1(f.readAll()).split(u'\n', Qt::SkipEmptyParts);
}

bool escreve(const QString& caminho, const QByteArray& dados) {
    QFile f(caminho);
    return f.open(QIODevice::WriteOnly | QIODevice::Truncate) && f.write(dados) == dados.size();
}

class ChaveAssinatura : public ::testing::Test {
  protected:
    QString caminho(const char* nome) const {
        return QDir(pasta.path()).filePath(QString::fromLatin1(nome));
    }
    QTemporaryDir pasta;
};

TEST_F(ChaveAssinatura, AGeneratedKeyFileHoldsTheEightComponentsForItsOwnerOnly) {
    const QString f = caminho("chave.key");
    QString erro;
    ASSERT_TRUE(GeraChave(f, &erro)) << erro.toStdString();
    const QStringList linhas = linhasDe(f);
    ASSERT_EQ(linhas.size(), 8);
    const int larguras[] = {172, 4, 88, 88, 88, 88, 88, 172};
    for (int i = 0; i < 8; ++i)
        EXPECT_EQ(linhas[i].size(), larguras[i]) << "componente " << i;
    EXPECT_EQ(linhas[1], QStringLiteral("AQAB"));
    const QFileDevice::Permissions modo = QFileInfo(f).permissions();
    EXPECT_TRUE(modo.testFlags(QFileDevice::ReadOwner | QFileDevice::WriteOwner));
    EXPECT_FALSE(modo & (QFileDevice::ReadGroup | QFileDevice::WriteGroup | QFileDevice::ReadOther |
                         QFileDevice::WriteOther));
    EXPECT_TRUE(linhasDe(ficheiroPemPublico(f)).value(0).startsWith(u"-----BEGIN PUBLIC KEY"));

    // A deployment's key is never replaced: the chains signed with it depend on it.
    EXPECT_FALSE(GeraChave(f, &erro));
    EXPECT_TRUE(erro.contains(QStringLiteral("já existe")));
    EXPECT_EQ(linhasDe(f), linhas);
}

TEST_F(ChaveAssinatura, SignaturesAreDeterministicAndVerifyWithThePublicHalfOnly) {
    const QString texto = QStringLiteral("2011-05-02;2011-05-02T13:45:10;FR1 2011/123;25.80;");
    const QString a = Assina_Nova(texto, testing::ficheiroChaveTeste());
    ASSERT_EQ(a.size(), 172);
    EXPECT_EQ(Assina_Nova(texto, testing::ficheiroChaveTeste()), a);
    EXPECT_NE(Assina_Nova(texto + u'x', testing::ficheiroChaveTeste()), a);

    const auto publica = ChaveRsa::doPemPublico(testing::ficheiroChavePublicaTeste());
    ASSERT_TRUE(publica);
    EXPECT_FALSE(publica->privada());
    EXPECT_TRUE(publica->assina(texto).isEmpty());
    EXPECT_TRUE(publica->confere(texto, a));
    EXPECT_FALSE(publica->confere(texto + u' ', a));
    EXPECT_FALSE(publica->confere(texto, QStringLiteral("não é base64")));

    // Accented text is signed as UTF-8, which is what the command line checks too.
    const QString acentos = QStringLiteral("Cópia;Zé d'Ouro;");
    const auto ok =
        testing::confereComOpenssl(acentos, Assina_Nova(acentos, testing::ficheiroChaveTeste()));
    if (!ok) GTEST_SKIP() << "sem o programa openssl";
    EXPECT_TRUE(*ok);
    EXPECT_TRUE(*testing::confereComOpenssl(texto, a));
    EXPECT_FALSE(*testing::confereComOpenssl(texto + u'x', a));
}

TEST_F(ChaveAssinatura, ABrokenKeyFileSignsNothing) {
    const QStringList boas = linhasDe(testing::ficheiroChaveTeste());
    ASSERT_EQ(boas.size(), 8);
    QStringList semUma = boas;
    semUma.removeLast();
    QStringList trocadas = boas;
    trocadas.swapItemsAt(0, 7);  // modulus and private exponent swapped
    QStringList outroD = boas;
    outroD[7][40] = outroD[7][40] == u'A' ? u'B' : u'A';
    QStringList naoBase64 = boas;
    naoBase64[3] = QStringLiteral("***");
    struct Caso {
        const char* nome;
        QByteArray conteudo;
    };
    const auto junta = [](const QStringList& l) { return l.join(u'\n').toLatin1(); };
    const Caso casos[] = {
        {"vazio", {}},
        {"sete linhas", junta(semUma)},
        {"nove linhas", junta(boas + QStringList{boas[1]})},
        {"componentes trocados", junta(trocadas)},
        {"expoente privado alterado", junta(outroD)},
        {"linha que não é base64", junta(naoBase64)},
        {"texto qualquer", "<RSAKeyValue><Modulus>x</Modulus></RSAKeyValue>"},
    };
    for (const Caso& c : casos) {
        const QString f = caminho(c.nome);
        ASSERT_TRUE(escreve(f, c.conteudo));
        EXPECT_TRUE(Assina_Nova(QStringLiteral("abc"), f).isEmpty()) << c.nome;
    }
    EXPECT_TRUE(Assina_Nova(QStringLiteral("abc"), caminho("não existe")).isEmpty());
    EXPECT_TRUE(Assina_Nova(QStringLiteral("abc"), QString()).isEmpty());
    EXPECT_FALSE(ChaveRsa::doPemPublico(caminho("não existe")));

    // Windows line ends, blank lines and spaces around the components are fine.
    const QString crlf = caminho("crlf");
    ASSERT_TRUE(
        escreve(crlf, "\r\n" + boas.join(QStringLiteral("  \r\n\r\n")).toLatin1() + "\r\n"));
    EXPECT_EQ(Assina_Nova(QStringLiteral("abc"), crlf),
              Assina_Nova(QStringLiteral("abc"), testing::ficheiroChaveTeste()));
}

TEST_F(ChaveAssinatura, AKeyFileReplacedInPlaceIsReadAgain) {
    const QString f = caminho("chave.key");
    const QString outra = caminho("outra.key");
    ASSERT_TRUE(GeraChave(f, nullptr));
    ASSERT_TRUE(GeraChave(outra, nullptr));
    const QString texto = QStringLiteral("texto");
    const QString antes = Assina_Nova(texto, f);
    ASSERT_FALSE(antes.isEmpty());

    QFile novo(outra);
    ASSERT_TRUE(novo.open(QIODevice::ReadOnly));
    ASSERT_TRUE(escreve(f, novo.readAll()));
    QFile alterado(f);
    ASSERT_TRUE(alterado.open(QIODevice::ReadWrite));
    ASSERT_TRUE(alterado.setFileTime(QDateTime::currentDateTime().addSecs(5),
                                     QFileDevice::FileModificationTime));
    alterado.close();
    const QString depois = Assina_Nova(texto, f);
    EXPECT_NE(depois, antes);
    EXPECT_EQ(depois, Assina_Nova(texto, outra));
}

TEST(TextoAssinatura, DateTimeIdentificationTotalAndThePreviousSignature) {
    struct Caso {
        const char* data;
        const char* dataSys;
        const char* total;
        const char* anterior;
        const char* esperado;
    };
    const Caso casos[] = {
        {"2011-05-02", "2011-05-02 13:45:10", "25.8", "",
         "2011-05-02;2011-05-02T13:45:10;FR1 2011/123;25.80;"},
        {"2011-05-02", "2011-05-02T13:45:10", "1234.5",
         "abc=", "2011-05-02;2011-05-02T13:45:10;FR1 2011/123;1234.50;abc="},
        {"2026-01-31", "2026-01-31 08:00:00.250", "1000000", "",
         "2026-01-31;2026-01-31T08:00:00;FR1 2026/123;1000000.00;"},
        {"2026-12-31", "2026-12-31 23:59:59", "-12.3", "x",
         "2026-12-31;2026-12-31T23:59:59;FR1 2026/123;-12.30;x"},
        {"2026-02-01", "2026-02-01 10:00:00", "0.125", "",
         "2026-02-01;2026-02-01T10:00:00;FR1 2026/123;0.12;"},
    };
    for (const Caso& c : casos) {
        const auto texto = TextoAssinatura(
            QString::fromLatin1(c.data), QString::fromLatin1(c.dataSys), QStringLiteral("FR1"),
            QStringLiteral("123"), *Currency::parse(QString::fromLatin1(c.total)),
            QString::fromLatin1(c.anterior));
        ASSERT_TRUE(texto) << c.dataSys;
        EXPECT_EQ(*texto, QString::fromLatin1(c.esperado));
    }
    for (const char* mau : {"", "ontem", "2026-02-30 10:00:00"}) {
        EXPECT_FALSE(TextoAssinatura(QStringLiteral("2026-02-01"), QString::fromLatin1(mau),
                                     QStringLiteral("FR1"), QStringLiteral("1"), Currency(1), {}))
            << mau;
    }
}

}  // namespace
}  // namespace brasel::documents
