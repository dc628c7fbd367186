// A document's cash movements: one row per method, the split with its VAT shares, the rewrite
// of a document and method, refund methods, the currency conversion and rounding, and the
// transaction they live in.
#include "cash/caixa_teste.h"
#include "cash/lanca_mov_caixa.h"
#include "db/query_helpers.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <QRegularExpression>

#include <gtest/gtest.h>

#include <tuple>

namespace brasel::cash {
namespace {

using teste::linhasCaixa;
using teste::V;
using teste::vendaDinheiro;

class LancaMovCaixaTeste : public ::testing::Test {
  protected:
    int linhasLog() {
        return e.gConn.firstRow(QStringLiteral("select count(*) from LogGeral where Modulo='CA'"))
            ->value(0)
            .toInt();
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
};

TEST_F(LancaMovCaixaTeste, OneMethodWritesOneRowOfTheWorkstationAndALogEntry) {
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, vendaDinheiro(QStringLiteral("00000001"))));
    const auto linhas = linhasCaixa(e.gConn, QStringLiteral("VD"), QStringLiteral("00000001"));
    ASSERT_EQ(linhas.size(), 1u);
    const teste::LinhaCaixa& l = linhas.at(QStringLiteral("NU"));
    EXPECT_EQ(l.caixa, QStringLiteral("01"));
    EXPECT_EQ(l.armazem, QStringLiteral("001"));
    EXPECT_EQ(l.data, QStringLiteral("2026-03-14"));
    EXPECT_EQ(l.ano, QStringLiteral("2026"));
    EXPECT_EQ(l.afecta, QStringLiteral("R+"));
    EXPECT_EQ(l.valor1, V("10"));
    EXPECT_EQ(l.valiva1, V("2.3"));
    EXPECT_EQ(l.valorTotal, V("12.3"));
    EXPECT_EQ(l.cambio, QStringLiteral("EUR"));
    EXPECT_EQ(l.valCambio, V("12.3"));
    EXPECT_EQ(l.nomeEntidade, QStringLiteral("Mesa d'Ouro"));
    EXPECT_EQ(l.integrou, QStringLiteral("N"));
    EXPECT_TRUE(QRegularExpression(QStringLiteral("^\\d\\d:\\d\\d$")).match(l.hora).hasMatch())
        << l.hora.toStdString();
    EXPECT_EQ(linhasLog(), 1);
}

TEST_F(LancaMovCaixaTeste, AnEffectOfNaWritesNothing) {
    MovimentoCaixa m = vendaDinheiro(QStringLiteral("00000002"));
    m.afecta = QStringLiteral(" na ");
    EXPECT_TRUE(LancaMovCaixa(e, e.gConn, m));
    EXPECT_TRUE(linhasCaixa(e.gConn, QStringLiteral("VD"), m.numero).empty());
    EXPECT_EQ(linhasLog(), 0);
}

// Each method's share of the VAT groups follows its part; the shares always add up to the
// document's groups, whatever the rounding did to each.
TEST_F(LancaMovCaixaTeste, ASplitSharesTheGroupsAndSkipsPartsOfZero) {
    struct Caso {
        const char* nome;
        std::vector<std::pair<const char*, const char*>> partes;
        // The rows written: method, valor1, valiva1.
        std::vector<std::tuple<const char*, const char*, const char*>> esperado;
    };
    const std::vector<Caso> casos{
        {"zero part", {{"NU", "12.30"}, {"MB", "0"}}, {{"NU", "10.00", "2.30"}}},
        {"one third",
         {{"NU", "4.10"}, {"MB", "8.20"}},
         {{"NU", "3.33", "0.77"}, {"MB", "6.67", "1.53"}}},
        {"tiny parts",
         {{"NU", "0.01"}, {"MB", "0.01"}, {"CC", "12.28"}},
         {{"NU", "0.01", "0.00"}, {"MB", "0.01", "0.00"}, {"CC", "9.98", "2.30"}}},
        {"one method twice", {{"NU", "4.10"}, {"NU", "8.20"}}, {{"NU", "10.00", "2.30"}}},
        {"negative part skipped", {{"NU", "-1.00"}, {"MB", "12.30"}}, {{"MB", "10.00", "2.30"}}},
    };
    int n = 10;
    for (const Caso& caso : casos) {
        SCOPED_TRACE(caso.nome);
        const MovimentoCaixa m = vendaDinheiro(QString::number(++n));
        std::vector<ParcialPagamento> divisao;
        for (const auto& [metodo, valor] : caso.partes)
            divisao.push_back({QString::fromLatin1(metodo), V(valor)});
        ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m, &divisao));
        const auto linhas = linhasCaixa(e.gConn, m.tipo, m.numero);
        ASSERT_EQ(linhas.size(), caso.esperado.size());
        Currency valor;
        Currency iva;
        for (const auto& [metodo, valor1, valiva1] : caso.esperado) {
            SCOPED_TRACE(metodo);
            ASSERT_TRUE(linhas.count(QString::fromLatin1(metodo)));
            const teste::LinhaCaixa& l = linhas.at(QString::fromLatin1(metodo));
            EXPECT_EQ(l.valor1, V(valor1));
            EXPECT_EQ(l.valiva1, V(valiva1));
            valor += l.valor1;
            iva += l.valiva1;
        }
        EXPECT_EQ(valor, m.valor[0]);
        EXPECT_EQ(iva, m.valiva[0]);
    }
    EXPECT_EQ(linhasLog(), static_cast<int>(casos.size()));
}

