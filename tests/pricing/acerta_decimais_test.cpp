// Number texts padded to the six decimals of exchange amounts.
#include "pricing/cambio.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

TEST(AcertaDecimais, PadsToSixDecimals) {
    struct Caso {
        const char* texto;
        const char* esperado;
    };
    const Caso casos[] = {
        {"12", "12.000000"},
        {"12.5", "12.500000"},
        {"12.12345", "12.123450"},
        {"12.123456", "12.123456"},
        {"1.1234567", "1.1234567"},
        {"12.", "12.000000"},
        {"", ".000000"},
        {"-3.1", "-3.100000"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(AcertaDecimais(QString::fromLatin1(c.texto)), QString::fromLatin1(c.esperado))
            << c.texto;
    }
}

TEST(ValorSeisDecimais, TextAndAmount) {
    EXPECT_EQ(ValorSeisDecimais{12345678}.toText(), QStringLiteral("12.345678"));
    EXPECT_EQ(ValorSeisDecimais{-5}.toText(), QStringLiteral("-0.000005"));
    EXPECT_EQ(ValorSeisDecimais{12345650}.paraValor(), teste::V("12.3456"));  // tie to even
    EXPECT_EQ(ValorSeisDecimais{12345750}.paraValor(), teste::V("12.3458"));
}

}  // namespace
}  // namespace brasel::pricing
