#include "balancas.h"
#include "devices/balanca.h"
#include "devices/balanca_cs300.h"
#include "devices/balanca_d70.h"
#include "support/devsim_teste.h"
#include "support/impressao_qt.h"

#include <QElapsedTimer>

#include <gtest/gtest.h>

#include <memory>

namespace brasel::devices {
namespace {

Currency valor(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

// A scale's situation in the simulator's own options ("peso=1.250,instavel").
devsim::SituacaoBalanca situacao(const char* opcoes) {
    return devsim::SituacaoBalanca::deOpcoes(QString::fromLatin1(opcoes)).value();
}

const QByteArray kPreco1250 = QByteArrayLiteral(
    "\x04\x02"
    "01\x1B"
    "001250\x1B\x03");
const QByteArray kLeitura = QByteArrayLiteral("\x04\x05");
const QByteArray kEstado = QByteArrayLiteral(
    "\x04\x02"
    "08\x03");
const QByteArray kEX = QByteArrayLiteral("EX\r");
const QByteArray kXZ = QByteArrayLiteral("XZ\r");
const QByteArray kXn = QByteArrayLiteral("Xn\r");

// The price-computing scale plays COM5 and the indicator COM6, each on the scale's own line. A
// pseudo-terminal takes neither 7 data bits (the dialog's default) nor, once reopened, a parity,
// so the simulated scales are reached at 8 bits without parity: their protocol is 7-bit text
// either way.
const QString kSettings = QStringLiteral("9600,n,8,1");
class BalancaTeste : public ::testing::Test {
  protected:
    bool pesa(BalancaSerie& balanca, int porta, const char* preco, double segundos = 2.0) {
        EXPECT_TRUE(balanca.SetPortaComm(&linha_, porta, kSettings));
        EXPECT_TRUE(balanca.OpenPort());
        const bool pesou = balanca.Pesagem(valor(preco), Currency(), segundos);
        balanca.ClosePort();
        return pesou;
    }

    testing::DevsimTeste devsim_;
    std::shared_ptr<devsim::BalancaCS300> cs300_ = std::make_shared<devsim::BalancaCS300>();
    std::shared_ptr<devsim::IndicadorD70> d70_ = std::make_shared<devsim::IndicadorD70>();
    devsim::ServidorDispositivo& servidorCS300_ = devsim_.liga(5, cs300_);
    devsim::ServidorDispositivo& servidorD70_ = devsim_.liga(6, d70_);
    LinhaSerie linha_{devsim_.mapa()};
};

TEST_F(BalancaTeste, CS300PesaAoPrecoUnitario) {
    cs300_->defineSituacao(situacao("peso=1.250"));
    clsCS300 balanca;
    ASSERT_TRUE(pesa(balanca, 5, "12.5"));
    EXPECT_EQ(balanca.Peso(), valor("1.25"));
    // 1.250 kg at 12.50 is 15.625: the scale's own price, rounded by the scale.
    EXPECT_EQ(balanca.PVP(), valor("15.63"));
    EXPECT_EQ(balanca.Erro(), QString());
    EXPECT_EQ(cs300_->pedidos(), (QList<QByteArray>{kPreco1250, kLeitura}));
    EXPECT_FALSE(linha_.aberta());
}

TEST_F(BalancaTeste, CS300FalhaComAMensagemDoEstado) {
    struct Caso {
        const char* nome;
        devsim::SituacaoBalanca situacao;
        const char* erro;
        QList<QByteArray> pedidos;
    };
    const Caso casos[] = {
        // A refused price record is followed by the status query, never by a reading.
        {"NAK ao preco",
         situacao("peso=1.250,recusa"),
         "Preço de base inválido",
         {kPreco1250, kEstado}},
        {"instavel",
         situacao("peso=1.250,instavel"),
         "Balança instável",
         {kPreco1250, kLeitura, kEstado}},
        {"sobrecarga",
         situacao("peso=1.250,sobrecarga"),
         "Balança em sobrecarga (além do alcança máximo permitido)",
         {kPreco1250, kLeitura, kEstado}},
        {"abaixo de zero",
         situacao("peso=-0.040"),
         "Balança abaixo do zero ou com indicação negativa de peso",
         {kPreco1250, kLeitura, kEstado}},
        {"calada",
         situacao("peso=1.250,silencio"),
         "Erro de comunicação com a balança",
         {kPreco1250, kEstado}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        auto cs300 = std::make_shared<devsim::BalancaCS300>(c.situacao);
        devsim_.liga(5, cs300);
        clsCS300 balanca;
        EXPECT_FALSE(pesa(balanca, 5, "12.5", 0.3));
        EXPECT_EQ(balanca.Erro(), QString::fromUtf8(c.erro));
        EXPECT_EQ(balanca.Peso(), Currency());
        EXPECT_EQ(cs300->pedidos(), c.pedidos);
    }
}

TEST_F(BalancaTeste, D70PesoOuMensagem) {
    struct Caso {
        const char* nome;
        devsim::SituacaoBalanca situacao;
        const char* erro;  // "" when the weight is captured
        QList<QByteArray> pedidos;
    };
    const Caso casos[] = {
        {"peso", situacao("peso=1.250"), "", {kEX, kXZ, kXn}},
        // An unstable indicator is refused at "XZ": "Xn" is never sent.
        {"instavel", situacao("peso=1.250,instavel"), "Balança Instável", {kEX, kXZ}},
        {"sobrecarga",
         situacao("peso=1.250,sobrecarga"),
         "Excedeu a carga máxima permitida",
         {kEX, kXZ}},
        {"sem peso", situacao("peso=0.000"), "Balança sem peso definido", {kEX, kXZ}},
        {"recusa", situacao("peso=1.250,recusa"), "Erro de comunicação com a Balança", {kEX, kXZ}},
        {"negativo",
         situacao("peso=-0.500"),
         "Peso não permitido (Valor Negativo)",
         {kEX, kXZ, kXn}},
        {"calado", situacao("peso=1.250,silencio"), kErroSemCaptura, {kEX, kXZ, kXn}},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        d70_->defineSituacao(c.situacao);
        const qsizetype antes = d70_->pedidos().size();
        clsD70 balanca;
        const bool pesou = pesa(balanca, 6, "12.5", 0.3);
        const QString erro = QString::fromUtf8(c.erro);
        EXPECT_EQ(pesou, erro.isEmpty());
        EXPECT_EQ(balanca.Erro(), erro);
        EXPECT_EQ(balanca.Peso(), erro.isEmpty() ? valor("1.25") : Currency());
        EXPECT_EQ(d70_->pedidos().mid(antes), c.pedidos);
    }
}

// Each of the three questions waits its whole time-out for a silent indicator, and no longer:
// the wait runs on the monotonic clock, which neither midnight nor a clock change moves.
TEST_F(BalancaTeste, EsperaTerminaNoTempoLimite) {
    d70_->defineSituacao(situacao("peso=1.250,silencio"));
    clsD70 balanca;
    QElapsedTimer relogio;
    relogio.start();
    EXPECT_FALSE(pesa(balanca, 6, "1", 0.3));
    const qint64 decorrido = relogio.elapsed();
    EXPECT_GE(decorrido, 900);
    EXPECT_LT(decorrido, 2500);
}

TEST_F(BalancaTeste, CapturaDoDialogoPassoAPasso) {
    struct Caso {
        const char* nome;
        DefinicoesBalanca definicoes;
        QStringList estados;
        bool capturada;
    };
    const QString aguarde = QStringLiteral("Aguarde por Favor...");
    const Caso casos[] = {
        {"CS300",
         {QStringLiteral("5"), kSettings, QStringLiteral("0.5"), QStringLiteral("CS300")},
         {aguarde, QStringLiteral("Inicializando..."),
          QStringLiteral("Captura efectuada   [ 1.250 ]")},
         true},
        {"D70",
         {QStringLiteral("6"), kSettings, QStringLiteral("0.5"), QStringLiteral("D70")},
         {aguarde, QStringLiteral("Estabelecendo Ligação..."),
          QStringLiteral("Captura efectuada   [ 1.250 ]")},
         true},
        {"porta sem balanca",
         {QStringLiteral("7"), kSettings, QStringLiteral("0.2"), QStringLiteral("CS300")},
         {aguarde, QStringLiteral("Inicializando..."),
          QStringLiteral("Erro de comunicação com a balança")},
         false},
        // Settings the line cannot take never open the port with other settings.
        {"definicoes invalidas",
         {QStringLiteral("6"), QStringLiteral("9600,x,7,1"), QStringLiteral("0.2"),
          QStringLiteral("D70")},
         {aguarde, QStringLiteral("Estabelecendo Ligação..."), QString::fromUtf8(kErroSemCaptura)},
         false},
    };
    cs300_->defineSituacao(situacao("peso=1.250"));
    d70_->defineSituacao(situacao("peso=1.250"));
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        const qsizetype antesD70 = d70_->pedidos().size();
        QStringList estados;
        const ResultadoCaptura r = capturaPesagem(c.definicoes, linha_, valor("12.5"),
                                                  [&](const QString& e) { estados << e; });
        EXPECT_EQ(estados, c.estados);
        EXPECT_EQ(r.estado, c.estados.last());
        EXPECT_EQ(r.capturada, c.capturada);
        EXPECT_EQ(r.peso, c.capturada ? valor("1.25") : Currency());
        if (!c.capturada) {
            EXPECT_EQ(d70_->pedidos().size(), antesD70);
        }
        EXPECT_FALSE(linha_.aberta());
    }
}

}  // namespace
}  // namespace brasel::devices
