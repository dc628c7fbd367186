// The payment screen's rules on the demo restaurant (EUR, 2 decimals; USD 1.08, GBP 0.86): the
// method list and default, tendered amount, amount charged, discount percent, currency and
// confirmation, and the conversion switch they rest on.
#include "cash/troco.h"
#include "pricing/cambio.h"

#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>

namespace brasel::cash {
namespace {

using pricing::teste::V;

QString T(const char* s) {
    return QString::fromUtf8(s);
}

// The open document behind the screen: a discount percent takes that share off its undiscounted
// total, as the order screen's discount calculation does.
struct DocumentoAberto {
    Currency base;
    bool recusa = false;
    QList<double> pedidos;

    AplicaDesconto aplica() {
        return [this](double p) -> std::optional<Currency> {
            pedidos << p;
            if (recusa) return std::nullopt;
            return base - base.percentOf(p);
        };
    }
};

class TrocoTeste : public ::testing::Test {
  protected:
    void exec(const QString& sql, const QVariantList& valores = {}) {
        if (!e.gConn.exec(sql, valores))
            throw std::runtime_error(e.gConn.lastError().toStdString());
    }
    void formula(int valor) { exec(T("update ParamGeral set FormulaCalcCambioB=?"), {valor}); }
    Troco novo(const char* total) {
        doc.base = V(total);
        return Troco(e, mensagens, doc.base, doc.aplica());
    }

