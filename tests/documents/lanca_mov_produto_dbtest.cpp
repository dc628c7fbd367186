// Posting a line on an embedded company: stock control and lots, the cost columns of each kind
// of movement, and what the posting completes on the row.
#include "documents/lanca_mov_produto.h"

#include "documents/movimentos_teste.h"
#include "documents/saldo_produto.h"
#include "pricing/insere_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <functional>

namespace brasel::documents {
namespace {

using pricing::teste::insere;
using pricing::teste::T;
using teste::C;
using teste::grava;
using teste::linhaVenda;
using teste::movimento;
using R = RecusaLancamento;

// Product K1 is stock-controlled, with its costs, usual seller, unit and return days.
void criaProdutos(app::Estado& e) {
    insere(e, "Produtos",
           {{"Codigo", T("K1")},
            {"Descricao", T("Vinho do Porto")},
            {"ctrlexistencia", 1},
            {"precomediocusto", T("2.5")},
            {"ultprecocompra", T("2.2")},
            {"ultprecocusto", T("2.4")},
            {"vendedorhabitual", T("07")},
            {"UnidadeVenda", T("GAR")},
            {"DiasDevolucao", 30}});
    insere(e, "Produtos", {{"Codigo", T("LT1")}, {"Descricao", T("Queijo")}, {"Lote", T("S")}});
}

std::int64_t contaLinhas(app::Estado& e) {
    const auto r = e.gConn.firstRow(QStringLiteral("select count(*) from MovProduto"));
    return r ? r->value(0).toLongLong() : -1;
}

class LancaEmpresa : public ::testing::Test {
  protected:
    void SetUp() override { criaProdutos(e); }

