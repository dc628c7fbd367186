// The restaurant configuration of a workstation: every setting kept, and only codes that exist
// (and, for a table's bill, only documents that move nothing) accepted.
#include "app/configuracao_rest.h"
#include "app/definicoes_posto.h"
#include "support/apoio_arranque.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <optional>

namespace brasel::app {
namespace {

using testing::EmpresaTeste;

TEST(ConfiguracaoRest, StoredCodesShowTheirDescriptionWhileTheyStillFit) {
    EmpresaTeste empresa(true);
    Estado& e = empresa.estado();
    struct Caso {
        CodigoConfiguracao tabela;
        const char* codigo;
        const char* descricao;  // nullptr: no longer fits
    } casos[] = {
        {CodigoConfiguracao::Caixa, "01", "Caixa principal"},
        {CodigoConfiguracao::Caixa, " 01 ", "Caixa principal"},
        {CodigoConfiguracao::Caixa, "", ""},
        {CodigoConfiguracao::Caixa, "99", nullptr},
        {CodigoConfiguracao::Caixa, "01' or '1'='1", nullptr},
        {CodigoConfiguracao::ImpressoraTalao, "EP1", "Impressora de talões ESC/POS 80 mm"},
        {CodigoConfiguracao::ImpressoraTalao, "01", nullptr},
        // The table's bill: a customer document that moves no account, stock, cash or bank.
        {CodigoConfiguracao::TipoImprimeMesa, "CM", "Consulta de Mesa"},
        {CodigoConfiguracao::TipoImprimeMesa, "VD", nullptr},
        {CodigoConfiguracao::TipoImprimeMesa, "FT", nullptr},
        {CodigoConfiguracao::TipoImprimeMesa, "ZZ", nullptr},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.codigo);
        const auto descricao = descricaoCodigo(e, c.tabela, QString::fromUtf8(c.codigo));
        if (c.descricao) {
            EXPECT_EQ(descricao, std::optional<QString>(QString::fromUtf8(c.descricao)));
        } else {
            EXPECT_FALSE(descricao);
        }
    }
    // A type changed to move cash no longer fits the table's bill.
    ASSERT_TRUE(
        e.gConn.exec(QStringLiteral("update TabTipoMov set AfectaCaixa='E+' where codigo='CM'")));
    EXPECT_FALSE(descricaoCodigo(e, CodigoConfiguracao::TipoImprimeMesa, QStringLiteral("CM")));
}

TEST(ConfiguracaoRest, EverySettingIsKeptAndBadStoredValuesReadAsDefaults) {
    testing::DefinicoesTemporarias definicoes;
    const ConfiguracaoRest omissao = ConfiguracaoRest::ler(QStringLiteral("02"));
    EXPECT_EQ(omissao.fonte, QStringLiteral("Arial"));
    EXPECT_EQ(omissao.tempoCozinha, 30);
    EXPECT_EQ(omissao.nivelEmenta, QStringLiteral("TABGRUPOPRO"));
    EXPECT_EQ(omissao.corFundo, QColor(64, 64, 64));

    ConfiguracaoRest c;
    c.caixa = QStringLiteral("02");
    c.fonte = QStringLiteral("DejaVu Sans");
    c.imagemFundo = QStringLiteral("/imagens/fundo.jpg");
    c.impCozinha = QStringLiteral("EP1");
    c.impCozinhaPorta = QStringLiteral("COM");
    c.impCozinhaNome = QStringLiteral("Cozinha PDF");
    c.impBar = QStringLiteral("EP2");
    c.impBarPorta = QStringLiteral("PAR");
    c.tempoCozinha = 45;
    c.caixaDinheiro = QStringLiteral("/dev/gaveta");
    c.precoIncBrowse = c.pedePassword = c.desactivaPassword = c.activaProdutosFacturaREST =
        c.limpaDocAposFechaDoc = true;
    c.nivelEmenta = QStringLiteral("TABSUBFAMPRO");
    c.tipoImprimeMesa = QStringLiteral("CM");
    c.corFundo = QColor(0x12, 0x34, 0x56);
    ASSERT_TRUE(c.gravar(QStringLiteral("02")));
    const ConfiguracaoRest lida = ConfiguracaoRest::ler(QStringLiteral("02"));
    EXPECT_EQ(lida.caixa, c.caixa);
    EXPECT_EQ(lida.fonte, c.fonte);
    EXPECT_EQ(lida.imagemFundo, c.imagemFundo);
    EXPECT_EQ(lida.impCozinha, c.impCozinha);
    EXPECT_EQ(lida.impCozinhaPorta, c.impCozinhaPorta);
    EXPECT_EQ(lida.impCozinhaNome, c.impCozinhaNome);
    EXPECT_EQ(lida.impBar, c.impBar);
    EXPECT_EQ(lida.impBarPorta, c.impBarPorta);
    EXPECT_EQ(lida.tempoCozinha, c.tempoCozinha);
    EXPECT_EQ(lida.caixaDinheiro, c.caixaDinheiro);
    EXPECT_TRUE(lida.precoIncBrowse && lida.pedePassword && lida.desactivaPassword &&
                lida.activaProdutosFacturaREST && lida.limpaDocAposFechaDoc);
    EXPECT_EQ(lida.nivelEmenta, c.nivelEmenta);
    EXPECT_EQ(lida.tipoImprimeMesa, c.tipoImprimeMesa);
    EXPECT_EQ(lida.corFundo, c.corFundo);
    // The colour belongs to the user.
    EXPECT_EQ(ConfiguracaoRest::ler(QStringLiteral("03")).corFundo, QColor(64, 64, 64));

    // A connection the windows do not offer (edited by hand) reads as the Windows printer.
    ASSERT_TRUE(posto::ConfigRest_ImpTalaoBarPorta.gravar(QStringLiteral("USB")));
    EXPECT_EQ(ConfiguracaoRest::ler(QStringLiteral("02")).impBarPorta, QString());
}

}  // namespace
}  // namespace brasel::app
