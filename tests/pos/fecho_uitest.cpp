// Closing a table from the order screen with the real windows: the confirmation, the payment
// screen and the print choice answered as they open; the document written and the screen ready
// for the next customer.
#include "pos/fecho_teste.h"
#include "pos/ui/frm_facturacao.h"
#include "support/aplicacao_teste.h"
#include "support/janelas_teste.h"

#include <QApplication>
#include <QMessageBox>
#include <QTimer>

#include <functional>
#include <map>

namespace brasel::pos {
namespace {

using testing::clicar;
using testing::filho;

// Answers every modal window that opens, by its name, for as long as it lives.
class Respostas {
  public:
    explicit Respostas(std::map<QString, std::function<void(QWidget*)>> respostas)
        : respostas_(std::move(respostas)) {
        QObject::connect(&timer_, &QTimer::timeout, [this] {
            QWidget* modal = QApplication::activeModalWidget();
            if (!modal) return;
            const auto r = respostas_.find(modal->objectName());
            if (r == respostas_.end()) return;
            vistas << modal->objectName();
            r->second(modal);
        });
        timer_.start(20);
    }
    QStringList vistas;

  private:
    std::map<QString, std::function<void(QWidget*)>> respostas_;
    QTimer timer_;
};

TEST(FechoJanela, MesaFechadaPeloBotaoFecharEEcranProntoParaOProximo) {
    testing::aplicacaoTeste();
    testing::DefinicoesTemporarias definicoes;
    testing::EmpresaTeste empresa(true);
    app::Estado& estado = empresa.estado();
    testing::usaChaveTeste(estado);
    estado.gVariosPagaComo = false;
    devices::LinhaSerie linha;
    frmFacturacao janela(estado, linha);
    janela.resize(1024, 768);
    janela.show();
    janela.abrirMesa(QStringLiteral("M01"));
    teste::PerguntasGravadas perguntas;
    for (const char* produto : {"B001", "B003"})
        ASSERT_GT(AdicionarProduto(janela.tab(), perguntas, QString::fromLatin1(produto)), 0);
    janela.mostraLista();
    const Currency total = janela.tab().lista().totais.total;
    janela.grab().save(QStringLiteral("/tmp/frmFacturacao-fecho.png"));

    QStringList mensagens;
    Respostas respostas(
        {{QStringLiteral("frmConfirmacao"), [](QWidget* d) { clicar(d, "cmdSim"); }},
         {QStringLiteral("frmTroco"),
          [](QWidget* d) {
              clicar(d, "cmdPagaComo_NU");
              clicar(d, "cmdFechaDiv");
          }},
         {QStringLiteral("frmImpresao"), [](QWidget* d) { clicar(d, "cmdNao"); }},
         {QStringLiteral("frmMensagem"), [&mensagens](QWidget* d) {
              mensagens << static_cast<QMessageBox*>(d)->text();
              static_cast<QMessageBox*>(d)->accept();
          }}});
    clicar(&janela, "cmdGravarDoc");
    EXPECT_EQ(respostas.vistas,
              (QStringList{QStringLiteral("frmConfirmacao"), QStringLiteral("frmTroco"),
                           QStringLiteral("frmImpresao")}))
        << mensagens.join(u'|').toStdString();

    auto r = estado.gConn.firstRow(
        QStringLiteral("select Tipo,Numero,Codigo,PagaComo,TotalDoc from MovCliente"));
    ASSERT_TRUE(r);
    EXPECT_EQ(r->value(0).toString(), QStringLiteral("VD"));
    EXPECT_EQ(r->value(1).toString(), QStringLiteral("00000001"));
    EXPECT_EQ(r->value(2).toString(), QStringLiteral("M01"));
    EXPECT_EQ(r->value(3).toString(), QStringLiteral("NU"));
    EXPECT_EQ(Currency::fromVariant(r->value(4)), total);
    auto abertas =
        estado.gConn.firstRow(QStringLiteral("select count(*) from MovProduto where Fechado='N'"));
    EXPECT_EQ(abertas->value(0).toInt(), 0);

    // The supervisor is offered the walk-in customer next, with an empty tab.
    EXPECT_EQ(filho<QLineEdit>(&janela, "txtCliente")->text(), estado.param.clidiversos);
    EXPECT_EQ(janela.lvwLista()->topLevelItemCount(), 0);
    EXPECT_EQ(janela.lblTotal()->text(), QStringLiteral("Total  0.00"));
}

}  // namespace
}  // namespace brasel::pos
