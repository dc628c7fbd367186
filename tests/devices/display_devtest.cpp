#include "devices/mostra_no_display.h"
#include "display.h"
#include "support/devsim_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <memory>

namespace brasel::devices {
namespace {

using namespace Qt::StringLiterals;

// The demo supervisor ("01") has the demo's 2x20 display on COM2: clear 12, line 1 between
// ESC Q A and CR, centred; line 2 between ESC Q B and CR, unchanged.
class DisplayTeste : public ::testing::Test {
  protected:
    // Waits for the two lines of one MostraNoDisplay (each ends in CR).
    bool esperaLinhas(int linhas) {
        return servidor_.espera([linhas](const QByteArray& r) { return r.count('\r') >= linhas; },
                                3000);
    }
    // Proves that nothing went out before: a marker written after whatever was (not) sent
    // arrives first and alone, since the line keeps the order of the bytes.
    void esperaSoMarcador() {
        ASSERT_TRUE(linha_.setCommPort(2));
        GuardaPorta guarda(linha_);
        ASSERT_TRUE(guarda.obtida());
        ASSERT_TRUE(linha_.Output("\x1B@"));
        ASSERT_TRUE(servidor_.esperaBytes(2, 3000));
        EXPECT_EQ(servidor_.recebidos(), QByteArray("\x1B@"));
    }
    void actualiza(const QString& sql, const QVariantList& valores) {
        ASSERT_TRUE(empresa_.estado().gConn.exec(sql, valores))
            << empresa_.estado().gConn.lastError().toStdString();
    }

    testing::EmpresaTeste empresa_{true};
    testing::DevsimTeste devsim_;
    std::shared_ptr<devsim::Display> display_ = std::make_shared<devsim::Display>();
    devsim::ServidorDispositivo& servidor_ = devsim_.liga(2, display_);
    LinhaSerie linha_{devsim_.mapa()};
};

TEST_F(DisplayTeste, AguardeCentradoEEncerrado) {
    ASSERT_TRUE(MostraAguardeNoDisplay(empresa_.estado(), linha_));
    ASSERT_TRUE(esperaLinhas(2));
    // 20 - 17 = 3 spare: 1.5 blanks, rounded to even.
    EXPECT_EQ(servidor_.recebidos(), QByteArray("\x0C\x1BQA  Aguarde Por Favor\r\x1BQB\r"));
    EXPECT_EQ(display_->linha1(), QStringLiteral("  Aguarde Por Favor"));
    EXPECT_EQ(display_->linha2(), QString());
    EXPECT_FALSE(linha_.aberta());

    ASSERT_TRUE(MostraEncerradoNoDisplay(empresa_.estado(), linha_));
    ASSERT_TRUE(esperaLinhas(4));
    EXPECT_EQ(display_->linha1(), QStringLiteral("    < ENCERRADO >"));
    EXPECT_EQ(display_->eventos().count(QStringLiteral("[LIMPA]")), 2);
}

TEST_F(DisplayTeste, ProdutoCortadoELinhaDosValores) {
    const QString descricao = QStringLiteral("Bacalhau à Brás com batatinhas");
    ASSERT_EQ(descricao.size(), 30);
    ASSERT_TRUE(MostraNoDisplay(empresa_.estado(), linha_, descricao, QStringLiteral("25,00"),
                                QStringLiteral("12.50"), QStringLiteral("2.000"),
                                QStringLiteral("EUR")));
    ASSERT_TRUE(esperaLinhas(2));
    // Cut to 20 characters, then the accent goes and the trailing blank is trimmed.
    EXPECT_EQ(display_->linha1(), QStringLiteral("Bacalhau a Bras com"));
    EXPECT_EQ(display_->linha2(), QStringLiteral("2x12.5 EUR    25 EUR"));
}

TEST_F(DisplayTeste, TotalMaiorQueALinhaNaoECortado) {
    ASSERT_TRUE(MostraNoDisplay(empresa_.estado(), linha_, QStringLiteral("Total a Pagar"),
                                QStringLiteral("1234567890123.5"), QStringLiteral("99.99"), {},
                                QStringLiteral("EUR")));
    ASSERT_TRUE(esperaLinhas(2));
    EXPECT_TRUE(display_->eventos().contains(QStringLiteral("2|99.99 EUR1234567890123.5 EUR|")));
    EXPECT_EQ(display_->linha1(), QStringLiteral("    Total a Pagar"));
}

TEST_F(DisplayTeste, UtilizadorSemDisplayNadaEnvia) {
    struct Caso {
        const char* nome;
        const char* sql;
        QVariantList valores;
    };
    const Caso casos[] = {
        {"UsaDisplay 0", "update UtilConfGeral set UsaDisplay=? where utilizador=?", {0, u"01"_s}},
        {"display inexistente",
         "update UtilConfGeral set UsaDisplay=?, CodigoDisplay=? "
         "where utilizador=?",
         {1, u"X'9"_s, u"01"_s}},
        {"utilizador sem configuracao", "delete from UtilConfGeral where utilizador=?", {u"01"_s}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        actualiza(QString::fromLatin1(c.sql), c.valores);
        EXPECT_FALSE(MostraAguardeNoDisplay(empresa_.estado(), linha_));
    }
    esperaSoMarcador();
}

// A printout holds the shared line on the printer's port: the display's output is dropped, and
// neither the port nor its settings change under the printout.
TEST_F(DisplayTeste, PortaOcupadaPorImpressao) {
    devsim_.liga(1, std::make_shared<devsim::Display>());
    ASSERT_TRUE(linha_.setCommPort(1));
    {
        GuardaPorta impressao(linha_);
        ASSERT_TRUE(impressao.obtida());
        EXPECT_FALSE(MostraAguardeNoDisplay(empresa_.estado(), linha_));
        EXPECT_EQ(linha_.CommPort(), 1);
        EXPECT_EQ(linha_.Settings(), QStringLiteral("9600,n,8,1"));
        EXPECT_TRUE(linha_.aberta());
    }
    esperaSoMarcador();
    EXPECT_TRUE(devsim_.servidor(1).recebidos().isEmpty());
}

}  // namespace
}  // namespace brasel::devices
