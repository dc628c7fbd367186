// Changing user offscreen: a waiter of the demo takes over after a wrong and a right password,
// and the window keeps its position; the password prompts of the supervisor and of the user
// confirmation.
#include "app/definicoes_posto.h"
#include "app/ui/frm_confirmacao_utilizador.h"
#include "app/ui/frm_muda_utilizador.h"
#include "app/ui/frm_password_supervisor.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QLineEdit>
#include <QTreeWidget>

namespace brasel::app {
namespace {

using testing::clicar;
using testing::EmpresaTeste;
using testing::filho;
using testing::MensagensGravadas;
using testing::noDialogo;

class JanelasUtilizador : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    testing::DefinicoesTemporarias definicoes;
    EmpresaTeste empresa{true};
    Estado& e = empresa.estado();
    MensagensGravadas m;
};

// Types `password` in the prompt and presses OK.
void responde(QWidget* prompt, const QString& password) {
    filho<QLineEdit>(prompt, "txtPassword")->setText(password);
    clicar(prompt, "cmdOK");
}

TEST_F(JanelasUtilizador, AWaiterTakesOverAfterTheRightPassword) {
    ASSERT_TRUE(posto::ConfigRest_PedePWD.gravar(true));
    frmMudaUtilizador janela(e, m);
    bool avisado = false;
    QObject::connect(&janela, &frmMudaUtilizador::utilizadorMudado, [&avisado] { avisado = true; });
    QTreeWidget* lista = janela.lvwUtilizadores();
    ASSERT_EQ(lista->topLevelItemCount(), 3);
    EXPECT_EQ(lista->topLevelItem(0)->text(1), QStringLiteral("ANA"));
    EXPECT_TRUE(lista->isColumnHidden(0));
    EXPECT_TRUE(lista->isColumnHidden(2));

    QStringList vistos;
    noDialogo([&](QWidget* d) {
        d->move(150, 60);
        // OK without a user: the window says so and stays.
        clicar(d, "cmdOK");
        EXPECT_TRUE(d->isVisible());
        lista->setCurrentItem(lista->topLevelItem(0));
        noDialogo([&](QWidget* prompt) {
            vistos << prompt->objectName();
            responde(prompt, QStringLiteral("errada"));
            // A wrong password: the prompt stays, empty, for another try.
            EXPECT_TRUE(prompt->isVisible());
            EXPECT_TRUE(filho<QLineEdit>(prompt, "txtPassword")->text().isEmpty());
            prompt->grab().save(QStringLiteral("/tmp/frmMudaUtilizadorPassword.png"));
            responde(prompt, EmpresaTeste::password());
        });
        d->grab().save(QStringLiteral("/tmp/frmMudaUtilizador.png"));
        clicar(d, "cmdOK");
    });
    EXPECT_TRUE(janela.Muda_de_Utilizador());
    EXPECT_EQ(vistos, QStringList{QStringLiteral("frmMudaUtilizadorPassword")});
    EXPECT_TRUE(avisado);
    EXPECT_EQ(m.textos(), (QStringList{QStringLiteral("Não Definiu o Utilizador!"),
                                       QStringLiteral("Password Inválida!")}));
    EXPECT_EQ(e.gUtilizador, QStringLiteral("02"));
    EXPECT_EQ(e.gConn.params().login, QStringLiteral("ANA"));
    EXPECT_EQ(posto::JanUtilizadorL.ler(0), 150);
    EXPECT_EQ(posto::JanUtilizadorT.ler(0), 60);
}

TEST_F(JanelasUtilizador, CancellingThePasswordKeepsTheUser) {
    ASSERT_TRUE(posto::ConfigRest_PedePWD.gravar(true));
    frmMudaUtilizador janela(e, m);
    janela.lvwUtilizadores()->setCurrentItem(janela.lvwUtilizadores()->topLevelItem(1));
    noDialogo([](QWidget* prompt) { clicar(prompt, "cmdCancelar"); });
    clicar(&janela, "cmdOK");
    EXPECT_EQ(e.gUtilizador, QStringLiteral("01"));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

TEST_F(JanelasUtilizador, WithoutPasswordAskedTheChoiceIsEnough) {
    frmMudaUtilizador janela(e, m);
    janela.lvwUtilizadores()->setCurrentItem(janela.lvwUtilizadores()->topLevelItem(1));
    clicar(&janela, "cmdOK");
    EXPECT_EQ(e.gUtilizador, QStringLiteral("03"));
    EXPECT_EQ(e.gNomeUtilizador, QStringLiteral("RUI"));
}

TEST_F(JanelasUtilizador, SupervisorPromptStaysUntilTheRightPassword) {
    int prompts = 0;
    noDialogo([&](QWidget* prompt) {
        ++prompts;
        EXPECT_EQ(prompt->objectName(), QStringLiteral("frmPasswordSupervisor"));
        responde(prompt, QStringLiteral("errada"));
        EXPECT_TRUE(prompt->isVisible());
        responde(prompt, EmpresaTeste::password());
    });
    EXPECT_TRUE(frmPasswordSupervisor::Autoriza(e, m));
    EXPECT_EQ(prompts, 1);
    EXPECT_EQ(m.textos(), QStringList{QStringLiteral("Password Inválida !")});

    noDialogo([](QWidget* prompt) { clicar(prompt, "cmdCancelar"); });
    EXPECT_FALSE(frmPasswordSupervisor::Autoriza(e, m));

    // A workstation that switched the password off asks nothing.
    ASSERT_TRUE(posto::ConfigRest_DesactivaPassword.gravar(true));
    EXPECT_TRUE(frmPasswordSupervisor::Autoriza(e, m));
}

TEST_F(JanelasUtilizador, ConfirmationGivesTheCodeOfTheLogin) {
    frmConfirmacaoUtilizador janela(e, m);
    noDialogo([](QWidget* prompt) {
        filho<QLineEdit>(prompt, "txtLogin")->setText(QStringLiteral("rui"));
        prompt->grab().save(QStringLiteral("/tmp/frmConfirmacaoUtilizador.png"));
        responde(prompt, EmpresaTeste::password());
    });
    EXPECT_EQ(janela.UtilizadorConfirma_str(), QStringLiteral("03"));

    noDialogo([](QWidget* prompt) {
        filho<QLineEdit>(prompt, "txtLogin")->setText(QStringLiteral("rui"));
        responde(prompt, QStringLiteral("errada"));
        EXPECT_TRUE(prompt->isVisible());
        clicar(prompt, "cmdCancelar");
    });
    EXPECT_EQ(janela.UtilizadorConfirma_str(), QString());
    EXPECT_EQ(m.mensagens().size(), 1);
    EXPECT_EQ(e.gUtilizador, QStringLiteral("01"));
}

}  // namespace
}  // namespace brasel::app
