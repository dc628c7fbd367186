// Posting on a PostgreSQL company, where every bound value must find its column's type: the
// procedure's 105 values, the balance procedures and a stock-controlled sale.
#include "db/connections.h"
#include "db/schema/servidor.h"
#include "documents/lanca_mov_produto.h"
#include "documents/movimentos_teste.h"
#include "documents/preco_medio_custo.h"
#include "documents/producao.h"
#include "documents/saldo_produto.h"
#include "support/empresa_pg.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"
#include "support/servidor_pg.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using teste::C;
using teste::linhaVenda;
using teste::movimento;

class LancamentoPg : public ::testing::Test {
  protected:
    void SetUp() override {
        if (!testing::servidorPg()) GTEST_SKIP() << "BRASEL_TEST_PG não definido";
        ASSERT_TRUE(empresa_.pronta()) << empresa_.erro().toStdString();
        ASSERT_TRUE(e.gConn.exec(QStringLiteral(
            "insert into Produtos (Codigo, Descricao, ctrlexistencia, precomediocusto, "
            "vendedorhabitual, UnidadeVenda, DiasDevolucao) values "
            "('K1','Vinho d''Ouro',1,'2.5','07','GAR',30)")));
    }

    testing::EmpresaPg empresa_{QLatin1Char('M')};
    app::Estado& e = empresa_.estado();
};

TEST_F(LancamentoPg, TheProcedureStoresEveryValueAndTheBalancesCountThem) {
    db::ValoresMovPro entrada = movimento("K1", "E+", "10", "2");
    entrada.RegiEncomenda = 12345678901LL;
    entrada.QuantConvert = 0.125;
    entrada.Sinal = -1;
    entrada.ObsLinha = QStringLiteral("entregue por 'José' -- \"ok\"");
    const std::int64_t n = db::MeteNoMovPro(e.gConn, entrada);
    ASSERT_GT(n, 0) << e.gConn.lastError().toStdString();
    const auto linha = e.gConn.firstRow(
        QStringLiteral("select RegiEncomenda, QuantConvert, Sinal, ObsLinha, Identifica, "
                       "QuantNormal, DataSys from MovProduto where NumRegisto=?"),
        {QVariant::fromValue<qlonglong>(n)});
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toLongLong(), 12345678901LL);
    EXPECT_DOUBLE_EQ(linha->value(1).toDouble(), 0.125);
    EXPECT_EQ(linha->value(2).toInt(), -1);
    EXPECT_EQ(linha->value(3).toString(), entrada.ObsLinha);
    EXPECT_EQ(linha->value(4).toString(), entrada.Identifica);
    EXPECT_EQ(Currency::fromVariant(linha->value(5)), C("10"));
    EXPECT_EQ(linha->value(6).toString().size(), 19);

    db::ValoresMovPro repetida = movimento("K1", "E+", "1");
    repetida.Identifica = entrada.Identifica;
    EXPECT_LT(db::MeteNoMovPro(e.gConn, repetida), 1);

    db::ValoresMovPro transf = movimento("K1", "TRA", "3");
    transf.ArmazemDest = QStringLiteral("002");
    ASSERT_GT(db::MeteNoMovPro(e.gConn, transf), 0);

    db::ChavesSaldo chaves;
    chaves.Produto = QStringLiteral("K1");
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("10"));
    chaves.Armazem = QStringLiteral("002");
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("3"));
    chaves.Lote = QStringLiteral("L1");
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("0"));
    chaves.Lote.clear();
    chaves.Cor = QStringLiteral("%");
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("3"));
}

