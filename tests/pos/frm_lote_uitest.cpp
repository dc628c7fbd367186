// The lot form offscreen: the lots in stock listed by expiry, a touched lot bringing its dates,
// another lot from the lot table, dates checked before the form closes. Saves /tmp/frmLote.png
// for review.
#include "pos/ui/frm_lote.h"
#include "pricing/insere_teste.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

namespace brasel::pos {
namespace {

using pricing::teste::insere;
using pricing::teste::T;
using testing::clicar;
using testing::filho;
using testing::noDialogo;

class PesquisaGravada : public lookups::JanelaPesquisa {
  public:
    std::optional<lookups::LinhaEscolhida> Pesquisa(const lookups::PedidoPesquisa& p) override {
        tabelas << p.tabela;
        return resposta;
    }
    QStringList tabelas;
    std::optional<lookups::LinhaEscolhida> resposta;
};

class TextoGravado : public PedeTexto {
  public:
    std::optional<QString> pedirTexto(const QString& titulo, const QString& inicial,
                                      bool) override {
        pedidos << titulo + QStringLiteral(":") + inicial;
        return resposta;
    }
    QStringList pedidos;
    std::optional<QString> resposta;
};

class FrmLoteTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoTeste();
        entrada("L1", "4", "2026-01-10", "2026-09-30");
        entrada("L2", "2", "", "2026-04-30");
    }
    void entrada(const char* lote, const char* quantidade, const char* fabrico,
                 const char* validade) {
        insere(e_, "MovProduto",
               {{"Codigo", T("P002")},
                {"AfectaStk", T("E+")},
                {"QuantNormal", T(quantidade)},
                {"Armazem", T("001")},
                {"Lote", T(lote)},
                {"DataFabrico", T(fabrico)},
                {"DataValidade", T(validade)},
                {"Identifica", T(lote)}});
    }
    std::optional<LoteEscolhido> escolher(Currency jaLancado,
                                          const std::function<void(frmLote*)>& accao) {
        frmLote form(e_, mensagens_, pesquisaTabelas_, teclado_, QStringLiteral("P002"), jaLancado);
        noDialogo([&](QWidget* d) { accao(qobject_cast<frmLote*>(d)); });
        return form.escolher();
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    testing::MensagensGravadas mensagens_;
    PesquisaGravada pesquisa_;
    lookups::PesquisaTabelas pesquisaTabelas_{e_, mensagens_, pesquisa_};
    TextoGravado teclado_;
};

TEST_F(FrmLoteTeste, LoteTocadoTrazAsSuasDatas) {
    QStringList linhas;
    bool jaLancadoVisivel = false;
    const auto lote = escolher(Currency(2), [&](frmLote* f) {
        ASSERT_NE(f, nullptr);
        jaLancadoVisivel = !f->lblJaLancado()->isHidden();
        EXPECT_EQ(f->lblJaLancado()->text(), QStringLiteral("Já lançado nesta mesa: 2.000"));
        for (int i = 0; i < f->lvwLotes()->topLevelItemCount(); ++i) {
            const QTreeWidgetItem* item = f->lvwLotes()->topLevelItem(i);
            linhas << item->text(0) + u'|' + item->text(1) + u'|' + item->text(2) + u'|' +
                          item->text(3);
        }
        Q_EMIT f->lvwLotes()->itemClicked(f->lvwLotes()->topLevelItem(1), 0);
        f->grab().save(QStringLiteral("/tmp/frmLote.png"));
        clicar(f, "cmdOK");
    });
    EXPECT_TRUE(jaLancadoVisivel);
    EXPECT_EQ(linhas, (QStringList{QStringLiteral("L2||2026-04-30|2.000"),
                                   QStringLiteral("L1|2026-01-10|2026-09-30|4.000")}));
    ASSERT_TRUE(lote.has_value());
    EXPECT_EQ(lote->lote, QStringLiteral("L1"));
    EXPECT_EQ(lote->dataFabrico, QStringLiteral("2026-01-10"));
    EXPECT_EQ(lote->dataValidade, QStringLiteral("2026-09-30"));
}

TEST_F(FrmLoteTeste, OutroLoteComDatasDoTecladoVerificadas) {
    pesquisa_.resposta = lookups::LinhaEscolhida{QStringLiteral("L9"), QStringLiteral("Nove")};
    QStringList recusas;
    bool aberto = false;
    const auto lote = escolher(Currency{}, [&](frmLote* f) {
        ASSERT_NE(f, nullptr);
        EXPECT_TRUE(f->lblJaLancado()->isHidden());
        // Empty: no lot yet.
        clicar(f, "cmdOK");
        clicar(f, "cmdPesquisaLote");
        EXPECT_EQ(f->txtLote()->text(), QStringLiteral("L9"));
        f->txtDataFabrico()->setText(QStringLiteral("2026-02-30"));
        clicar(f, "cmdOK");
        teclado_.resposta = QStringLiteral(" 2026-02-27 ");
        clicar(f, "cmdDataFabrico");
        teclado_.resposta = QStringLiteral("2026-02-01");
        clicar(f, "cmdDataValidade");
        clicar(f, "cmdOK");
        recusas = mensagens_.textos();
        aberto = f->isVisible();
        teclado_.resposta = QStringLiteral("2027-02-01");
        clicar(f, "cmdDataValidade");
        clicar(f, "cmdOK");
    });
    EXPECT_EQ(recusas, (QStringList{QStringLiteral("Não seleccionou qualquer Lote"),
                                    QStringLiteral("Data de Fabrico Inválida!"),
                                    QStringLiteral("A Data de Validade é anterior à Data de "
                                                   "Fabrico!")}));
    EXPECT_TRUE(aberto);
    EXPECT_EQ(pesquisa_.tabelas, QStringList{QStringLiteral("TabLotes")});
    EXPECT_EQ(teclado_.pedidos.first(), QStringLiteral("Data de Fabrico:2026-02-30"));
    ASSERT_TRUE(lote.has_value());
    EXPECT_EQ(lote->lote, QStringLiteral("L9"));
    EXPECT_EQ(lote->dataFabrico, QStringLiteral("2026-02-27"));
    EXPECT_EQ(lote->dataValidade, QStringLiteral("2027-02-01"));

    const auto cancelado = escolher(Currency{}, [&](frmLote* f) { clicar(f, "cmdCancelar"); });
    EXPECT_FALSE(cancelado.has_value());
}

}  // namespace
}  // namespace brasel::pos
