// A product pressed on a tab reaches the kitchen or the bar: a dish waits in the kitchen queue
// and prints nothing; a drink prints its bar ticket on the simulated printer at once, once its
// line is stored; a dish deleted again queues its cancellation.
#include "app/definicoes_posto.h"
#include "devices/definicao_impressora.h"
#include "impressora.h"
#include "pos/adicionar_produto.h"
#include "pos/alteracao_linhas.h"
#include "pos/tab_teste.h"
#include "support/aplicacao_gui.h"
#include "support/devsim_teste.h"
#include "support/impressao_qt.h"

#include <memory>

namespace brasel::pos {
namespace {

class TabCozinhaTeste : public teste::TabTeste {
  protected:
    void SetUp() override {
        testing::aplicacaoGui();
        ASSERT_TRUE(app::posto::ConfigRest_ImpTalaoBar.gravar(QStringLiteral("EP1")));
    }

    QString transcricao() {
        impressora_.espera([](const QByteArray& b) { return b.contains("Caf"); }, 3000);
        return impressora_.transcricao();
    }

    devices::DefinicaoImpressora definicao_ =
        devices::LerDefinicaoImpressora(estado().gConn, QStringLiteral("EP1")).value();
    testing::DevsimTeste devsim_;
    devsim::ServidorDispositivo& impressora_ =
        devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(definicao_.codigos));
    devices::LinhaSerie linhaBar_{devsim_.mapa()};
    Tab tabBar_{estado(), m_, linhaBar_};
};

TEST_F(TabCozinhaTeste, PratoEntraNaFilaBebidaImprimeNoBar) {
    ASSERT_TRUE(tabBar_.definirTipo(QStringLiteral("VD")));
    ASSERT_TRUE(AbrirMesa(tabBar_, QStringLiteral("M01")));

    const qint64 prato = AdicionarProduto(tabBar_, p_, QStringLiteral("P002"));
    ASSERT_GT(prato, 0);
    EXPECT_EQ(pedidosCozinha(), 1);
    EXPECT_TRUE(impressora_.recebidos().isEmpty());

    ASSERT_GT(AdicionarProduto(tabBar_, p_, QStringLiteral("B015")), 0);
    EXPECT_TRUE(transcricao().contains(QStringLiteral("MESA -> M01    1  - Café")))
        << transcricao().toStdString();
    EXPECT_EQ(pedidosCozinha(), 1);
    EXPECT_TRUE(m_.textos().isEmpty()) << m_.textos().join(u'|').toStdString();

    m_.responder({true});
    ASSERT_TRUE(EliminarLinha(tabBar_, p_, prato));
    EXPECT_EQ(contar(QStringLiteral("select count(*) from HistoricoCopa where ANULACAO='S'")), 1);
}

TEST_F(TabCozinhaTeste, BarDesligadoAvisaMasALinhaFica) {
    impressora_.parar();
    ASSERT_TRUE(tabBar_.definirTipo(QStringLiteral("VD")));
    ASSERT_TRUE(AbrirMesa(tabBar_, QStringLiteral("M01")));
    EXPECT_GT(AdicionarProduto(tabBar_, p_, QStringLiteral("B015")), 0);
    EXPECT_EQ(linhasMovProduto(), 1);
    EXPECT_TRUE(m_.contem(QStringLiteral("Avise o bar.")));
}

}  // namespace
}  // namespace brasel::pos
