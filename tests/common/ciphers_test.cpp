#include "common/cls_encripta.h"
#include "common/ediv.h"
#include "common/settings_store.h"
#include "support/apoio_arranque.h"

#include <gtest/gtest.h>

namespace brasel {
namespace {

QString deCodigos(std::initializer_list<char16_t> codigos) {
    QString s;
    for (char16_t c : codigos)
        s.append(QChar(c));
    return s;
}

// Supervisor passwords already in company databases were written with this transformation:
// every code must map exactly as they were written, Windows-1252 characters included.
TEST(EDiv, CadaCodigoInverteOsBitsETrocaAsMetades) {
    struct Caso {
        const char* nome;
        QString claro;
        QString cifrado;
    };
    const Caso casos[] = {
        {"codigo 0 da 255", deCodigos({0x00}), deCodigos({0xFF})},
        {"codigo 15 fica 15", deCodigos({0x0F}), deCodigos({0x0F})},
        {"A (0x41) da 0xEB", QStringLiteral("A"), deCodigos({0xEB})},
        {"c cedilha (0xE7) da 0x81", QStringLiteral("ç"), deCodigos({0x81})},
        {"euro (0x80 em 1252) da 0xF7", QStringLiteral("€"), deCodigos({0xF7})},
        {"vazio", QString(), QString()},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(EDiv::Encrypt(c.claro), c.cifrado);
        EXPECT_EQ(EDiv::Decrypt(c.cifrado), c.claro);
    }
}

TEST(EDiv, DuasVezesDevolveOTextoComOMesmoComprimento) {
    const QString textos[] = {
        QStringLiteral("Supervisor"), QStringLiteral("ação ÇÃO ñ € œ Ÿ ‰"),
        QStringLiteral("a'b\"c;--"),
        deCodigos({0x81, 0x8D, 0x8F, 0x90, 0x9D}),  // the codes 1252 leaves undefined
    };
    for (const QString& t : textos) {
        SCOPED_TRACE(t.toStdString());
        const QString cifrado = EDiv::Encrypt(t);
        EXPECT_EQ(cifrado.size(), t.size());
        EXPECT_NE(cifrado, t);
        EXPECT_EQ(EDiv::Decrypt(cifrado), t);
    }
}

TEST(EDiv, CaracterSemCodigo1252PassaAPontoDeInterrogacao) {
    const QString t = QStringLiteral("a日b");
    EXPECT_EQ(EDiv::Decrypt(EDiv::Encrypt(t)), QStringLiteral("a?b"));
}

const QString kChave = clsEncripta::chaveEmpresas();

// Answers computed with the block cipher alone under the 12-byte key: a key padded to
// Blowfish's default 16 bytes, another mode or another padding all give other texts.
TEST(ClsEncripta, BlowfishComAChaveDe12Bytes) {
    EXPECT_EQ(kChave, QStringLiteral("NuncaAlterar"));
    EXPECT_EQ(clsEncripta::Encripta(0, kChave, QStringLiteral("password")),
              QStringLiteral("A2D2D0704D5D427B5A8B6DEA0E3E6344"));
    EXPECT_EQ(clsEncripta::Encripta(0, kChave, QStringLiteral("a")),
              QStringLiteral("67E07524C4E1ABD3"));
}

TEST(ClsEncripta, IdaEVolta) {
    const QString textos[] = {
        QStringLiteral("a"),
        QStringLiteral("12345678"),  // exactly one block: a whole block of padding follows
        QStringLiteral("palavra-passe com ação e €"),
        QString(300, QLatin1Char('x')),
    };
    for (const QString& t : textos) {
        SCOPED_TRACE(t.toStdString());
        const QString cifrado = clsEncripta::Encripta(0, kChave, t);
        EXPECT_EQ(cifrado.size() % 16, 0);
        EXPECT_EQ(cifrado, cifrado.toUpper());
        EXPECT_EQ(clsEncripta::Desencripta(0, kChave, cifrado), t);
        EXPECT_EQ(clsEncripta::Desencripta(0, kChave, cifrado.toLower()), t);
    }
    EXPECT_EQ(clsEncripta::Encripta(0, kChave, QString()), QString());
    EXPECT_EQ(clsEncripta::Desencripta(0, kChave, QString()), QString());
}

TEST(ClsEncripta, OutrosAlgoritmosDaoVazio) {
    for (int algoritmo : {-1, 1, 4, 8, 9}) {
        SCOPED_TRACE(algoritmo);
        EXPECT_EQ(clsEncripta::Encripta(algoritmo, kChave, QStringLiteral("x")), QString());
        EXPECT_EQ(clsEncripta::Desencripta(algoritmo, kChave, QStringLiteral("67E07524C4E1ABD3")),
                  QString());
    }
}

// A hand-edited or damaged server list must give an empty password, never a crash or junk.
TEST(ClsEncripta, TextoCifradoInvalidoDaVazio) {
    struct Caso {
        const char* nome;
        QString chave;
        QString cifrado;
    };
    const QString bom = QStringLiteral("A2D2D0704D5D427B5A8B6DEA0E3E6344");
    const Caso casos[] = {
        {"nao hexadecimal", kChave, QStringLiteral("password")},
        {"comprimento impar", kChave, bom.left(15)},
        {"meio bloco", kChave, bom.left(8)},
        {"bloco de enchimento cortado", kChave, bom.left(16)},
        {"letras fora do hexadecimal", kChave, QStringLiteral("G2D2D0704D5D427B")},
        {"espacos", kChave, QStringLiteral("A2D2D070 4D5D427")},
        {"chave errada", QStringLiteral("OutraChave"), bom},
        {"chave vazia", QString(), bom},
        {"texto de outro programa", kChave, QStringLiteral("00000000000000000000000000000000")},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(clsEncripta::Desencripta(0, c.chave, c.cifrado), QString());
    }
}

TEST(ClsEncripta, TextoCifradoSobreviveAoArmazemDeDefinicoes) {
    testing::DefinicoesTemporarias pasta;
    const QString senha = QStringLiteral("S3nh@ ção;=,\"");
    const QString cifrado = clsEncripta::Encripta(0, kChave, senha);
    ASSERT_TRUE(SaveSetting(QStringLiteral("Montiva"), QStringLiteral("Autenticação"),
                            QStringLiteral("Password1"), cifrado));
    const QString lido = GetSetting(QStringLiteral("Montiva"), QStringLiteral("Autenticação"),
                                    QStringLiteral("Password1"));
    EXPECT_EQ(lido, cifrado);
    EXPECT_EQ(clsEncripta::Desencripta(0, kChave, lido), senha);
}

}  // namespace
}  // namespace brasel
