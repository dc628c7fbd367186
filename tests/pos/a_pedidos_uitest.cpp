// The kitchen-order window offscreen: the waiting rows as the list shows them, release and drop
// of the checked rows only, a note edited by double-touching a row, and the note box itself.
#include "pos/copa_teste.h"
#include "pos/ui/a_pedidos.h"
#include "pos/ui/editor_texto_janela.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"
#include "support/mensagens_gravadas.h"

#include <QPlainTextEdit>

namespace brasel::pos {
namespace {

using testing::clicar;
using testing::filho;
using testing::MensagensGravadas;
using testing::noDialogo;

class EditorGravado : public cozinha::EditorTexto {
  public:
    std::optional<QString> resposta;
    std::optional<QString> editar(const QString&) override { return resposta; }
};

class APedidosTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoTeste(); }

    QStringList linha(const APedidos& janela, int i) const {
        QStringList textos;
        const QTreeWidgetItem* item = janela.lvwPedidos()->topLevelItem(i);
        for (int c = 0; c < item->columnCount(); ++c)
            textos << item->text(c);
        return textos;
    }

    void marca(APedidos& janela, QList<int> linhas) {
        for (int i : linhas)
            janela.lvwPedidos()->topLevelItem(i)->setCheckState(0, Qt::Checked);
    }

    testing::DefinicoesTemporarias definicoes_;
    testing::EmpresaTeste empresa_{true};
    app::Estado& e_ = empresa_.estado();
    MensagensGravadas mensagens_;
    EditorGravado editor_;
};

TEST_F(APedidosTeste, ListsTheWaitingRowsByTableWithTheirColumns) {
    const qint64 a = cozinha::teste::enfileira(e_, QStringLiteral("M02"), QStringLiteral("BIT"),
                                               QStringLiteral("sem sal"), false,
                                               QStringLiteral("2024-05-01 12:00:00"));
    const qint64 b = cozinha::teste::enfileira(e_, QStringLiteral("M01"), QStringLiteral("SOPA"),
                                               {}, true, QStringLiteral("2024-05-01 12:05:00"));
    APedidos janela(e_, mensagens_, editor_);
    EXPECT_EQ(janela.objectName(), QStringLiteral("APedidos"));
    ASSERT_EQ(janela.lvwPedidos()->topLevelItemCount(), 2);
    const QString esperado[] = {
        QString::number(b) +
            QStringLiteral("|M01|Mesa 1|SOPA|Descrição de SOPA|1,000||ANA|2024-05-01 12:05:00|S"),
        QString::number(a) +
            QStringLiteral("|M02|Mesa 2|BIT|Descrição de BIT|1,000|sem sal|ANA|2024-05-01 "
                           "12:00:00|N")};
    for (int i = 0; i < 2; ++i)
        EXPECT_EQ(linha(janela, i), esperado[i].split(u'|'));
    EXPECT_EQ(janela.lvwPedidos()->topLevelItem(0)->checkState(0), Qt::Unchecked);
}

TEST_F(APedidosTeste, ReleaseAndDropTakeTheCheckedRowsAndRefresh) {
    QList<qint64> n;
    for (const char* mesa : {"M01", "M02", "M03"})
        n << cozinha::teste::enfileira(e_, QString::fromUtf8(mesa), QStringLiteral("BIT"));
    APedidos janela(e_, mensagens_, editor_);
    mensagens_.respostaFinal = true;
    marca(janela, {0, 2});
    clicar(&janela, "cmdImprimir");
    EXPECT_EQ(cozinha::teste::naFila(e_, 1), (QList<qint64>{n[0], n[2]}));
    ASSERT_EQ(janela.lvwPedidos()->topLevelItemCount(), 1);
    marca(janela, {0});
    clicar(&janela, "cmdEliminar");
    EXPECT_TRUE(cozinha::teste::naFila(e_, 0).isEmpty());
    EXPECT_EQ(janela.lvwPedidos()->topLevelItemCount(), 0);
    EXPECT_EQ(mensagens_.perguntas(), (QStringList{QStringLiteral("Confirma a Impressão?"),
                                                   QStringLiteral("Confirma a Eliminação?")}));
}

TEST_F(APedidosTeste, DoubleTouchingARowEditsItsNote) {
    const qint64 n = cozinha::teste::enfileira(e_, QStringLiteral("M01"), QStringLiteral("BIT"),
                                               QStringLiteral("antes"));
    APedidos janela(e_, mensagens_, editor_);
    QTreeWidgetItem* item = janela.lvwPedidos()->topLevelItem(0);
    editor_.resposta = QStringLiteral("d'Ouro, sem \"sal\"");
    Q_EMIT janela.lvwPedidos()->itemDoubleClicked(item, 6);
    EXPECT_EQ(item->text(6), *editor_.resposta);
    EXPECT_EQ(
        e_.gConn
            .firstRow(QStringLiteral("select ObsLinha from HistoricoCopa where NumRegisto=?"), {n})
            ->value(0)
            .toString(),
        *editor_.resposta);
}

TEST_F(APedidosTeste, TheNoteBoxGivesTheTextWithItsLineBreaksOrNothing) {
    EditorTextoJanela editor;
    struct Caso {
        const char* botao;
        std::optional<QString> esperado;
    } casos[] = {
        {"cmdOK", QStringLiteral("sem sal\r\nbem passado")},
        {"cmdCancelar", std::nullopt},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.botao);
        QString recebido;
        noDialogo([&](QWidget* d) {
            auto* txt = filho<QPlainTextEdit>(d, "txtResultado");
            recebido = txt->toPlainText();
            txt->setPlainText(QStringLiteral("sem sal\nbem passado"));
            clicar(d, c.botao);
        });
        EXPECT_EQ(editor.editar(QStringLiteral("antes\r\nlinha")), c.esperado);
        EXPECT_EQ(recebido, QStringLiteral("antes\nlinha"));
    }
}

}  // namespace
}  // namespace brasel::pos
