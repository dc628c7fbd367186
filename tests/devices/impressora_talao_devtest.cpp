#include "devices/codigo_impressora.h"
#include "devices/impressao_serie.h"
#include "devices/impressora_talao.h"
#include "devices/pagina_codigos.h"
#include "impressora.h"
#include "support/aplicacao_gui.h"
#include "support/bytes_teste.h"
#include "support/devsim_teste.h"
#include "support/impressao_qt.h"

#include <QTimer>

#include <gtest/gtest.h>

namespace brasel::devices {
namespace {

using testing::bytes;

// The demo's 80 mm printer on COM1.
DefinicaoImpressora definicaoDemo() {
    DefinicaoImpressora d;
    d.codigo = QStringLiteral("EP1");
    d.porta = 1;
    CodigosImpressora& c = d.codigos;
    c.abrirCaixa = ConstroiCodigo(QStringLiteral("27+112+0+25+250"));
    c.feedNLines = ConstroiCodigo(QStringLiteral("27+100"));
    c.smallOn = ConstroiCodigo(QStringLiteral("27+33+1"));
    c.mediumOn = ConstroiCodigo(QStringLiteral("27+33+16"));
    c.largeOn = ConstroiCodigo(QStringLiteral("27+33+48"));
    c.largeOff = ConstroiCodigo(QStringLiteral("27+33+0"));
    c.corte = ConstroiCodigo(QStringLiteral("29+86+66+0"));
    c.cor0 = ConstroiCodigo(QStringLiteral("27+114+0"));
    c.cor1 = ConstroiCodigo(QStringLiteral("27+114+1"));
    c.reset = ConstroiCodigo(QStringLiteral("27+64"));
    c.internacional = ConstroiCodigo(QStringLiteral("27+116+3"));
    return d;
}

class ImpressoraTalaoTeste : public ::testing::Test {
  protected:
    void SetUp() override {
        testing::aplicacaoGui();
        impressora_.setCtrlInterface(&linha_);
        impressora_.defineCodigos(definicao_.codigos, true);
        ASSERT_TRUE(impressora_.SetPortaComm(1, kDefinicoesTalao));
    }

    // The bytes the printer got after the first `desde`, once `total` of them arrived.
    QByteArray chegou(qsizetype desde, qsizetype quantos) {
        EXPECT_TRUE(servidor_.esperaBytes(desde + quantos, 2000));
        return servidor_.recebidos().mid(desde);
    }

    DefinicaoImpressora definicao_ = definicaoDemo();
    testing::DevsimTeste devsim_;
    devsim::ServidorDispositivo& servidor_ =
        devsim_.liga(1, std::make_shared<devsim::ImpressoraTalao>(definicao_.codigos));
    LinhaSerie linha_{devsim_.mapa()};
    CImpressoraTalao impressora_;
};

TEST_F(ImpressoraTalaoTeste, CodigosGuardadosChegamComoBytes) {
    struct Caso {
        const char* texto;
        QByteArray esperado;
    };
    const Caso casos[] = {
        {"27+100+3", bytes({27, 100, 3})},
        {"27 + 100", bytes({27, 100})},
        {"27+100+1+2+3+4+5", bytes({27, 100, 1, 2, 3, 4})},
        {"27++100", bytes({27, 100})},
        {"300", QByteArray()},
    };
    GuardaPorta guarda(linha_);
    ASSERT_TRUE(guarda.obtida());
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        const qsizetype antes = servidor_.recebidos().size();
        impressora_.chrCORTE = ConstroiCodigo(QString::fromUtf8(c.texto));
        ASSERT_TRUE(impressora_.CortaPapel());
        // The cut is followed by CR.
        EXPECT_EQ(chegou(antes, c.esperado.size() + 1), c.esperado + "\r");
    }
}

TEST_F(ImpressoraTalaoTeste, LinhaComTamanhoCorEFim) {
    struct Caso {
        const char* nome;
        bool novaLinha;
        int tamanho;
        bool cor;
        QByteArray esperado;
    };
    const Caso casos[] = {
        // Small has no off code: nothing follows the text but the line end.
        {"pequena", true, 1, false, bytes({27, 114, 0, 27, 33, 1, 'P', 132, 'o', 13, 10})},
        {"pequena sem mudar de linha", false, 1, false,
         bytes({27, 114, 0, 27, 33, 1, 'P', 132, 'o', 13})},
        // Medium off is in no printer definition, so it is empty.
        {"média", true, 2, false, bytes({27, 114, 0, 27, 33, 16, 'P', 132, 'o', 13, 10})},
        {"grande a cor", true, 3, true,
         bytes({27, 114, 1, 27, 33, 48, 'P', 132, 'o', 27, 33, 0, 13, 10})},
        {"tamanho desconhecido é grande", true, 0, false,
         bytes({27, 114, 0, 27, 33, 48, 'P', 132, 'o', 27, 33, 0, 13, 10})},
    };
    GuardaPorta guarda(linha_);
    ASSERT_TRUE(guarda.obtida());
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const qsizetype antes = servidor_.recebidos().size();
        ASSERT_TRUE(impressora_.ImprimeLinha(QStringLiteral("Pão"), c.novaLinha, c.tamanho, c.cor));
        EXPECT_EQ(chegou(antes, c.esperado.size()), c.esperado);
    }
    const qsizetype antes = servidor_.recebidos().size();
    ASSERT_TRUE(impressora_.ImprimeLinha_A(QStringLiteral("Pão")));
    EXPECT_EQ(chegou(antes, 3), bytes({'P', 132, 'o'}));
}

