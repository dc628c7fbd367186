// The rights editor offscreen: a user without rights gets them created on request, and a button
// refused, saved and reloaded stays refused.
#include "app/ui/frm_acessos.h"
#include "support/aplicacao_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QTreeWidget>

namespace brasel::app {
namespace {

using testing::clicar;
using testing::EmpresaTeste;
using testing::MensagensGravadas;
using testing::noDialogo;

const JanelaAcesso kJanela{QStringLiteral("frmRegistoDeCaixa"),
                           QStringLiteral("Registo de Caixa"),
                           {{QStringLiteral("cmdImprimir"), QStringLiteral("&Imprimir")},
                            {QStringLiteral("cmdFechar"), QStringLiteral("&Fechar")}}};
const QString kBotao = chaveBotao(chaveJanela(kJanela.nome), QStringLiteral("cmdImprimir"));

class EditorAcessos : public ::testing::Test {
  protected:
    void SetUp() override { ApagaTodososAcessos(e, QStringLiteral("02")); }

    // The tree's item of a right, by its key.
    QTreeWidgetItem* item(const QString& chave) {
        for (QTreeWidgetItemIterator it(janela.tvwAcessos()); *it; ++it) {
            if ((*it)->data(0, kPapelChave).toString() == chave) return *it;
        }
        return nullptr;
    }

    EmpresaTeste empresa{true};
    // After the company (its database layer must outlive the application) and before any
    // window.
    QApplication& aplicacao = testing::aplicacaoTeste();
    Estado& e = empresa.estado();
    MensagensGravadas m;
    int pedidosJanelas = 0;
    frmAcessos janela{e, m, [this] {
                          ++pedidosJanelas;
                          return QList<JanelaAcesso>{kJanela};
                      }};
};

TEST_F(EditorAcessos, CancellingTheRecordCreatesNothing) {
    noDialogo([](QWidget* d) { clicar(d, "cmdCancelarRegisto"); });
    janela.Utilizador(QStringLiteral("02"));
    EXPECT_EQ(janela.tvwAcessos()->topLevelItemCount(), 0);
    EXPECT_EQ(pedidosJanelas, 0);
    EXPECT_TRUE(lerDireitos(e, QStringLiteral("02")).isEmpty());
}

TEST_F(EditorAcessos, ARefusedButtonIsSavedAndReloaded) {
    noDialogo([](QWidget* d) { clicar(d, "cmdCriarRegisto"); });
    janela.Utilizador(QStringLiteral("02"));
    EXPECT_EQ(pedidosJanelas, 1);
    // The program at the root, the window under it, its button under the window (the way out
    // of the window has no right).
    QTreeWidget* arvore = janela.tvwAcessos();
    ASSERT_EQ(arvore->topLevelItemCount(), 1);
    QTreeWidgetItem* programa = arvore->topLevelItem(0);
    EXPECT_EQ(programa->text(0), QStringLiteral("Brasel"));
    ASSERT_EQ(programa->childCount(), 1);
    ASSERT_EQ(programa->child(0)->childCount(), 1);
    QTreeWidgetItem* botao = item(kBotao);
    ASSERT_EQ(botao, programa->child(0)->child(0));
    EXPECT_EQ(botao->checkState(0), Qt::Checked);

    botao->setCheckState(0, Qt::Unchecked);
    // Unchecking a button leaves its window as it was.
    EXPECT_EQ(programa->child(0)->checkState(0), Qt::Checked);
    clicar(&janela, "cmdGravar");
    EXPECT_EQ(CheckUtilizApp(e, kBotao, QStringLiteral("02")), 0);
    EXPECT_EQ(CheckUtilizApp(e, chaveJanela(kJanela.nome), QStringLiteral("02")), 1);
    const ResultadoAcesso acesso = FormAcessos(e, kJanela, QStringLiteral("02"));
    EXPECT_TRUE(acesso.permitido);
    EXPECT_FALSE(acesso.botoes.value(QStringLiteral("cmdImprimir")));

    // Reload shows what the database holds now.
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update acessos set value=1 where chave=?"), {kBotao}));
    clicar(&janela, "cmdActualizar");
    ASSERT_NE(item(kBotao), nullptr);
    EXPECT_EQ(item(kBotao)->checkState(0), Qt::Checked);

    clicar(&janela, "cmdDesmarcarTodos");
    clicar(&janela, "cmdGravar");
    for (const DireitoAcesso& d : lerDireitos(e, QStringLiteral("02")))
        EXPECT_FALSE(d.valor) << d.chave.toStdString();
    EXPECT_TRUE(m.mensagens().isEmpty());

    janela.resize(1024, 768);
    arvore->expandAll();
    janela.grab().save(QStringLiteral("/tmp/frmAcessos.png"));
}

TEST_F(EditorAcessos, TheSupportUsersRightsAreNeverSaved) {
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("insert into acessos (utilizador, chave, value) "
                                    "values ('00', 'Brasel', 1)")));
    janela.Utilizador(QStringLiteral("00"));
    clicar(&janela, "cmdDesmarcarTodos");
    clicar(&janela, "cmdGravar");
    EXPECT_EQ(CheckUtilizApp(e, kPrograma, QStringLiteral("00")), 1);
    EXPECT_EQ(m.mensagens().size(), 1);
    EXPECT_EQ(pedidosJanelas, 0);
}

}  // namespace
}  // namespace brasel::app
