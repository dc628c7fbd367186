// The order screen driven by its buttons: a table opened, three products touched, a quantity
// changed on the keypad and a line deleted, with the list and the totals checked after.
#include "pos/ui/frm_facturacao.h"
#include "support/aplicacao_teste.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"

#include <QApplication>
#include <QTimer>

#include <deque>
#include <functional>
#include <utility>

namespace brasel::pos {
namespace {

using testing::clicar;
using testing::filho;

// Answers the modal dialogs as they come, each by its window name, in order.
class Dialogos {
  public:
    explicit Dialogos(std::deque<std::pair<QString, std::function<void(QWidget*)>>> passos)
        : passos_(std::move(passos)) {
        QObject::connect(&timer_, &QTimer::timeout, [this] {
            QWidget* modal = QApplication::activeModalWidget();
            if (passos_.empty() || !modal || modal->objectName() != passos_.front().first) return;
            auto accao = std::move(passos_.front().second);
            passos_.pop_front();
            accao(modal);
        });
        timer_.start(10);
    }
    bool terminados() const { return passos_.empty(); }

  private:
    std::deque<std::pair<QString, std::function<void(QWidget*)>>> passos_;
    QTimer timer_;
};

void sim(QWidget* d) {
    clicar(d, "cmdSim");
}

QTreeWidgetItem* linhaDe(QTreeWidget* lista, const char* produto) {
    for (int i = 0; i < lista->topLevelItemCount(); ++i)
        if (lista->topLevelItem(i)->text(1) == QLatin1String(produto))
            return lista->topLevelItem(i);
    return nullptr;
}

void premir(frmFacturacao& janela, const char* produto) {
    QListWidget* botoes = janela.lvwListaProdutos();
    for (int i = 0; i < botoes->count(); ++i) {
        if (botoes->item(i)->data(Qt::UserRole).toString() == QLatin1String(produto)) {
            Q_EMIT botoes->itemClicked(botoes->item(i));
            return;
        }
    }
    ADD_FAILURE() << "sem botão " << produto;
}

TEST(FrmFacturacao, MesaTresProdutosQuantidadeNoTecladoEEliminacao) {
    testing::aplicacaoTeste();
    testing::DefinicoesTemporarias definicoes;
    testing::EmpresaTeste empresa(true);
    devices::LinhaSerie linha;
    frmFacturacao janela(empresa.estado(), linha);
    janela.resize(1024, 768);
    janela.show();

    auto* txtCliente = filho<QLineEdit>(&janela, "txtCliente");
    txtCliente->setText(QStringLiteral("M01"));
    Q_EMIT txtCliente->returnPressed();
    EXPECT_EQ(filho<QLabel>(&janela, "lblCliente")->text(), QStringLiteral("Mesa 1"));
    EXPECT_EQ(filho<QLabel>(&janela, "lblTipo")->text(), QStringLiteral("[Venda a Dinheiro]"));

    {
        Dialogos grupo({{QStringLiteral("aGrupos"), [](QWidget* d) { clicar(d, "cmdGrupo_01"); }}});
        clicar(&janela, "cmdGrupo");
        EXPECT_TRUE(grupo.terminados());
    }
    EXPECT_EQ(filho<QLabel>(&janela, "lblGrupo")->text(), QStringLiteral("Bebidas"));
    premir(janela, "B001");
    premir(janela, "B015");
    premir(janela, "B003");
    QTreeWidget* lista = janela.lvwLista();
    ASSERT_EQ(lista->topLevelItemCount(), 3);

    // Three coffees instead of one, on the keypad.
    lista->setCurrentItem(linhaDe(lista, "B015"));
    {
        Dialogos passos({{QStringLiteral("frmConfirmacao"), sim},
                         {QStringLiteral("frmTeclado"), [](QWidget* d) {
                              clicar(d, "cmd3");
                              clicar(d, "cmdEnter");
                          }}});
        clicar(&janela, "cmdAltQtyJaLancada");
        EXPECT_TRUE(passos.terminados());
    }
    // The water goes.
    lista->setCurrentItem(linhaDe(lista, "B001"));
    {
        Dialogos passos({{QStringLiteral("frmConfirmacao"), sim}});
        clicar(&janela, "cmdEliminarpro");
        EXPECT_TRUE(passos.terminados());
    }

    ASSERT_EQ(lista->topLevelItemCount(), 2);
    EXPECT_EQ(linhaDe(lista, "B001"), nullptr);
    QTreeWidgetItem* cafe = linhaDe(lista, "B015");
    ASSERT_NE(cafe, nullptr);
    EXPECT_EQ(cafe->text(2), QStringLiteral("3.000"));
    EXPECT_EQ(cafe->text(14), QStringLiteral("2.71"));  // 3 x 0.80 + 13 %
    EXPECT_EQ(cafe->checkState(0), Qt::Checked);
    EXPECT_EQ(linhaDe(lista, "B003")->text(14), QStringLiteral("1.80"));
    EXPECT_EQ(janela.lblTotal()->text(), QStringLiteral("Total  4.51"));

    // For review at the touch screen's size.
    janela.grab().save(QStringLiteral("/tmp/frmFacturacao.png"));

    // Unticking a line takes it out of the total.
    cafe->setCheckState(0, Qt::Unchecked);
    EXPECT_EQ(janela.lblTotal()->text(), QStringLiteral("Total  1.80"));
}

}  // namespace
}  // namespace brasel::pos
