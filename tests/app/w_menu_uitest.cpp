// The main window as a waiter sees it: the status bar, a window refused by its rights row, the
// ways out that the rights never disable, and logging off.
#include "app/ui/acessos_janela.h"
#include "app/ui/frm_acessos.h"
#include "app/ui/w_menu.h"
#include "db/connections.h"
#include "devices/definicao_impressora.h"
#include "display.h"
#include "impressora.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/devsim_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QAction>
#include <QDir>
#include <QLabel>
#include <QMdiSubWindow>
#include <QMessageBox>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;

class MenuPrincipal : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        Estado& e = empresa.estado();
        e.gUtilizador = QStringLiteral("02");
        e.gNomeEmpresa = QStringLiteral("Restaurante Demonstração");
        ASSERT_TRUE(
            e.gConn.exec(QStringLiteral("update Utilizador set UsoPOS=1 where Codigo='02'")));
    }

    QAction* accao(WMenu& menu, const char* nome) {
        auto* a = menu.findChild<QAction*>(QString::fromLatin1(nome));
        EXPECT_NE(a, nullptr) << nome;
        return a;
    }

    testing::DefinicoesTemporarias definicoes;
    EmpresaTeste empresa{true};
};

TEST_F(MenuPrincipal, WaiterSeesTheStatusBarAndTheWindowReadsWellAt1024x768) {
    WMenu menu(empresa.estado());
    ASSERT_TRUE(menu.carregar());
    menu.resize(1024, 768);
    menu.show();
    const auto* utilizador = menu.findChild<QLabel*>(QStringLiteral("Painel3"));
    ASSERT_NE(utilizador, nullptr);
    EXPECT_EQ(utilizador->text(), QStringLiteral("ANA - 02"));
    EXPECT_EQ(menu.findChild<QLabel*>(QStringLiteral("Painel4"))->text(),
              QStringLiteral("Arm.-> ") + empresa.estado().gArmazem);
    const QString capturas = qEnvironmentVariable("BRASEL_CAPTURAS");
    if (!capturas.isEmpty()) menu.grab().save(QDir(capturas).filePath(QStringLiteral("WMenu.png")));
}

TEST_F(MenuPrincipal, WindowRefusedByItsRightsRowDoesNotOpen) {
    Estado& e = empresa.estado();
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("insert into acessos (utilizador, chave, value) values ('02', ?, 0)"),
        {chaveJanela(QStringLiteral("AConfiguraRest"))}));
    WMenu menu(e);
    ASSERT_TRUE(menu.carregar());
    QString mostrada;
    testing::noDialogo([&mostrada](QWidget* dialogo) {
        auto* caixa = qobject_cast<QMessageBox*>(dialogo);
        ASSERT_NE(caixa, nullptr) << dialogo->objectName().toStdString();
        mostrada = caixa->text();
        caixa->accept();
    });
    accao(menu, "DefBott_Fonte")->trigger();
    EXPECT_EQ(mostrada, QStringLiteral("Acesso Negado !"));
}

TEST_F(MenuPrincipal, TheOrderScreenOpensInsideTheFrame) {
    WMenu menu(empresa.estado());
    ASSERT_TRUE(menu.carregar());
    accao(menu, "Testes")->trigger();
    ASSERT_EQ(menu.area()->subWindowList().size(), 1);
    EXPECT_EQ(menu.area()->subWindowList().first()->widget()->objectName(),
              QStringLiteral("frmFacturacao"));
}

TEST_F(MenuPrincipal, WaysOutAreNeverDisabledByTheRights) {
    Estado& e = empresa.estado();
    testing::MensagensGravadas m;
    frmAcessos janela(e, m, [] { return QList<JanelaAcesso>{}; });
    ASSERT_TRUE(verificarAcesso(e, &janela, QStringLiteral("Acessos dos Utilizadores"), m));
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("update acessos set value=0 where utilizador='02' and ctrl<>''")));
    ASSERT_TRUE(verificarAcesso(e, &janela, QStringLiteral("Acessos dos Utilizadores"), m));
    EXPECT_FALSE(testing::filho<QPushButton>(&janela, "cmdGravar")->isEnabled());
    EXPECT_TRUE(testing::filho<QPushButton>(&janela, "cmdFechar")->isEnabled());
}

TEST_F(MenuPrincipal, LogOffEndsTheWorkOfTheUser) {
    Estado& e = empresa.estado();
    auto* menu = new WMenu(e);
    ASSERT_TRUE(menu->carregar());
    menu->show();
    int terminou = 0;
    QObject::connect(menu, &WMenu::terminou, [&terminou] { ++terminou; });
    accao(*menu, "LogOff")->trigger();
    EXPECT_EQ(terminou, 1);
    EXPECT_FALSE(e.gConn.isOpen());
    EXPECT_FALSE(e.gConnAux.isOpen());
    EXPECT_FALSE(e.gConnLocks.isOpen());
    delete menu;
    // The in-use flag was cleared before the connections closed.
    db::Connection conn;
    QString password = EmpresaTeste::password();
    ASSERT_TRUE(db::Abre_Connexao(conn, empresa.pasta(), QStringLiteral("Vendrola0001"),
                                  EmpresaTeste::login(), password, {}, QStringLiteral("SQL"), 0,
                                  60));
    EXPECT_EQ(conn.firstRow(QStringLiteral("select UsoPOS from Utilizador where Codigo='02'"))
                  ->value(0)
                  .toInt(),
              0);
}

TEST_F(MenuPrincipal, DisplayGreetsAndSaysGoodbyeAndTheDrawerOpensFromTheMenu) {
    Estado& e = empresa.estado();
    testing::DevsimTeste devsim;
    const auto definicao = devices::LerDefinicaoImpressora(e.gConn, QStringLiteral("EP1"));
    ASSERT_TRUE(definicao);
    auto& impressora = devsim.liga(definicao->porta,
                                   std::make_shared<devsim::ImpressoraTalao>(definicao->codigos));
    auto& display = devsim.liga(2, std::make_shared<devsim::Display>());
    devsim.aplica(e);
    auto* menu = new WMenu(e);
    ASSERT_TRUE(menu->carregar());
    EXPECT_TRUE(
        display.espera([](const QByteArray& b) { return b.contains("Aguarde Por Favor"); }, 3000));
    accao(*menu, "mnuAbreCaixa")->trigger();
    const QByteArray gaveta = definicao->codigos.abrirCaixa;
    EXPECT_TRUE(
        impressora.espera([&gaveta](const QByteArray& b) { return b.contains(gaveta); }, 3000))
        << impressora.transcricao().toStdString();
    menu->show();
    accao(*menu, "LogOff")->trigger();
    EXPECT_TRUE(
        display.espera([](const QByteArray& b) { return b.contains("< ENCERRADO >"); }, 3000))
        << display.transcricao().toStdString();
    delete menu;
}

}  // namespace
}  // namespace brasel::app
