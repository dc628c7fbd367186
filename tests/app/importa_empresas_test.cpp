// The import of an older installation's server list: CSV fields with commas, quotes and line
// breaks, the two file encodings, and the one-time import on a workstation's first start.
#include "app/importa_empresas.h"

#include "common/cls_encripta.h"
#include "common/ediv.h"
#include "support/apoio_arranque.h"
#include "support/impressao_qt.h"

#include <QDir>
#include <QFile>
#include <QStringEncoder>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using namespace Qt::StringLiterals;

using testing::DefinicoesTemporarias;

QString ficheiro(const QTemporaryDir& pasta, const QByteArray& conteudo,
                 const QString& nome = kFicheiroEmpresasAntigo) {
    const QString caminho = QDir(pasta.path()).filePath(nome);
    QFile f(caminho);
    EXPECT_TRUE(f.open(QIODevice::WriteOnly));
    f.write(conteudo);
    return caminho;
}

// A CSV field for any text: quoted, with its quotes doubled.
QString campoCsv(const QString& texto) {
    QString t = texto;
    t.replace(QLatin1Char('"'), QStringLiteral("\"\""));
    return QLatin1Char('"') + t + QLatin1Char('"');
}

TEST(LerLinhasCsv, QuotedFieldsKeepCommasQuotesAndLineBreaks) {
    struct Caso {
        const char* texto;
        QList<QStringList> linhas;
    };
    const Caso casos[] = {
        {"a,b,c\n", {{u"a"_s, u"b"_s, u"c"_s}}},
        {"a,b,c", {{u"a"_s, u"b"_s, u"c"_s}}},
        {"a,b\r\n\r\nc,d\r\n", {{u"a"_s, u"b"_s}, {u"c"_s, u"d"_s}}},
        {"\"s,1\",\"x\"\"y\",z\n", {{u"s,1"_s, u"x\"y"_s, u"z"_s}}},
        {"\"linha\nseguinte\",b\n", {{u"linha\nseguinte"_s, u"b"_s}}},
        {"a,,\n", {{u"a"_s, u""_s, u""_s}}},
        {"\"\",b\n", {{u""_s, u"b"_s}}},
        {"\n\n", {}},
    };
    for (const Caso& caso : casos) {
        EXPECT_EQ(lerLinhasCsv(QString::fromUtf8(caso.texto)), caso.linhas) << caso.texto;
    }
}

TEST(LerEmpresasCsv, PasswordsMoveFromTheCharacterCipherToTheCompanyListCipher) {
    const QString dificil = QStringLiteral("pa,ss\"wo rd;é");
    const QString cifrada = EDiv::Encrypt(dificil);
    // The cipher text is made of 8-bit characters, so the file's encoding matters.
    ASSERT_NE(cifrada.toLatin1(), cifrada.toUtf8());
    const QString texto = QStringLiteral("PWD,Server,UID\r\n") + campoCsv(cifrada) +
                          QStringLiteral(",srv-b,sa\r\n") +
                          campoCsv(EDiv::Encrypt(QStringLiteral("x"))) +
                          QStringLiteral(",SRV-A,\"o,utro\"\r\n,,ninguem\r\n");
    QStringEncoder ansi("Windows-1252");
    ASSERT_TRUE(ansi.isValid());
    for (const QByteArray& bytes : {texto.toUtf8(), QByteArray(ansi.encode(texto))}) {
        QTemporaryDir pasta;
        const auto entradas = lerEmpresasCsv(ficheiro(pasta, bytes));
        ASSERT_TRUE(entradas);
        ASSERT_EQ(entradas->size(), 2);  // the row without a server is left out
        EXPECT_EQ((*entradas)[0].servidor, QStringLiteral("SRV-A"));
        EXPECT_EQ((*entradas)[0].login, QStringLiteral("o,utro"));
        EXPECT_EQ((*entradas)[0].password(), QStringLiteral("x"));
        EXPECT_EQ((*entradas)[1].servidor, QStringLiteral("srv-b"));
        EXPECT_EQ((*entradas)[1].password(), dificil);
        EXPECT_EQ((*entradas)[1].passwordCifrada,
                  clsEncripta::Encripta(0, clsEncripta::chaveEmpresas(), dificil));
        for (const EntradaServidor& e : *entradas)
            EXPECT_EQ(e.tipoAutenticacao, QStringLiteral("SQL"));
    }
}

