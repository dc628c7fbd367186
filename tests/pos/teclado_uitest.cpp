// The touch keyboard, keypad and barcode form offscreen, driven by their buttons; the two
// product configuration windows ticking rows and saving them. Each test saves a picture of its
// window in /tmp for review.
#include "pos/ui/frm_config_produtos.h"
#include "pos/ui/frm_config_produtos_facturacao.h"
#include "pos/ui/frm_preco_quant.h"
#include "pos/ui/frm_teclado.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QCheckBox>
#include <QLineEdit>

namespace brasel::pos {
namespace {

using testing::clicar;
using testing::filho;
using testing::MensagensGravadas;
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

class TecladoJanelaTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    void teclas(QWidget* d, std::initializer_list<const char*> nomes) {
        for (const char* nome : nomes)
            clicar(d, nome);
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    MensagensGravadas mensagens_;
    PesquisaGravada pesquisa_;
    lookups::PesquisaTabelas textos_{e_, mensagens_, pesquisa_};
};

TEST_F(TecladoJanelaTeste, KeysDeadKeysCapsLockAndTextsMakeTheNote) {
    TecladoJanela teclado(mensagens_, &textos_);
    pesquisa_.resposta =
        lookups::LinhaEscolhida{QStringLiteral("007"), QStringLiteral("Molho à parte")};
    QString mostrado;
    noDialogo([&](QWidget* d) {
        EXPECT_EQ(d->objectName(), QStringLiteral("frmTeclado"));
        auto* txt = filho<QLineEdit>(d, "txtResultado");
        EXPECT_EQ(txt->text(), QStringLiteral("d'Ouro"));
        teclas(d, {"cmdBack", "cmdEspaco", "cmdAcentoDir", "cmdE"});
        filho<QCheckBox>(d, "chkCapsLock")->setChecked(false);
        EXPECT_EQ(filho<QPushButton>(d, "cmdA")->text(), QStringLiteral("a"));
        teclas(d, {"cmdTilo", "cmdA", "cmdO", "cmdEspaco", "cmdTemplates"});
        mostrado = txt->text();
        d->grab().save(QStringLiteral("/tmp/frmTeclado.png"));
        clicar(d, "cmdEnter");
    });
    EXPECT_EQ(teclado.editar(QStringLiteral("d'Ouro")), QStringLiteral("d'Our Éão Molho à parte"));
    EXPECT_EQ(mostrado, QStringLiteral("d'Our Éão Molho à parte"));
    EXPECT_EQ(pesquisa_.tabelas, QStringList{QStringLiteral("HistoricoOBS")});

    noDialogo([&](QWidget* d) {
        clicar(d, "cmdA");
        clicar(d, "cmdCancelar");
    });
    EXPECT_EQ(teclado.pedirTexto(QStringLiteral("Nota")), std::nullopt);
}

TEST_F(TecladoJanelaTeste, KeypadRefusesWhatIsNotANumber) {
    TecladoJanela teclado(mensagens_);
    bool letrasVisiveis = true;
    int recusas = 0;
    noDialogo([&](QWidget* d) {
        letrasVisiveis = filho<QPushButton>(d, "cmdA")->isVisibleTo(d);
        auto* txt = filho<QLineEdit>(d, "txtResultado");
        txt->setText(QStringLiteral("1x"));
        Q_EMIT txt->textEdited(txt->text());  // typed on a physical keyboard
        clicar(d, "cmdEnter");
        recusas = mensagens_.mensagens().size();
        d->grab().save(QStringLiteral("/tmp/frmTeclado_numerico.png"));
        teclas(d, {"cmdBack", "cmdPonto1", "cmd2", "cmd5", "cmdEnter"});
    });
    EXPECT_EQ(teclado.pedirValor(QStringLiteral("Quantidade")), Currency::fromRaw(12500));
    EXPECT_FALSE(letrasVisiveis);
    EXPECT_EQ(recusas, 1);
    EXPECT_TRUE(mensagens_.contem(QStringLiteral("Valor Inválido!")));

    noDialogo([&](QWidget* d) { clicar(d, "cmdEnter"); });
    EXPECT_EQ(teclado.pedirValor(QStringLiteral("Preço")), std::nullopt);
}

TEST_F(TecladoJanelaTeste, BarcodeFormGivesTheOfferedFields) {
    PrecoQuantJanela janela(mensagens_, 2, 3);
    const PropostaPrecoQuant proposta{true, false, Currency::fromRaw(12345000), Currency(2)};
    noDialogo([&](QWidget* d) {
        auto* preco = filho<QLineEdit>(d, "txtPreco");
        EXPECT_EQ(preco->text(), QStringLiteral("1,234.50"));
        EXPECT_FALSE(filho<QLineEdit>(d, "txtQuantidade")->isEnabled());
        EXPECT_EQ(filho<QLineEdit>(d, "txtUnidades")->text(), QStringLiteral("1"));
        preco->setText(QStringLiteral("abc"));
        clicar(d, "cmdContinuar");
        preco->setText(QStringLiteral("3,75"));
        d->grab().save(QStringLiteral("/tmp/frmProdutosCodigosBarrasInteractividade.png"));
        clicar(d, "cmdContinuar");
    });
    const PrecoQuant dado = janela.pedir(QStringLiteral("INT-1"), proposta);
    EXPECT_EQ(dado.preco, Currency::fromRaw(37500));
    EXPECT_EQ(dado.quantidade, std::nullopt);
    EXPECT_EQ(mensagens_.mensagens().size(), 1);
}

QTreeWidgetItem* linhaDe(QTreeWidget* lista, const QString& codigo) {
    for (int i = 0; i < lista->topLevelItemCount(); ++i)
        if (lista->topLevelItem(i)->text(0) == codigo) return lista->topLevelItem(i);
    return nullptr;
}

void toca(QTreeWidget* lista, const QString& codigo) {
    QTreeWidgetItem* item = linhaDe(lista, codigo);
    ASSERT_NE(item, nullptr) << codigo.toStdString();
    lista->setCurrentItem(item);
    Q_EMIT lista->itemClicked(item, 1);
}

TEST_F(TecladoJanelaTeste, KitchenFlagsWindowStoresTheTicks) {
    frmConfigProdutos janela(e_, mensagens_);
    QTreeWidget* lista = janela.lvwLista();
    ASSERT_GT(lista->topLevelItemCount(), 30);
    EXPECT_EQ(linhaDe(lista, QStringLiteral("P001"))->checkState(0), Qt::Unchecked);
    toca(lista, QStringLiteral("B001"));
    toca(lista, QStringLiteral("S001"));
    EXPECT_EQ(linhaDe(lista, QStringLiteral("S001"))->checkState(0), Qt::Unchecked);
    janela.resize(1024, 768);
    janela.grab().save(QStringLiteral("/tmp/frmConfigProdutos.png"));
    clicar(&janela, "cmdGravar");
    auto flag = [&](const char* codigo) {
        return e_.gConn
            .firstRow(QStringLiteral("select ImpCopa from Produtos where Codigo=?"),
                      {QString::fromLatin1(codigo)})
            ->value(0)
            .toInt();
    };
    EXPECT_EQ(flag("B001"), 1);
    EXPECT_EQ(flag("S001"), 0);
    EXPECT_EQ(flag("S002"), 1);
}

TEST_F(TecladoJanelaTeste, ProductSetWindowSavesAndReloadsASet) {
    frmConfigProdutosFacturacao janela(e_, mensagens_, &textos_);
    EXPECT_EQ(janela.lvwLista()->headerItem()->text(4), QStringLiteral("Nivel"));
    clicar(&janela, "cmdProximo");
    EXPECT_EQ(janela.txtCodigo()->text(), QStringLiteral("1"));
    janela.txtDescricao()->setText(QStringLiteral("Menu de Verão"));
    janela.txtDataInicial()->setDate(QDate(2024, 6, 1));
    janela.txtDataFinal()->setDate(QDate(2024, 9, 30));
    toca(janela.lvwLista(), QStringLiteral("S001"));
    toca(janela.lvwLista(), QStringLiteral("P001"));
    clicar(&janela, "cmdGravar");
    ASSERT_TRUE(mensagens_.mensagens().isEmpty()) << mensagens_.textos().join(u'\n').toStdString();
    QTreeWidgetItem* s001 = linhaDe(janela.lvwLista(), QStringLiteral("S001"));
    EXPECT_EQ(s001->checkState(0), Qt::Checked);
    EXPECT_EQ(s001->text(2), QStringLiteral("01-06-2024"));
    EXPECT_EQ(s001->text(3), QStringLiteral("30-09-2024"));
    EXPECT_EQ(s001->text(4), QStringLiteral("Sobremesas"));
    janela.resize(1024, 768);
    janela.grab().save(QStringLiteral("/tmp/frmConfigProdutosFacturacao.png"));

    // A second window opened on the code shows the stored set.
    frmConfigProdutosFacturacao outra(e_, mensagens_, &textos_);
    outra.txtCodigo()->setText(QStringLiteral("1"));
    Q_EMIT outra.txtCodigo()->editingFinished();
    EXPECT_EQ(outra.txtDescricao()->text(), QStringLiteral("Menu de Verão"));
    EXPECT_EQ(outra.txtDataFinal()->date(), QDate(2024, 9, 30));
    EXPECT_EQ(linhaDe(outra.lvwLista(), QStringLiteral("P001"))->checkState(0), Qt::Checked);
    EXPECT_EQ(linhaDe(outra.lvwLista(), QStringLiteral("P002"))->checkState(0), Qt::Unchecked);
}

}  // namespace
}  // namespace brasel::pos
