// The touch keyboard's text: dead keys, Caps Lock, backspace; and the keypad's reading of a
// number, which must refuse anything that is not one.
#include "pos/teclado.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

TEST(Teclado, DeadKeysAndCapsLockShapeTheNextKey) {
    struct Caso {
        const char* nome;
        bool capsLock;
        const char* teclas;  // "^" stands for the dead key pressed before the next letter
        QChar acento;
        const char* esperado;
    } casos[] = {
        {"acute e, lower case", false, "^E", u'´', "é"},
        {"acute e, upper case", true, "^E", u'´', "É"},
        {"grave a", false, "^A", u'`', "à"},
        {"tilde o, upper case", true, "^O", u'~', "Õ"},
        {"tilde on e gives a plain e", false, "^EE", u'~', "ee"},
        {"acute on a consonant", true, "^N", u'´', "N"},
        {"accent spent after one key", false, "^AA", u'´', "áa"},
        {"cedilla follows Caps Lock", false, "Ç", QChar(), "ç"},
        {"symbols unchanged", false, "€%1", QChar(), "€%1"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        Teclado t(c.capsLock);
        for (QChar tecla : QString::fromUtf8(c.teclas)) {
            if (tecla == u'^')
                t.acento(c.acento);
            else
                t.CarregaLetra(QString(tecla));
        }
        EXPECT_EQ(t.resultado(), QString::fromUtf8(c.esperado));
        EXPECT_TRUE(t.acentoPendente().isNull());
    }
}

TEST(Teclado, BackspaceStopsAtTheEmptyText) {
    Teclado t(true);
    t.apaga();
    EXPECT_EQ(t.resultado(), QString());
    t.CarregaLetra(QStringLiteral("A"));
    t.acrescenta(QStringLiteral(" sem sal"));
    t.apaga();
    EXPECT_EQ(t.resultado(), QStringLiteral("A sem sa"));
}

TEST(Teclado, KeypadReadsNumbersOnly) {
    struct Caso {
        const char* texto;
        bool valido;
        std::optional<Currency> valor;
    } casos[] = {
        {"", true, std::nullopt},
        {"  ", true, std::nullopt},
        {"3", true, Currency(3)},
        {"2.5", true, Currency::fromRaw(25000)},
        {"2,5", true, Currency::fromRaw(25000)},
        {"-1", true, Currency(-1)},
        {"0", true, Currency(0)},
        {"12a", false, std::nullopt},
        {"1.2.3", false, std::nullopt},
        {"1,000.5", false, std::nullopt},
        {".", false, std::nullopt},
        {"--1", false, std::nullopt},
        {"1-", false, std::nullopt},
        {"99999999999999999999", false, std::nullopt},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        const ValorTeclado v = lerValorTeclado(QString::fromUtf8(c.texto));
        EXPECT_EQ(v.valido, c.valido);
        EXPECT_EQ(v.valor, c.valor);
    }
}

}  // namespace
}  // namespace brasel::pos
