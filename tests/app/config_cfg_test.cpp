#include "app/config_cfg.h"
#include "support/apoio_arranque.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

class ConfigCfgTeste : public ::testing::Test {
  protected:
    QString escrever(const QByteArray& conteudo, const char* nome = "Config.cfg") {
        const QString caminho = QDir(pasta_.path()).filePath(QString::fromUtf8(nome));
        QFile f(caminho);
        EXPECT_TRUE(f.open(QIODevice::WriteOnly | QIODevice::Truncate));
        f.write(conteudo);
        return caminho;
    }
    QString caminho(const char* nome) const {
        return QDir(pasta_.path()).filePath(QString::fromUtf8(nome));
    }

    QTemporaryDir pasta_;
    testing::MensagensGravadas mensagens_;
};

TEST_F(ConfigCfgTeste, FicheiroInexistenteOuVazioTerminaOPrograma) {
    struct Caso {
        const char* nome;
        bool criar;
        const char* mensagem;
    };
    const Caso casos[] = {
        {"inexistente", false, "Aplicativo sem as configuração definidas!"},
        {"vazio", true, "Não foi possível abrir as configuração definidas!"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        mensagens_.limpar();
        const QString ficheiro = c.criar ? escrever(QByteArray(), c.nome) : caminho(c.nome);
        ConfigCfg cfg;
        EXPECT_EQ(LeConfigCfg(cfg, mensagens_, ficheiro), LeituraConfig::Terminar);
        ASSERT_EQ(mensagens_.mensagens().size(), 1u);
        EXPECT_EQ(mensagens_.mensagens()[0].texto, QString::fromUtf8(c.mensagem));
        EXPECT_EQ(mensagens_.mensagens()[0].icone, Icone::Critico);
    }
}

TEST_F(ConfigCfgTeste, CincoLinhasComQualquerFimDeLinha) {
    const QByteArray casos[] = {
        "/dados\n/chave.txt\n123/AT\n/portas.txt\n/actualizacoes",
        "/dados\r\n/chave.txt\r\n123/AT\r\n/portas.txt\r\n/actualizacoes\r\n",
        "\xEF\xBB\xBF/dados\r\n/chave.txt\n  123/AT \t\r\n/portas.txt\n/actualizacoes\n\nextra\n",
    };
    for (const QByteArray& conteudo : casos) {
        SCOPED_TRACE(conteudo.toStdString());
        ConfigCfg cfg;
        ASSERT_EQ(LeConfigCfg(cfg, mensagens_, escrever(conteudo)), LeituraConfig::Ok);
        EXPECT_EQ(cfg.pastaDados, QStringLiteral("/dados"));
        EXPECT_EQ(cfg.ficheiroChave, QStringLiteral("/chave.txt"));
        EXPECT_EQ(cfg.numeroCertificado, QStringLiteral("123/AT"));
        EXPECT_EQ(cfg.mapaPortas, QStringLiteral("/portas.txt"));
        EXPECT_EQ(cfg.pastaActualizacoes, QStringLiteral("/actualizacoes"));
    }
    EXPECT_TRUE(mensagens_.mensagens().isEmpty());
}

// Any of the five lines missing or blank is refused, but the program is not ended.
TEST_F(ConfigCfgTeste, LinhaEmBrancoNaoEstaBemDefinida) {
    const QByteArray casos[] = {
        "/dados\n/chave\n\n/portas\n/act\n",  "/dados\r\n/chave\r\n   \r\n/portas\r\n/act\r\n",
        "\n/chave\n123\n/portas\n/act\n",     "/dados\n/chave\n123\n/portas\n",
        "/dados\n/chave\n123\n/portas\n \t ", "   ",
    };
    for (const QByteArray& conteudo : casos) {
        SCOPED_TRACE(conteudo.toStdString());
        mensagens_.limpar();
        ConfigCfg cfg;
        EXPECT_EQ(LeConfigCfg(cfg, mensagens_, escrever(conteudo)), LeituraConfig::Incompleta);
        ASSERT_EQ(mensagens_.mensagens().size(), 1u);
        EXPECT_EQ(mensagens_.mensagens()[0].texto,
                  QStringLiteral("Não tem as configurações bem definidas!"));
        EXPECT_EQ(mensagens_.mensagens()[0].icone, Icone::Critico);
    }
}

TEST(TextoAte, TextoAntesDoPrimeiroCaracter) {
    struct Caso {
        const char* texto;
        char c;
        const char* esperado;
    };
    const Caso casos[] = {
        {"10.0.0.1 5000 22", ' ', "10.0.0.1"},
        {"a=b=c", '=', "a"},
        {"sem separador", ';', "sem separador"},
        {";no inicio", ';', ""},
        {"", ';', ""},
        {"fim;", ';', "fim"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(TextoAte(QString::fromUtf8(c.texto), QLatin1Char(c.c)),
                  QString::fromUtf8(c.esperado));
    }
}

TEST_F(ConfigCfgTeste, MapaDasPortasSerie) {
    const QString ficheiro = escrever(
        "COM1=/dev/ttyUSB0\r\n"
        "  com3 = /dev/pts/5  \n"
        "# comentário\n"
        "COM0=/dev/nada\n"
        "COM4=\n"
        "LPT1=/dev/lp0\n"
        "COM12=/dev/ttyACM0\n",
        "portas.txt");
    const MapaPortas mapa = MapaPortas::ler(ficheiro);
    struct Caso {
        int porta;
        const char* dispositivo;
    };
    const Caso casos[] = {
        {1, "/dev/ttyUSB0"},  {2, "/dev/ttyS1"}, {3, "/dev/pts/5"}, {4, "/dev/ttyS3"},
        {12, "/dev/ttyACM0"}, {0, ""},           {-1, ""},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.porta);
        EXPECT_EQ(mapa.dispositivo(c.porta), QString::fromUtf8(c.dispositivo));
    }
    const MapaPortas semFicheiro = MapaPortas::ler(caminho("nao-existe.txt"));
    EXPECT_EQ(semFicheiro.dispositivo(1), QStringLiteral("/dev/ttyS0"));
}

}  // namespace
}  // namespace brasel::app
