// The kitchen queue on a PostgreSQL company, where every bound value must find its column's type
// (a quantity as decimal text, a key as a number) and a note's quotes stay text.
#include "db/connections.h"
#include "db/schema/servidor.h"
#include "pos/cozinha/historico_copa.h"
#include "pos/cozinha/pedidos_cozinha.h"
#include "support/empresa_pg.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace brasel::pos::cozinha {
namespace {

class SemEditor : public EditorTexto {
  public:
    std::optional<QString> editar(const QString&) override { return std::nullopt; }
};

class HistoricoCopaPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        ASSERT_TRUE(estado_.gConn.exec(
            QStringLiteral("insert into Clientes (Codigo, Descricao) values ('M01','Mesa 1')")));
    }

    testing::EmpresaPg empresa_{QLatin1Char('H')};
    db::Sessao& estado_ = empresa_.estado();
};

TEST_F(HistoricoCopaPg, AQueuedRowIsListedReleasedAndReadBackForPrinting) {
    PedidoCozinha p{
        QStringLiteral("BIT"), QStringLiteral("Bitoque d'Ouro"),        *Currency::parse(u"1.5"),
        QStringLiteral("M01"), QStringLiteral("sem 'sal' -- \"nada\""), QStringLiteral("ANA")};
    EXPECT_FALSE(ExistemPedidosPorLibertar(estado_));
    ASSERT_TRUE(MetePedidoCozinha(estado_, p)) << estado_.gConn.lastError().toStdString();
    ASSERT_TRUE(MeteAnulacaoCozinha(estado_, p));
    EXPECT_TRUE(ExistemPedidosPorLibertar(estado_));

    const auto fila = PedidosPorLibertar(estado_);
    ASSERT_TRUE(fila) << estado_.gConn.lastError().toStdString();
    ASSERT_EQ(fila->size(), 2);
    EXPECT_EQ(fila->at(0).descricao, p.descricao);
    EXPECT_EQ(fila->at(0).quantidade, p.quantidade);
    EXPECT_EQ(fila->at(0).descricaoMesa, QStringLiteral("Mesa 1"));
    EXPECT_EQ(fila->at(0).obs + QStringLiteral("|") + fila->at(1).obs, p.obs + QStringLiteral("|"));
    EXPECT_NE(fila->at(0).anulacao, fila->at(1).anulacao);

    testing::MensagensGravadas mensagens;
    mensagens.respostaFinal = true;
    SemEditor editor;
    PedidosCozinha pedidos(estado_, mensagens, editor);
    ASSERT_TRUE(pedidos.liberta({fila->at(0).numRegisto, fila->at(1).numRegisto}, false));
    EXPECT_FALSE(ExistemPedidosPorLibertar(estado_));
    const auto libertados = PedidosLibertados(estado_);
    ASSERT_TRUE(libertados);
    ASSERT_EQ(libertados->size(), 2);
    for (const PedidoCopa& l : *libertados)
        EXPECT_TRUE(ApagaPedidoImpresso(estado_, l.numRegisto));
    EXPECT_TRUE(PedidosLibertados(estado_)->isEmpty());
}

}  // namespace
}  // namespace brasel::pos::cozinha
