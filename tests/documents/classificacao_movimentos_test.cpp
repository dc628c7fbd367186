// How a movement is classified: which balance procedure its keys go to, how its stock effect
// counts, how it is valued, and how document numbers are written.
#include "db/procedimentos/saldo_produto_sp.h"
#include "documents/custos_linha.h"
#include "documents/numeracao.h"
#include "documents/saldo_produto.h"

#include <gtest/gtest.h>

namespace brasel::documents {
namespace {

using P = ProcedimentoSaldo;

struct CasoEscolha {
    const char* nome;
    db::ChavesSaldo chaves;
    P esperado;
};

db::ChavesSaldo chaves(const char* armazem, const char* localizacao, const char* lote,
                       const char* fabrico = "", const char* validade = "") {
    db::ChavesSaldo c;
    c.Produto = QStringLiteral("P1");
    c.Armazem = QString::fromLatin1(armazem);
    c.Localizacao = QString::fromLatin1(localizacao);
    c.Lote = QString::fromLatin1(lote);
    c.DataFabrico = QString::fromLatin1(fabrico);
    c.DataValidade = QString::fromLatin1(validade);
    return c;
}

db::ChavesSaldo comAtributo(db::ChavesSaldo c, QString db::ChavesSaldo::*atributo) {
    c.*atributo = QStringLiteral("X");
    return c;
}

TEST(EscolhaProcedimentoSaldo, TheNarrowestProcedureThatTakesEveryGivenKey) {
    const CasoEscolha casos[] = {
        {"only the product", chaves("", "", ""), P::Pro},
        {"\"%\" counts as not given", chaves("%", "%", "%"), P::Pro},
        {"lot", chaves("", "", "L1"), P::ProLote},
        {"warehouse", chaves("001", "", ""), P::ProArm},
        {"warehouse and location", chaves("001", "A1", ""), P::ProArmLoc},
        {"warehouse, location and lot", chaves("001", "A1", "L1"), P::ProArmLocLote},
        {"with both dates", chaves("001", "A1", "L1", "2026-01-01", "2026-12-31"),
         P::ProArmLocLote_DtFabricoValidade},
        {"one date is not enough", chaves("001", "A1", "L1", "2026-01-01"), P::ProArmLocLote},
        {"dates without a lot are not taken", chaves("001", "A1", "", "2026-01-01", "2026-12-31"),
         P::ProArmLoc},
        {"lot in a warehouse without location", chaves("001", "", "L1"), P::SaldoProduto},
        {"location without warehouse", chaves("", "A1", ""), P::SaldoProduto},
        {"station", comAtributo(chaves("", "", ""), &db::ChavesSaldo::Estacao), P::SaldoProduto},
        {"size beside a warehouse", comAtributo(chaves("001", "", ""), &db::ChavesSaldo::Tamanho),
         P::SaldoProduto},
        {"supplier", comAtributo(chaves("001", "A1", "L1"), &db::ChavesSaldo::Fornece),
         P::SaldoProduto},
    };
    for (const CasoEscolha& caso : casos) {
        EXPECT_EQ(EscolheProcedimentoSaldo(caso.chaves), caso.esperado) << caso.nome;
    }
}

TEST(EfeitoStock, EntriesAndReturnsComeInExitsAndReversalsGoOut) {
    const std::pair<const char*, int> casos[] = {
        {"E+", 1},   {"S-", 1},  {"AC+", 1},  {"TL+", 1}, {"S+", -1}, {"E-", -1}, {"AC-", -1},
        {"TL-", -1}, {"s+", -1}, {" E+ ", 1}, {"NA", 0},  {"TRA", 0}, {"", 0},    {"X+", 0},
    };
    for (const auto& [codigo, sinal] : casos) {
        EXPECT_EQ(db::SinalStock(QString::fromLatin1(codigo)), sinal) << codigo;
    }
}

TEST(ClasseDeCusto, ByDocumentTypeOrStockEffect) {
    struct Caso {
        const char* tipo;
        const char* afecta;
        ClasseCusto esperada;
    };
    const Caso casos[] = {
        {"VD", "S+", ClasseCusto::Outro},     {"CM", "NA", ClasseCusto::Outro},
        {"DV", "S-", ClasseCusto::Outro},     {"CPR", "E+", ClasseCusto::Entrada},
        {"DVF", "E-", ClasseCusto::Entrada},  {"AC+", "E+", ClasseCusto::Interno},
        {"AJ", "AC-", ClasseCusto::Interno},  {"TL-", "S+", ClasseCusto::Interno},
        {"TRF", "TRA", ClasseCusto::Interno}, {"tl+", "", ClasseCusto::Interno},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(ClassificaCusto(QString::fromLatin1(c.tipo), QString::fromLatin1(c.afecta)),
                  c.esperada)
            << c.tipo << " " << c.afecta;
    }
    EXPECT_TRUE(EntradaSaldosIniciais(QStringLiteral("SALDOS INICIAIS(FECHO ANO)")));
    EXPECT_TRUE(EntradaSaldosIniciais(QStringLiteral("Entrada de Saldos Iniciais")));
    EXPECT_FALSE(EntradaSaldosIniciais(QStringLiteral("SALDOS INICIAIS")));
}

TEST(NumeroDocumento, ZeroFilledToEightDigitsSoThatTextOrderIsNumberOrder) {
    EXPECT_EQ(NumeroDocumento(1), QStringLiteral("00000001"));
    EXPECT_EQ(NumeroDocumento(12345678), QStringLiteral("12345678"));
    EXPECT_LT(NumeroDocumento(9), NumeroDocumento(10));
}

}  // namespace
}  // namespace brasel::documents