TEST_F(ImpressoraTalaoTeste, AvancoGavetaEConjuntoDeCaracteres) {
    GuardaPorta guarda(linha_);
    ASSERT_TRUE(guarda.obtida());
    ASSERT_TRUE(impressora_.FeedLinhas(8));
    EXPECT_EQ(chegou(0, 3), bytes({27, 100, 8}));
    // A count that is no byte sends nothing at all.
    EXPECT_FALSE(impressora_.FeedLinhas(300));
    EXPECT_FALSE(impressora_.FeedLinhas(-1));
    ASSERT_TRUE(impressora_.AbreCaixa());
    EXPECT_EQ(chegou(3, 5), bytes({27, 112, 0, 25, 250}));
    ASSERT_TRUE(impressora_.SetInternationalCHR(definicao_.codigos.internacional));
    ASSERT_TRUE(impressora_.Reset());
    EXPECT_EQ(chegou(8, 7), bytes({27, 116, 3, 13, 27, 64, 13}));
    EXPECT_EQ(servidor_.transcricao(), QStringLiteral("[FEED 8][GAVETA][CHARSET][RESET]"));
}

TEST_F(ImpressoraTalaoTeste, PortaFechadaNaoEnviaNadaEFicaRegistado) {
    EXPECT_FALSE(impressora_.ImprimeLinha(QStringLiteral("perdida"), true, 1, false));
    EXPECT_FALSE(impressora_.semFalhas());
    // Once failed, nothing more goes out, even with the port open again.
    GuardaPorta guarda(linha_);
    ASSERT_TRUE(guarda.obtida());
    EXPECT_FALSE(impressora_.Reset());
    EXPECT_FALSE(servidor_.esperaBytes(1, 200));
}

class CursoImpressaoTeste : public ImpressoraTalaoTeste {
  protected:
    static void duasLinhas(CImpressoraTalao& imp, int via) {
        imp.ImprimeLinha(QStringLiteral("Via %1").arg(via), true, 2, false);
        imp.ImprimeLinha(QStringLiteral("Açúcar 1,50"), true, 1, false);
    }
};

TEST_F(CursoImpressaoTeste, ViasLinhasEmBrancoCorteEReset) {
    OpcoesImpressaoSerie opcoes;
    opcoes.vias = 2;
    opcoes.saltaLinhas = 2;
    ASSERT_TRUE(ImprimeNaSerie(linha_, definicao_, opcoes, duasLinhas));
    EXPECT_FALSE(linha_.aberta());
    const QString via = QStringLiteral(
        "[COR0][MEDIO]Via %1\n[COR0][PEQUENO]Açúcar 1,50\n[COR0][PEQUENO] \n[COR0][PEQUENO] \n"
        "[CORTE][RESET]");
    const QString esperado = QStringLiteral("[CHARSET][RESET]") + via.arg(1) + via.arg(2);
    EXPECT_TRUE(servidor_.espera(
        [&](const QByteArray& r) {
            return r.endsWith(bytes({29, 86, 66, 0, 13, 27, 64, 13})) &&
                   r.count(bytes({29, 86, 66, 0})) == 2;
        },
        2000));
    EXPECT_EQ(servidor_.transcricao(), esperado);
}

