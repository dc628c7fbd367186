// Stock balances on an embedded company: every stock effect with its sign, transfers between
// warehouses, and each procedure's keys.
#include "documents/saldo_produto.h"

#include "documents/movimentos_teste.h"
#include "support/empresa_teste.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using teste::C;
using teste::grava;
using teste::movimento;

class SaldoEmpresa : public ::testing::Test {
  protected:
    void SetUp() override {
        // Warehouse 001: 10 in, 3 sold, 1 returned, 2 back to the supplier, 1 adjusted in,
        // 4 sent to 002; 002: 4 received, 1 adjusted out. Lines without stock effect and other
        // products do not count.
        grava(e, lote(movimento("P1", "E+", "10"), "L1", "A1"));
        grava(e, lote(movimento("P1", "S+", "3"), "L1", "A1"));
        grava(e, lote(movimento("P1", "S-", "1"), "L1", "A2"));
        grava(e, lote(movimento("P1", "E-", "2"), "L2", "A1"));
        grava(e, lote(movimento("P1", "AC+", "1"), "L2", "A1"));
        db::ValoresMovPro transf = movimento("P1", "TRA", "4");
        transf.ArmazemDest = QStringLiteral("002");
        grava(e, transf);
        grava(e, lote(movimento("P1", "AC-", "1", "0", "002"), "L1", ""));
        grava(e, movimento("P1", "NA", "50"));
        grava(e, movimento("P2", "E+", "7"));
        db::ValoresMovPro datado = lote(movimento("P1", "E+", "5", "0", "003"), "L9", "B1");
        datado.DataFabrico = QStringLiteral("2026-01-01");
        datado.DataValidade = QStringLiteral("2026-06-30");
        grava(e, datado);
        db::ValoresMovPro outraValidade = datado;
        outraValidade.QuantNormal = C("2");
        outraValidade.DataValidade = QStringLiteral("2026-09-30");
        grava(e, outraValidade);
        db::ValoresMovPro tamanho = movimento("P1", "E+", "6", "0", "004");
        tamanho.Tamanho = QStringLiteral("XL");
        tamanho.Cor = QStringLiteral("Azul");
        grava(e, tamanho);
    }

    static db::ValoresMovPro lote(db::ValoresMovPro v, const char* lote, const char* local) {
        v.Lote = QString::fromLatin1(lote);
        v.Localizacao = QString::fromLatin1(local);
        return v;
    }

    testing::EmpresaTeste empresa_{true};
    app::Estado& e = empresa_.estado();
};

db::ChavesSaldo k(const char* armazem, const char* local = "", const char* lote = "") {
    db::ChavesSaldo c;
    c.Produto = QStringLiteral("P1");
    c.Armazem = QString::fromLatin1(armazem);
    c.Localizacao = QString::fromLatin1(local);
    c.Lote = QString::fromLatin1(lote);
    return c;
}

TEST_F(SaldoEmpresa, EachProcedureCountsTheLinesOfItsKeys) {
    db::ChavesSaldo validade = k("003", "B1", "L9");
    validade.DataFabrico = QStringLiteral("2026-01-01");
    validade.DataValidade = QStringLiteral("2026-09-30");
    db::ChavesSaldo tamanho = k("");
    tamanho.Tamanho = QStringLiteral("XL");
    db::ChavesSaldo corErrada = k("004");
    corErrada.Cor = QStringLiteral("Verde");
    db::ChavesSaldo semProduto = k("");
    semProduto.Produto = QStringLiteral("P9");
    const std::pair<db::ChavesSaldo, const char*> casos[] = {
        // 10-3+1-2+1 in 001, +4-4 moved, -1 in 002, 5+2 in 003, 6 in 004.
        {k(""), "19"},
        {k("001"), "3"},
        {k("002"), "3"},
        {k("001", "A1"), "6"},
        {k("001", "A1", "L1"), "7"},
        {k("", "", "L1"), "7"},
        {k("001", "", "L2"), "-1"},
        {validade, "2"},
        {tamanho, "6"},
        {corErrada, "0"},
        {semProduto, "0"},
    };
    for (const auto& [chaves, esperado] : casos) {
        const auto saldo = SaldoProduto_SP(e, chaves);
        ASSERT_TRUE(saldo) << e.gConn.lastError().toStdString();
        EXPECT_EQ(*saldo, C(esperado))
            << chaves.Armazem.toStdString() << "/" << chaves.Localizacao.toStdString() << "/"
            << chaves.Lote.toStdString() << " -> " << saldo->toText().toStdString();
    }
}

TEST_F(SaldoEmpresa, TheGeneralProcedureTakesPercentAsAnyValue) {
    db::ChavesSaldo c = k("%", "%", "%");
    for (QString* atributo : {&c.Estacao, &c.Sexo, &c.Referencia, &c.Modelo, &c.Cor, &c.Tamanho,
                              &c.Comprimento, &c.Fornece})
        *atributo = QStringLiteral("%");
    EXPECT_EQ(db::SaldoProduto(e.gConn, c), C("19"));
    c.Cor = QStringLiteral("Azul");
    EXPECT_EQ(db::SaldoProduto(e.gConn, c), C("6"));
}

}  // namespace
}  // namespace brasel::documents
