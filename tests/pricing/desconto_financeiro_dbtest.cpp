// The financial discount built line by line counts the open lines of the current user's tab:
// tab lines hold the user's login, so lines under the user's code or another login are not his.
#include "pricing/desconto_financeiro.h"

#include "pricing/insere_teste.h"
#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

namespace brasel::pricing {
namespace {

using teste::insere;
using teste::T;
using teste::V;

class DescontoFinanceiroTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        e.param.casadec = 2;
        insere(e, "Clientes", {{"Codigo", T("M1")}, {"decdescgeral", 2}, {"arredescgeral", 1}});
        insere(e, "TabDescontosFinanceiros",
               {{"Cliente", T("M1")}, {"Produto", T("P1")}, {"DescontoFinanceiro", T("10")}});
    }

    void linha(const QString& utilizador, const char* iliq, int selecFecha = 1,
               const char* tipo = "VD") {
        insere(e, "MovProduto",
               {{"Codigo", T("P1")},
                {"Tipo", T(tipo)},
                {"Numero", T("")},
                {"Ano", T("2026")},
                {"CliFor", T("C")},
                {"Terceiro", T("M1")},
                {"Utilizador", utilizador},
                {"ValorIliq", T(iliq)},
                {"TotalDesconto", T("0")},
                {"SelecFecha", selecFecha},
                {"Fechado", T("N")}});
    }

    Currency valor() {
        const auto d = DescontoFinanceiro_Calcular(e, T("M1"), T("VD"), T("2026"), T(""), V("0"));
        EXPECT_TRUE(d.has_value());
        return d ? d->valor : V("-1");
    }

    testing::EmpresaTeste empresa;
    app::Estado& e = empresa.estado();
};

TEST_F(DescontoFinanceiroTeste, OnlyTheTickedLinesOfTheUsersLoginCount) {
    ASSERT_NE(e.gLogin, e.gUtilizador);
    struct Caso {
        const char* caso;
        QString utilizador;
        const char* iliq;
        int selecFecha;
        const char* tipo;
        const char* esperado;  // running total of the discount after this line
    };
    const Caso casos[] = {
        {"the login's ticked line", e.gLogin, "50", 1, "VD", "5"},
        {"a line under the user's code is not his tab", e.gUtilizador, "100", 1, "VD", "5"},
        {"another waiter's line", T("ANA"), "200", 1, "VD", "5"},
        {"the login's unticked line", e.gLogin, "300", 0, "VD", "5"},
        {"the login's line under another type", e.gLogin, "400", 1, "FT", "5"},
        {"a second ticked line of the login", e.gLogin, "20", 1, "VD", "7"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.caso);
        linha(c.utilizador, c.iliq, c.selecFecha, c.tipo);
        EXPECT_EQ(valor(), V(c.esperado));
    }
}

}  // namespace
}  // namespace brasel::pricing