TEST(LerEmpresasCsv, WithoutHeaderColumnsAreServerLoginPassword) {
    QTemporaryDir pasta;
    const auto entradas = lerEmpresasCsv(ficheiro(
        pasta,
        (QStringLiteral("srv,sa,") + campoCsv(EDiv::Encrypt(QStringLiteral("pw")))).toUtf8()));
    ASSERT_TRUE(entradas);
    ASSERT_EQ(entradas->size(), 1);
    EXPECT_EQ((*entradas)[0].login, QStringLiteral("sa"));
    EXPECT_EQ((*entradas)[0].password(), QStringLiteral("pw"));
}

TEST(LerEmpresasCsv, MissingFileOrColumnIsRefusedWithItsReason) {
    QTemporaryDir pasta;
    QString erro;
    EXPECT_FALSE(lerEmpresasCsv(QDir(pasta.path()).filePath(QStringLiteral("nada.csv")), &erro));
    EXPECT_FALSE(erro.isEmpty());
    erro.clear();
    EXPECT_FALSE(lerEmpresasCsv(ficheiro(pasta, "Server,UID\nsrv,sa\n"), &erro));
    EXPECT_EQ(erro, QStringLiteral("O ficheiro não tem as colunas Server, UID e PWD."));
}

TEST(JuntarServidores, FillsFreeEntriesSkipsRepeatedAndStopsAtTwenty) {
    ListaServidores lista;
    lista[0].servidor = QStringLiteral("existente");
    lista[2].servidor = QStringLiteral("outro");
    QList<EntradaServidor> novos;
    for (int i = 0; i < 20; ++i)
        novos.append(
            {QStringLiteral("srv%1").arg(i), QStringLiteral("sa"), {}, QStringLiteral("SQL")});
    novos.append({QStringLiteral(" EXISTENTE "), {}, {}, QStringLiteral("SQL")});
    novos.append({QStringLiteral("srv0"), {}, {}, QStringLiteral("SQL")});
    const ResultadoImportacao r = juntarServidores(lista, novos);
    EXPECT_EQ(r.importados, 18);
    EXPECT_EQ(r.semLugar, 2);
    EXPECT_EQ(r.repetidos, 2);
    EXPECT_EQ(lista[1].servidor, QStringLiteral("srv0"));
    EXPECT_EQ(lista[2].servidor, QStringLiteral("outro"));
    EXPECT_EQ(lista[19].servidor, QStringLiteral("srv17"));
}

TEST(PastaDaLinhaComando, FirstWordOrQuotedText) {
    const std::pair<const char*, const char*> casos[] = {
        {"", ""},
        {"   ", ""},
        {"/srv/antigo", "/srv/antigo"},
        {"  /srv/antigo  --outro", "/srv/antigo"},
        {"C:\\Quoril\\Dados resto", "C:\\Quoril\\Dados"},
        {"\"/pasta com espaço\" resto", "/pasta com espaço"},
        {"<@>ACT_CHK<@>srv<@>1<@>sa<@>pw", ""},
    };
    for (const auto& [linha, pasta] : casos)
        EXPECT_EQ(pastaDaLinhaComando(QString::fromUtf8(linha)), QString::fromUtf8(pasta)) << linha;
}

TEST(ImportarEmpresasIniciais, RunsOnceOnAnEmptyListFromTheCommandLineFolder) {
    DefinicoesTemporarias definicoes;
    QTemporaryDir pasta;
    ficheiro(pasta, (QStringLiteral("Server,UID,PWD\n/dados,sa,") +
                     campoCsv(EDiv::Encrypt(QStringLiteral("segredo"))) + QLatin1Char('\n'))
                        .toUtf8());
    EXPECT_FALSE(importarEmpresasIniciais({}));
    EXPECT_FALSE(importarEmpresasIniciais(QStringLiteral("/pasta/que/nao/existe")));
    EXPECT_FALSE(lerServidores()[0].emUso());

    EXPECT_TRUE(importarEmpresasIniciais(pasta.path() + QStringLiteral(" --x")));
    ListaServidores lista = lerServidores();
    EXPECT_EQ(lista[0].servidor, QStringLiteral("/dados"));
    EXPECT_EQ(lista[0].login, QStringLiteral("sa"));
    EXPECT_EQ(lista[0].password(), QStringLiteral("segredo"));
    EXPECT_EQ(lista[0].tipoAutenticacao, QStringLiteral("SQL"));
    EXPECT_FALSE(lista[1].emUso());

    // A list that has servers is never replaced, even after they were all changed.
    lista[0].servidor = QStringLiteral("/novo");
    ASSERT_TRUE(gravarServidores(lista));
    EXPECT_FALSE(importarEmpresasIniciais(pasta.path()));
    EXPECT_EQ(lerServidores()[0].servidor, QStringLiteral("/novo"));
}

}  // namespace
}  // namespace brasel::app
