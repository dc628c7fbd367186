#include "devices/balanca.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <limits>

namespace brasel::devices {
namespace {

Currency valor(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

// The weighing dialog of a test: keeps the unit prices it was asked to weigh at and answers a
// fixed weight.
class BalancaGravada : public PortaBalanca {
  public:
    Currency pesa(Currency precoUnitario) override {
        precos.append(precoUnitario);
        return valor("1.25");
    }
    QList<Currency> precos;
};

// The demo's VAT tables: "NO" 23 % with prices including VAT, "RD" 6 % and "IT" 13 % without.
TEST(BalancaCur, PrecoUnitarioConformeATabelaDeIva) {
    testing::EmpresaTeste empresa(true);
    struct Caso {
        const char* tabela;
        const char* semIva;
        const char* comIva;
        double taxa;
        const char* enviado;
    };
    const Caso casos[] = {
        {"NO", "10", "12.3", 23, "12.3"},
        // Without VAT included the price with VAT handed in is not used: the rate is applied.
        {"RD", "10", "99", 6, "10.6"},
        {"IT", "2.5", "0", 13, "2.825"},
        {"XX", "10", "99", 23, "12.3"},
        {"N'O", "10", "99", 23, "12.3"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.tabela);
        BalancaGravada dialogo;
        const Currency peso = Balanca_cur(empresa.estado().gConn, dialogo, valor(c.semIva),
                                          QString::fromLatin1(c.tabela), valor(c.comIva), c.taxa);
        EXPECT_EQ(peso, valor("1.25"));
        EXPECT_EQ(dialogo.precos, QList<Currency>{valor(c.enviado)});
    }
}

TEST(BalancaCur, PrecoForaDoAlcanceNaoPesa) {
    testing::EmpresaTeste empresa(true);
    BalancaGravada dialogo;
    const Currency enorme = Currency::fromRaw(std::numeric_limits<std::int64_t>::max() / 2);
    EXPECT_EQ(
        Balanca_cur(empresa.estado().gConn, dialogo, enorme, QStringLiteral("RD"), Currency(), 150),
        Currency());
    EXPECT_TRUE(dialogo.precos.isEmpty());
}

}  // namespace
}  // namespace brasel::devices
