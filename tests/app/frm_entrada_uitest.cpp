// The windows of the way in, offscreen: the demo company is chosen and the supervisor and a
// waiter log in through the flow; every Cancel goes back one stage; the server maintenance and
// the search window on their own.
#include "app/definicoes_posto.h"
#include "app/ui/fluxo_entrada.h"
#include "app/ui/frm_login.h"
#include "app/ui/frm_sel_empresa.h"
#include "app/ui/frm_sel_empresa_pesquisar.h"
#include "app/ui/frm_sel_empresas_validacao.h"
#include "common/ediv.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTemporaryDir>
#include <QTimer>
#include <QTreeWidget>

#include <gtest/gtest.h>

#include <functional>

namespace brasel::app {
namespace {

using testing::DefinicoesTemporarias;
using testing::EmpresaTeste;
using testing::MensagensGravadas;

template <class T>
T* filho(QWidget* janela, const char* nome) {
    T* w = janela ? janela->findChild<T*>(QString::fromLatin1(nome)) : nullptr;
    EXPECT_NE(w, nullptr) << nome;
    return w;
}

void clicar(QWidget* janela, const char* botao) {
    if (auto* b = filho<QPushButton>(janela, botao)) b->click();
}

// Windows closed by the flow are deleted on the way back to the event loop.
void apagarPendentes() {
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void entrar(frmLogin* login, const QString& nome, const QString& password) {
    filho<QLineEdit>(login, "txtLogin")->setText(nome);
    filho<QLineEdit>(login, "txtPassword")->setText(password);
    clicar(login, "cmdOK");
}

class JanelasEntrada : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        ListaServidores lista;
        lista[0].servidor = empresa.pasta();
        lista[0].login = EmpresaTeste::login();
        lista[0].definirPassword(EmpresaTeste::password());
        lista[0].tipoAutenticacao = QStringLiteral("SQL");
        ASSERT_TRUE(gravarServidores(lista));
    }