TEST_F(CursoImpressaoTeste, GavetaSoQuandoAImpressaoAPode) {
    const auto gavetaNoCorpo = [](CImpressoraTalao& imp, int) { imp.AbreCaixa(); };
    OpcoesImpressaoSerie opcoes;
    ASSERT_TRUE(ImprimeNaSerie(linha_, definicao_, opcoes, gavetaNoCorpo));
    opcoes.comGaveta = true;
    ASSERT_TRUE(ImprimeNaSerie(linha_, definicao_, opcoes, gavetaNoCorpo));
    EXPECT_TRUE(servidor_.espera(
        [](const QByteArray& r) {
            return r.count(
                       "\x1d"
                       "VB") == 2;
        },
        2000));
    EXPECT_EQ(servidor_.transcricao().count(QStringLiteral("[GAVETA]")), 1);
}

TEST_F(CursoImpressaoTeste, ImpressoraDesligadaOuSemPortaNaoContaComoImpressa) {
    struct Caso {
        const char* nome;
        int porta;
        bool desligada;
    };
    const Caso casos[] = {
        {"desligada", 1, true},
        {"porta sem impressora", 5, false},
        {"porta zero", 0, false},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        if (c.desligada) servidor_.parar();
        DefinicaoImpressora definicao = definicao_;
        definicao.porta = c.porta;
        EXPECT_FALSE(ImprimeNaSerie(linha_, definicao, {}, duasLinhas));
        EXPECT_FALSE(linha_.aberta());
        if (c.desligada) {
            ASSERT_TRUE(servidor_.iniciar());
        }
    }
    // Plugged in again, the same printer prints.
    EXPECT_TRUE(ImprimeNaSerie(linha_, definicao_, {}, duasLinhas));
}

TEST_F(CursoImpressaoTeste, DesligadaAMeioParaDeEnviar) {
    int linhasTentadas = 0;
    const auto longo = [&](CImpressoraTalao& imp, int) {
        for (int i = 0; i < 10; ++i) {
            if (i == 3) servidor_.parar();
            imp.ImprimeLinha(QStringLiteral("linha"), true, 1, false);
            ++linhasTentadas;
        }
    };
    EXPECT_FALSE(ImprimeNaSerie(linha_, definicao_, {}, longo));
    EXPECT_EQ(linhasTentadas, 10);
    EXPECT_FALSE(linha_.aberta());
}

TEST_F(CursoImpressaoTeste, OutraSaidaAMeioDaImpressaoERecusada) {
    // A timer (the kitchen poll) fires while the receipt yields to the message loop: its
    // printout finds the port held and is refused, and the receipt goes out whole.
    bool segundaTentada = false;
    bool segunda = true;
    QTimer::singleShot(0, [&] {
        segundaTentada = true;
        segunda = ImprimeNaSerie(linha_, definicao_, {}, [](CImpressoraTalao& imp, int) {
            imp.ImprimeLinha(QStringLiteral("COZINHA"), true, 3, false);
        });
    });
    ASSERT_TRUE(ImprimeNaSerie(linha_, definicao_, {}, duasLinhas));
    EXPECT_TRUE(segundaTentada);
    EXPECT_FALSE(segunda);
    EXPECT_TRUE(servidor_.espera([](const QByteArray& r) { return r.endsWith("\x1b@\r"); }, 2000));
    EXPECT_FALSE(servidor_.transcricao().contains(QStringLiteral("COZINHA")));
}

TEST(PaginaCodigosNaImpressora, AsTrintaESeisLetrasVoltamIguais) {
    // The printer side decodes with the whole code page, the program encodes with its own table
    // of 36: the two must agree on every Portuguese letter.
    const QString letras = QStringLiteral("ÇéâãàÁçêÊèÍÔìÃÂÉÀÈôõòÚùÌÕÙÓáíóúªºÒ«»");
    devsim::ImpressoraTalao impressora({});
    impressora.recebe(TraduzCaracteres(letras));
    EXPECT_EQ(impressora.transcricao(), letras);
}

TEST(TranscricaoDaImpressora, CodigosPartidosEntreLeiturasEBytesSoltos) {
    devsim::ImpressoraTalao impressora(definicaoDemo().codigos);
    // The cut arrives in three pieces; 27 33 could still become small, medium or large.
    for (const QByteArray& pedaco : {bytes({'a', 29}), bytes({86, 66}), bytes({0, 27, 33})})
        impressora.recebe(pedaco);
    EXPECT_EQ(impressora.transcricao(), QStringLiteral("a[CORTE][#27]!"));
    impressora.recebe(bytes({16, 7, 27, 100}));
    EXPECT_EQ(impressora.transcricao(), QStringLiteral("a[CORTE][MEDIO][#7][#27]d"));
    impressora.recebe(bytes({3, 0xFC, 'x'}));
    EXPECT_EQ(impressora.transcricao(), QStringLiteral("a[CORTE][MEDIO][#7][FEED 3]ⁿx"));
}

}  // namespace
}  // namespace brasel::devices
