// The print-choice dialog offscreen: the choice, copies and observation it hands back, the
// copies it proposes, the user without a configuration, and the drawer button.
#include "devices/escolha_impressao.h"
#include "devices/talao_teste.h"
#include "devices/ui/frm_impresao.h"
#include "support/aplicacao_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"

#include <QCheckBox>
#include <QSpinBox>

namespace brasel::devices {
namespace {

using testing::clicar;
using testing::filho;
using testing::noDialogo;

class JanelaImpresao : public teste::TalaoTeste {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        TalaoTeste::SetUp();
    }

    // Opens the dialog for `tipo`, runs `accao` on it and unpacks its answer.
    EscolhaImpressao escolhe(const QString& tipo, std::function<void(QWidget*)> accao) {
        frmImpresao janela(estado_, mensagens_, linha_);
        EXPECT_EQ(janela.objectName(), QStringLiteral("frmImpresao"));
        noDialogo(std::move(accao));
        return DesempacotaEscolha(janela.Abrir(tipo));
    }
};

TEST_F(JanelaImpresao, EscolhaViasEObservacao) {
    struct Caso {
        const char* nome;
        const char* botao;
        int vias;  // typed; -1 keeps what is proposed
        bool observacao;
        EscolhaImpressao esperada;
    };
    const Caso casos[] = {
        {"talão de compra", "cmdTalaoNormal", -1, false, {1, 1, false}},
        {"contabilístico com observação e três vias", "cmdTalaoContab", 3, true, {2, 3, true}},
        {"a observação só serve o contabilístico", "cmdTalaoNormal", 2, true, {1, 2, false}},
        {"sem vias", "cmdTalaoContab", 0, false, {2, 0, false}},
        {"não imprimir", "cmdNao", -1, false, {0, 1, false}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const EscolhaImpressao e = escolhe(QStringLiteral("VD"), [&](QWidget* d) {
            if (c.vias >= 0) filho<QSpinBox>(d, "txtVias")->setValue(c.vias);
            filho<QCheckBox>(d, "chkImpObservacao")->setChecked(c.observacao);
            clicar(d, c.botao);
        });
        EXPECT_EQ(e.escolha, c.esperada.escolha);
        EXPECT_EQ(e.vias, c.esperada.vias);
        EXPECT_EQ(e.observacao, c.esperada.observacao);
    }
}

TEST_F(JanelaImpresao, ViasPropostas) {
    int proposta = -1;
    const auto le = [&](QWidget* d) {
        proposta = filho<QSpinBox>(d, "txtVias")->value();
        clicar(d, "cmdNao");
    };
    // The invoice type asks for two copies; the user decides whether the type's count counts.
    escolhe(QStringLiteral("FT"), le);
    EXPECT_EQ(proposta, 1);
    teste::configura(conn_, QStringLiteral("ImpTalaoViasTipoMov"), 1);
    escolhe(QStringLiteral("FT"), le);
    EXPECT_EQ(proposta, 2);
    EXPECT_TRUE(mensagens_.textos().isEmpty());
}

TEST_F(JanelaImpresao, UtilizadorSemConfiguracaoNaoImprime) {
    ASSERT_TRUE(conn_.exec(QStringLiteral("delete from UtilConfGeral where utilizador='01'")));
    frmImpresao janela(estado_, mensagens_, linha_);
    EXPECT_TRUE(janela.Abrir(QStringLiteral("VD")).isZero());
    EXPECT_EQ(mensagens_.textos(),
              QStringList{QStringLiteral("Não tem o POS configurado para o utilizador 01")});
}

TEST_F(JanelaImpresao, BotaoAbreAGaveta) {
    const EscolhaImpressao e = escolhe(QStringLiteral("VD"), [&](QWidget* d) {
        clicar(d, "cmdAbrirCaixa");
        EXPECT_TRUE(d->isVisible()) << "the dialog stays open after the drawer";
        clicar(d, "cmdNao");
    });
    EXPECT_EQ(e.escolha, EscolhaImpressao::Nenhum);
    EXPECT_TRUE(impressora_->espera(
        [](const QByteArray& r) { return r == QByteArray("\x1bp\x00\x19\xfa", 5); }, 2000));
}

}  // namespace
}  // namespace brasel::devices
