// The split of a payment across methods, offscreen: parts typed in the cells or on the keypad,
// cmdTudo, and OK refused until the parts make the document total.
#include "cash/teclado_gravado.h"
#include "cash/ui/frm_lanc_mov_caixa.h"
#include "pricing/valores_teste.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

namespace brasel::cash {
namespace {

using teste::TecladoGravado;

using testing::clicar;
using testing::MensagensGravadas;
using testing::noDialogo;

using pricing::teste::V;

class LancMovCaixaJanela : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    static int linhaDe(QTableWidget* lista, const char* codigo) {
        for (int i = 0; i < lista->rowCount(); ++i) {
            if (lista->item(i, ListaFormasValor::Codigo)->text() == QString::fromLatin1(codigo))
                return i;
        }
        ADD_FAILURE() << codigo;
        return 0;
    }
    static void escreve(QTableWidget* lista, const char* codigo, const char* texto) {
        lista->item(linhaDe(lista, codigo), ListaFormasValor::Valor)
            ->setText(QString::fromUtf8(texto));
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    MensagensGravadas mensagens_;
    TecladoGravado teclado_;
};

TEST_F(LancMovCaixaJanela, OkWaitsForThePartsToMakeTheTotal) {
    frmLancMovCaixa janela(e_, mensagens_, nullptr, &teclado_);
    std::vector<QString> restos;
    QStringList recusas;
    teclado_.respostas = {V("1"), V("0")};
    noDialogo([&](QWidget* d) {
        auto* lista = janela.lvwFormas();
        EXPECT_EQ(d, &janela);
        EXPECT_TRUE(lista->isColumnHidden(0));
        EXPECT_EQ(lista->horizontalHeaderItem(3)->text(), QStringLiteral("Parcial"));
        EXPECT_EQ(lista->rowCount(), 4);
        restos.push_back(janela.lblResto()->text());
        escreve(lista, "NU", "4,10");
        restos.push_back(janela.lblResto()->text());
        clicar(d, "cmdOK");
        recusas << mensagens_.textos();
        lista->selectRow(linhaDe(lista, "MB"));
        clicar(d, "cmdTudo");
        restos.push_back(janela.lblResto()->text());
        lista->selectRow(linhaDe(lista, "CC"));
        clicar(d, "cmdValor");
        restos.push_back(janela.lblResto()->text());
        clicar(d, "cmdOK");
        clicar(d, "cmdValor");
        d->grab().save(QStringLiteral("/tmp/frmLancMovCaixa.png"));
        clicar(d, "cmdOK");
    });
    const auto partes = janela.Carregar(V("12.30"));
    ASSERT_TRUE(partes);
    EXPECT_EQ(restos, (std::vector<QString>{QStringLiteral("12.30"), QStringLiteral("8.20"),
                                            QStringLiteral("0.00"), QStringLiteral("-1.00")}));
    EXPECT_EQ(recusas, QStringList{QStringLiteral("Não Atribuiu o Valor Total do Documento!")});
    EXPECT_EQ(mensagens_.textos().size(), 2);
    EXPECT_EQ(teclado_.titulos, (QStringList{QStringLiteral("Cartão de Crédito"),
                                             QStringLiteral("Cartão de Crédito")}));
    std::map<QString, Currency> porMetodo;
    for (const ParcialPagamento& p : *partes)
        porMetodo[p.pagaComo] = p.valor;
    EXPECT_EQ(porMetodo, (std::map<QString, Currency>{{QStringLiteral("CC"), V("0")},
                                                      {QStringLiteral("MB"), V("8.20")},
                                                      {QStringLiteral("MW"), V("0")},
                                                      {QStringLiteral("NU"), V("4.10")}}));
}

TEST_F(LancMovCaixaJanela, TheMethodChosenAtPaymentStartsWithTheWholeTotal) {
    frmLancMovCaixa janela(e_, mensagens_, nullptr, &teclado_);
    int seleccionada = -1;
    int proposta = -2;
    noDialogo([&](QWidget* d) {
        seleccionada = janela.lvwFormas()->currentRow();
        proposta = linhaDe(janela.lvwFormas(), "MB");
        clicar(d, "cmdOK");
    });
    const auto partes = janela.Carregar(V("7.45"), QStringLiteral("MB"));
    ASSERT_TRUE(partes);
    EXPECT_EQ(seleccionada, proposta);
    Currency total;
    for (const ParcialPagamento& p : *partes) {
        total += p.valor;
        EXPECT_EQ(p.valor, p.pagaComo == u"MB" ? V("7.45") : V("0")) << p.pagaComo.toStdString();
    }
    EXPECT_EQ(total, V("7.45"));
    EXPECT_TRUE(mensagens_.textos().isEmpty());
}

TEST_F(LancMovCaixaJanela, APartThatIsNotANumberOrACancelGivesNothing) {
    frmLancMovCaixa janela(e_, mensagens_, nullptr, &teclado_);
    bool aberta = false;
    noDialogo([&](QWidget* d) {
        escreve(janela.lvwFormas(), "NU", "12.30");
        escreve(janela.lvwFormas(), "MB", "1x");
        clicar(d, "cmdOK");
        aberta = d->isVisible();
        clicar(d, "cmdCancelar");
    });
    EXPECT_EQ(janela.Carregar(V("12.30")), std::nullopt);
    EXPECT_TRUE(aberta);
    EXPECT_EQ(mensagens_.textos(), QStringList{QStringLiteral("Valor Inválido!")});
}

TEST_F(LancMovCaixaJanela, WithoutPaymentMethodsTheProcessIsIncomplete) {
    ASSERT_TRUE(e_.gConn.exec(QStringLiteral("delete from PagaComo")));
    frmLancMovCaixa janela(e_, mensagens_, nullptr, &teclado_);
    EXPECT_EQ(janela.Carregar(V("5")), std::nullopt);
    EXPECT_EQ(mensagens_.textos(), QStringList{QStringLiteral("Processo Incompleto!")});
}

}  // namespace
}  // namespace brasel::cash
