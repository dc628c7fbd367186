#include "balancas.h"
#include "devices/balanca.h"
#include "devices/balanca_cs300.h"
#include "devices/balanca_d70.h"
#include "support/apoio_arranque.h"
#include "support/impressao_qt.h"

#include <gtest/gtest.h>

#include <limits>

namespace brasel::devices {
namespace {

Currency valor(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

TEST(CampoPrecoCS300, CentimosEmSeisDigitos) {
    const std::pair<const char*, const char*> casos[] = {
        {"12.5", "001250"},    {"0", "000000"},      {"0.5", "000050"},
        {"9999.99", "999999"}, {"12.346", "001235"}, {"0.004", "000000"},
    };
    for (const auto& [preco, campo] : casos) {
        SCOPED_TRACE(preco);
        EXPECT_EQ(campoPrecoCS300(valor(preco)), QByteArray(campo));
    }
    // Beyond six digits, or below zero, the scale would misread the record: nothing is sent.
    EXPECT_FALSE(campoPrecoCS300(valor("10000")));
    EXPECT_FALSE(campoPrecoCS300(valor("-1")));
}

TEST(CampoTaraCS300, GramasEmQuatroDigitos) {
    EXPECT_EQ(campoTaraCS300(valor("0.5")), QByteArray("0500"));
    EXPECT_EQ(campoTaraCS300(valor("9.999")), QByteArray("9999"));
    EXPECT_EQ(campoTaraCS300(valor("0.012")), QByteArray("0012"));
    EXPECT_FALSE(campoTaraCS300(valor("10")));
}

TEST(PedidoPrecoCS300, RegistoComESemTara) {
    EXPECT_EQ(pedidoPrecoCS300(valor("12.5"), Currency()).bytes,
              QByteArrayLiteral("\x04\x02"
                                "01\x1B"
                                "001250\x1B\x03"));
    EXPECT_EQ(pedidoPrecoCS300(valor("12.5"), valor("-1")).bytes,
              QByteArrayLiteral("\x04\x02"
                                "01\x1B"
                                "001250\x1B\x03"));
    EXPECT_EQ(pedidoPrecoCS300(valor("12.5"), valor("0.25")).bytes, QByteArrayLiteral("\x04\x02"
                                                                                      "03\x1B"
                                                                                      "001250\x1B"
                                                                                      "0250\x03"));

    const PedidoCS300 precoMau = pedidoPrecoCS300(valor("123456"), Currency());
    EXPECT_TRUE(precoMau.bytes.isEmpty());
    EXPECT_EQ(precoMau.erro, QStringLiteral("Preço de base inválido"));
    const PedidoCS300 taraMa = pedidoPrecoCS300(valor("1"), valor("12"));
    EXPECT_TRUE(taraMa.bytes.isEmpty());
    EXPECT_EQ(taraMa.erro, QStringLiteral("Não foi recebida nenhuma tara válida"));
}

TEST(LeituraCS300, PesoEPrecoNasSuasColunas) {
    const QByteArray leitura = QByteArrayLiteral(
        "\x02"
        "02\x1B"
        "3\x1B"
        "01250\x1B"
        "001250\x1B"
        "001563\x03");
    const auto lida = leituraCS300(leitura);
    ASSERT_TRUE(lida);
    EXPECT_EQ(lida->peso, valor("1.25"));
    EXPECT_EQ(lida->pvp, valor("15.63"));

    const std::pair<const char*, QByteArray> mas[] = {
        {"sem STX", leitura.mid(1)},
        {"cortada no preco", leitura.left(24)},
        {"peso com letras", QByteArray(leitura).replace(8, 1, "x")},
        {"NAK", QByteArrayLiteral("\x15")},
        {"vazia", QByteArray()},
    };
    for (const auto& [nome, resposta] : mas) {
        SCOPED_TRACE(nome);
        EXPECT_FALSE(leituraCS300(resposta));
    }
}

TEST(EstadoCS300, TextoDeCadaCodigo) {
    const std::pair<const char*, const char*> casos[] = {
        {"", "Erro de comunicação com a balança"},
        {"00", ""},
        {"01", "Erro geral na balança"},
        {"02", "Erro de Paridade, our excesso de caracteres permitidos"},
        {"10", "Reconhecimento de número de registo errado"},
        {"11", "Preço de base inválido"},
        {"12", "Não foi recebida nenhuma tara válida"},
        {"13", "Não foi recebido nenhum texto válido"},
        {"20", "Balança instável"},
        {"21", "Desde a última pesagem não se verificou nenhum movimento"},
        {"22", "Ainda não existe nenhum cálculo de preço"},
        {"30", "A balança encontra-se no alcance mínimo de pesagem"},
        {"31", "Balança abaixo do zero ou com indicação negativa de peso"},
        {"32", "Balança em sobrecarga (além do alcança máximo permitido)"},
    };
    for (const auto& [codigo, texto] : casos) {
        SCOPED_TRACE(codigo);
        EXPECT_EQ(textoEstadoCS300(codigo), QString::fromUtf8(texto));
    }
    EXPECT_FALSE(textoEstadoCS300("99"));
    EXPECT_FALSE(textoEstadoCS300("0"));
}

TEST(RespostaD70, CodigosDeEstadoEPeso) {
    const QByteArray normal = QByteArrayLiteral("$    1.250 kg           0000\r");
    EXPECT_FALSE(erroEstadoD70(normal, 25));
    EXPECT_EQ(pesoD70(normal), valor("1.25"));
    EXPECT_EQ(pesoD70(QByteArrayLiteral("$   -0.500 kg           0000\r")), valor("-0.5"));
    // Only a reply marked "$" carries a weight.
    EXPECT_FALSE(pesoD70(QByteArrayLiteral("     1.250 kg           0000\r")));
    EXPECT_FALSE(pesoD70(QByteArrayLiteral("$  1,250kg")));
    EXPECT_FALSE(pesoD70(QByteArray()));

    const std::pair<const char*, const char*> codigos[] = {
        {"??", "Erro de comunicação com a Balança"},
        {"B300", "Balança sem peso definido"},
        {"2100", "Balança Instável"},
        {"2500", "Excedeu a carga máxima permitida"},
    };
    for (const auto& [codigo, texto] : codigos) {
        SCOPED_TRACE(codigo);
        EXPECT_EQ(erroEstadoD70(QByteArray(codigo) + "\r", 1), QString::fromUtf8(texto));
        EXPECT_EQ(erroEstadoD70(QByteArray(24, ' ') + codigo + "\r", 25), QString::fromUtf8(texto));
        // A code elsewhere in the reply is no status.
        EXPECT_FALSE(erroEstadoD70(QByteArray(" ") + codigo, 1));
    }
}

TEST(DefinicoesBalanca, CamposReescritosAoSair) {
    const std::pair<const char*, const char*> portas[] = {
        {"3", "3"},  {" 7", "7"},  {"3abc", "3"}, {"2.7", "2"},   {"0", "1"},
        {"-2", "1"}, {"abc", "1"}, {"", "1"},     {"99999", "1"},
    };
    for (const auto& [texto, esperado] : portas) {
        SCOPED_TRACE(texto);
        EXPECT_EQ(normalizaPortaCom(QString::fromLatin1(texto)), QString::fromLatin1(esperado));
    }
    const std::pair<const char*, const char*> tempos[] = {
        {"0.5", "0.5"},     {"2", "2"},    {".25", "0.25"}, {"1.5s", "1.5"}, {"0", "0.1"},
        {"0.00001", "0.1"}, {"-1", "0.1"}, {"abc", "0.1"},  {"", "0.1"},
    };
    for (const auto& [texto, esperado] : tempos) {
        SCOPED_TRACE(texto);
        EXPECT_EQ(normalizaTimeOut(QString::fromLatin1(texto)), QString::fromLatin1(esperado));
    }
}

TEST(DefinicoesBalanca, OmissoesEGravacao) {
    testing::DefinicoesTemporarias definicoes;
    const DefinicoesBalanca omissao = DefinicoesBalanca::ler();
    EXPECT_EQ(omissao.portaCom, QStringLiteral("1"));
    EXPECT_EQ(omissao.inicializar, QStringLiteral("9600,o,7,1"));
    EXPECT_EQ(omissao.timeOut, QStringLiteral("0.5"));
    EXPECT_EQ(omissao.tipoBalanca, QStringLiteral("CS300"));
    EXPECT_FALSE(omissao.d70());
    EXPECT_EQ(omissao.segundos(), 0.5);

    const DefinicoesBalanca d70{QStringLiteral("4"), QStringLiteral("9600,n,8,1"),
                                QStringLiteral("1.5"), QStringLiteral("D70")};
    ASSERT_TRUE(d70.gravar());
    const DefinicoesBalanca lidas = DefinicoesBalanca::ler();
    EXPECT_EQ(lidas.porta(), 4);
    EXPECT_EQ(lidas.segundos(), 1.5);
    EXPECT_TRUE(lidas.d70());
    EXPECT_EQ(lidas.inicializar, QStringLiteral("9600,n,8,1"));
}

TEST(EsperaBalanca, TempoLimitadoEmMilissegundos) {
    EXPECT_EQ(milissegundosEspera(0.5), 500);
    EXPECT_EQ(milissegundosEspera(0.1), 100);
    EXPECT_EQ(milissegundosEspera(0), 0);
    EXPECT_EQ(milissegundosEspera(-3), 0);
    EXPECT_EQ(milissegundosEspera(1e12), kEsperaMaximaMs);
    EXPECT_EQ(milissegundosEspera(std::numeric_limits<double>::quiet_NaN()), 0);
    EXPECT_EQ(milissegundosEspera(std::numeric_limits<double>::infinity()), 0);
}

TEST(SituacaoBalanca, OpcoesDoSimulador) {
    const auto s = devsim::SituacaoBalanca::deOpcoes(
        QStringLiteral("peso=1.250,preco=15.63,instavel,sobrecarga,recusa,silencio"));
    ASSERT_TRUE(s);
    EXPECT_EQ(s->pesoGramas, 1250);
    EXPECT_EQ(s->precoCentimos, 1563);
    EXPECT_TRUE(s->instavel && s->sobrecarga && s->recusa && s->silencio);
    EXPECT_EQ(devsim::SituacaoBalanca::deOpcoes(QStringLiteral("peso=-0.5"))->pesoGramas, -500);
    EXPECT_FALSE(devsim::SituacaoBalanca::deOpcoes(QStringLiteral("peso=muito")));
    EXPECT_FALSE(devsim::SituacaoBalanca::deOpcoes(QStringLiteral("tremida")));
}

}  // namespace
}  // namespace brasel::devices
