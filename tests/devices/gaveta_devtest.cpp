#include "devices/gaveta.h"
#include "impressora.h"
#include "support/aplicacao_gui.h"
#include "support/devsim_teste.h"
#include "support/empresa_teste.h"
#include "support/impressao_qt.h"
#include "support/texto_pdf.h"

#include <QDir>
#include <QFileInfo>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

const QByteArray kGavetaImpressora("\x1bp\x00\x19\xfa", 5);  // the demo printer's abrircaixa

class GavetaTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoGui();
        ASSERT_TRUE(conn_.isOpen());
    }

    void porDrive(int valor) {
        ASSERT_TRUE(conn_.exec(QStringLiteral("update UtilConfGeral set CaixaDinheiroPorDrive=? "
                                              "where utilizador=?"),
                               {valor, QStringLiteral("01")}));
    }
    QStringList pdfs() const {
        return QDir(pastaPdf_.path()).entryList({QStringLiteral("*.pdf")}, QDir::Files);
    }

    testing::EmpresaTeste empresa_{true};
    db::Connection& conn_ = empresa_.estado().gConn;
    testing::DevsimTeste devsim_;
    devsim::ServidorDispositivo& impressora_ =
        devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(
                            LerDefinicaoImpressora(conn_, QStringLiteral("EP1"))->codigos));
    devsim::ServidorDispositivo& opos_ =
        devsim_.liga(2, std::make_shared<devsim::ImpressoraTalao>(CodigosImpressora{}));
    LinhaSerie linha_{devsim_.mapa()};
    QTemporaryDir pastaPdf_;
    MeiosGaveta meios_{linha_, {}, pastaPdf_.path()};
};

