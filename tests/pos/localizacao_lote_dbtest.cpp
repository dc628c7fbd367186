// Where a product is taken from when it is sold: the location of its warehouse that holds most
// of it, and the lots in stock there with their dates, on the demo restaurant.
#include "pos/adicionar_produto_localizacao.h"
#include "pos/adicionar_produto_lote.h"
#include "pricing/valores_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

using pricing::teste::V;

// One stock movement of a product.
struct Movimento {
    const char* afectaStk;
    const char* quantidade;
    const char* armazem;
    const char* localizacao;
    const char* lote = "";
    const char* dataFabrico = "";
    const char* dataValidade = "";
    const char* armazemDest = "";
};

class LocalizacaoLoteTeste : public ::testing::Test {
  protected:
    void movimento(const char* produto, const Movimento& m) {
        auto t = [](const char* s) { return QString::fromUtf8(s); };
        ASSERT_TRUE(e.gConn.exec(
            QStringLiteral("insert into MovProduto (Codigo,AfectaStk,QuantNormal,Armazem,"
                           "ArmazemDest,Localizacao,Lote,DataFabrico,DataValidade,Identifica,"
                           "CliFor,Fechado) values (?,?,?,?,?,?,?,?,?,?,'F','S')"),
            {t(produto), t(m.afectaStk), t(m.quantidade), t(m.armazem), t(m.armazemDest),
             t(m.localizacao), t(m.lote), t(m.dataFabrico), t(m.dataValidade),
             QStringLiteral("MOV%1").arg(++n_)}))
            << e.gConn.lastError().toStdString();
    }

    testing::EmpresaTeste empresa{true};
    app::Estado& e = empresa.estado();
    int n_ = 0;
};

TEST_F(LocalizacaoLoteTeste, LocalizacaoComMaisExistenciaNoArmazem) {
    struct Passo {
        const char* caso;
        Movimento movimento;
        const char* esperada;
        bool registada;
    };
    const Passo passos[] = {
        {"stock without a location", {"E+", "10", "001", ""}, "", true},
        {"the one location holding it", {"E+", "5", "001", "BAR"}, "BAR", true},
        {"a location holding more", {"E+", "8", "001", "COZ"}, "COZ", true},
        {"sold from it below the other", {"S+", "4", "001", "COZ"}, "BAR", true},
        {"equal balances take the lowest code", {"E+", "1", "001", "COZ"}, "BAR", true},
        {"another warehouse does not count", {"E+", "50", "002", "GER"}, "BAR", true},
        {"a transfer into the warehouse counts",
         {"TRA", "20", "002", "GER", "", "", "", "001"},
         "GER",
         true},
        {"a location not in the table", {"E+", "100", "001", "XPT"}, "XPT", false},
        {"no location left with stock", {"S+", "100", "001", "XPT"}, "GER", true},
    };
    for (const Passo& p : passos) {
        SCOPED_TRACE(p.caso);
        movimento("B001", p.movimento);
        const auto l =
            LocalizacaoProduto_Procura(e.gConn, QStringLiteral("B001"), QStringLiteral("001"));
        ASSERT_TRUE(l.has_value());
        EXPECT_EQ(l->codigo, QString::fromLatin1(p.esperada));
        EXPECT_EQ(l->registada, p.registada);
    }
    // Every location emptied: the line carries none.
    movimento("B001", {"S+", "20", "001", "GER"});
    movimento("B001", {"S+", "5", "001", "BAR"});
    movimento("B001", {"S+", "5", "001", "COZ"});
    const auto l =
        LocalizacaoProduto_Procura(e.gConn, QStringLiteral("B001"), QStringLiteral("001"));
    ASSERT_TRUE(l.has_value());
    EXPECT_EQ(l->codigo, QString());
}

TEST_F(LocalizacaoLoteTeste, LotesComExistenciaPorOrdemDeValidade) {
    movimento("P002", {"E+", "10", "001", "", "L1", "2026-01-01", "2026-06-30"});
    movimento("P002", {"E+", "5", "001", "COZ", "L2", "2026-01-15", "2026-03-31"});
    movimento("P002", {"S+", "1", "001", "COZ", "L2"});
    movimento("P002", {"E+", "3", "001", "", "L3"});
    movimento("P002", {"E+", "2", "001", "", "L4", "", "2026-01-31"});
    movimento("P002", {"S+", "2", "001", "", "L4"});                    // sold out
    movimento("P002", {"E+", "7", "002", "", "L5", "", "2026-01-31"});  // another warehouse
    movimento("P002", {"E+", "1", "001", "", "L6", "", "2026-03-31"});
    movimento("P002", {"E+", "9", "001", "", ""});                      // no lot
    movimento("B001", {"E+", "9", "001", "", "L0", "", "2026-01-01"});  // another product

    const auto lotes = LotesDisponiveis(e.gConn, QStringLiteral("P002"), QStringLiteral("001"));
    ASSERT_TRUE(lotes.has_value());
    struct Esperado {
        const char* lote;
        const char* fabrico;
        const char* validade;
        const char* saldo;
    };
    const Esperado esperados[] = {
        {"L2", "2026-01-15", "2026-03-31", "4"},
        {"L6", "", "2026-03-31", "1"},
        {"L1", "2026-01-01", "2026-06-30", "10"},
        {"L3", "", "", "3"},
    };
    ASSERT_EQ(lotes->size(), std::size(esperados));
    for (std::size_t i = 0; i < lotes->size(); ++i) {
        const LoteDisponivel& l = (*lotes)[i];
        SCOPED_TRACE(esperados[i].lote);
        EXPECT_EQ(l.lote, QString::fromLatin1(esperados[i].lote));
        EXPECT_EQ(l.dataFabrico, QString::fromLatin1(esperados[i].fabrico));
        EXPECT_EQ(l.dataValidade, QString::fromLatin1(esperados[i].validade));
        EXPECT_EQ(l.saldo, V(esperados[i].saldo));
    }
}

}  // namespace
}  // namespace brasel::pos
