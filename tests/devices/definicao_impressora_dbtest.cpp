#include "devices/definicao_impressora.h"
#include "support/bytes_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/mensagens_gravadas.h"

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using testing::bytes;

class DefinicaoImpressoraTeste : public ::testing::Test {
  protected:
    testing::EmpresaTeste empresa_{true};
    db::Connection& conn_ = empresa_.estado().gConn;
    testing::MensagensGravadas mensagens_;
};

TEST_F(DefinicaoImpressoraTeste, ImpressoraDaDemoComOsSeusCodigos) {
    const auto d = CarregaDefinicaoImpressora(conn_, QStringLiteral("EP1"), mensagens_);
    ASSERT_TRUE(d.has_value());
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
    EXPECT_EQ(d->porta, 1);
    EXPECT_EQ(d->codigos.abrirCaixa, bytes({27, 112, 0, 25, 250}));
    EXPECT_EQ(d->codigos.feedNLines, bytes({27, 100}));
    EXPECT_EQ(d->codigos.smallOn, bytes({27, 33, 1}));
    EXPECT_EQ(d->codigos.mediumOn, bytes({27, 33, 16}));
    EXPECT_EQ(d->codigos.largeOn, bytes({27, 33, 48}));
    EXPECT_EQ(d->codigos.largeOff, bytes({27, 33, 0}));
    EXPECT_EQ(d->codigos.corte, bytes({29, 86, 66, 0}));
    EXPECT_EQ(d->codigos.cor0, bytes({27, 114, 0}));
    EXPECT_EQ(d->codigos.cor1, bytes({27, 114, 1}));
    EXPECT_EQ(d->codigos.reset, bytes({27, 64}));
    EXPECT_EQ(d->codigos.internacional, bytes({27, 116, 3}));
}

TEST_F(DefinicaoImpressoraTeste, DefinicaoInexistenteAvisaEAbandona) {
    for (const QString& codigo :
         {QStringLiteral("XX"), QStringLiteral("EP1' or '1'='1"), QString()}) {
        SCOPED_TRACE(codigo.toStdString());
        mensagens_.limpar();
        EXPECT_FALSE(CarregaDefinicaoImpressora(conn_, codigo, mensagens_).has_value());
        ASSERT_EQ(mensagens_.mensagens().size(), 1);
        EXPECT_EQ(mensagens_.mensagens()[0].texto,
                  QStringLiteral("A T E N Ç Ã O !  Impressora de Talões não Configurada!"));
        EXPECT_EQ(mensagens_.mensagens()[0].icone, Icone::Critico);
    }
}

TEST_F(DefinicaoImpressoraTeste, CodigosMalFormadosFicamMaisCurtos) {
    ASSERT_TRUE(conn_.exec(QStringLiteral("update ImpTaloes set COM=?, corte=?, reset=?, cor0=? "
                                          "where Codigo=?"),
                           {QStringLiteral(" 3 (USB)"), QStringLiteral("29+86+300+0"), QVariant(),
                            QStringLiteral("27 + 114 + 1"), QStringLiteral("EP1")}));
    const auto d = LerDefinicaoImpressora(conn_, QStringLiteral("EP1"));
    ASSERT_TRUE(d.has_value());
    EXPECT_EQ(d->porta, 3);
    EXPECT_EQ(d->codigos.corte, bytes({29, 86, 0}));
    EXPECT_TRUE(d->codigos.reset.isEmpty());
    EXPECT_EQ(d->codigos.cor0, bytes({27, 114, 1}));
}

TEST_F(DefinicaoImpressoraTeste, ConfiguracaoDeImpressaoDoUtilizador) {
    const auto c = LerConfigTalao(conn_, QStringLiteral("01"));
    ASSERT_TRUE(c.has_value());
    EXPECT_EQ(c->portaTalao, QStringLiteral("COM"));
    EXPECT_EQ(c->tipoImpTalao, QStringLiteral("EP1"));
    EXPECT_EQ(c->saltaLinhas, 5);
    EXPECT_FALSE(c->pausaImpressao);
    EXPECT_TRUE(c->abreCaixa);
    EXPECT_FALSE(c->caixaDinheiroPorDrive);
    EXPECT_FALSE(LerConfigTalao(conn_, QStringLiteral("99")).has_value());

    ASSERT_TRUE(conn_.exec(QStringLiteral("update UtilConfGeral set SaltaLinhas=?, "
                                          "PausaImpressao=?, CaixaDinheiroPorDrive=?, abrecaixa=? "
                                          "where utilizador=?"),
                           {-4, 1, 1, 0, QStringLiteral("01")}));
    const auto mudada = LerConfigTalao(conn_, QStringLiteral("01"));
    ASSERT_TRUE(mudada.has_value());
    EXPECT_EQ(mudada->saltaLinhas, 0);  // a negative count feeds nothing
    EXPECT_TRUE(mudada->pausaImpressao);
    EXPECT_TRUE(mudada->caixaDinheiroPorDrive);
    EXPECT_FALSE(mudada->abreCaixa);
}

TEST(PortaDoTextoTeste, AlgarismosIniciais) {
    struct Caso {
        const char* texto;
        int porta;
    };
    const Caso casos[] = {{"1", 1},   {" 2 ", 2},  {"3x", 3},
                          {"12", 12}, {"COM1", 0}, {"", 0},
                          {"-1", 0},  {"1.5", 1},  {"99999999999", 999999999}};
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(portaDoTexto(QString::fromUtf8(c.texto)), c.porta);
    }
}

}  // namespace
}  // namespace brasel::devices
