#include "devices/display.h"
#include "devices/mostra_no_display.h"
#include "display.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

TEST(TiraAcentos, SoAsLetrasDaListaPerdemOAcento) {
    EXPECT_EQ(TiraAcentos(QStringLiteral("ÃÁÀãáàÈÊÉèêéÌÍìíÙÚùúÓÕÔÒóõôòÇç")),
              QStringLiteral("AAAaaaEEEeeeIIiiUUuuOOOOooooCc"));
    // Circumflex a, the ordinals and what the display can show as it is pass unchanged.
    EXPECT_EQ(TiraAcentos(QStringLiteral("âÂªº€ü 1x2")), QStringLiteral("âÂªº€ü 1x2"));
}

TEST(AlinhaLinhaDisplay, AlinhamentoERecortes) {
    struct Caso {
        const char* texto;
        int alinhamento;
        int comprimento;
        const char* esperado;
    };
    const Caso casos[] = {
        // 3 spare: 1.5 blanks rounded to even gives 2.
        {"Aguarde Por Favor", 2, 20, "  Aguarde Por Favor"},
        // 7 spare: 3.5 gives 4; 5 spare: 2.5 gives 2; 1 spare: 0.5 gives 0; 4 spare: 2.
        {"< ENCERRADO >", 2, 20, "    < ENCERRADO >"},
        {"Proximo Cliente", 5, 20, "  Proximo Cliente"},
        {"Sopa do dia 12345678", 2, 21, "Sopa do dia 12345678"},
        {"Total a Pagar", 2, 17, "  Total a Pagar"},
        {"Total a Pagar", 1, 20, "       Total a Pagar"},
        {"  Total a Pagar  ", 0, 20, "Total a Pagar"},
        // Blanks at both ends go before aligning; accents go before measuring.
        {"   Pão   ", 1, 6, "   Pao"},
        // A longer text is neither aligned nor cut.
        {"Francesinha especial da casa", 2, 20, "Francesinha especial da casa"},
        {"Francesinha", 1, 0, "Francesinha"},
        {"", 2, 20, "          "},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(alinhaLinhaDisplay(QString::fromUtf8(c.texto), c.alinhamento, c.comprimento),
                  QString::fromUtf8(c.esperado));
    }
}

TEST(ValorDisplay, SeparadoresETextoMaisCurto) {
    const std::pair<const char*, const char*> casos[] = {
        {"12.50", "12.5"},
        {"12,50", "12.5"},
        {" 3 ", "3"},
        {"0.000", "0"},
        {"-2.000", "-2"},
        {"1,234.50", "1234.5"},
        {"1.234,50", "1234.5"},
        {"1,234,567", "1234567"},
        {"1.234.567", "1234567"},
        {"0,0001", "0.0001"},
        {"", ""},
        {"abc", ""},
        {"12.5 EUR", ""},
    };
    for (const auto& [texto, esperado] : casos) {
        SCOPED_TRACE(texto);
        EXPECT_EQ(valorDisplay(QString::fromUtf8(texto)), QString::fromUtf8(esperado));
    }
}

TEST(Linha2Display, OTotalAcabaNaUltimaColuna) {
    struct Caso {
        const char* nome;
        const char* quantidade;
        const char* preco;
        const char* total;
        const char* esperado;
    };
    const Caso casos[] = {
        {"linha de produto", "2", "3.5", "7", "2x3.5 EUR      7 EUR"},
        {"so o total", "", "", "12.5", "            12.5 EUR"},
        {"sem total", "2", "3.5", "", "2x3.5 EUR           "},
        {"nada", "", "", "", "                    "},
        // No room left: no blank between price and total, and nothing is cut.
        {"total comprido", "3", "1234.5", "123456789.25", "3x1234.5 EUR123456789.25 EUR"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        EXPECT_EQ(linha2Display(QString::fromUtf8(c.quantidade), QString::fromUtf8(c.preco),
                                QString::fromUtf8(c.total), QStringLiteral("EUR"), 20),
                  QString::fromUtf8(c.esperado));
    }
}

// The simulated display must read the program's bytes however the line splits them.
TEST(DisplaySimulado, LeOsCodigosEmQualquerCorte) {
    const QByteArray bytes = QByteArrayLiteral("\x0C\x1BQA  Aguarde Por Favor\r\x1BQB\r\x1B@\x07");
    const QStringList esperados = {QStringLiteral("[LIMPA]"),
                                   QStringLiteral("1|  Aguarde Por Favor|"), QStringLiteral("2||"),
                                   QStringLiteral("[INICIA]"), QStringLiteral("[?7]")};
    for (int passo : {1, 2, 3, 7, static_cast<int>(bytes.size())}) {
        SCOPED_TRACE(passo);
        devsim::Display display;
        for (qsizetype i = 0; i < bytes.size(); i += passo)
            display.recebe(bytes.mid(i, passo));
        EXPECT_EQ(display.eventos(), esperados);
        EXPECT_EQ(display.linha1(), QStringLiteral("  Aguarde Por Favor"));
        EXPECT_EQ(display.linha2(), QString());
    }
}

TEST(DisplaySimulado, SemCodigoDeFimALinhaAcabaNoCodigoSeguinte) {
    devsim::CodigosDisplay codigos;
    codigos.fimLinha1.clear();
    codigos.colunas = 8;
    devsim::Display display(codigos);
    display.recebe("\x1BQAUma linha comprida");
    EXPECT_EQ(display.linha1(), QStringLiteral("Uma linh"));
    display.recebe("\x1BQBdois\r");
    EXPECT_EQ(display.eventos(),
              (QStringList{QStringLiteral("1|Uma linha comprida|"), QStringLiteral("2|dois|")}));
}

}  // namespace
}  // namespace brasel::devices
