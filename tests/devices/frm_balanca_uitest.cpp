// The weighing dialog offscreen against a simulated price-computing scale on COM5: the capture,
// the weight handed back, the settings fields rewritten and saved.
#include "balancas.h"
#include "devices/ui/frm_balanca.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/devsim_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

#include <memory>

namespace brasel::devices {
namespace {

using testing::clicar;
using testing::filho;
using testing::noDialogo;

Currency valor(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

class JanelaBalanca : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        devsim_.aplica(estado_);
        balanca_->defineSituacao(*devsim::SituacaoBalanca::deOpcoes(QStringLiteral("peso=1.250")));
        // A pseudo-terminal takes 8 data bits without parity only.
        ASSERT_TRUE((DefinicoesBalanca{QStringLiteral("5"), QStringLiteral("9600,n,8,1"),
                                       QStringLiteral("0.5"), QStringLiteral("CS300")}
                         .gravar()));
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::DevsimTeste devsim_;
    std::shared_ptr<devsim::BalancaCS300> balanca_ = std::make_shared<devsim::BalancaCS300>();
    devsim::ServidorDispositivo& servidor_ = devsim_.liga(5, balanca_);
    app::Estado estado_;
};

TEST_F(JanelaBalanca, CapturaEDevolveOPeso) {
    frmBalanca janela(estado_);
    EXPECT_EQ(janela.objectName(), QStringLiteral("frmBalanca"));
    EXPECT_EQ(janela.windowTitle(), QStringLiteral("Ligação à Balança - CS300"));
    QString estado;
    noDialogo([&](QWidget* d) {
        clicar(d, "cmdCapturarPesagem");
        estado = filho<QLabel>(d, "lblEstado")->text();
        clicar(d, "cmdOK");
    });
    EXPECT_EQ(janela.pesa(valor("12.5")), valor("1.25"));
    EXPECT_EQ(estado, QStringLiteral("Captura efectuada   [ 1.250 ]"));
    ASSERT_FALSE(balanca_->pedidos().isEmpty());
    EXPECT_EQ(balanca_->pedidos().first(), QByteArrayLiteral("\x04\x02"
                                                             "01\x1B"
                                                             "001250\x1B\x03"));
}

TEST_F(JanelaBalanca, SemCapturaDevolveZero) {
    struct Caso {
        const char* nome;
        const char* situacao;
        const char* botao;
    };
    // A failed weighing clears a weight captured before it; Cancel never hands one back.
    const Caso casos[] = {
        {"pesagem falhada", "peso=1.250,instavel", "cmdOK"},
        {"cancelada", "peso=1.250", "cmdCancelar"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        frmBalanca janela(estado_);
        QString estado;
        noDialogo([&](QWidget* d) {
            clicar(d, "cmdCapturarPesagem");
            balanca_->defineSituacao(
                *devsim::SituacaoBalanca::deOpcoes(QString::fromLatin1(c.situacao)));
            clicar(d, "cmdCapturarPesagem");
            estado = filho<QLabel>(d, "lblEstado")->text();
            clicar(d, c.botao);
        });
        EXPECT_EQ(janela.pesa(valor("12.5")), Currency());
        EXPECT_FALSE(estado.isEmpty());
        balanca_->defineSituacao(*devsim::SituacaoBalanca::deOpcoes(QStringLiteral("peso=1.250")));
    }
}

TEST_F(JanelaBalanca, CamposReescritosEGravadosAoFechar) {
    frmBalanca janela(estado_);
    auto* porta = filho<QLineEdit>(&janela, "txtPortaCom");
    auto* espera = filho<QLineEdit>(&janela, "txtTimeOut");
    auto* tipo = filho<QComboBox>(&janela, "cmbTipoBalanca");
    porta->setText(QStringLiteral("0"));
    Q_EMIT porta->editingFinished();
    EXPECT_EQ(porta->text(), QStringLiteral("1"));
    espera->setText(QStringLiteral("2.5s"));
    Q_EMIT espera->editingFinished();
    EXPECT_EQ(espera->text(), QStringLiteral("2.5"));
    tipo->setCurrentText(QStringLiteral("D70"));
    EXPECT_EQ(janela.windowTitle(), QStringLiteral("Ligação à Balança - D70"));

    noDialogo([](QWidget* d) { clicar(d, "cmdCancelar"); });
    janela.pesa(valor("1"));
    const DefinicoesBalanca gravadas = DefinicoesBalanca::ler();
    EXPECT_EQ(gravadas.portaCom, QStringLiteral("1"));
    EXPECT_EQ(gravadas.timeOut, QStringLiteral("2.5"));
    EXPECT_EQ(gravadas.tipoBalanca, QStringLiteral("D70"));
    EXPECT_EQ(gravadas.inicializar, QStringLiteral("9600,n,8,1"));
}

}  // namespace
}  // namespace brasel::devices
