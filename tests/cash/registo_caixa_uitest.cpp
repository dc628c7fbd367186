// The count window and the register report offscreen: counting, reloading, the report's choice
// of destination and its PDF; the change of the workstation's register.
#include "app/definicoes_posto.h"
#include "cash/caixa_teste.h"
#include "cash/teclado_gravado.h"
#include "cash/ui/frm_alt_caixa.h"
#include "cash/ui/frm_registo_de_caixa.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"
#include "support/texto_pdf.h"

#include <QMessageBox>
#include <QPrintPreviewDialog>
#include <QPrintPreviewWidget>
#include <QPrinter>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTimer>

namespace brasel::cash {
namespace {

using teste::TecladoGravado;

using teste::V;
using testing::clicar;
using testing::filho;
using testing::MensagensGravadas;

class PesquisaGravada : public lookups::JanelaPesquisa {
  public:
    std::optional<lookups::LinhaEscolhida> Pesquisa(const lookups::PedidoPesquisa& p) override {
        tabelas << p.tabela;
        return resposta;
    }
    QStringList tabelas;
    std::optional<lookups::LinhaEscolhida> resposta;
};

// Runs `accao` on the modal window of class T once it is the active one, waiting for it
// (a window that opens after another closes is not there at the next turn of the loop).
template <class T>
void quandoAberto(std::function<void(T*)> accao, int tentativas = 100) {
    QTimer::singleShot(20, [accao, tentativas] {
        if (auto* janela = qobject_cast<T*>(QApplication::activeModalWidget())) {
            accao(janela);
        } else if (tentativas > 0) {
            quandoAberto<T>(accao, tentativas - 1);
        } else {
            ADD_FAILURE() << "janela não abriu";
        }
    });
}

class RegistoCaixaJanela : public ::testing::Test {
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
    static QString valorDe(QTableWidget* lista, const char* codigo) {
        return lista->item(linhaDe(lista, codigo), ListaFormasValor::Valor)->text();
    }
    static void escreve(QTableWidget* lista, const char* codigo, const char* texto) {
        lista->item(linhaDe(lista, codigo), ListaFormasValor::Valor)
            ->setText(QString::fromUtf8(texto));
    }
    QHash<QString, Currency> contado(const char* data) {
        return CarregaRegistoCaixa(e_.gConn, QStringLiteral("01"), QString::fromLatin1(data))
            .value_or(QHash<QString, Currency>{});
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    MensagensGravadas mensagens_;
    TecladoGravado teclado_;
    PesquisaGravada pesquisa_;
};

TEST_F(RegistoCaixaJanela, CountsReloadsAndCountsAgain) {
    frmRegistoDeCaixa janela(e_, mensagens_, nullptr, &pesquisa_, &teclado_);
    auto* lista = janela.lvwFormas();
    EXPECT_EQ(janela.caixa(), QStringLiteral("01"));
    EXPECT_EQ(filho<QLabel>(&janela, "lblCaixa")->text(), QStringLiteral("Caixa principal"));
    janela.dtpData()->setDate(QDate(2026, 3, 14));
    ASSERT_EQ(lista->rowCount(), 4);
    EXPECT_TRUE(lista->isColumnHidden(0));
    EXPECT_EQ(lista->horizontalHeaderItem(1)->text(), QStringLiteral("Código"));
    EXPECT_EQ(lista->horizontalHeaderItem(3)->text(), QStringLiteral("Valor"));
    escreve(lista, "NU", "20,5");
    lista->selectRow(linhaDe(lista, "MB"));
    teclado_.respostas = {V("5")};
    clicar(&janela, "cmdValor");
    EXPECT_EQ(janela.lblTotal()->text(), QStringLiteral("25.50"));
    clicar(&janela, "cmdActualizar");
    janela.grab().save(QStringLiteral("/tmp/frmRegistoDeCaixa.png"));
    EXPECT_EQ(contado("2026-03-14"), (QHash<QString, Currency>{{QStringLiteral("NU"), V("20.5")},
                                                               {QStringLiteral("MB"), V("5")},
                                                               {QStringLiteral("CC"), V("0")},
                                                               {QStringLiteral("MW"), V("0")}}));

    // Another day has no count; coming back shows the one recorded.
    janela.dtpData()->setDate(QDate(2026, 3, 15));
    EXPECT_EQ(valorDe(lista, "NU"), QStringLiteral("0.00"));
    EXPECT_EQ(janela.lblTotal()->text(), QStringLiteral("0.00"));
    janela.dtpData()->setDate(QDate(2026, 3, 14));
    EXPECT_EQ(valorDe(lista, "NU"), QStringLiteral("20.50"));
    EXPECT_EQ(valorDe(lista, "MB"), QStringLiteral("5.00"));

    escreve(lista, "NU", "10");
    escreve(lista, "MB", "");
    clicar(&janela, "cmdActualizar");
    EXPECT_EQ(contado("2026-03-14").value(QStringLiteral("NU")), V("10"));
    EXPECT_EQ(contado("2026-03-14").value(QStringLiteral("MB")), V("0"));
    EXPECT_TRUE(mensagens_.mensagens().isEmpty()) << mensagens_.textos().join(u'|').toStdString();

    // A count that is not a number, or no register, changes nothing.
    escreve(lista, "NU", "1.2.3");
    clicar(&janela, "cmdActualizar");
    janela.txtCaixa()->clear();
    escreve(lista, "NU", "3");
    clicar(&janela, "cmdActualizar");
    EXPECT_EQ(mensagens_.textos(), (QStringList{QStringLiteral("Valor Inválido!"),
                                                QStringLiteral("Não definiu o Caixa!")}));
    EXPECT_EQ(contado("2026-03-14").value(QStringLiteral("NU")), V("10"));
}

TEST_F(RegistoCaixaJanela, TheReportGoesToThePreviewWhenAskedForTheScreen) {
    frmRegistoDeCaixa janela(e_, mensagens_, nullptr, &pesquisa_, &teclado_);
    janela.dtpData()->setDate(QDate(2026, 3, 14));
    QString pergunta;
    int paginas = 0;
    testing::noDialogo([&](QWidget* d) {
        auto* caixa = qobject_cast<QMessageBox*>(d);
        ASSERT_NE(caixa, nullptr);
        pergunta = caixa->text();
        quandoAberto<QPrintPreviewDialog>([&](QPrintPreviewDialog* previsao) {
            if (auto* w = previsao->findChild<QPrintPreviewWidget*>()) paginas = w->pageCount();
            previsao->reject();
        });
        clicar(d, "cmdEcran");
    });
    clicar(&janela, "cmdImprimir");
    EXPECT_EQ(pergunta, QStringLiteral("Tipo de Listagem?"));
    EXPECT_EQ(paginas, 1);
}

TEST_F(RegistoCaixaJanela, TheReportPrintsItsFiguresIntoAPdf) {
    MovimentoCaixa m = teste::vendaDinheiro(QStringLiteral("1"));
    m.valorTotal = V("1234.5");
    ASSERT_TRUE(LancaMovCaixa(e_, e_.gConn, m));
    m.numero = QStringLiteral("2");
    m.data = QStringLiteral("2026-03-10");
    m.valorTotal = V("40");
    ASSERT_TRUE(LancaMovCaixa(e_, e_.gConn, m));
    ASSERT_TRUE(GravaRegistoCaixa(e_, mensagens_, QStringLiteral("01"),
                                  QStringLiteral("2026-03-14"),
                                  {{QStringLiteral("NU"), V("1000")}}));
    const auto relatorio =
        CalculaRelatorioCaixa(e_, QStringLiteral("01"), QStringLiteral("2026-03-14"));
    ASSERT_TRUE(relatorio);

    QTemporaryDir pasta;
    const QString ficheiro = pasta.filePath(QStringLiteral("registo.pdf"));
    QPrinter impressora(QPrinter::HighResolution);
    impressora.setOutputFormat(QPrinter::PdfFormat);
    impressora.setOutputFileName(ficheiro);
    ASSERT_TRUE(ImprimeRelatorioCaixa(impressora, *relatorio, 2));
    const auto texto = testing::textoPdf(ficheiro);
    ASSERT_TRUE(texto) << "pdftotext";
    const auto linha = [&](const char* padrao) {
        return QRegularExpression(QString::fromUtf8(padrao)).match(*texto).hasMatch();
    };
    EXPECT_TRUE(linha("Diário do Caixa - Caixa principal \\(01\\)")) << texto->toStdString();
    EXPECT_TRUE(linha("Data: 14-03-2026"));
    EXPECT_TRUE(
        linha("Formas de Pagamento\\s+Recebimentos\\s+Pagamentos\\s+Saldo Caixa\\s+"
              "Registo\\s+Dif. Registo"));
    EXPECT_TRUE(linha("Numerário\\s+1,234.50\\s+0.00\\s+1,234.50\\s+1,000.00\\s+-234.50"))
        << texto->toStdString();
    EXPECT_TRUE(linha("Saldo anterior\\s+40.00"));
    EXPECT_TRUE(linha("Saldo do Dia\\s+1,234.50"));
    EXPECT_TRUE(linha("Saldo Actual\\s+1,274.50"));
}

TEST_F(RegistoCaixaJanela, ChangingTheRegisterKeepsAnExistingOne) {
    ASSERT_TRUE(e_.gConn.exec(
        QStringLiteral("insert into Caixas (Codigo, Descricao) values ('02', 'Esplanada')")));
    frmAltCaixa janela(e_, mensagens_, nullptr, &pesquisa_);
    EXPECT_EQ(janela.txtCaixa()->text(), QStringLiteral("01"));
    EXPECT_EQ(janela.lblCaixa()->text(), QStringLiteral("Caixa principal"));
    janela.show();

    janela.txtCaixa()->clear();
    clicar(&janela, "cmdOK");
    janela.txtCaixa()->setText(QStringLiteral("99"));
    clicar(&janela, "cmdOK");
    EXPECT_EQ(mensagens_.textos(), (QStringList{QStringLiteral("Não definiu o Caixa!"),
                                                QStringLiteral("Caixa Inexistente")}));
    EXPECT_TRUE(janela.isVisible());
    EXPECT_EQ(e_.gCaixa, QStringLiteral("01"));

    pesquisa_.resposta = lookups::LinhaEscolhida{QStringLiteral("02"), QStringLiteral("Esplanada")};
    clicar(&janela, "cmdPesquisa");
    EXPECT_EQ(pesquisa_.tabelas, QStringList{QStringLiteral("Caixas")});
    EXPECT_EQ(janela.lblCaixa()->text(), QStringLiteral("Esplanada"));
    janela.grab().save(QStringLiteral("/tmp/frmAltCaixa.png"));
    clicar(&janela, "cmdOK");
    EXPECT_EQ(janela.result(), QDialog::Accepted);
    EXPECT_EQ(e_.gCaixa, QStringLiteral("02"));
    EXPECT_EQ(app::posto::ConfigRest_CAIXA.ler(), QStringLiteral("02"));
}

}  // namespace
}  // namespace brasel::cash
