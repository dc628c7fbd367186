// Confirming the walk-in customer's data: the tax number required from 2010-12-31 on unless the
// user may post without one, and the incomplete address pointed out.
#include "pos/dados_cli_div.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::pos {
namespace {

struct Caso {
    const char* data;
    const char* contribuinte;
    bool lancaSemContribuinte;
    const char* morada;
    bool preencher;  // the answer to "Preencher os Campos?"
    bool aceite;
    bool pedeContribuinte;
    bool perguntaMorada;
};

const Caso kCasos[] = {
    {"2010-12-30", "", false, "Rua A", false, true, false, false},
    {"2010-12-31", "", false, "Rua A", false, false, true, false},
    {"2010-12-31", "", true, "Rua A", false, true, false, false},
    {"2026-01-05", "501964843", false, "Rua A", false, true, false, false},
    {"2026-01-05", "501964843", false, "", true, false, false, true},
    {"2026-01-05", "501964843", false, "", false, true, false, true},
    // The missing tax number is reported before the address.
    {"2026-01-05", "  ", false, "", true, false, true, false},
};

TEST(ConfirmaDadosCliDiv, ContribuinteEMorada) {
    for (const Caso& c : kCasos) {
        testing::MensagensGravadas m;
        m.responder({c.preencher});
        DadosClienteDiverso d;
        d.contribuinte = QString::fromLatin1(c.contribuinte);
        d.nome = QStringLiteral("Cliente");
        d.morada = QString::fromLatin1(c.morada);
        d.local = QStringLiteral("Lisboa");
        d.codPostal = QStringLiteral("1100-148");
        d.pais = QStringLiteral("PT");
        const std::string onde = std::string(c.data) + " '" + c.contribuinte + "' " + c.morada;
        EXPECT_EQ(ConfirmaDadosCliDiv(m, d, QString::fromLatin1(c.data), c.lancaSemContribuinte),
                  c.aceite)
            << onde;
        if (c.pedeContribuinte) {
            ASSERT_EQ(m.mensagens().size(), 1) << onde;
            EXPECT_EQ(m.mensagens()[0].texto, textoFaltaContribuinte());
            EXPECT_EQ(m.mensagens()[0].titulo, QStringLiteral("ATENÇÃO"));
        } else {
            EXPECT_TRUE(m.mensagens().isEmpty()) << onde;
        }
        EXPECT_EQ(m.perguntas().size(), c.perguntaMorada ? 1 : 0) << onde;
        if (c.perguntaMorada) {
            EXPECT_TRUE(m.perguntas()[0].endsWith(QStringLiteral("Preencher os Campos?")));
        }
    }
}

}  // namespace
}  // namespace brasel::pos