    DefinicoesTemporarias definicoes;
    EmpresaTeste empresa{true};
    Estado estado;
    MensagensGravadas m;
};

TEST_F(JanelasEntrada, SupervisorAndWaiterLogInAndEachCancelGoesBackOneStage) {
    bool terminou = false;
    FluxoEntrada fluxo(estado, m, {}, {}, [](Estado&) {
        auto* w = new QWidget;
        w->setObjectName(QStringLiteral("WMenu"));
        return w;
    });
    QObject::connect(&fluxo, &FluxoEntrada::terminado, [&terminou] { terminou = true; });
    fluxo.iniciar();

    frmSelEmpresa* seleccao = fluxo.seleccao();
    ASSERT_NE(seleccao, nullptr);
    EXPECT_TRUE(seleccao->isVisible());
    EXPECT_TRUE(
        filho<QLabel>(seleccao, "lblVersao")->text().startsWith(QStringLiteral("Versão Actual [")));
    ASSERT_EQ(filho<QTreeWidget>(seleccao, "lvwEmpresas")->topLevelItemCount(), 1);
    clicar(seleccao, "cmdOK");
    apagarPendentes();
    EXPECT_EQ(fluxo.seleccao(), nullptr);
    EXPECT_EQ(estado.gEmpresa, QStringLiteral("0001"));

    frmLogin* login = fluxo.login();
    ASSERT_NE(login, nullptr);
    ASSERT_TRUE(login->isVisible());
    filho<QLineEdit>(login, "txtLogin")->setText(QStringLiteral("supervisor"));
    filho<QLineEdit>(login, "txtPassword")->setText(EmpresaTeste::password());
    clicar(login, "cmdOK");
    ASSERT_NE(fluxo.principal(), nullptr);
    EXPECT_EQ(fluxo.principal()->objectName(), QStringLiteral("WMenu"));
    EXPECT_TRUE(fluxo.principal()->isVisible());
    EXPECT_FALSE(login->isVisible());
    EXPECT_EQ(estado.gUtilizador, QStringLiteral("01"));

    // Closing the main window brings the login back with the last name typed.
    fluxo.principal()->close();
    apagarPendentes();
    EXPECT_EQ(fluxo.principal(), nullptr);
    ASSERT_EQ(fluxo.login(), login);
    EXPECT_TRUE(login->isVisible());
    EXPECT_EQ(filho<QLineEdit>(login, "txtLogin")->text(), QStringLiteral("SUPERVISOR"));
    EXPECT_TRUE(filho<QLineEdit>(login, "txtPassword")->text().isEmpty());

    entrar(login, QStringLiteral("ana"), QStringLiteral("errada"));
    EXPECT_EQ(fluxo.principal(), nullptr);
    EXPECT_TRUE(login->isVisible());
    EXPECT_TRUE(filho<QLineEdit>(login, "txtPassword")->text().isEmpty());
    entrar(login, QStringLiteral("ana"), EmpresaTeste::password());
    ASSERT_NE(fluxo.principal(), nullptr);
    EXPECT_EQ(estado.gUtilizador, QStringLiteral("02"));
    fluxo.principal()->close();
    apagarPendentes();
    EXPECT_TRUE(m.mensagens().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();

    // Cancel in the login: back to the company list, the company's connections closed.
    clicar(login, "cmdCancelar");
    apagarPendentes();
    EXPECT_EQ(fluxo.login(), nullptr);
    EXPECT_FALSE(estado.gConn.isOpen() || estado.gConnAux.isOpen() || estado.gConnLocks.isOpen());
    seleccao = fluxo.seleccao();
    ASSERT_NE(seleccao, nullptr);
    EXPECT_TRUE(seleccao->isVisible());
    EXPECT_FALSE(terminou);

    // Cancel in the company list ends the program and keeps its filters.
    filho<QLineEdit>(seleccao, "txtEmpresa")->setText(QStringLiteral("tasca"));
    clicar(seleccao, "cmdCancelar");
    apagarPendentes();
    EXPECT_TRUE(terminou);
    EXPECT_EQ(fluxo.seleccao(), nullptr);
    EXPECT_EQ(posto::ME_Empresa.ler(), QStringLiteral("tasca"));
}

TEST_F(JanelasEntrada, RefusedCompanyStaysInTheList) {
    ASSERT_TRUE(
        empresa.estado().gConn.exec(QStringLiteral("update ParamGeral set ConverteuNVARCHAR=0")));
    bool escolhida = false;
    frmSelEmpresa seleccao(estado, m, {});
    QObject::connect(&seleccao, &frmSelEmpresa::empresaEscolhida,
                     [&escolhida] { escolhida = true; });
    seleccao.show();
    clicar(&seleccao, "cmdOK");
    EXPECT_FALSE(escolhida);
    EXPECT_TRUE(seleccao.isVisible());
    EXPECT_TRUE(m.contem(QStringLiteral("ainda não foi convertida")));
    // The year filter hides the company; an empty one shows it again.
    filho<QLineEdit>(&seleccao, "txtAno")->setText(QStringLiteral("1999"));
    clicar(&seleccao, "cmdFiltrar");
    EXPECT_EQ(filho<QTreeWidget>(&seleccao, "lvwEmpresas")->topLevelItemCount(), 0);
    filho<QLineEdit>(&seleccao, "txtAno")->clear();
    clicar(&seleccao, "cmdFiltrar");
    EXPECT_EQ(filho<QTreeWidget>(&seleccao, "lvwEmpresas")->topLevelItemCount(), 1);
}

// Runs `passo` on the modal window that the next action opens.
void naJanelaModal(std::function<void(QWidget*)> passo) {
    QTimer::singleShot(0, [passo = std::move(passo)] {
        QWidget* modal = QApplication::activeModalWidget();
        EXPECT_NE(modal, nullptr);
        if (modal) passo(modal);
    });
}

TEST_F(JanelasEntrada, SearchAndServersOpenFromTheCompanyList) {
    frmSelEmpresa seleccao(estado, m, {});
    seleccao.show();
    auto* lista = filho<QTreeWidget>(&seleccao, "lvwEmpresas");
    lista->setCurrentItem(nullptr);
    QString aberta;
    naJanelaModal([&aberta](QWidget* janela) {
        aberta = janela->objectName();
        filho<QLineEdit>(janela, "txtPesquisa")->setText(QStringLiteral("0001"));
        clicar(janela, "cmdOK");
    });
    clicar(&seleccao, "cmdPesquisar");
    EXPECT_EQ(aberta, QStringLiteral("frmSelEmpresaPesquisar"));
    ASSERT_NE(lista->currentItem(), nullptr);
    EXPECT_EQ(lista->currentItem()->text(0), QStringLiteral("0001"));

    // Saving the servers lists the companies again: here, none is left.
    naJanelaModal([&aberta](QWidget* janela) {
        aberta = janela->objectName();
        auto* servidores = filho<QTreeWidget>(janela, "lvwServidores");
        servidores->setCurrentItem(servidores->topLevelItem(0));
        clicar(janela, "cmdApagar");
        clicar(janela, "cmdGravar");
    });
    clicar(&seleccao, "cmdServidores");
    EXPECT_EQ(aberta, QStringLiteral("frmSelEmpresas_Validacao"));
    EXPECT_EQ(lista->topLevelItemCount(), 0);
    EXPECT_FALSE(lerServidores()[0].emUso());
}

TEST_F(JanelasEntrada, ServerMaintenanceEditsImportsAndSavesTheList) {
    frmSelEmpresas_Validacao janela(m);
    auto* lista = filho<QTreeWidget>(&janela, "lvwServidores");
    ASSERT_EQ(lista->topLevelItemCount(), 1);
    lista->setCurrentItem(lista->topLevelItem(0));
    EXPECT_EQ(filho<QLineEdit>(&janela, "txtPassword")->text(), EmpresaTeste::password());

    // A second entry with the same server is refused.
    clicar(&janela, "cmdAdicionar");
    EXPECT_EQ(m.textos(), QStringList{QStringLiteral("Servidor já Existente!")});

    // Windows authentication takes neither login nor password.
    filho<QLineEdit>(&janela, "txtServidor")->setText(QStringLiteral("postgresql://caixa"));
    filho<QRadioButton>(&janela, "optWIN")->setChecked(true);
    EXPECT_FALSE(filho<QLineEdit>(&janela, "txtLogin")->isEnabled());
    EXPECT_FALSE(filho<QLineEdit>(&janela, "txtPassword")->isEnabled());
    clicar(&janela, "cmdAdicionar");
    ASSERT_EQ(lista->topLevelItemCount(), 2);
    EXPECT_EQ(janela.lista()[1].tipoAutenticacao, QStringLiteral("WIN"));
    EXPECT_TRUE(janela.lista()[1].login.isEmpty());

    QTemporaryDir pasta;
    const QString csv = QDir(pasta.path()).filePath(QStringLiteral("Empresas.csv"));
    QFile f(csv);
    ASSERT_TRUE(f.open(QIODevice::WriteOnly));
    QString pwd = EDiv::Encrypt(QStringLiteral("a,b\"c"));
    pwd.replace(QLatin1Char('"'), QStringLiteral("\"\""));
    f.write((QStringLiteral("Server,UID,PWD\n\"/outra,pasta\",sa,\"") + pwd +
             QStringLiteral("\"\npostgresql://caixa,sa,x\n"))
                .toUtf8());
    f.close();
    m.limpar();
    janela.importar(csv);
    EXPECT_EQ(
        m.textos(),
        QStringList{QStringLiteral("Foram importados 1 Servidores.\r\n1 já existiam na lista.")});
    ASSERT_EQ(lista->topLevelItemCount(), 3);
    EXPECT_EQ(janela.lista()[2].password(), QStringLiteral("a,b\"c"));

    // Nothing is stored before Save.
    EXPECT_FALSE(lerServidores()[1].emUso());
    clicar(&janela, "cmdGravar");
    EXPECT_EQ(janela.result(), QDialog::Accepted);
    EXPECT_EQ(lerServidores()[2].servidor, QStringLiteral("/outra,pasta"));
}

TEST_F(JanelasEntrada, SearchFindsByCodeOrName) {
    QList<LinhaEmpresa> linhas(2);
    linhas[0].codigo = QStringLiteral("0001");
    linhas[0].nome = QStringLiteral("Tasca do Largo");
    linhas[1].codigo = QStringLiteral("0002");
    linhas[1].nome = QStringLiteral("Pastelaria Central");
    frmSelEmpresaPesquisar pesquisa(linhas);
    auto* resultado = filho<QTreeWidget>(&pesquisa, "lvwResultado");
    EXPECT_EQ(resultado->topLevelItemCount(), 2);
    filho<QLineEdit>(&pesquisa, "txtPesquisa")->setText(QStringLiteral("central"));
    ASSERT_EQ(resultado->topLevelItemCount(), 1);
    EXPECT_EQ(pesquisa.escolhida(), 1);
    filho<QLineEdit>(&pesquisa, "txtPesquisa")->setText(QStringLiteral("9999"));
    EXPECT_EQ(pesquisa.escolhida(), -1);
}

}  // namespace
}  // namespace brasel::app
