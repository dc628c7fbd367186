// The document-copies window offscreen: the list and its filter, the signature check before any
// copy, the print-choice dialog and the receipt for a ticket user, the A4 page for the others.
#include "devices/talao_teste.h"
#include "documents/ui/frm_factura_cli_2via.h"
#include "support/aplicacao_teste.h"
#include "support/impressao_qt.h"
#include "support/janelas_teste.h"

#include <QDir>
#include <QLineEdit>
#include <QTableWidget>
#include <QTemporaryDir>

namespace brasel::documents {
namespace {

using testing::clicar;
using testing::filho;
using testing::noDialogo;

class JanelaSegundaVia : public devices::teste::TalaoTeste {
  protected:
    void SetUp() override {
        TalaoTeste::SetUp();
        devices::teste::escreveDocumento(conn_);
        devices::teste::OpcoesDocumento factura;
        factura.tipo = QStringLiteral("FT");
        factura.numero = QStringLiteral("00000003");
        devices::teste::escreveDocumento(conn_, factura);
        devices::teste::assinaDocumento(estado_, chaves_.filePath(QStringLiteral("chave.txt")),
                                        nota_);
        janela_.carregarLista();
    }

    QTemporaryDir chaves_;
    QString nota_;
    // The application exists before the window is made.
    QApplication& aplicacao_ = testing::aplicacaoTeste();
    frmFacturaCli2Via janela_{estado_, mensagens_, linha_};
};

TEST_F(JanelaSegundaVia, ListaFiltroEEscolha) {
    EXPECT_EQ(janela_.objectName(), QStringLiteral("frmFacturaCli2Via"));
    auto* lista = filho<QTableWidget>(&janela_, "lvwDocumentos");
    ASSERT_NE(lista, nullptr);
    EXPECT_EQ(lista->rowCount(), 2);
    struct Caso {
        const char* filtro;
        int linhas;
    };
    for (const Caso& c :
         {Caso{"ft", 1}, Caso{"joão", 2}, Caso{"00000007", 1}, Caso{"zzz", 0}, Caso{"", 2}}) {
        SCOPED_TRACE(c.filtro);
        filho<QLineEdit>(&janela_, "txtFiltro")->setText(QString::fromUtf8(c.filtro));
        EXPECT_EQ(lista->rowCount(), c.linhas);
    }
    filho<QLineEdit>(&janela_, "txtFiltro")->setText(QStringLiteral("VD"));
    lista->selectRow(0);
    EXPECT_EQ(filho<QLineEdit>(&janela_, "txtTipo")->text(), QStringLiteral("VD"));
    EXPECT_EQ(filho<QLineEdit>(&janela_, "txtNumero")->text(), QStringLiteral("00000007"));
    EXPECT_EQ(filho<QLineEdit>(&janela_, "txtAno")->text(), QStringLiteral("2026"));
    EXPECT_EQ(lista->item(0, 5)->text(), QStringLiteral("33,05"));
}

TEST_F(JanelaSegundaVia, TalaoDepoisDaEscolha) {
    filho<QLineEdit>(&janela_, "txtTipo")->setText(QStringLiteral("VD"));
    filho<QLineEdit>(&janela_, "txtNumero")->setText(QStringLiteral("00000007"));
    filho<QLineEdit>(&janela_, "txtAno")->setText(QStringLiteral("2026"));
    noDialogo([](QWidget* d) {
        EXPECT_EQ(d->objectName(), QStringLiteral("frmImpresao"));
        clicar(d, "cmdTalaoNormal");
    });
    ASSERT_TRUE(janela_.imprimir()) << mensagens_.textos().join(u'|').toStdString();
    const QString t = transcricao(1);
    EXPECT_TRUE(t.contains(QStringLiteral(">>>>>>>>>>  TALAO DE COMPRA  <<<<<<<<<<<")));
    EXPECT_TRUE(t.contains(nota_.left(40)));
}

TEST_F(JanelaSegundaVia, AssinaturaInvalidaNaoImprime) {
    ASSERT_TRUE(conn_.exec(QStringLiteral("update MovCliente set TotalDoc=3.05 where Tipo='VD'")));
    filho<QLineEdit>(&janela_, "txtTipo")->setText(QStringLiteral("VD"));
    filho<QLineEdit>(&janela_, "txtNumero")->setText(QStringLiteral("00000007"));
    filho<QLineEdit>(&janela_, "txtAno")->setText(QStringLiteral("2026"));
    // No print-choice dialog is opened: a dialog left waiting would fail the next test.
    EXPECT_FALSE(janela_.imprimir());
    ASSERT_EQ(mensagens_.mensagens().size(), 1);
    EXPECT_EQ(mensagens_.mensagens().first().texto,
              QStringLiteral("Não pode Imprimir este Documento porque a Assinatura não é Válida!"
                             "\r\nPor favor contacte o seu administrador."));
    EXPECT_FALSE(impressora_->esperaBytes(1, 300));
    // Nor without a key to print.
    mensagens_.limpar();
    filho<QLineEdit>(&janela_, "txtNumero")->clear();
    EXPECT_FALSE(janela_.imprimir());
    EXPECT_EQ(mensagens_.textos(),
              QStringList{QStringLiteral("Seleccione o documento a imprimir.")});
}

TEST_F(JanelaSegundaVia, PaginaA4ParaQuemNaoImprimeTaloes) {
    QTemporaryDir pasta;
    devices::teste::configura(conn_, QStringLiteral("Impressora"), pasta.path());
    filho<QLineEdit>(&janela_, "txtTipo")->setText(QStringLiteral("VD"));
    filho<QLineEdit>(&janela_, "txtNumero")->setText(QStringLiteral("00000007"));
    filho<QLineEdit>(&janela_, "txtAno")->setText(QStringLiteral("2026"));
    ASSERT_TRUE(janela_.imprimir()) << mensagens_.textos().join(u'|').toStdString();
    const QStringList pdfs = QDir(pasta.path()).entryList({QStringLiteral("*.pdf")});
    ASSERT_EQ(pdfs.size(), 1);
    EXPECT_EQ(mensagens_.textos(),
              QStringList{QStringLiteral("Documento gravado em ") + pasta.filePath(pdfs.first())});
    EXPECT_FALSE(impressora_->esperaBytes(1, 300)) << "no receipt and no drawer";
}

}  // namespace
}  // namespace brasel::documents
