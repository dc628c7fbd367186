// Cash movements on a PostgreSQL company, where every bound value must find its column's type
// and the unique key on document and method holds: the rewrite, the split and the report's sums.
#include "cash/caixa_teste.h"
#include "cash/lanca_mov_caixa.h"
#include "cash/registo_caixa.h"
#include "support/empresa_pg.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <gtest/gtest.h>

namespace brasel::cash {
namespace {

using teste::V;

TEST(LancaMovCaixaPg, RewritesTheRowOfADocumentAndMethodAndSumsTheDay) {
    if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
    testing::EmpresaPg empresa(QLatin1Char('C'));
    ASSERT_TRUE(empresa.pronta()) << empresa.erro().toStdString();
    app::Estado& e = empresa.estado();
    e.gUtilizador = QStringLiteral("01");
    e.gCaixa = QStringLiteral("01");
    e.gArmazem = QStringLiteral("001");
    e.param.cambiodef = QStringLiteral("EUR");
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("insert into PagaComo (codigo, Descricao, Reembolso) "
                                    "values ('NU','Numerário',0), ('MB','Multibanco',0)")));

    MovimentoCaixa m = teste::vendaDinheiro(QStringLiteral("00000001"));
    const std::vector<ParcialPagamento> divisao{{QStringLiteral("NU"), V("4.10")},
                                                {QStringLiteral("MB"), V("8.20")}};
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m, &divisao)) << e.gConn.lastError().toStdString();
    m.valorTotal = V("12.30");
    m.nomeEntidade = QStringLiteral("Reescrito");
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m)) << e.gConn.lastError().toStdString();

    const auto linhas = teste::linhasCaixa(e.gConn, m.tipo, m.numero);
    ASSERT_EQ(linhas.size(), 2u);
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).valorTotal, V("12.30"));
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).valor1, V("10"));
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).nomeEntidade, QStringLiteral("Reescrito"));
    EXPECT_EQ(linhas.at(QStringLiteral("MB")).valor1, V("6.67"));
    EXPECT_EQ(linhas.at(QStringLiteral("MB")).valorTotal, V("8.20"));

    testing::MensagensGravadas mensagens;
    ASSERT_TRUE(GravaRegistoCaixa(e, mensagens, QStringLiteral("01"), m.data,
                                  {{QStringLiteral("NU"), V("12.30")}}));
    const auto r = CalculaRelatorioCaixa(e, QStringLiteral("01"), m.data);
    ASSERT_TRUE(r) << e.gConn.lastError().toStdString();
    EXPECT_EQ(r->saldoDia, V("20.50"));
    ASSERT_EQ(r->linhas.size(), 2u);
    EXPECT_EQ(r->linhas[1].pagaComo, QStringLiteral("NU"));
    EXPECT_EQ(r->linhas[1].diferenca, V("0"));
}

}  // namespace
}  // namespace brasel::cash