TEST_F(GavetaTeste, RegrasDaAberturaDaGaveta) {
    struct Caso {
        const char* nome;
        int porDrive;
        const char* tipo;
        bool drivePermitido;
        bool comOpos;
        bool impressora;  // the ticket printer gets its drawer code
        bool opos;        // the OPOS device gets the pulse
        bool pdf;         // a driver job is printed
    };
    const Caso casos[] = {
        {"menu", 0, "", true, false, true, false, false},
        {"tipo que abre", 0, "VD", false, false, true, false, false},
        {"tipo que não abre", 0, "FT", true, true, false, false, false},
        {"tipo desconhecido abre", 0, "ZZ", true, false, true, false, false},
        {"tipo em branco é o menu", 0, "  ", true, false, true, false, false},
        {"menu com OPOS", 0, "", true, true, true, true, false},
        {"por drive, do menu", 1, "", true, true, false, false, true},
        {"por drive, tipo em branco", 1, " ", true, false, false, false, true},
        {"por drive, documento", 1, "VD", true, true, false, false, false},
        {"por drive, sem licença de drive", 1, "", false, true, false, false, false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        porDrive(c.porDrive);
        meios_.dispositivoOPOS = c.comOpos ? devsim_.caminho(2) : QString();
        const qsizetype antesImpressora = impressora_.recebidos().size();
        const qsizetype antesOpos = opos_.recebidos().size();
        const qsizetype antesPdf = pdfs().size();

        const bool aberta = AbreGaveta(conn_, QStringLiteral("01"), meios_,
                                       QString::fromUtf8(c.tipo), c.drivePermitido);

        EXPECT_EQ(aberta, c.impressora || c.opos || c.pdf);
        EXPECT_FALSE(linha_.aberta());
        if (c.impressora) {
            EXPECT_TRUE(impressora_.esperaBytes(antesImpressora + 5, 2000));
            EXPECT_EQ(impressora_.recebidos().mid(antesImpressora), kGavetaImpressora);
        } else {
            EXPECT_FALSE(impressora_.esperaBytes(antesImpressora + 1, 100));
        }
        if (c.opos) {
            EXPECT_TRUE(opos_.esperaBytes(antesOpos + 5, 2000));
            EXPECT_EQ(opos_.recebidos().mid(antesOpos), kPulsoGaveta);
        } else {
            EXPECT_FALSE(opos_.esperaBytes(antesOpos + 1, 100));
        }
        EXPECT_EQ(pdfs().size(), antesPdf + (c.pdf ? 1 : 0));
    }
    EXPECT_EQ(impressora_.transcricao().count(QStringLiteral("[GAVETA]")), 5);
}

TEST_F(GavetaTeste, TrabalhoPorDriveImprimeUmaLinha) {
    porDrive(1);
    ASSERT_TRUE(AbreGaveta(conn_, QStringLiteral("01"), meios_, {}, true));
    const QStringList ficheiros = pdfs();
    ASSERT_EQ(ficheiros.size(), 1);
    EXPECT_TRUE(ficheiros[0].startsWith(QStringLiteral("Abretura do Caixa - Por Drive ")));
    const auto texto = testing::textoPdf(QDir(pastaPdf_.path()).filePath(ficheiros[0]));
    ASSERT_TRUE(texto.has_value());
    EXPECT_EQ(texto->trimmed(), QStringLiteral("---"));
    // A page printer that is not there opens nothing.
    meios_.impressoraPagina = QStringLiteral("Impressora Que Não Existe");
    EXPECT_FALSE(AbreGaveta(conn_, QStringLiteral("01"), meios_, {}, true));
}

TEST_F(GavetaTeste, UtilizadorSemConfiguracaoSoTemOOpos) {
    meios_.dispositivoOPOS = devsim_.caminho(2);
    EXPECT_TRUE(AbreGaveta(conn_, QStringLiteral("99"), meios_, {}, true));
    EXPECT_TRUE(opos_.esperaBytes(5, 2000));
    EXPECT_FALSE(impressora_.esperaBytes(1, 100));
    meios_.dispositivoOPOS.clear();
    EXPECT_FALSE(AbreGaveta(conn_, QStringLiteral("99"), meios_, {}, true));
}

TEST_F(GavetaTeste, ImpressoraOcupadaOuDesligada) {
    {
        // The port is held by another output: the drawer waits for nothing and sends nothing.
        ASSERT_TRUE(linha_.setCommPort(2));
        GuardaPorta outra(linha_);
        ASSERT_TRUE(outra.obtida());
        EXPECT_FALSE(AbreGaveta(conn_, QStringLiteral("01"), meios_, {}, true));
        EXPECT_TRUE(linha_.aberta());
    }
    EXPECT_FALSE(impressora_.esperaBytes(1, 100));
    impressora_.parar();
    EXPECT_FALSE(AbreGaveta(conn_, QStringLiteral("01"), meios_, {}, true));
}

TEST_F(GavetaTeste, OposSoParaUmDispositivoQueExiste) {
    const QString inexistente = QDir(pastaPdf_.path()).filePath(QStringLiteral("gaveta0"));
    struct Caso {
        const char* nome;
        QString caminho;
        bool enviado;
    };
    const Caso casos[] = {
        {"sem dispositivo", QString(), false},
        {"só espaços", QStringLiteral("   "), false},
        {"caminho que não existe", inexistente, false},
        {"dispositivo ligado", devsim_.caminho(2), true},
        {"com espaços à volta", QStringLiteral(" ") + devsim_.caminho(2) + QStringLiteral(" "),
         true},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const qsizetype antes = opos_.recebidos().size();
        EXPECT_EQ(AbreGavetaOPOS(c.caminho), c.enviado);
        EXPECT_EQ(opos_.esperaBytes(antes + 5, c.enviado ? 2000 : 100), c.enviado);
    }
    // Nothing is created where the device was missing.
    EXPECT_FALSE(QFileInfo::exists(inexistente));
    EXPECT_EQ(opos_.recebidos(), kPulsoGaveta + kPulsoGaveta);
}

}  // namespace
}  // namespace brasel::devices
