// A lot chosen for a line: a lot must be given, its dates are real dates "yyyy-mm-dd" and the
// expiry does not come before the fabrication.
#include "pos/adicionar_produto_lote.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

TEST(ValidaLote, LoteObrigatorioEDatasReais) {
    struct Caso {
        const char* lote;
        const char* fabrico;
        const char* validade;
        const char* mensagem;  // "" = accepted
    };
    const Caso casos[] = {
        {"L1", "", "", ""},
        {"L1", "2026-01-31", "2026-12-31", ""},
        {"L1", "2026-02-01", "2026-02-01", ""},
        {"L1", "", "2024-02-29", ""},
        {" ", "2026-01-31", "", "Não seleccionou qualquer Lote"},
        {"L1", "2026-02-30", "", "Data de Fabrico Inválida!"},
        {"L1", "31-01-2026", "", "Data de Fabrico Inválida!"},
        {"L1", "2026-1-31", "", "Data de Fabrico Inválida!"},
        {"L1", "", "2025-02-29", "Data de Validade Inválida!"},
        {"L1", "", "amanhã", "Data de Validade Inválida!"},
        {"L1", "2026-03-01", "2026-02-28", "A Data de Validade é anterior à Data de Fabrico!"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(std::string(c.lote) + "/" + c.fabrico + "/" + c.validade);
        EXPECT_EQ(ValidaLote({QString::fromUtf8(c.lote), QString::fromUtf8(c.fabrico),
                              QString::fromUtf8(c.validade)}),
                  QString::fromUtf8(c.mensagem));
    }
}

}  // namespace
}  // namespace brasel::pos
