// Cutting scale and price labels: the fixed-cut and prefix schemes, alone and together, short
// labels, case of the prefixes, and the labels that must be refused instead of misread.
#include "pos/codigo_barras.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

ParamCodigoBarras corteFixo() {
    ParamCodigoBarras p;
    p.controlespecifico = true;
    p.corte1 = 7;
    p.corte2 = 5;
    p.DIVISAO = 1000;
    return p;
}

ParamCodigoBarras prefixos() {
    ParamCodigoBarras p;
    p.controlOficial = true;
    p.Prefixo1Preco = QStringLiteral("2A");
    p.Prefixo2Preco = QStringLiteral("29");
    p.PrefixoPrecoCorte1 = 5;
    p.PrefixoPrecoCorte2 = 5;
    p.PrefixoPrecoDivisor = 100;
    p.Prefixo1Quant = QStringLiteral("28");
    p.Prefixo2Quant = QStringLiteral("QQ");
    p.PrefixoQuantCorte1 = 4;
    p.PrefixoQuantCorte2 = 5;
    p.PrefixoQuantDivisor = 1000;
    return p;
}

ParamCodigoBarras ambos() {
    ParamCodigoBarras p = prefixos();
    const ParamCodigoBarras f = corteFixo();
    p.controlespecifico = true;
    p.corte1 = f.corte1;
    p.corte2 = f.corte2;
    p.DIVISAO = f.DIVISAO;
    return p;
}

TEST(LerCodigoBarras, CutsEachSchemeAsConfigured) {
    struct Caso {
        const char* nome;
        ParamCodigoBarras param;
        const char* codigo;
        const char* produto;
        const char* valor;
        const char* tipo;
    } casos[] = {
        // Price prefix, five code characters, 00125, one check character left unused.
        {"worked example", prefixos(), "29ABCDE001257", "ABCDE", "1.25", "P"},
        {"price prefix compared without case", prefixos(), "2aABCDE012349", "ABCDE", "12.34", "P"},
        {"quantity prefix", prefixos(), "28B001015005", "B001", "1.5", "Q"},
        {"second quantity prefix in lower case", prefixos(), "qqB001002500", "B001", "0.25", "Q"},
        {"no prefix: the code as it stands", prefixos(), "B001", "B001", "", ""},
        {"fixed cut", corteFixo(), "200123401250X", "2001234", "1.25", "Q"},
        {"fixed cut on a short label", corteFixo(), "20012", "20012", "0", "Q"},
        {"both schemes, no prefix: whole text, fixed-cut value", ambos(), "200123401250X",
         "200123401250X", "1.25", "Q"},
        {"both schemes, price prefix wins", ambos(), "29ABCDE001257", "ABCDE", "1.25", "P"},
        {"nothing on", ParamCodigoBarras{}, "29ABCDE001257", "", "", ""},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const LeituraCodigo l = LerCodigoBarras(c.param, QString::fromUtf8(c.codigo));
        EXPECT_TRUE(l.valido);
        EXPECT_EQ(l.produto, QString::fromUtf8(c.produto));
        EXPECT_EQ(l.valor, QString::fromUtf8(c.valor));
        EXPECT_EQ(l.tipo, QString::fromUtf8(c.tipo));
    }
}

TEST(LerCodigoBarras, RefusesLabelsWhoseValueCannotBeRead) {
    ParamCodigoBarras semDivisor = prefixos();
    semDivisor.PrefixoPrecoDivisor = 0;
    ParamCodigoBarras corteSemDivisor = corteFixo();
    corteSemDivisor.DIVISAO = 0;
    struct Caso {
        const char* nome;
        ParamCodigoBarras param;
        const char* codigo;
    } casos[] = {
        {"divisor 0", semDivisor, "29ABCDE001257"},
        {"fixed-cut divisor 0", corteSemDivisor, "200123401250"},
        {"letters among the price digits", prefixos(), "29ABCDE0A1257"},
        {"sign among the quantity digits", prefixos(), "28B001-15005"},
        {"too many digits for an amount",
         [] {
             ParamCodigoBarras p = prefixos();
             p.PrefixoPrecoCorte2 = 19;
             return p;
         }(),
         "29ABCDE9999999999999999999"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_FALSE(LerCodigoBarras(c.param, QString::fromUtf8(c.codigo)).valido);
    }
}

}  // namespace
}  // namespace brasel::pos
