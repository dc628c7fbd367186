// A receipt's readings on a PostgreSQL company, where every bound value must find its column's
// type and the text comparisons of the document list must agree with the embedded engine.
#include "devices/conta_provisoria.h"
#include "devices/documento_impresso.h"
#include "devices/talao_teste.h"
#include "support/empresa_pg.h"
#include "support/impressao_qt.h"
#include "support/servidor_pg.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

Currency v(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

class TalaoDocumentoPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        teste::escreveDocumento(conn_);
    }

    testing::EmpresaPg empresa_{QLatin1Char('D'), true};
    app::Estado& estado_ = empresa_.estado();
    db::Connection& conn_ = estado_.gConn;
    testing::MensagensGravadas mensagens_;
};

TEST_F(TalaoDocumentoPg, DocumentoLidoComoNoMotorEmbutido) {
    const auto d = LerDocumentoImpresso(conn_, mensagens_, QStringLiteral("VD"),
                                        QStringLiteral("00000007"), QStringLiteral("2026"));
    ASSERT_TRUE(d) << mensagens_.textos().join(u'|').toStdString();
    EXPECT_EQ(d->descricaoTipo, QStringLiteral("Venda a Dinheiro"));
    EXPECT_EQ(d->afectaCli, QStringLiteral("S+"));
    EXPECT_EQ(d->login, QStringLiteral("ANA"));
    EXPECT_EQ(d->blocoCliente().at(3), QStringLiteral("1100-148 Lisboa"));
    EXPECT_EQ(DocumentoImpresso::horaImpressa(d->horaAbertura), QStringLiteral("12:41"));
    EXPECT_EQ(d->totalDoc, v("33.05"));
    EXPECT_EQ(d->troco(), v("16.95"));
    ASSERT_EQ(d->linhas.size(), 3u);
    EXPECT_EQ(d->linhas[2].outUnidade, QStringLiteral("Copo"));
    EXPECT_EQ(d->linhas[2].total(), v("3.6"));
    ASSERT_EQ(d->ivas.size(), 2u);
    EXPECT_EQ(d->ivas[1].comIva(), v("4.8"));
    ASSERT_EQ(d->impostos.size(), 1u);
    EXPECT_EQ(d->impostos[0].valor, v("0.1"));
    ASSERT_EQ(d->pagamentos.size(), 1u);
    EXPECT_EQ(d->pagamentos[0].descricao, QStringLiteral("Numerário"));

    struct Caso {
        const char* filtro;
        std::size_t documentos;
    };
    for (const Caso& c : {Caso{"", 1}, Caso{"joão", 1}, Caso{"vd", 1}, Caso{"zz", 0}}) {
        SCOPED_TRACE(c.filtro);
        EXPECT_EQ(ListaDocumentosCliente(conn_, QString::fromUtf8(c.filtro)).size(), c.documentos);
    }
}

TEST_F(TalaoDocumentoPg, LinhasAbertasDaConta) {
    ASSERT_TRUE(
        conn_.exec(QStringLiteral("update MovProduto set Numero='',Fechado='N',"
                                  "Utilizador='ANA' where Tipo='VD'")));
    const auto conta = LerContaProvisoria(estado_, QStringLiteral("M01"), QStringLiteral("VD"),
                                          QStringLiteral("ANA"));
    ASSERT_TRUE(conta);
    EXPECT_EQ(conta->linhas.size(), 3u);
    EXPECT_EQ(conta->cliente.first(), QStringLiteral("Mesa 1"));
    EXPECT_TRUE(LerContaProvisoria(estado_, QStringLiteral("M01"), QStringLiteral("VD"),
                                   QStringLiteral("RUI"))
                    ->linhas.empty());
}

}  // namespace
}  // namespace brasel::devices