TEST_F(LancaMovCaixaTeste, TheSameDocumentAndMethodTwiceRewritesItsRow) {
    MovimentoCaixa m = vendaDinheiro(QStringLiteral("00000003"));
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m));
    m.valorTotal = V("20");
    m.nomeEntidade = QStringLiteral("Outro");
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m));
    auto linhas = linhasCaixa(e.gConn, m.tipo, m.numero);
    ASSERT_EQ(linhas.size(), 1u);
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).valorTotal, V("20"));
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).nomeEntidade, QStringLiteral("Outro"));

    // The same number in another year is another document.
    m.data = QStringLiteral("2027-01-02");
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m));
    EXPECT_EQ(
        e.gConn
            .firstRow(QStringLiteral("select count(*) from MovCaixa where Numero=?"), {m.numero})
            ->value(0)
            .toInt(),
        2);
}

TEST_F(LancaMovCaixaTeste, ARefundMethodIsWrittenOutsideTheTill) {
    ASSERT_TRUE(e.gConn.exec(QStringLiteral("update PagaComo set Reembolso=1 where codigo=?"),
                             {QStringLiteral("CC")}));
    const MovimentoCaixa m = vendaDinheiro(QStringLiteral("00000004"));
    const std::vector<ParcialPagamento> divisao{{QStringLiteral("NU"), V("2.30")},
                                                {QStringLiteral("CC"), V("10")}};
    ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m, &divisao));
    const auto linhas = linhasCaixa(e.gConn, m.tipo, m.numero);
    EXPECT_EQ(linhas.at(QStringLiteral("NU")).afecta, QStringLiteral("R+"));
    EXPECT_EQ(linhas.at(QStringLiteral("CC")).afecta, QStringLiteral("NA"));
}

// Amounts of a foreign currency come into the company's at its rate (a currency without one at
// 1) and are rounded to the company's decimals, nearest with halves up; ValCambio keeps the
// amount as paid.
TEST_F(LancaMovCaixaTeste, ForeignCurrencyIsConvertedAndRounded) {
    struct Caso {
        const char* cambio;
        int casadec;
        const char* pago;
        const char* total;
        const char* valor1;
        const char* guardado;
    };
    const Caso casos[] = {
        {"USD", 2, "10", "10.80", "10.80", "USD"},
        {"GBP", 2, "12.345", "10.62", "8.60", "GBP"},
        {"GBP", 0, "12.345", "11", "9", "GBP"},
        {"EUR", 2, "12.345", "12.35", "10.00", "EUR"},
        {"XYZ", 2, "12.345", "12.35", "10.00", "XYZ"},
        {"", 3, "12.3456", "12.346", "10.000", "EUR"},
    };
    int n = 100;
    for (const Caso& c : casos) {
        SCOPED_TRACE(std::string(c.cambio) + " " + c.pago);
        e.param.casadec = c.casadec;
        MovimentoCaixa m = vendaDinheiro(QString::number(++n));
        m.cambio = QString::fromLatin1(c.cambio);
        m.valorTotal = V(c.pago);
        ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m));
        const teste::LinhaCaixa l = linhasCaixa(e.gConn, m.tipo, m.numero).at(QStringLiteral("NU"));
        EXPECT_EQ(l.valorTotal, V(c.total));
        EXPECT_EQ(l.valor1, V(c.valor1));
        EXPECT_EQ(l.valCambio, V(c.pago));
        EXPECT_EQ(l.cambio, QString::fromLatin1(c.guardado));
    }
}

TEST_F(LancaMovCaixaTeste, InsideTheCallersTransactionItNeitherCommitsNorEndsIt) {
    const MovimentoCaixa m = vendaDinheiro(QStringLiteral("00000005"));
    {
        db::WriteTransaction fecho(e.gConn);
        ASSERT_TRUE(fecho.active());
        ASSERT_TRUE(LancaMovCaixa(e, e.gConn, m));
        EXPECT_TRUE(e.gConn.inTransaction());
        EXPECT_EQ(linhasCaixa(e.gConn, m.tipo, m.numero).size(), 1u);
    }
    EXPECT_TRUE(linhasCaixa(e.gConn, m.tipo, m.numero).empty());
    EXPECT_EQ(linhasLog(), 0);
}

TEST_F(LancaMovCaixaTeste, ARowThatCannotBeWrittenLeavesNoneOfTheDocument) {
    ASSERT_TRUE(e.gConn.exec(
        QStringLiteral("create trigger recusa_mb before insert on MovCaixa when "
                       "new.PagaComo='MB' begin select raise(abort, 'recusado'); end")));
    const MovimentoCaixa m = vendaDinheiro(QStringLiteral("00000006"));
    const std::vector<ParcialPagamento> divisao{{QStringLiteral("NU"), V("2.30")},
                                                {QStringLiteral("MB"), V("10")}};
    EXPECT_FALSE(LancaMovCaixa(e, e.gConn, m, &divisao));
    EXPECT_TRUE(linhasCaixa(e.gConn, m.tipo, m.numero).empty());
    EXPECT_FALSE(e.gConn.inTransaction());
}

}  // namespace
}  // namespace brasel::cash
