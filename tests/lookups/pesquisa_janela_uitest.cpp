// The lists built from a column layout text and the search window, offscreen: columns hide
// and align as laid out, dates and amounts sort as such, and the search window finds, limits
// and returns the chosen row, or nothing when cancelled.
#include "lookups/definicoes_pesquisa.h"
#include "lookups/pesquisa_tabelas.h"
#include "lookups/ui/campo_codigo_janela.h"
#include "lookups/ui/lista_colunas.h"
#include "lookups/ui/w_pesquisa_nova.h"

#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <QApplication>
#include <QComboBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QTimer>
#include <QTreeWidget>

#include <functional>

#include <gtest/gtest.h>

namespace brasel::lookups {
namespace {

using testing::EmpresaTeste;

template <class T>
T* filho(QWidget* janela, const char* nome) {
    T* w = janela ? janela->findChild<T*>(QString::fromLatin1(nome)) : nullptr;
    EXPECT_NE(w, nullptr) << nome;
    return w;
}

QStringList coluna(QTreeWidget* lista, int c) {
    QStringList textos;
    for (int i = 0; i < lista->topLevelItemCount(); ++i)
        textos << lista->topLevelItem(i)->text(c);
    return textos;
}

// Acts on the modal window that opens next, once the event loop runs it.
void naJanelaModal(std::function<void(QWidget*)> accao) {
    QTimer::singleShot(0, [accao = std::move(accao)] {
        QWidget* janela = QApplication::activeModalWidget();
        ASSERT_NE(janela, nullptr);
        accao(janela);
    });
}

PedidoPesquisa pedidoDe(Mestre mestre) {
    const DefinicaoPesquisa& d = definicao(mestre);
    PedidoPesquisa p;
    p.titulo = d.titulo;
    p.tabela = d.tabela;
    p.seleccao = d.seleccao;
    p.campos = d.campos;
    p.colunas = d.colunas;
    p.ordem = d.ordem;
    return p;
}

class Janelas : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    testing::DefinicoesTemporarias definicoes;
};

TEST_F(Janelas, ListColumnsFollowTheirLayout) {
    QTreeWidget lista;
    Cria_lvwLISTA(&lista, QStringLiteral("Código,700/Nome da Entidade,3540/Ano,600,C/Servidor,800,"
                                         "C/Login,0/Password,0/Autenticação,0,C/Versão,800,C/"
                                         "Tamanho,0,D/"));
    ASSERT_EQ(lista.columnCount(), 9);
    for (int c = 0; c < 9; ++c)
        EXPECT_EQ(lista.isColumnHidden(c), c == 4 || c == 5 || c == 6 || c == 8) << c;
    EXPECT_EQ(lista.headerItem()->text(1), QStringLiteral("Nome da Entidade"));
    EXPECT_EQ(lista.columnWidth(1), twipsParaPixeis(3540, lista.logicalDpiX()));
    EXPECT_EQ(lista.headerItem()->textAlignment(2) & Qt::AlignHorizontal_Mask, Qt::AlignHCenter);
    // Hidden columns still carry their text.
    const ItemLista* item = adicionaLinha(&lista, {QStringLiteral("0001"),
                                                   QStringLiteral("Tasca"),
                                                   QStringLiteral("2026"),
                                                   {},
                                                   QStringLiteral("SUPERVISOR")});
    EXPECT_EQ(item->text(4), QStringLiteral("SUPERVISOR"));
    EXPECT_EQ(item->textAlignment(2) & Qt::AlignHorizontal_Mask, Qt::AlignHCenter);
    EXPECT_TRUE(item->text(8).isEmpty());

    // Rebuilt with other columns, the list starts empty.
    Cria_lvwLISTA(&lista, QStringLiteral("Código,900/Descrição,2000"));
    EXPECT_EQ(lista.columnCount(), 2);
    EXPECT_EQ(lista.topLevelItemCount(), 0);
    EXPECT_FALSE(lista.isColumnHidden(0) || lista.isColumnHidden(1));
}

TEST_F(Janelas, HeaderClicksSortDatesAndAmountsAsSuch) {
    QTreeWidget lista;
    const QString colunas = QStringLiteral("Doc,900/Data,1200,C,DATA/Total,1200,D,VALOR/");
    Cria_lvwLISTA(&lista, colunas);
    // Built twice: the header click must still sort once per click.
    Cria_lvwLISTA(&lista, colunas);
    const QStringList linhas[] = {
        {QStringLiteral("A"), QStringLiteral("05-03-2024"), QStringLiteral("1,200.00")},
        {QStringLiteral("B"), QStringLiteral("28-12-2023"), QStringLiteral("-15.50")},
        {QStringLiteral("C"), QStringLiteral("2024-01-10"), QStringLiteral("9.99")},
        {QStringLiteral("D"), QStringLiteral("10-01-2025"), QStringLiteral("250.00")},
    };
    for (const QStringList& linha : linhas)
        adicionaLinha(&lista, linha);
    EXPECT_EQ(lista.topLevelItem(0)->textAlignment(2) & Qt::AlignHorizontal_Mask, Qt::AlignRight);
    // Until a header is clicked the rows keep the order they came in.
    EXPECT_EQ(coluna(&lista, 0), (QStringList{QStringLiteral("A"), QStringLiteral("B"),
                                              QStringLiteral("C"), QStringLiteral("D")}));

    Q_EMIT lista.header()->sectionClicked(2);
    EXPECT_EQ(coluna(&lista, 0), (QStringList{QStringLiteral("B"), QStringLiteral("C"),
                                              QStringLiteral("D"), QStringLiteral("A")}));
    Q_EMIT lista.header()->sectionClicked(2);
    EXPECT_EQ(coluna(&lista, 0), (QStringList{QStringLiteral("A"), QStringLiteral("D"),
                                              QStringLiteral("C"), QStringLiteral("B")}));
    Q_EMIT lista.header()->sectionClicked(1);
    EXPECT_EQ(coluna(&lista, 0), (QStringList{QStringLiteral("B"), QStringLiteral("C"),
                                              QStringLiteral("A"), QStringLiteral("D")}));
}

class JanelaPesquisaDemo : public Janelas {
  protected:
    EmpresaTeste empresa{true};
};

TEST_F(JanelaPesquisaDemo, FindsLimitsAndReturnsTheChosenRow) {
    PedidoPesquisa pedido = pedidoDe(Mestre::Produtos);
    pedido.campo = 1;
    pedido.chave = QStringLiteral("cerv");
    WPesquisaNOVA janela(empresa.estado(), pedido);
    EXPECT_EQ(janela.objectName(), QStringLiteral("WPesquisaNOVA"));
    auto* lista = filho<QTreeWidget>(&janela, "lvwPesquisa");
    auto* campo = filho<QComboBox>(&janela, "cmbCampo");
    ASSERT_EQ(campo->count(), 4);
    EXPECT_EQ(campo->currentText(), QStringLiteral("Descrição"));
    EXPECT_EQ(campo->itemText(3), QStringLiteral("Descrição Extra (A.M.)"));
    // It opened searching the key it was given.
    EXPECT_EQ(coluna(lista, 1),
              (QStringList{QStringLiteral("Cerveja sem álcool"), QStringLiteral("Cerveja preta")}));
    EXPECT_EQ(lista->columnCount(), 4);

    campo->setCurrentIndex(0);
    filho<QLineEdit>(&janela, "txtChave")->setText(QStringLiteral("b*1"));
    filho<QLineEdit>(&janela, "txtLimite")->setText(QStringLiteral("abc"));
    filho<QPushButton>(&janela, "cmdPesquisar")->click();
    EXPECT_EQ(coluna(lista, 0).size(), 10);  // B001, B010 .. B018: codes like b%1%
    EXPECT_EQ(filho<QLabel>(&janela, "lblRegistos")->text(), QStringLiteral("10 registo(s)"));
    filho<QLineEdit>(&janela, "txtLimite")->setText(QStringLiteral("2"));
    filho<QPushButton>(&janela, "cmdPesquisar")->click();
    ASSERT_EQ(lista->topLevelItemCount(), 2);

    lista->setCurrentItem(lista->topLevelItem(1));
    filho<QPushButton>(&janela, "cmdSeleccionar")->click();
    EXPECT_EQ(janela.result(), QDialog::Accepted);
    const auto escolhida = janela.escolhida();
    ASSERT_TRUE(escolhida);
    EXPECT_EQ(escolhida->codigo, QStringLiteral("B010"));
    EXPECT_EQ(escolhida->descricao, lista->topLevelItem(1)->text(1));
}

TEST_F(JanelaPesquisaDemo, ModalSearchChoosesOrCancels) {
    PesquisaEmJanela porta(empresa.estado(), nullptr);
    PedidoPesquisa pedido = pedidoDe(Mestre::Caixas);
    naJanelaModal([](QWidget* janela) { filho<QPushButton>(janela, "cmdCancelar")->click(); });
    EXPECT_FALSE(porta.Pesquisa(pedido));

    // A double touch on a row chooses it.
    pedido = pedidoDe(Mestre::PagaComo);
    naJanelaModal([](QWidget* janela) {
        auto* lista = filho<QTreeWidget>(janela, "lvwPesquisa");
        ASSERT_EQ(lista->topLevelItemCount(), 4);
        Q_EMIT lista->itemActivated(lista->topLevelItem(1), 0);
    });
    const auto escolhida = porta.Pesquisa(pedido);
    ASSERT_TRUE(escolhida);
    EXPECT_EQ(escolhida->codigo, QStringLiteral("MB"));  // CC, MB, MW, NU by code
    EXPECT_EQ(escolhida->descricao, QStringLiteral("Multibanco"));
}

TEST_F(JanelaPesquisaDemo, ACodeBoxAndItsLabelTakeTheChosenRow) {
    testing::MensagensGravadas mensagens;
    PesquisaEmJanela porta(empresa.estado(), nullptr);
    PesquisaTabelas pesquisa(empresa.estado(), mensagens, porta);
    QLineEdit txtProduto(QStringLiteral("\\cer*pre"));
    QLabel lblProduto;
    naJanelaModal([](QWidget* janela) {
        EXPECT_EQ(filho<QLineEdit>(janela, "txtChave")->text(), QStringLiteral("cer*pre"));
        filho<QPushButton>(janela, "cmdSeleccionar")->click();
    });
    pesquisaNoCampo(&txtProduto, &lblProduto, [&](CampoCodigo& c) { pesquisa.Produtos(c, false); });
    EXPECT_EQ(txtProduto.text(), QStringLiteral("B009"));
    EXPECT_EQ(lblProduto.text(), QStringLiteral("Cerveja preta"));

    txtProduto.setText(QStringLiteral("NADA"));
    pesquisaNoCampo(&txtProduto, &lblProduto, [&](CampoCodigo& c) { pesquisa.Produtos(c, false); });
    EXPECT_TRUE(txtProduto.text().isEmpty() && lblProduto.text().isEmpty());
    EXPECT_EQ(mensagens.textos().size(), 1);
}

TEST_F(JanelaPesquisaDemo, DatabaseTroubleIsShownAndTheListStaysEmpty) {
    PedidoPesquisa pedido = pedidoDe(Mestre::Caixas);
    pedido.seleccao = QStringLiteral(" Caixas.Codigo,Caixas.Nome from Caixas ");
    QString mostrada;
    naJanelaModal([&mostrada](QWidget* caixa) {
        auto* mensagem = qobject_cast<QMessageBox*>(caixa);
        ASSERT_NE(mensagem, nullptr);
        mostrada = mensagem->text();
        mensagem->accept();
    });
    WPesquisaNOVA janela(empresa.estado(), pedido);
    EXPECT_EQ(mostrada, QStringLiteral("Campo Inexistente na Tabela Caixas"));
    EXPECT_EQ(filho<QTreeWidget>(&janela, "lvwPesquisa")->topLevelItemCount(), 0);
    EXPECT_FALSE(janela.escolhida());
}

}  // namespace
}  // namespace brasel::lookups
