// The average cost of a product by both formulas, on worked numbers.
#include "documents/preco_medio_custo.h"

#include "documents/movimentos_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using teste::C;
using teste::grava;
using teste::movimento;

db::ValoresMovPro comDescontos(db::ValoresMovPro v, const char* desconto, const char* despesa,
                               const char* descontoFactura) {
    v.TotalDesconto = C(desconto);
    v.ValDespesa = C(despesa);
    v.CalculoFacturaDesconto = C(descontoFactura);
    return v;
}

class PrecoMedioEmpresa : public ::testing::Test {
  protected:
    // Warehouse 001, in date order (stored out of order on purpose):
    //   01-05 E+ 10 x 2.00 = 20
    //   01-08 S+ 4
    //   01-10 E+ 6 x 3.1667 = 19, discount 1
    //   01-12 S- 2
    //   01-15 E- 3 x 2.00 = 6 (back to the supplier)
    //   01-20 NA 100 (no stock effect)
    // and in warehouse 002: 02-01 E+ 5 x 4.00 = 20.
    void SetUp() override {
        n0112 = grava(e, movimento("P1", "S-", "2", "0", "001", "2026-01-12"));
        grava(e, movimento("P1", "E+", "10", "2", "001", "2026-01-05"));
        grava(e, movimento("P1", "S+", "4", "0", "001", "2026-01-08"));
        db::ValoresMovPro segunda = movimento("P1", "E+", "6", "0", "001", "2026-01-10");
        segunda.ValorIliq = C("19");
        grava(e, comDescontos(segunda, "1", "0", "0"));
        grava(e, movimento("P1", "E-", "3", "2", "001", "2026-01-15"));
        grava(e, movimento("P1", "NA", "100", "50", "001", "2026-01-20"));
        grava(e, movimento("P1", "E+", "5", "4", "002", "2026-02-01"));
        grava(e, movimento("P2", "E+", "1", "1000", "001", "2026-01-01"));
    }

    std::optional<Currency> pmc(FormulaPMC formula, const char* afecta, const char* quant,
                                const char* preco, bool porArmazem = false,
                                const char* data = "2026-03-01", std::int64_t numRegisto = 0) {
        const MovimentoCusto mov{
            QStringLiteral("P1"),  QString::fromLatin1(afecta), C(quant),  C(preco),
            QStringLiteral("001"), QString::fromLatin1(data),   numRegisto};
        return PrecoMedioCusto_Calcular(e, mov, formula, porArmazem);
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
    std::int64_t n0112 = 0;
};

TEST_F(PrecoMedioEmpresa, TotalsMethodSumsTheEntriesLessTheirReversals) {
    using F = FormulaPMC;
    struct Caso {
        const char* nome;
        std::optional<Currency> obtido;
        const char* esperado;
    };
    const Caso casos[] = {
        // Quantity 10+6-3+5 = 18, value 20+19-6+20 = 53, discount 1:
        // 53/18 - 1/18 = 2.9444 - 0.0556.
        {"history only (a sale adds nothing)", pmc(F::Totais, "S+", "7", "9"), "2.8888"},
        // + 12 x 2.25: quantity 30, value 80 -> 2.6667 - 0.0333.
        {"an entry being posted", pmc(F::Totais, "E+", "12", "2.25"), "2.6334"},
        // - 8 x 2.00: quantity 10, value 37 -> 3.7 - 0.1.
        {"a reversal being posted", pmc(F::Totais, "E-", "8", "2"), "3.6"},
        // Warehouse 001 only: quantity 13, value 33 -> 2.5385 - 0.0769.
        {"per warehouse", pmc(F::Totais, "S+", "1", "0", true), "2.4616"},
        // Up to 01-12: quantity 16, value 39 -> 2.4375 - 0.0625.
        {"up to a date", pmc(F::Totais, "NA", "0", "0", false, "2026-01-12"), "2.375"},
        // Nothing entered by then.
        {"no quantity left", pmc(F::Totais, "NA", "0", "0", false, "2026-01-01"), "0"},
    };
    for (const Caso& c : casos) {
        ASSERT_TRUE(c.obtido) << c.nome << " " << e.gConn.lastError().toStdString();
        EXPECT_EQ(*c.obtido, C(c.esperado)) << c.nome << ": " << c.obtido->toText().toStdString();
    }
}

TEST_F(PrecoMedioEmpresa, MovingAverageWalksTheLinesInDateOrder) {
    using F = FormulaPMC;
    struct Caso {
        const char* nome;
        std::optional<Currency> obtido;
        const char* esperado;
    };
    // 001: 10 at 2.00 -> avg 2, stock 10; sold 4 -> 6; 6 for 18 net -> (12+18)/12 = 2.5;
    // returned 2 -> 14; 3 back -> 11. 002: 5 at 4.00 -> (11 x 2.5 + 20)/16 = 2.96875.
    const Caso casos[] = {
        {"history of every warehouse", pmc(F::MediaMovel, "S+", "1", "0"), "2.9688"},
        {"warehouse 001", pmc(F::MediaMovel, "S+", "1", "0", true), "2.5"},
        // (11 x 2.5 + 9 x 3.5) / 20 = 59 / 20.
        {"an entry being posted", pmc(F::MediaMovel, "E+", "9", "3.5", true), "2.95"},
        {"a reversal moves only the stock", pmc(F::MediaMovel, "E-", "9", "3.5", true), "2.5"},
        // Up to the line of 01-12 by date and registry: the 01-12 return is the first stored.
        {"up to a registry number", pmc(F::MediaMovel, "NA", "0", "0", true, "2026-03-01", n0112),
         "0"},
        {"up to a date", pmc(F::MediaMovel, "NA", "0", "0", true, "2026-01-09"), "2"},
    };
    for (const Caso& c : casos) {
        ASSERT_TRUE(c.obtido) << c.nome << " " << e.gConn.lastError().toStdString();
        EXPECT_EQ(*c.obtido, C(c.esperado)) << c.nome << ": " << c.obtido->toText().toStdString();
    }
}

TEST(PrecoMedioMovel, AnEntryThatBringsANegativeStockToZeroTakesItsOwnCost) {
    testing::EmpresaTeste empresa(true);
    app::Estado& e = empresa.estado();
    grava(e, movimento("P1", "S+", "5", "0", "001", "2026-01-01"));
    grava(e, movimento("P1", "E+", "5", "3", "001", "2026-01-02"));
    grava(e, movimento("P1", "E+", "5", "5", "001", "2026-01-03"));
    const MovimentoCusto mov{
        QStringLiteral("P1"),  QStringLiteral("NA"),         Currency(), Currency(),
        QStringLiteral("001"), QStringLiteral("2026-02-01"), 0};
    // -5 +5 at 3 -> 3 (not a division by zero); then (0 x 3 + 25) / 5.
    EXPECT_EQ(PrecoMedioCusto_Calcular(e, mov, FormulaPMC::MediaMovel, false), C("5"));
}

}  // namespace
}  // namespace brasel::documents
