// The payment screen and the change display offscreen, driven by their buttons with the keypad
// answered from a script; each saves a picture of its window in /tmp for review.
#include "cash/ui/frm_troco.h"
#include "cash/ui/frm_troco_espera.h"

#include "cash/teclado_gravado.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QLabel>
#include <QLineEdit>
#include <QTreeWidget>

namespace brasel::cash {
namespace {

using teste::TecladoGravado;

using testing::clicar;
using testing::filho;
using testing::noDialogo;

QString T(const char* s) {
    return QString::fromUtf8(s);
}

Currency V(const char* s) {
    return *Currency::parse(QString::fromLatin1(s));
}

class FrmTrocoTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    QString texto(QWidget* d, const char* nome) { return filho<QLineEdit>(d, nome)->text(); }

    // The open document: a percent takes its share off 42.30.
    std::function<std::optional<Currency>(double)> aplica() {
        return [this](double p) -> std::optional<Currency> {
            percentagens << p;
            return V("42.30") - V("42.30").percentOf(p);
        };
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
    TecladoGravado teclado_;
    QList<double> percentagens;
};

TEST_F(FrmTrocoTeste, KeypadCurrencyAndMethodButtonsMakeThePayment) {
    frmTroco janela(e_, mensagens_, teclado_);
    teclado_.respostas = {V("10"), V("40"), V("50"), V("50")};
    QStringList vistos;
    noDialogo([&](QWidget* d) {
        EXPECT_EQ(d->objectName(), T("frmTroco"));
        EXPECT_EQ(texto(d, "txtPagaComo"), T("NU"));  // the table's default method
        EXPECT_EQ(filho<QLabel>(d, "lblPagaComo")->text(), T("Numerário"));
        EXPECT_TRUE(filho<QPushButton>(d, "cmdPagaComo_NU")->isChecked());
        clicar(d, "cmdDescontoPer");
        vistos << texto(d, "evalDescontoPer") << texto(d, "evalTotalDoc");
        clicar(d, "cmdAltTotalDoc");
        vistos << texto(d, "evalDescontoPer") << texto(d, "evalTotalDoc")
               << texto(d, "evalValor_Pagar") << texto(d, "evalDesconto");
        clicar(d, "cmdAltEntregou");
        vistos << texto(d, "evalTroco");
        noDialogo([](QWidget* pesquisa) {
            auto* lista = filho<QTreeWidget>(pesquisa, "lvwPesquisa");
            const auto usd = lista->findItems(QStringLiteral("USD"), Qt::MatchExactly, 0);
            ASSERT_EQ(usd.size(), 1);
            lista->setCurrentItem(usd.front());
            clicar(pesquisa, "cmdSeleccionar");
        });
        clicar(d, "cmdCambio");
        vistos << texto(d, "txtCambio") << filho<QLabel>(d, "lblCambio")->text()
               << texto(d, "evalEntregou");
        clicar(d, "cmdAltEntregou");
        clicar(d, "cmdPagaComo_MB");
        filho<QLineEdit>(d, "txtObserva")->setText(T("Mesa do canto"));
        vistos << texto(d, "evalTroco") << texto(d, "txtPagaComo");
        d->grab().save(QStringLiteral("/tmp/frmTroco.png"));
        clicar(d, "cmdFechaDiv");
    });
    const auto p = janela.Abrir(T("M01"), V("42.30"), aplica());
    EXPECT_EQ(vistos,
              (QStringList{T("10.00"), T("38.07"), T("0.00"), T("42.30"), T("40.00"), T("2.30"),
                           T("10.00"), T("USD"), T("US$"), T("0.00"), T("14.00"), T("MB")}));
    EXPECT_EQ(teclado_.titulos, (QStringList{T("Desconto %"), T("Valor a Pagar"),
                                             T("Valor Entregue"), T("Valor Entregue")}));
    EXPECT_EQ(percentagens, (QList<double>{10, 0}));
    ASSERT_TRUE(p);
    EXPECT_EQ(p->pagaComo, T("MB"));
    EXPECT_EQ(p->cambio, T("USD"));
    EXPECT_EQ(p->entregouNoCambio, V("50"));
    EXPECT_EQ(p->entregou, V("54"));
    EXPECT_EQ(p->troco, V("14"));
    EXPECT_EQ(p->desconto, V("2.30"));
    EXPECT_EQ(p->observa, T("Mesa do canto"));
}

TEST_F(FrmTrocoTeste, WithoutAMethodTheScreenStaysAndCancelGivesNothing) {
    if (!e_.gConn.exec(T("update Clientes set PagaComo='' where Codigo=?"), {T("M02")}))
        FAIL() << e_.gConn.lastError().toStdString();
    frmTroco janela(e_, mensagens_, teclado_);
    bool ficou = false;
    noDialogo([&](QWidget* d) {
        clicar(d, "cmdFechaDiv");
        ficou = d->isVisible();
        clicar(d, "cmdPagaComo_CC");
        clicar(d, "cmdFechaDiv");
    });
    const auto p = janela.Abrir(T("M02"), V("12.50"), aplica());
    EXPECT_TRUE(ficou);
    EXPECT_EQ(mensagens_.textos(), QStringList{T("Não definiu a Forma de Pagamento")});
    ASSERT_TRUE(p);
    EXPECT_EQ(p->pagaComo, T("CC"));
    EXPECT_EQ(p->entregou, V("12.50"));
    EXPECT_EQ(p->troco, V("0"));

    // The same window opens afresh for the next closing; Cancel hands back nothing.
    noDialogo([&](QWidget* d) {
        EXPECT_EQ(texto(d, "evalTotalDoc"), T("8.00"));
        EXPECT_EQ(texto(d, "txtObserva"), QString());
        clicar(d, "cmdCancelar");
    });
    EXPECT_EQ(janela.Abrir(T("M01"), V("8"), aplica()), std::nullopt);
}

TEST_F(FrmTrocoTeste, TheChangeDisplayOpensWithoutBlockingAndCloses) {
    frmTrocoEspera espera(e_);
    const QString documento = T("VD\nNº 000123\n2026-12-06");
    espera.Abrir(documento, T("ABRIR"), V("42.30"), V("50"), V("7.70"));
    EXPECT_TRUE(espera.isVisible());
    EXPECT_FALSE(espera.isModal());
    EXPECT_EQ(filho<QLabel>(&espera, "lblDocumento")->text(), documento);
    EXPECT_EQ(filho<QLabel>(&espera, "lblTotalDoc")->text(), T("42.30"));
    EXPECT_EQ(filho<QLabel>(&espera, "lblEntregou")->text(), T("50.00"));
    EXPECT_EQ(filho<QLabel>(&espera, "lblTroco")->text(), T("7.70"));
    espera.grab().save(QStringLiteral("/tmp/frmTrocoEspera.png"));
    espera.Abrir(QString(), T("FECHAR"), {}, {}, {});
    EXPECT_FALSE(espera.isVisible());
}

}  // namespace
}  // namespace brasel::cash
