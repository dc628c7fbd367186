#include "app/instancia_unica.h"
#include "common/settings_store.h"
#include "support/apoio_arranque.h"
#include "support/mensagens_gravadas.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QProcessEnvironment>
#include <QSysInfo>

#include <gtest/gtest.h>

namespace brasel::app {
namespace {

const QString kMensagem = QStringLiteral("Só pode iniciar uma instância da aplicação de cada vez!");
constexpr char kVariavelFilho[] = "BRASEL_TESTE_SEGUNDA_INSTANCIA";

void esperarRecusa(const testing::MensagensGravadas& m) {
    ASSERT_EQ(m.mensagens().size(), 1u);
    EXPECT_EQ(m.mensagens()[0].texto, kMensagem);
    EXPECT_EQ(m.mensagens()[0].icone, Icone::Critico);
}

TEST(InstanciaUnica, SegundaNoMesmoPostoERecusada) {
    testing::DefinicoesTemporarias pasta;
    testing::MensagensGravadas m;
    {
        InstanciaUnica primeira;
        ASSERT_TRUE(primeira.adquirir(m));
        InstanciaUnica segunda;
        EXPECT_FALSE(segunda.adquirir(m));
        esperarRecusa(m);
    }
    // Once the first one ends, the program starts again.
    m.limpar();
    InstanciaUnica depois;
    EXPECT_TRUE(depois.adquirir(m));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

TEST(InstanciaUnica, PostosComPastasProprias) {
    testing::MensagensGravadas m;
    testing::DefinicoesTemporarias posto1;
    InstanciaUnica primeira;
    ASSERT_TRUE(primeira.adquirir(m));
    testing::DefinicoesTemporarias posto2;
    InstanciaUnica outroPosto;
    EXPECT_TRUE(outroPosto.adquirir(m));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

// A program that crashed leaves its lock file behind; that must not lock the workstation out.
TEST(InstanciaUnica, LockDeUmProcessoMortoETomado) {
    testing::DefinicoesTemporarias pasta;
    QProcess morto;
    morto.start(QStringLiteral("true"), {});
    ASSERT_TRUE(morto.waitForStarted());
    const qint64 pid = morto.processId();
    ASSERT_TRUE(morto.waitForFinished());

    QFile lock(QDir(pasta.pasta()).filePath(QStringLiteral("brasel.lock")));
    ASSERT_TRUE(lock.open(QIODevice::WriteOnly));
    lock.write(QByteArray::number(pid) + "\nbrasel\n" + QSysInfo::machineHostName().toUtf8() +
               "\n");
    lock.close();

    testing::MensagensGravadas m;
    InstanciaUnica instancia;
    EXPECT_TRUE(instancia.adquirir(m));
    EXPECT_TRUE(m.mensagens().isEmpty());
}

// The second process of the pair below: refused, and it leaves no settings behind.
TEST(InstanciaUnicaFilho, SegundoProcesso) {
    if (!qEnvironmentVariableIsSet(kVariavelFilho)) {
        GTEST_SKIP() << "corre apenas como segundo processo de SegundoProcessoERecusado";
    }
    testing::MensagensGravadas m;
    InstanciaUnica instancia;
    EXPECT_FALSE(instancia.adquirir(m));
    esperarRecusa(m);
    EXPECT_EQ(QDir(pastaDefinicoes()).entryList(QDir::Files | QDir::Hidden),
              QStringList{QStringLiteral("brasel.lock")});
}

TEST(InstanciaUnica, SegundoProcessoERecusado) {
    testing::DefinicoesTemporarias pasta;
    testing::MensagensGravadas m;
    InstanciaUnica primeira;
    ASSERT_TRUE(primeira.adquirir(m));

    QProcess filho;
    QProcessEnvironment ambiente = QProcessEnvironment::systemEnvironment();
    ambiente.insert(QString::fromLatin1(kVariavelFilho), QStringLiteral("1"));
    filho.setProcessEnvironment(ambiente);
    filho.setProcessChannelMode(QProcess::MergedChannels);
    filho.start(QFileInfo(QStringLiteral("/proc/self/exe")).symLinkTarget(),
                {QStringLiteral("--gtest_filter=InstanciaUnicaFilho.SegundoProcesso")});
    ASSERT_TRUE(filho.waitForFinished(30000));
    const QString saida = QString::fromUtf8(filho.readAll());
    EXPECT_EQ(filho.exitCode(), 0) << saida.toStdString();
    EXPECT_TRUE(saida.contains(QStringLiteral("[  PASSED  ] 1 test"))) << saida.toStdString();
}

}  // namespace
}  // namespace brasel::app
