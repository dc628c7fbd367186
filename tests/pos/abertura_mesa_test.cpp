// Which of another user's lines may join the user's tab when a table is opened: at most four
// VAT tables, and never two tax regions.
#include "pos/abertura_mesa.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

QStringList lista(const char* texto) {
    return QString::fromLatin1(texto).split(u'|', Qt::SkipEmptyParts);
}

TEST(PassagemDeLinhas, QuatroIvasNoMaximo) {
    struct Caso {
        const char* daTab;
        const char* iva;
        bool aceite;
    };
    const Caso casos[] = {
        {"", "NO", true},
        {"RD|IT|NO", "Z4", true},
        {"RD|IT|NO|Z4", "Z5", false},
        {"RD|IT|NO|Z4", "IT", true},
        {"RD|IT|NO|Z4", "", true},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(std::string(c.daTab) + " + " + c.iva);
        EXPECT_EQ(Ver_4_Ivas_MovProduto_bln(lista(c.daTab), QString::fromLatin1(c.iva)), c.aceite);
    }
}

TEST(PassagemDeLinhas, UmaSoZonaDeIva) {
    const QHash<QString, QString> zonas{{QStringLiteral("NO"), QString()},
                                        {QStringLiteral("IT"), QString()},
                                        {QStringLiteral("RM"), QStringLiteral("M")},
                                        {QStringLiteral("IM"), QStringLiteral("M")},
                                        {QStringLiteral("RA"), QStringLiteral("A")}};
    struct Caso {
        const char* caso;
        const char* daTab;
        const char* iva;
        bool aceite;
    };
    const Caso casos[] = {
        {"an empty tab takes any region", "", "RM", true},
        {"another code of the tab's region", "RM", "IM", true},
        {"the company's own region beside another", "NO|IT", "RM", false},
        {"another region beside the company's own", "RM", "NO", false},
        {"a third region", "RM|IM", "RA", false},
        {"a line without VAT", "RM", "", true},
        {"a code without a row is of the company's own region", "NO", "XX", true},
        {"nor fits a tab that already mixes regions", "NO|RM", "IT", false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.caso);
        EXPECT_EQ(Ver_Zonas_IVA_MovProduto_bln(lista(c.daTab), QString::fromLatin1(c.iva), zonas),
                  c.aceite);
    }
}

}  // namespace
}  // namespace brasel::pos
