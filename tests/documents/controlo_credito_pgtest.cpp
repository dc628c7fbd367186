// The customer's credit checks on PostgreSQL: the balance against the limit and an overdue
// document, read through the same statements as on the embedded engine.
#include "documents/controlo_credito.h"
#include "pricing/valores_teste.h"
#include "support/empresa_pg.h"
#include "support/servidor_pg.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using pricing::teste::V;

TEST(ControloCreditoPg, LimiteEVencidos) {
    if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
    testing::EmpresaPg empresa(QLatin1Char('R'), true);
    ASSERT_TRUE(empresa.pronta()) << empresa.erro().toStdString();
    db::Connection& c = empresa.estado().gConn;
    const QDate hoje(2026, 6, 15);
    ASSERT_TRUE(
        c.exec(QStringLiteral("update Clientes set LimiteCredito=100,ControlaVencidos=1 "
                              "where Codigo='M01'")));
    ASSERT_TRUE(
        c.exec(QStringLiteral("insert into MovCliente (Codigo,Tipo,Numero,Ano,Afecta,"
                              "saldodoc,datavenc) values ('M01','FT','00000001','2026',"
                              "'D+','40','2026-07-01')")));

    EXPECT_EQ(VerificaCreditoCliente(c, QStringLiteral("M01"), V("60"), QStringLiteral("FT"), hoje),
              std::nullopt);
    const auto acima =
        VerificaCreditoCliente(c, QStringLiteral("M01"), V("60.01"), QStringLiteral("FT"), hoje);
    ASSERT_TRUE(acima);
    EXPECT_TRUE(acima->texto.contains(QStringLiteral("Limite de Crédito")))
        << acima->texto.toStdString();
    // A cash sale goes on nobody's account.
    EXPECT_EQ(
        VerificaCreditoCliente(c, QStringLiteral("M01"), V("500"), QStringLiteral("VD"), hoje),
        std::nullopt);

    ASSERT_TRUE(
        c.exec(QStringLiteral("insert into MovCliente (Codigo,Tipo,Numero,Ano,Afecta,"
                              "saldodoc,datavenc) values ('M01','FT','00000002','2026',"
                              "'D+','5','2026-06-14')")));
    const auto vencido =
        VerificaCreditoCliente(c, QStringLiteral("M01"), V("1"), QStringLiteral("FT"), hoje);
    ASSERT_TRUE(vencido);
    EXPECT_FALSE(vencido->autorizavel);
    EXPECT_TRUE(vencido->texto.contains(QStringLiteral("Vencidos")))
        << vencido->texto.toStdString();
}

}  // namespace
}  // namespace brasel::documents