    testing::EmpresaTeste empresa{true};
    app::Estado& e = empresa.estado();
    testing::MensagensGravadas mensagens;
    DocumentoAberto doc;
};

TEST_F(TrocoTeste, MethodsComeByDescriptionWithTheirPicturesAndTheTablesDefault) {
    // A picture is raw bytes, zeros included: read back as text it would be cut short.
    const QByteArray foto("\x89PNG\r\n\x1a\n\0\0\0\rIHDR", 16);
    exec(T("update PagaComo set foto=? where codigo=?"), {foto, T("MB")});
    Troco t = novo("42.30");
    const auto formas = t.CarregarFPagamento(T("M01"));
    QStringList ordem;
    for (const BotaoPagaComo& f : formas)
        ordem << f.codigo;
    EXPECT_EQ(ordem, (QStringList{T("CC"), T("MW"), T("MB"), T("NU")}));
    EXPECT_EQ(formas[2].foto, foto);
    EXPECT_TRUE(formas[0].foto.isEmpty());
    EXPECT_EQ(t.txtPagaComo(), T("NU"));
    EXPECT_EQ(t.lblPagaComo(), T("Numerário"));

    // A method already chosen stays; a default that is no method is not taken.
    t.EscolhePagaComo(T("MB"));
    t.CarregarFPagamento(T("M01"));
    EXPECT_EQ(t.txtPagaComo(), T("MB"));
    exec(T("update Clientes set PagaComo=? where Codigo=?"), {T("XX"), T("M02")});
    Troco semMetodo = novo("42.30");
    semMetodo.CarregarFPagamento(T("M02"));
    EXPECT_EQ(semMetodo.txtPagaComo(), QString());
    semMetodo.EscolhePagaComo(T("ZZ"));
    EXPECT_EQ(semMetodo.txtPagaComo(), QString());
}

TEST_F(TrocoTeste, ConfirmingWithoutAMethodKeepsTheScreen) {
    Troco t = novo("10");
    EXPECT_EQ(t.Confirmar(), std::nullopt);
    ASSERT_EQ(mensagens.mensagens().size(), 1);
    EXPECT_EQ(mensagens.mensagens()[0].texto, T("Não definiu a Forma de Pagamento"));
    EXPECT_EQ(mensagens.mensagens()[0].icone, Icone::Critico);
    t.EscolhePagaComo(T(" CC "));
    const auto p = t.Confirmar();
    ASSERT_TRUE(p);
    EXPECT_EQ(p->pagaComo, T("CC"));
    EXPECT_EQ(mensagens.mensagens().size(), 1);
}

// One case: what the cashier does on a document of `total`, then the fields before confirming
// and what the confirmation hands back.
struct CasoValores {
    const char* nome;
    const char* total;
    std::function<void(Troco&)> accoes;
    const char* entregou;  // field, in txtCambio
    const char* troco;
    const char* pagar;
    const char* totalFinal;
    double percentagem;
    // Handed back by the confirmation.
    const char* entregouFinal;  // in the company's currency
    const char* trocoFinal;
    const char* descontoFinal;
    const char* cambioFinal;
};

TEST_F(TrocoTeste, TenderedChargedPercentAndCurrencyFollowTheirRules) {
    const CasoValores casos[] = {
        {"nothing tendered records the amount charged", "42.30", [](Troco&) {}, "0", "0", "42.30",
         "42.30", 0, "42.30", "0", "0", "EUR"},
        {"tendered above the amount gives change", "42.30",
         [](Troco& t) { t.AlteraEntregou(V("50")); }, "50", "7.70", "42.30", "42.30", 0, "50",
         "7.70", "0", "EUR"},
        {"tendered below the amount counts as nothing", "42.30",
         [](Troco& t) { t.AlteraEntregou(V("42.29")); }, "0", "0", "42.30", "42.30", 0, "42.30",
         "0", "0", "EUR"},
        {"an amount charged above the total charges the total", "42.30",
         [](Troco& t) { t.AlteraValorPagar(V("60")); }, "0", "0", "42.30", "42.30", 0, "42.30", "0",
         "0", "EUR"},
        {"a lower amount charged is a discount and moves the change", "42.30",
         [](Troco& t) {
             t.AlteraEntregou(V("50"));
             t.AlteraValorPagar(V("40"));
         },
         "50", "10", "40", "42.30", 0, "50", "10", "2.30", "EUR"},
        {"an amount charged of 0 charges the total", "42.30",
         [](Troco& t) { t.AlteraValorPagar(V("0")); }, "0", "0", "0", "42.30", 0, "42.30", "0", "0",
         "EUR"},
        {"a negative amount charged changes nothing", "42.30",
         [](Troco& t) { t.AlteraValorPagar(V("-5")); }, "0", "0", "42.30", "42.30", 0, "42.30", "0",
         "0", "EUR"},
        {"a percent of 99.99 is applied", "200", [](Troco& t) { t.AlteraDescontoPer(99.99); }, "0",
         "0", "0.02", "0.02", 99.99, "0.02", "0", "0", "EUR"},
        {"a percent keeps the change of what was tendered", "100",
         [](Troco& t) {
             t.AlteraEntregou(V("100"));
             t.AlteraDescontoPer(10);
         },
         "100", "10", "90", "90", 10, "100", "10", "0", "EUR"},
        {"100 percent or more is no discount", "100",
         [](Troco& t) {
             t.AlteraDescontoPer(10);
             t.AlteraDescontoPer(100);
         },
         "0", "0", "100", "100", 0, "100", "0", "0", "EUR"},
        {"a negative percent is no discount", "100", [](Troco& t) { t.AlteraDescontoPer(-5); }, "0",
         "0", "100", "100", 0, "100", "0", "0", "EUR"},
        {"an amount charged takes an applied percent off first", "100",
         [](Troco& t) {
             t.AlteraDescontoPer(10);
             t.AlteraValorPagar(V("95"));
         },
         "0", "0", "95", "100", 0, "95", "0", "5", "EUR"},
        {"a percent raising the amount due clears a short tendered amount", "100",
         [](Troco& t) {
             t.AlteraDescontoPer(20);
             t.AlteraEntregou(V("85"));
             t.AlteraDescontoPer(10);
         },
         "0", "0", "90", "90", 10, "90", "0", "0", "EUR"},
        {"changing the currency clears tendered and change", "42.30",
         [](Troco& t) {
             t.AlteraEntregou(V("50"));
             t.AlteraCambio(QStringLiteral("USD"));
         },
         "0", "0", "42.30", "42.30", 0, "42.30", "0", "0", "EUR"},
        {"choosing the same currency again keeps the amounts", "42.30",
         [](Troco& t) {
             t.AlteraEntregou(V("50"));
             t.AlteraCambio(QStringLiteral("eur"));
         },
         "50", "7.70", "42.30", "42.30", 0, "50", "7.70", "0", "EUR"},
        {"dollars are worth their rate", "42.30",
         [](Troco& t) {
             t.AlteraCambio(QStringLiteral("USD"));
             t.AlteraEntregou(V("50"));
         },
         "50", "11.70", "42.30", "42.30", 0, "54", "11.70", "0", "USD"},
        {"a currency without a rate converts at 1", "42.30",
         [](Troco& t) {
             t.AlteraCambio(QStringLiteral("JPY"));
             t.AlteraEntregou(V("50"));
         },
         "50", "7.70", "42.30", "42.30", 0, "50", "7.70", "0", "JPY"},
    };
    for (const CasoValores& c : casos) {
        SCOPED_TRACE(c.nome);
        Troco t = novo(c.total);
        t.EscolhePagaComo(QStringLiteral("NU"));
        c.accoes(t);
        EXPECT_EQ(t.evalEntregou(), V(c.entregou));
        EXPECT_EQ(t.evalTroco(), V(c.troco));
        EXPECT_EQ(t.evalValor_Pagar(), V(c.pagar));
        EXPECT_EQ(t.evalTotalDoc(), V(c.totalFinal));
        EXPECT_DOUBLE_EQ(t.evalDescontoPer(), c.percentagem);
        const auto p = t.Confirmar();
        ASSERT_TRUE(p);
        EXPECT_EQ(p->entregou, V(c.entregouFinal));
        EXPECT_EQ(p->troco, V(c.trocoFinal));
        EXPECT_EQ(p->desconto, V(c.descontoFinal));
        EXPECT_EQ(t.evalDesconto(), V(c.descontoFinal));
        EXPECT_EQ(p->cambio, T(c.cambioFinal));
        EXPECT_EQ(p->totalDoc, V(c.totalFinal));
        EXPECT_EQ(p->valorPagar, p->totalDoc - p->desconto);
        EXPECT_DOUBLE_EQ(p->descontoPer, c.percentagem);
    }
}

TEST_F(TrocoTeste, ARefusedDiscountLeavesEveryFieldAsItWas) {
    Troco t = novo("100");
    t.AlteraDescontoPer(10);
    t.AlteraEntregou(V("95"));
    doc.recusa = true;
    t.AlteraDescontoPer(20);
    t.AlteraValorPagar(V("50"));
    EXPECT_DOUBLE_EQ(t.evalDescontoPer(), 10);
    EXPECT_EQ(t.evalTotalDoc(), V("90"));
    EXPECT_EQ(t.evalValor_Pagar(), V("90"));
    EXPECT_EQ(t.evalTroco(), V("5"));
    EXPECT_EQ(doc.pedidos, (QList<double>{10, 20, 0}));
}

// The rate's quote decides what converts into the company's money: USD 1.08 is worth 1.08 euros
// (0) or one euro buys 1.08 dollars (1).
TEST_F(TrocoTeste, TheFormulaSwitchDecidesHowTheRateConverts) {
    struct Caso {
        int formula;
        const char* sentido;
        const char* esperado;
    };
    const Caso casos[] = {
        {0, "+", "54.000000"}, {0, "-", "46.296296"}, {1, "+", "46.296296"},
        {1, "-", "54.000000"}, {7, "+", "54.000000"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.formula);
        SCOPED_TRACE(c.sentido);
        formula(c.formula);
        const auto r = pricing::ConverteCambio_SEIS_Decimais(e, V("50"), T("USD"), T(c.sentido));
        ASSERT_TRUE(r);
        EXPECT_EQ(r->toText(), T(c.esperado));
    }

    // On the screen, rounded to the company's decimals; a short amount is judged in euros, not
    // by the figure counted in dollars.
    formula(1);
    Troco t = novo("42.30");
    t.EscolhePagaComo(T("NU"));
    t.AlteraCambio(T("USD"));
    t.AlteraEntregou(V("50"));
    EXPECT_EQ(t.evalTroco(), V("4.00"));  // 46.30 - 42.30
    t.AlteraEntregou(V("45"));            // 41.67 euros
    EXPECT_EQ(t.evalEntregou(), V("0"));
    exec(T("update Cambios set valor=null where codigo=?"), {T("USD")});
    t.AlteraEntregou(V("45"));
    EXPECT_EQ(t.evalTroco(), V("2.70"));
}

}  // namespace
}  // namespace brasel::cash