TEST_F(LancamentoPg, AStockControlledSaleIsPostedUpToItsBalance) {
    db::ValoresMovPro entrada = movimento("K1", "E+", "2", "2");
    ASSERT_GT(db::MeteNoMovPro(e.gConn, entrada), 0);
    db::ValoresMovPro demais = linhaVenda("K1", "3", "4.5");
    EXPECT_EQ(LancaMovProduto(e, demais).recusa, RecusaLancamento::SemExistencia);
    db::ValoresMovPro venda = linhaVenda("K1", "2", "4.5");
    venda.ObsLinha = QStringLiteral("sem 'sal'");
    const ResultadoLancamento r = LancaMovProduto(e, venda, {QStringLiteral("Rest"), {}});
    ASSERT_TRUE(r) << e.gConn.lastError().toStdString();
    const auto linha = e.gConn.firstRow(
        QStringLiteral("select Vendedor, PMCusto, ObsLinha, DataDevolucao, Hora, Unidade from "
                       "MovProduto where NumRegisto=?"),
        {QVariant::fromValue<qlonglong>(r.NumRegisto)});
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toString(), QStringLiteral("07"));
    EXPECT_EQ(Currency::fromVariant(linha->value(1)), C("2.5"));
    EXPECT_EQ(linha->value(2).toString(), venda.ObsLinha);
    EXPECT_EQ(linha->value(3).toString(), QStringLiteral("2026-04-01"));
    EXPECT_EQ(linha->value(4).toString().size(), 8);
    EXPECT_EQ(linha->value(5).toString(), QStringLiteral("GAR"));

    const MovimentoCusto mov{QStringLiteral("K1"),  QStringLiteral("E+"),         C("2"), C("5"),
                             QStringLiteral("001"), QStringLiteral("2026-12-31"), 0};
    // (4 + 10) / 4 by totals; (0 x 2 + 10) / 2 by moving average, the sale having emptied the
    // stock.
    EXPECT_EQ(PrecoMedioCusto_Calcular(e, mov, FormulaPMC::Totais, false), C("3.5"));
    EXPECT_EQ(PrecoMedioCusto_Calcular(e, mov, FormulaPMC::MediaMovel, true), C("5"));
}

TEST_F(LancamentoPg, ProductionIsNumberedLinkedAndUndone) {
    for (const char* sql :
         {"insert into Produtos (Codigo, Descricao) values ('PA','Sangria'),('M1','Vinho')",
          "insert into Nomenclatura (ProdutoAcabado, ProdutoPrima, Quantidade) values "
          "('PA','M1','0.5')",
          "insert into ConfigProd (TipoSaida, TipoEnt, Fornece, cliente) values "
          "('PRS','PRE','PROD','PROD')",
          "insert into TabTipoMov (codigo, UltNumero) values "
          "('PRS','00000009'),('PRE','00000000')"}) {
        ASSERT_TRUE(e.gConn.exec(QString::fromLatin1(sql))) << e.gConn.lastError().toStdString();
    }
    testing::MensagensGravadas mensagens;
    const DestinoProducao destino{QStringLiteral("VD"), QString(), QStringLiteral("2026-03-02"),
                                  QStringLiteral("{V'1}")};
    ASSERT_TRUE(
        Producao_Lanca(e, QStringLiteral("PA"), C("3"), destino, QStringLiteral("001"), mensagens))
        << mensagens.textos().join(u'|').toStdString() << e.gConn.lastError().toStdString();
    const auto numeros = e.gConn.firstRow(QStringLiteral(
        "select (select UltNumero from TabTipoMov where codigo='PRS'), (select count(*) from "
        "MovProduto_Ligacoes where Destino_Identifica='{V''1}'), (select QuantNormal from "
        "MovProduto where Codigo='M1')"));
    ASSERT_TRUE(numeros);
    EXPECT_EQ(numeros->value(0).toString(), QStringLiteral("00000010"));
    EXPECT_EQ(numeros->value(1).toInt(), 2);
    EXPECT_EQ(Currency::fromVariant(numeros->value(2)), C("1.5"));
    ASSERT_TRUE(Producao_AnulaIdentifica(e, destino.Identifica));
    const auto resto = e.gConn.firstRow(QStringLiteral(
        "select (select count(*) from MovProduto), (select count(*) from MovProduto_Ligacoes)"));
    ASSERT_TRUE(resto);
    EXPECT_EQ(resto->value(0).toInt(), 0);
    EXPECT_EQ(resto->value(1).toInt(), 0);
}

}  // namespace
}  // namespace brasel::documents
