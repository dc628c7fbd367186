#include "devices/codigo_impressora.h"
#include "devices/pagina_codigos.h"
#include "support/bytes_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using testing::bytes;

TEST(ExtraiCodigoTeste, CampoDeUmCodigo) {
    struct Caso {
        int campo;
        const char* texto;
        const char* digitos;
    };
    const Caso casos[] = {
        {1, "27+100+3", "27"}, {2, "27+100+3", "100"}, {3, "27+100+3", "3"},
        {4, "27+100+3", ""},   {2, "27 + 100", "100"},  // blanks are passed over
        {2, "27++100", ""},                             // an empty field
        {3, "27++100", "100"},                          // the later field keeps its number
        {1, "2a7", "27"},                               // only the digits of the field count
        {1, "", ""},           {0, "27+100", ""},      {1, "+27", ""},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(std::string(c.texto) + " campo " + std::to_string(c.campo));
        EXPECT_EQ(ExtraiCodigo(c.campo, QString::fromUtf8(c.texto)), QString::fromUtf8(c.digitos));
    }
}

TEST(ExtraiCodigoTeste, SoAsPrimeirasCemPosicoesContam) {
    // 98 blanks, then "12" at positions 99 and 100 and "3" at 101: the 3 is never seen.
    const QString texto = QString(98, QLatin1Char(' ')) + QStringLiteral("123");
    EXPECT_EQ(ExtraiCodigo(1, texto), QStringLiteral("12"));
    // A "+" beyond position 100 opens no field.
    const QString depois = QString(100, QLatin1Char(' ')) + QStringLiteral("+5");
    EXPECT_EQ(ExtraiCodigo(2, depois), QString());
}

TEST(ConstroiCodigoTeste, BytesDeUmCodigo) {
    struct Caso {
        const char* texto;
        QByteArray esperado;
    };
    const Caso casos[] = {
        {"27+100+3", bytes({27, 100, 3})},
        {"27 + 100", bytes({27, 100})},
        {"27+100+1+2+3+4+5", bytes({27, 100, 1, 2, 3, 4})},  // a seventh field is ignored
        {"27++100", bytes({27, 100})},                       // the empty field is skipped
        {"300", QByteArray()},                               // no byte is 300
        {"27+256+0+255", bytes({27, 0, 255})},
        {"0", bytes({0})},
        {"007+010", bytes({7, 10})},
        {"99999999999999999999+1", bytes({1})},  // too large for any number
        {"", QByteArray()},
        {"+++", QByteArray()},
        {"abc", QByteArray()},
        {"-1+2", bytes({1, 2})},  // the minus sign is not a digit
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(ConstroiCodigo(QString::fromUtf8(c.texto)), c.esperado);
    }
}

TEST(TraduzCaracteresTeste, PortuguesVaiParaAPagina860) {
    const char* letras = "ÇéâãàÁçêÊèÍÔìÃÂÉÀÈôõòÚùÌÕÙÓáíóúªºÒ«»";
    const QByteArray esperado = bytes({128, 130, 131, 132, 133, 134, 135, 136, 137, 138, 139, 140,
                                       141, 142, 143, 144, 145, 146, 147, 148, 149, 150, 151, 152,
                                       153, 157, 159, 160, 161, 162, 163, 166, 167, 169, 174, 175});
    EXPECT_EQ(TraduzCaracteres(QString::fromUtf8(letras)), esperado);
}

TEST(TraduzCaracteresTeste, OutrosCaracteresLevamOCodigoWindows) {
    struct Caso {
        const char* texto;
        QByteArray esperado;
    };
    const Caso casos[] = {
        {"Pão", bytes({'P', 132, 'o'})},
        {"ü Ü ñ", bytes({0xFC, ' ', 0xDC, ' ', 0xF1})},  // no Portuguese place: Windows code
        {"€ 5", bytes({0x80, ' ', '5'})},
        {"“x” – …", bytes({0x93, 'x', 0x94, ' ', 0x96, ' ', 0x85})},
        {"°", bytes({0xB0})},
        {"ł", bytes({'?'})},  // no single-byte Windows code
        {"😀", bytes({'?'})},  // one character, one byte, even outside the basic plane
        {"a\r\nb\t", bytes({'a', 13, 10, 'b', 9})},
        {"", QByteArray()},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(TraduzCaracteres(QString::fromUtf8(c.texto)), c.esperado);
    }
}

}  // namespace
}  // namespace brasel::devices
