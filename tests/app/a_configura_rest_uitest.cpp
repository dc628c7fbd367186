// The restaurant configuration window offscreen: every control lands in its setting when the
// window closes, the kitchen poll at once, and a code that does not exist is refused.
#include "app/definicoes_posto.h"
#include "app/ui/a_configura_rest.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QFontComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QRadioButton>
#include <QSpinBox>
#include <QTabWidget>
#include <QTreeWidget>

namespace brasel::app {
namespace {

using testing::clicar;
using testing::EmpresaTeste;
using testing::filho;
using testing::MensagensGravadas;
using testing::noDialogo;

class ConfiguraRest : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    // Types a code as a person would: the text, then leaving the box.
    static void escreveCodigo(QWidget* janela, const char* caixa, const QString& codigo) {
        auto* t = filho<QLineEdit>(janela, caixa);
        t->setText(codigo);
        Q_EMIT t->editingFinished();
    }

    testing::DefinicoesTemporarias definicoes;
    EmpresaTeste empresa{true};
    Estado& e = empresa.estado();
    MensagensGravadas m;
};

TEST_F(ConfiguraRest, EveryControlIsSavedWhenTheWindowCloses) {
    AConfiguraRest janela(e, m);
    int gravacoes = 0;
    QObject::connect(&janela, &AConfiguraRest::configuracaoGravada, [&gravacoes] { ++gravacoes; });
    EXPECT_EQ(janela.windowTitle(), QStringLiteral("Configurações"));
    EXPECT_EQ(filho<QSpinBox>(&janela, "spnTempoCozinha")->value(), 30);
    EXPECT_TRUE(filho<QRadioButton>(&janela, "optNivelEmenta0")->isChecked());

    escreveCodigo(&janela, "txtCaixa", QStringLiteral("01"));
    EXPECT_FALSE(filho<QLabel>(&janela, "lblCaixa")->text().isEmpty());
    escreveCodigo(&janela, "txtImpCozinha", QStringLiteral("EP1"));
    escreveCodigo(&janela, "txtImpBar", QStringLiteral("EP1"));
    escreveCodigo(&janela, "txtTipoImprimeMesa", QStringLiteral("CM"));
    filho<QFontComboBox>(&janela, "cmbFonte")->setCurrentText(QStringLiteral("DejaVu Sans"));
    filho<QLineEdit>(&janela, "txtImagem")->setText(QStringLiteral("/imagens/sala.jpg"));
    filho<QRadioButton>(&janela, "optCozinhaPorta1")->setChecked(true);
    filho<QRadioButton>(&janela, "optBarPorta2")->setChecked(true);
    filho<QComboBox>(&janela, "cmbImpCozinhaNome")->setCurrentText(QStringLiteral("/tmp/cozinha"));
    filho<QSpinBox>(&janela, "spnTempoCozinha")->setValue(12);
    filho<QLineEdit>(&janela, "txtCaixaDinheiro")->setText(QStringLiteral("/dev/gaveta"));
    filho<QRadioButton>(&janela, "optNivelEmenta2")->setChecked(true);
    for (const char* nome : {"chkPrecoIncBrowse", "chkPedePWD", "chkDesactivaPassword",
                             "chkActivaProdutosFacturaREST", "chkLimpaDocAposFechaDoc"}) {
        filho<QCheckBox>(&janela, nome)->setChecked(true);
    }

    // The kitchen poll is saved at once by its own button; nothing else is yet.
    clicar(&janela, "cmdGravar");
    EXPECT_EQ(posto::ConfigRest_TempoImpTalaoCozinha.ler(), 12);
    EXPECT_EQ(posto::ConfigRest_CAIXA.ler(), QString());
    EXPECT_EQ(gravacoes, 1);

    for (int i = 0; i < 3; ++i) {
        filho<QTabWidget>(&janela, "tabPaginas")->setCurrentIndex(i);
        janela.resize(1024, 768);
        janela.grab().save(QStringLiteral("/tmp/AConfiguraRest%1.png").arg(i));
    }
    clicar(&janela, "cmdFechar");
    EXPECT_EQ(gravacoes, 2);
    EXPECT_TRUE(m.mensagens().isEmpty()) << m.textos().join(QLatin1Char('|')).toStdString();

    EXPECT_EQ(posto::ConfigRest_CAIXA.ler(), QStringLiteral("01"));
    EXPECT_EQ(posto::ConfigRest_Font.ler(), QStringLiteral("DejaVu Sans"));
    EXPECT_EQ(posto::ConfigRest_BotaoIMG.ler(), QStringLiteral("/imagens/sala.jpg"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoCozinha.ler(), QStringLiteral("EP1"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoCozinhaPorta.ler(), QStringLiteral("COM"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoCozinhaNome.ler(), QStringLiteral("/tmp/cozinha"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoBar.ler(), QStringLiteral("EP1"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoBarPorta.ler(), QStringLiteral("PAR"));
    EXPECT_EQ(posto::ConfigRest_TempoImpTalaoCozinha.ler(), 12);
    EXPECT_EQ(posto::ConfigRest_CaixaDinheiro.ler(), QStringLiteral("/dev/gaveta"));
    for (const DefFlag* f :
         {&posto::ConfigRest_PrecoIncBrowse, &posto::ConfigRest_PedePWD,
          &posto::ConfigRest_DesactivaPassword, &posto::ConfigRest_ActivaProdutosFacturaREST,
          &posto::ConfigRest_LimpaDocAposFechaDoc}) {
        EXPECT_TRUE(f->ler()) << f->chave().toStdString();
    }
    EXPECT_EQ(posto::NivelEmenta.ler(), QStringLiteral("TABSUBFAMPRO"));
    EXPECT_EQ(posto::TipoImprimeMesa.ler(), QStringLiteral("CM"));
    EXPECT_EQ(posto::JanBackColor.ler(e.gUtilizador), QColor(64, 64, 64));
    // What the main window keeps follows at once.
    EXPECT_EQ(e.gImpTalaoCozinha, QStringLiteral("EP1"));
    EXPECT_EQ(e.gCaixaDinheiro, QStringLiteral("/dev/gaveta"));
    EXPECT_EQ(e.gNivelEmenta, QStringLiteral("TABSUBFAMPRO"));

    // Opened again, the window shows what was saved, and closing it unchanged changes nothing.
    AConfiguraRest outra(e, m);
    outra.show();
    EXPECT_EQ(filho<QLineEdit>(&outra, "txtCaixa")->text(), QStringLiteral("01"));
    EXPECT_TRUE(filho<QRadioButton>(&outra, "optBarPorta2")->isChecked());
    EXPECT_EQ(filho<QFontComboBox>(&outra, "cmbFonte")->currentText(),
              QStringLiteral("DejaVu Sans"));
    outra.close();
    EXPECT_EQ(posto::ConfigRest_Font.ler(), QStringLiteral("DejaVu Sans"));
    EXPECT_EQ(posto::ConfigRest_ImpTalaoCozinhaPorta.ler(), QStringLiteral("COM"));
}

TEST_F(ConfiguraRest, ACodeThatDoesNotExistIsRefusedAndCleared) {
    ASSERT_TRUE(posto::ConfigRest_CAIXA.gravar(QStringLiteral("01")));
    AConfiguraRest janela(e, m);
    janela.show();
    escreveCodigo(&janela, "txtCaixa", QStringLiteral("99"));
    escreveCodigo(&janela, "txtTipoImprimeMesa", QStringLiteral("VD"));
    EXPECT_EQ(
        m.textos(),
        (QStringList{
            QStringLiteral("Caixa Inexistente"),
            QStringLiteral("Tipo de Movimento Inexistente ou não pertence a estas condições")}));
    EXPECT_TRUE(filho<QLineEdit>(&janela, "txtCaixa")->text().isEmpty());
    EXPECT_TRUE(filho<QLabel>(&janela, "lblCaixa")->text().isEmpty());
    janela.close();
    EXPECT_EQ(posto::ConfigRest_CAIXA.ler(), QString());
    EXPECT_EQ(posto::TipoImprimeMesa.ler(), QString());
}

TEST_F(ConfiguraRest, TheSearchOffersOnlyDocumentsThatFitATablesBill) {
    AConfiguraRest janela(e, m);
    QStringList oferecidos;
    noDialogo([&oferecidos](QWidget* pesquisa) {
        auto* lista = filho<QTreeWidget>(pesquisa, "lvwPesquisa");
        for (int i = 0; lista && i < lista->topLevelItemCount(); ++i)
            oferecidos << lista->topLevelItem(i)->text(0);
        if (lista && lista->topLevelItemCount() > 0) lista->setCurrentItem(lista->topLevelItem(0));
        clicar(pesquisa, "cmdSeleccionar");
    });
    clicar(&janela, "cmdPesquisaTipoImprimeMesa");
    EXPECT_EQ(oferecidos, QStringList{QStringLiteral("CM")});
    EXPECT_EQ(filho<QLineEdit>(&janela, "txtTipoImprimeMesa")->text(), QStringLiteral("CM"));
    EXPECT_FALSE(filho<QLabel>(&janela, "lblTipoImprimeMesa")->text().isEmpty());
}

}  // namespace
}  // namespace brasel::app