    QSqlRecord linha(std::int64_t n) {
        return e.gConn
            .firstRow(QStringLiteral("select * from MovProduto where NumRegisto=?"),
                      {QVariant::fromValue<qlonglong>(n)})
            .value_or(QSqlRecord());
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
};

// Steps applied in order on one company; each says whether the line is posted.
struct Passo {
    const char* nome;
    std::function<db::ValoresMovPro()> linha;
    R esperado;
    bool historico = false;  // stored as it is, as the back office would
};

TEST_F(LancaEmpresa, StockControlRefusesAnExitBeyondTheBalanceAndLeavesNoRow) {
    const auto tipo = [](db::ValoresMovPro v, const char* t) {
        v.Tipo = QString::fromLatin1(t);
        return v;
    };
    const Passo passos[] = {
        {"no stock at all", [] { return linhaVenda("K1", "1"); }, R::SemExistencia, false},
        {"2 arrive", [] { return movimento("K1", "E+", "2"); }, R::Nenhuma, true},
        {"5 arrive elsewhere", [] { return movimento("K1", "E+", "5", "0", "002"); }, R::Nenhuma,
         true},
        {"3 of 2", [] { return linhaVenda("K1", "3"); }, R::SemExistencia, false},
        {"2 of 2", [] { return linhaVenda("K1", "2"); }, R::Nenhuma, false},
        {"1 of 0", [] { return linhaVenda("K1", "1"); }, R::SemExistencia, false},
        {"the reversal of an entry is an exit",
         [] {
             db::ValoresMovPro v = movimento("K1", "E-", "1");
             v.Tipo = QStringLiteral("DVF");
             return v;
         },
         R::SemExistencia, false},
        {"a return comes in",
         [] {
             db::ValoresMovPro v = linhaVenda("K1", "1");
             v.AfectaStk = QStringLiteral("S-");
             return v;
         },
         R::Nenhuma, false},
        {"then 1 of 1", [] { return linhaVenda("K1", "1"); }, R::Nenhuma, false},
        {"an adjustment is never refused", [&] { return tipo(linhaVenda("K1", "4"), "AC-"); },
         R::Nenhuma, false},
        {"nor a transfer", [&] { return tipo(linhaVenda("K1", "1"), "TL-"); }, R::Nenhuma, false},
        {"a product without control goes negative", [] { return linhaVenda("B001", "5"); },
         R::Nenhuma, false},
        {"a product that does not exist", [] { return linhaVenda("ZZZ", "1"); },
         R::ProdutoInexistente, false},
        {"a lot product moved without a lot", [] { return linhaVenda("LT1", "1"); }, R::SemLote,
         false},
        {"with its lot",
         [] {
             db::ValoresMovPro v = linhaVenda("LT1", "1");
             v.Lote = QStringLiteral("L7");
             return v;
         },
         R::Nenhuma, false},
        {"a lot product on a line without stock effect",
         [] {
             db::ValoresMovPro v = linhaVenda("LT1", "1");
             v.AfectaStk = QStringLiteral("NA");
             return v;
         },
         R::Nenhuma, false},
    };
    for (const Passo& p : passos) {
        db::ValoresMovPro v = p.linha();
        if (p.historico) {
            grava(e, v);
            continue;
        }
        const std::int64_t antes = contaLinhas(e);
        const ResultadoLancamento r = LancaMovProduto(e, v);
        EXPECT_EQ(r.recusa, p.esperado) << p.nome;
        EXPECT_EQ(bool(r), p.esperado == R::Nenhuma) << p.nome;
        EXPECT_EQ(contaLinhas(e), antes + (p.esperado == R::Nenhuma ? 1 : 0)) << p.nome;
    }
    db::ChavesSaldo chaves;
    chaves.Produto = QStringLiteral("K1");
    chaves.Armazem = QStringLiteral("001");
    // 2 in, 2 out, 1 back, 1 out, 4 adjusted out, 1 transferred out.
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("-5"));
    chaves.Produto = QStringLiteral("B001");
    EXPECT_EQ(SaldoProduto_SP(e, chaves), C("-5"));
}

TEST_F(LancaEmpresa, ThePostingCompletesTheRowItWrites) {
    grava(e, movimento("K1", "E+", "10"));
    e.gConn.exec(QStringLiteral("update UtilConfGeral set ActivaLogGeral=1"));
    db::ValoresMovPro v = linhaVenda("K1", "2", "4.5");
    v.ObsLinha = QStringLiteral("sem 'gelo'");
    v.Unidade.clear();
    const ResultadoLancamento r = LancaMovProduto(
        e, v, {QStringLiteral("Facturação Clientes (Rest)"), QStringLiteral("2000000000017")});
    ASSERT_TRUE(r) << e.gConn.lastError().toStdString();
    EXPECT_EQ(r.recusa, R::Nenhuma);
    const QSqlRecord l = linha(r.NumRegisto);
    EXPECT_EQ(l.value(QStringLiteral("Vendedor")).toString(), QStringLiteral("07"));
    EXPECT_EQ(l.value(QStringLiteral("Unidade")).toString(), QStringLiteral("GAR"));
    EXPECT_EQ(l.value(QStringLiteral("DataDevolucao")).toString(), QStringLiteral("2026-04-01"));
    EXPECT_EQ(l.value(QStringLiteral("Integrou")).toString(), QStringLiteral("N"));
    EXPECT_EQ(l.value(QStringLiteral("Fechado")).toString(), QStringLiteral("N"));
    EXPECT_EQ(l.value(QStringLiteral("ObsLinha")).toString(), v.ObsLinha);
    EXPECT_EQ(l.value(QStringLiteral("CodigoBarras")).toString(), QStringLiteral("2000000000017"));
    EXPECT_EQ(l.value(QStringLiteral("Identifica")).toString(), v.Identifica);
    EXPECT_FALSE(v.Identifica.isEmpty());
    const QString dataSys = l.value(QStringLiteral("DataSys")).toString();
    EXPECT_EQ(l.value(QStringLiteral("Hora")).toString(), dataSys.mid(11, 8));
    EXPECT_EQ(l.value(QStringLiteral("Hora")).toString().size(), 8);
    // What the caller gets back is what was stored.
    EXPECT_EQ(v.Vendedor, QStringLiteral("07"));
    EXPECT_EQ(v.PMCusto, C("2.5"));

    const auto log = e.gConn.firstRow(
        QStringLiteral("select Modulo, Observa, Produto, Terceiro, Valor from LogGeral order by "
                       "NumRegisto desc limit 1"));
    ASSERT_TRUE(log);
    EXPECT_EQ(log->value(0).toString(), QStringLiteral("FC"));
    EXPECT_EQ(log->value(1).toString(), QStringLiteral("Facturação Clientes (Rest)"));
    EXPECT_EQ(log->value(2).toString(), QStringLiteral("K1"));
    EXPECT_EQ(log->value(3).toString(), QStringLiteral("M01"));
    EXPECT_EQ(Currency::fromVariant(log->value(4)), C("9"));

    db::ValoresMovPro vendedor = linhaVenda("K1", "1");
    vendedor.Vendedor = QStringLiteral("03");
    ASSERT_TRUE(LancaMovProduto(e, vendedor));
    EXPECT_EQ(vendedor.Vendedor, QStringLiteral("03"));
}

TEST_F(LancaEmpresa, InsideTheCallersTransactionItsRollbackTakesTheLineAway) {
    const std::int64_t antes = contaLinhas(e);
    {
        db::WriteTransaction t(e.gConn);
        ASSERT_TRUE(t.active());
        db::ValoresMovPro recusada = linhaVenda("K1", "1");
        EXPECT_EQ(LancaMovProduto(e, recusada).recusa, R::SemExistencia);
        EXPECT_TRUE(e.gConn.inTransaction());
        db::ValoresMovPro aceite = linhaVenda("B001", "1");
        ASSERT_TRUE(LancaMovProduto(e, aceite));
        EXPECT_EQ(contaLinhas(e), antes + 1);
    }
    EXPECT_EQ(contaLinhas(e), antes);
    EXPECT_FALSE(e.gConn.inTransaction());
}

// The cost columns of each kind of movement. History of K1 in warehouse 001: 10 entered at 2.00
// with warehouse costs 2.10 / 2.00 / 2.05; product costs 2.50 average, 2.20 last purchase, 2.40
// last cost.
struct CasoCusto {
    const char* nome;
    const char* formula;
    int pmcArmazem;
    const char* tranfAcertos;
    std::function<db::ValoresMovPro()> linha;
    const char* preco;
    const char* pmc;
    const char* upCompra;
    const char* upCusto;
    const char* armPmc;
    const char* armUpCompra;
    const char* armUpCusto;
    const char* ivaTaxa;
    const char* ivaValor;
};

db::ValoresMovPro entrada(const char* quant, const char* preco, const char* descricao = "") {
    db::ValoresMovPro v = movimento("K1", "E+", quant, preco, "001", "2026-03-02");
    v.Tipo = QStringLiteral("CPR");
    v.CliFor = QStringLiteral("F");
    v.Terceiro = QStringLiteral("F01");
    v.IvaTabela = QStringLiteral("NO");
    v.Descricao = QString::fromLatin1(descricao);
    return v;
}

db::ValoresMovPro interna(const char* tipo, const char* afecta) {
    db::ValoresMovPro v = movimento("K1", afecta, "4", "9", "001", "2026-03-02");
    v.Tipo = QString::fromLatin1(tipo);
    v.ArmazemDest = QStringLiteral("002");
    return v;
}

TEST(CustosLancamento, EachKindOfMovementIsValuedByItsRule) {
    const auto semEfeito = [] {
        db::ValoresMovPro v = linhaVenda("K1", "1", "7");
        v.Tipo = QStringLiteral("CM");
        v.AfectaStk = QStringLiteral("NA");
        return v;
    };
    const CasoCusto casos[] = {
        {"sale", "1", 0, "", [] { return linhaVenda("K1", "2", "7"); }, "7", "2.5", "2.2", "2.4",
         "0", "0", "0", "0", "0"},
        {"customer line without stock effect", "1", 0, "", semEfeito, "7", "2.5", "2.2", "2.4", "0",
         "0", "0", "0", "0"},
        {"sale with warehouse costs", "1", 1, "", [] { return linhaVenda("K1", "2", "7"); }, "7",
         "2.5", "2.2", "2.4", "2.1", "2", "2.05", "0", "0"},
        // (20 + 10 x 3) / 20; VAT on cost 23 % of 30.
        {"entry, totals", "1", 0, "", [] { return entrada("10", "3"); }, "3", "2.5", "3", "3", "0",
         "0", "0", "23", "6.9"},
        // (10 x 2 + 30) / 20 as well, warehouse average too.
        {"entry, moving average, per warehouse", "2", 1, "", [] { return entrada("10", "3"); }, "3",
         "2.5", "3", "3", "2.5", "3", "3", "23", "6.9"},
        {"opening balance carries its price", "1", 0, "",
         [] { return entrada("4", "1.75", "SALDOS INICIAIS(FECHO ANO)"); }, "1.75", "1.75", "1.75",
         "1.75", "0", "0", "0", "23", "1.61"},
        {"transfer at the average cost", "1", 0, "PRECOMEDIOCUSTO",
         [] { return interna("TRF", "TRA"); }, "2.5", "2.5", "2.2", "2.4", "0", "0", "0", "0", "0"},
        {"transfer at the last cost", "1", 0, "", [] { return interna("TRF", "TRA"); }, "2.4",
         "2.5", "2.2", "2.4", "0", "0", "0", "0", "0"},
        {"adjustment type at the average cost", "1", 0, "precomediocusto",
         [] { return interna("AC-", "S+"); }, "2.5", "2.5", "2.2", "2.4", "0", "0", "0", "0", "0"},
    };
    for (const CasoCusto& c : casos) {
        testing::EmpresaTeste empresa(true);
        app::Estado& e = empresa.estado();
        criaProdutos(e);
        db::ValoresMovPro historia = movimento("K1", "E+", "10", "2");
        historia.Armazem_PMCusto = C("2.1");
        historia.Armazem_UPCompra = C("2");
        historia.Armazem_UPCusto = C("2.05");
        grava(e, historia);
        ASSERT_TRUE(
            e.gConn.exec(QStringLiteral("update TabIva set TaxaCustos=23 where codigo='NO'")));
        ASSERT_TRUE(e.gConn.exec(
            QStringLiteral("update ParamGeral set FormulaPrecoMedioCusto=?, PMCArmazem=?, "
                           "PrecoTranfAcertos=?"),
            {QString::fromLatin1(c.formula), c.pmcArmazem, QString::fromLatin1(c.tranfAcertos)}));
        db::ValoresMovPro v = c.linha();
        const ResultadoLancamento r = LancaMovProduto(e, v);
        ASSERT_TRUE(r) << c.nome << " " << e.gConn.lastError().toStdString();
        const QSqlRecord l =
            e.gConn
                .firstRow(QStringLiteral("select * from MovProduto where NumRegisto=?"),
                          {QVariant::fromValue<qlonglong>(r.NumRegisto)})
                .value_or(QSqlRecord());
        const auto col = [&l](const char* nome) {
            return Currency::fromVariant(l.value(QString::fromLatin1(nome)));
        };
        EXPECT_EQ(col("Preco"), C(c.preco)) << c.nome;
        EXPECT_EQ(col("ValorIliq"), C(c.preco) * v.QuantNormal) << c.nome;
        EXPECT_EQ(col("PMCusto"), C(c.pmc)) << c.nome;
        EXPECT_EQ(col("UPCompra"), C(c.upCompra)) << c.nome;
        EXPECT_EQ(col("UPCusto"), C(c.upCusto)) << c.nome;
        EXPECT_EQ(col("Armazem_PMCusto"), C(c.armPmc)) << c.nome;
        EXPECT_EQ(col("Armazem_UPCompra"), C(c.armUpCompra)) << c.nome;
        EXPECT_EQ(col("Armazem_UPCusto"), C(c.armUpCusto)) << c.nome;
        EXPECT_EQ(col("IvaCustos_Taxa"), C(c.ivaTaxa)) << c.nome;
        EXPECT_EQ(col("IvaCustos_Valor"), C(c.ivaValor)) << c.nome;
    }
}

}  // namespace
}  // namespace brasel::documents
