#include "devices/linha_serie.h"
#include "support/aplicacao_gui.h"
#include "support/devsim_teste.h"

#include <QElapsedTimer>

#include <gtest/gtest.h>

#include <memory>

namespace brasel::devices {
namespace {

// A device that keeps what it gets and answers every "?" with "PESO".
class Eco : public devsim::Dispositivo {
  public:
    void recebe(const QByteArray& bytes) override {
        texto_ += QString::fromLatin1(bytes);
        if (bytes.contains('?')) responde("PESO");
    }
    QString transcricao() const override { return texto_; }

  private:
    QString texto_;
};

class LinhaSerieTeste : public ::testing::Test {
  protected:
    void SetUp() override { testing::aplicacaoGui(); }

    testing::DevsimTeste devsim_;
    devsim::ServidorDispositivo& eco_ = devsim_.liga(3, std::make_shared<Eco>());
    LinhaSerie linha_{devsim_.mapa()};
};

TEST_F(LinhaSerieTeste, BytesChegamIntactosAoOutroLado) {
    ASSERT_TRUE(linha_.setCommPort(3));
    ASSERT_TRUE(linha_.abrir());
    QByteArray todos;
    for (int b = 0; b < 256; ++b)
        todos.append(static_cast<char>(b));
    // CR, LF and the bytes a terminal would treat as signals or flow control pass untouched.
    EXPECT_TRUE(linha_.Output(todos));
    EXPECT_TRUE(eco_.esperaBytes(256, 2000));
    EXPECT_EQ(eco_.recebidos(), todos);
}

TEST_F(LinhaSerieTeste, SegundoAbrirERecusado) {
    ASSERT_TRUE(linha_.setCommPort(3));
    GuardaPorta impressao(linha_);
    ASSERT_TRUE(impressao.obtida());
    {
        // The display's turn comes while the printout holds the port: refused, and neither the
        // port nor its settings change under the printout.
        EXPECT_FALSE(linha_.setCommPort(2));
        EXPECT_FALSE(linha_.setSettings(QStringLiteral("9600,o,7,1")));
        GuardaPorta mostrador(linha_);
        EXPECT_FALSE(mostrador.obtida());
    }
    EXPECT_TRUE(linha_.aberta());
    EXPECT_EQ(linha_.CommPort(), 3);
    EXPECT_TRUE(linha_.Output("ainda aberta"));
    EXPECT_TRUE(eco_.esperaBytes(12, 2000));
}

TEST_F(LinhaSerieTeste, GuardaFechaAoSair) {
    ASSERT_TRUE(linha_.setCommPort(3));
    {
        GuardaPorta guarda(linha_);
        EXPECT_TRUE(guarda.obtida());
    }
    EXPECT_FALSE(linha_.aberta());
    EXPECT_FALSE(linha_.Output("x"));
}

TEST_F(LinhaSerieTeste, PortaSemDispositivoNaoAbre) {
    struct Caso {
        const char* nome;
        int porta;
    };
    const Caso casos[] = {{"porta sem dispositivo", 4}, {"porta zero", 0}, {"porta negativa", -1}};
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        ASSERT_TRUE(linha_.setCommPort(c.porta));
        EXPECT_FALSE(linha_.abrir());
        EXPECT_FALSE(linha_.aberta());
    }
}

TEST_F(LinhaSerieTeste, DispositivoDesligadoAMeioFalhaAEscrita) {
    ASSERT_TRUE(linha_.setCommPort(3));
    ASSERT_TRUE(linha_.abrir());
    ASSERT_TRUE(linha_.Output("antes"));
    eco_.parar();
    EXPECT_FALSE(linha_.Output("depois"));
    linha_.fechar();
    // Unplugged, the port is gone; plugged in again it is the same path.
    EXPECT_FALSE(linha_.abrir());
    ASSERT_TRUE(eco_.iniciar());
    ASSERT_TRUE(linha_.abrir());
    EXPECT_TRUE(linha_.Output("de novo"));
    EXPECT_TRUE(eco_.espera([](const QByteArray& r) { return r.endsWith("de novo"); }, 2000));
}

TEST_F(LinhaSerieTeste, LeituraEsperaPelaRespostaSemPassarDoPrazo) {
    ASSERT_TRUE(linha_.setCommPort(3));
    ASSERT_TRUE(linha_.abrir());
    QElapsedTimer relogio;
    relogio.start();
    EXPECT_FALSE(linha_.esperaDados(300));
    EXPECT_GE(relogio.elapsed(), 280);
    EXPECT_LT(relogio.elapsed(), 2000);
    EXPECT_TRUE(linha_.lerDisponivel().isEmpty());

    ASSERT_TRUE(linha_.Output("?"));
    ASSERT_TRUE(linha_.esperaDados(2000));
    QByteArray resposta = linha_.lerDisponivel();
    while (resposta.size() < 4 && linha_.esperaDados(2000))
        resposta += linha_.lerDisponivel();
    EXPECT_EQ(resposta, "PESO");

    ASSERT_TRUE(eco_.envia("velho"));
    ASSERT_TRUE(linha_.esperaDados(2000));
    linha_.limpaEntrada();
    EXPECT_FALSE(linha_.esperaDados(100));
}

}  // namespace
}  // namespace brasel::devices
