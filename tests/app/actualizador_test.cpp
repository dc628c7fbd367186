#include "app/actualizador.h"
#include "support/apoio_arranque.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <optional>

namespace brasel::app {
namespace {

TEST(Versao, LerTextoDeVersao) {
    struct Caso {
        const char* texto;
        std::optional<Versao> versao;
    };
    const Caso casos[] = {
        {"000100020003", Versao{1, 2, 3}},
        {" 1.10.0 ", Versao{1, 10, 0}},
        {"0.0.0", Versao{0, 0, 0}},
        {"1.2", std::nullopt},
        {"1.2.3.4", std::nullopt},
        {"1.2.3.zip", std::nullopt},
        {"00010002000", std::nullopt},
        {"0001000200030", std::nullopt},
        {"a.b.c", std::nullopt},
        {"99999.0.0", std::nullopt},
        {"", std::nullopt},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.texto);
        EXPECT_EQ(Versao::ler(QString::fromUtf8(c.texto)), c.versao);
    }
    EXPECT_LT((Versao{1, 9, 9}), (Versao{1, 10, 0}));
    EXPECT_EQ((Versao{2, 0, 11}).texto(), QStringLiteral("2.0.11"));
}

class Actualizacoes : public ::testing::Test {
  protected:
    void criar(const char* nome, bool pasta = false, const QByteArray& conteudo = {}) {
        const QString caminho = QDir(raiz_.path()).filePath(QString::fromUtf8(nome));
        if (pasta) {
            ASSERT_TRUE(QDir().mkpath(caminho));
            return;
        }
        QFile f(caminho);
        ASSERT_TRUE(f.open(QIODevice::WriteOnly));
        f.write(conteudo);
    }
    QString pasta() const { return raiz_.path(); }
    QString caminho(const char* nome) const {
        return QDir(raiz_.path()).filePath(QString::fromUtf8(nome));
    }

    QTemporaryDir raiz_;
};

TEST_F(Actualizacoes, SemPastaOuSemVersoesNaoHaNada) {
    EXPECT_EQ(VerificaNovasVersoes(caminho("nao-existe")), std::nullopt);
    EXPECT_EQ(VerificaNovasVersoes(QString()), std::nullopt);  // not the current folder
    EXPECT_EQ(VerificaNovasVersoes(pasta()), std::nullopt);
    criar("leia-me.txt");
    criar("1.2", true);
    criar("versao.txt", false, "\n  \nsem versao\n");
    EXPECT_EQ(VerificaNovasVersoes(pasta()), std::nullopt);
}

TEST_F(Actualizacoes, AMaisRecenteDaPasta) {
    criar("000100020003", true);
    criar("1.9.9.tar.gz");
    criar("notas.txt");
    EXPECT_EQ(VerificaNovasVersoes(pasta())->versao, (Versao{1, 9, 9}));
    criar("1.10.0", true);
    auto nova = VerificaNovasVersoes(pasta());
    ASSERT_TRUE(nova);
    EXPECT_EQ(nova->versao, (Versao{1, 10, 0}));
    EXPECT_EQ(nova->caminho, caminho("1.10.0"));

    criar("versao.txt", false, "\r\n 000200000001\r\n");
    nova = VerificaNovasVersoes(pasta());
    ASSERT_TRUE(nova);
    EXPECT_EQ(nova->versao, (Versao{2, 0, 1}));
    EXPECT_EQ(nova->caminho, QDir(pasta()).absolutePath());
}

TEST_F(Actualizacoes, LegendaDaSeleccaoDeEmpresas) {
    const QString actual = Versao::actual().texto();
    EXPECT_EQ(legendaVersoes(VersaoDisponivel{{3, 1, 4}, pasta()}),
              QStringLiteral("Versão Actual [") + actual +
                  QStringLiteral("]    Versão já disponível na Internet [3.1.4]"));
    EXPECT_EQ(legendaVersoes(std::nullopt), QStringLiteral("Versão Actual [") + actual +
                                                QStringLiteral("]    Versão já disponível na "
                                                               "Internet [") +
                                                actual + QLatin1Char(']'));
}

TEST_F(Actualizacoes, SoUmaVersaoMaisNovaEAnunciada) {
    const Versao actual = Versao::actual();
    testing::MensagensGravadas m;
    EXPECT_FALSE(ProcessaActualizacoes(caminho("nao-existe"), m));
    criar(actual.texto().toUtf8().constData(), true);
    EXPECT_FALSE(ProcessaActualizacoes(pasta(), m));
    EXPECT_TRUE(m.mensagens().isEmpty());

    const Versao nova{actual.maior, actual.menor, actual.revisao + 1};
    criar(nova.texto().toUtf8().constData(), true);
    EXPECT_TRUE(ProcessaActualizacoes(pasta(), m));
    ASSERT_EQ(m.mensagens().size(), 1u);
    EXPECT_TRUE(
        m.mensagens()[0].texto.contains(QLatin1Char('[') + nova.texto() + QLatin1Char(']')));
    EXPECT_TRUE(m.mensagens()[0].texto.contains(
        QDir::toNativeSeparators(caminho(nova.texto().toUtf8().constData()))));
    EXPECT_EQ(m.mensagens()[0].icone, Icone::Informacao);
}

}  // namespace
}  // namespace brasel::app
