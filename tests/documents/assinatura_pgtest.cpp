// The signature chain on a PostgreSQL company: the previous signature, the sequence check and
// the header signature read and written inside the closing's transaction, and a changed total
// caught before printing.
#include "db/query_helpers.h"
#include "documents/assinatura.h"
#include "documents/assinatura_teste.h"
#include "support/chave_teste.h"
#include "support/empresa_pg.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using teste::assinaEGrava;

class AssinaturaPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        testing::usaChaveTeste(e);
        teste::criaTipos(e.gConn);
    }
    void confere(const QString& texto, const QString& hash) {
        const auto ok = testing::confereComOpenssl(texto, hash);
        if (!ok) GTEST_SKIP() << "sem o programa openssl";
        EXPECT_TRUE(*ok) << texto.toStdString();
    }

    testing::EmpresaPg empresa_{QLatin1Char('A')};
    app::Estado& e = empresa_.estado();
};

TEST_F(AssinaturaPg, TheChainIsSignedInsideTheTransactionAndCheckedBeforePrinting) {
    {
        db::WriteTransaction t(e.gConn);
        ASSERT_TRUE(t.active());
        const auto d1 = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000001"),
                                     QStringLiteral("2026-08-01"), QStringLiteral("1500.25"));
        ASSERT_TRUE(d1.ok);
        confere(QStringLiteral("2026-08-01;2026-08-01T10:00:00;FR1 2026/00000001;1500.25;"),
                d1.assinatura.hash);
        // The second reads the first, written but not yet committed, on the same connection.
        const auto d2 = assinaEGrava(e, e.gConn, QStringLiteral("FR1"), QStringLiteral("00000002"),
                                     QStringLiteral("2026-08-02"), QStringLiteral("3.5"));
        ASSERT_TRUE(d2.ok);
        confere(QStringLiteral("2026-08-02;2026-08-02T10:00:00;FR1 2026/00000002;3.50;") +
                    d1.assinatura.hash,
                d2.assinatura.hash);
        const auto conteudo = AssinaConteudo(e, e.gConn, true, QStringLiteral("FR1"),
                                             QStringLiteral("00000002"), QStringLiteral("2026"));
        ASSERT_TRUE(conteudo);
        // The sequence check sees the uncommitted documents too.
        Assinatura a;
        QString dataSys = QStringLiteral("2026-08-03 09:00:00");
        EXPECT_FALSE(AssinaDocumento(e, e.gConn, a, dataSys, QStringLiteral("FR1"),
                                     QStringLiteral("00000001"), QStringLiteral("2026-08-03"),
                                     Currency(1)));
        ASSERT_TRUE(t.commit());
    }
    const auto quoril = db::primeiraLinha(
        e.gConn, QStringLiteral("select Hash_Quoril from MovCliente where Tipo=? and Numero=?"),
        {QStringLiteral("FR1"), QStringLiteral("00000002")});
    ASSERT_TRUE(quoril);
    EXPECT_EQ(quoril->value(0).toString().size(), 172);

    testing::MensagensGravadas mensagens;
    for (const char* n : {"00000001", "00000002"}) {
        EXPECT_TRUE(ValidaAssinatura(e, mensagens, true, QStringLiteral("FR1"),
                                     QString::fromLatin1(n), QStringLiteral("2026")))
            << n;
    }
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("update MovCliente set TotalDoc=? where Tipo=? and "
                       "Numero=?"),
        {QStringLiteral("1500.26"), QStringLiteral("FR1"), QStringLiteral("00000001")}));
    EXPECT_FALSE(ValidaAssinatura(e, mensagens, true, QStringLiteral("FR1"),
                                  QStringLiteral("00000001"), QStringLiteral("2026")));
    // The next one signed the first's signature, not its total.
    EXPECT_TRUE(ValidaAssinatura(e, mensagens, true, QStringLiteral("FR1"),
                                 QStringLiteral("00000002"), QStringLiteral("2026")));
    EXPECT_EQ(mensagens.mensagens().size(), 1);
}

}  // namespace
}  // namespace brasel::documents
