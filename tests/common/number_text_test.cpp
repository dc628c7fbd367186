// Number texts: "," groups thousands and "." marks decimals, whatever the machine's locale.
#include "common/number_text.h"

#include <gtest/gtest.h>

namespace brasel {
namespace {

Currency V(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

TEST(TextoParaNumero, DropsThousandsAndReadsTheDecimalSeparator) {
    struct Caso {
        const char* texto;
        double valor;
    };
    const Caso casos[] = {
        {"1,234.56", 1234.56}, {" 12.5 ", 12.5}, {"-3", -3.0},       {"1,000,000", 1e6}, {"", 0.0},
        {"abc", 0.0},          {"12a", 0.0},     {"0.0001", 0.0001},
    };
    for (const Caso& c : casos) {
        EXPECT_DOUBLE_EQ(TextoParaNumero(QString::fromLatin1(c.texto)), c.valor) << c.texto;
    }
    EXPECT_DOUBLE_EQ(TextoParaNumero(u"1.234,5", u'.', u','), 1234.5);
}

TEST(TextoParaValor, ReadsAmountsExactly) {
    EXPECT_EQ(TextoParaValor(u"1,234.5678"), V("1234.5678"));
    EXPECT_EQ(TextoParaValor(u"900,719,925,474.0993"), V("900719925474.0993"));
    EXPECT_EQ(TextoParaValor(u"0.00005"), V("0"));
    EXPECT_EQ(TextoParaValor(u"-1.234,5", u'.', u','), V("-1234.5"));
    EXPECT_FALSE(TextoParaValor(u"").has_value());
    EXPECT_FALSE(TextoParaValor(u"x1").has_value());
    EXPECT_FALSE(TextoParaValor(u"922,337,203,685,477.5808").has_value());
}

TEST(NumeroParaTexto, GroupsThousandsAndRoundsTiesToEven) {
    struct Caso {
        const char* valor;
        int decimais;
        const char* texto;
    };
    const Caso casos[] = {
        {"1234567.891", 2, "1,234,567.89"},
        {"-1234.5", 2, "-1,234.50"},
        {"0.5", 0, "0"},
        {"1.5", 0, "2"},
        {"999.995", 2, "1,000.00"},
        {"-0.004", 2, "0.00"},
        {"12", 0, "12"},
        {"123", 2, "123.00"},
        {"-100", 0, "-100"},
        {"1000", 4, "1,000.0000"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(NumeroParaTexto(V(c.valor), c.decimais), QString::fromLatin1(c.texto)) << c.valor;
    }
    EXPECT_EQ(NumeroParaTexto(V("1234.5"), 1, u'.', u','), QStringLiteral("1.234,5"));
    EXPECT_EQ(NumeroParaTexto(23.0, 2), QStringLiteral("23.00"));
    EXPECT_EQ(NumeroParaTexto(1e30, 0), QStringLiteral("1000000000000000019884624838656"));
}

TEST(NumeroParaTexto, ReadsBackWhatItWrites) {
    for (const char* v : {"0", "0.0001", "-0.0001", "1234567.8912", "-922337203685477.5808",
                          "922337203685477.5807", "100"}) {
        EXPECT_EQ(TextoParaValor(NumeroParaTexto(V(v), 4)), V(v)) << v;
    }
}

}  // namespace
}  // namespace brasel
