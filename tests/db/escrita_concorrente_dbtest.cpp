// Two workstations writing the same embedded company at once: one waits for the other, none
// fails, no number is taken twice.
#include "db/connections.h"
#include "db/master_logins.h"
#include "db/query_helpers.h"

#include <QCoreApplication>
#include <QProcess>
#include <QProcessEnvironment>
#include <QTemporaryDir>
#include <QThread>

#include <gtest/gtest.h>
#include "support/impressao_qt.h"

namespace brasel::db {
namespace {

constexpr int kEscritasPorProcesso = 60;

void preparaSessao(Sessao& sessao, const QString& pasta) {
    sessao.gServidor = pasta;
    sessao.gEmpresa = QStringLiteral("0001");
    sessao.gLogin = QStringLiteral("posto");
    sessao.gPassword = QStringLiteral("pw");
    sessao.gAutenticacao = QStringLiteral("SQL");
}

// Run only as a child of EscritaConcorrente.DoisProcessos.
TEST(EscritaConcorrente, Posto) {
    const QString pasta = qEnvironmentVariable("BRASEL_TESTE_PASTA_CONCORRENTE");
    if (pasta.isEmpty()) GTEST_SKIP() << "só corre como processo filho";
    Sessao sessao;
    preparaSessao(sessao, pasta);
    ASSERT_TRUE(Abre_Connexao_Local(sessao, sessao.gConn, 0, 60));
    for (int i = 0; i < kEscritasPorProcesso; ++i) {
        WriteTransaction tx(sessao.gConn);
        ASSERT_TRUE(tx.active()) << sessao.gConn.lastError().toStdString();
        const auto linha =
            primeiraLinha(sessao.gConn, QStringLiteral("select coalesce(max(n),0) from Numeros"));
        ASSERT_TRUE(linha);
        const int proximo = linha->value(0).toInt() + 1;
        QThread::usleep(300);  // hold the lock long enough for the other writer to queue
        ASSERT_TRUE(sessao.gConn.exec(QStringLiteral("insert into Numeros (n, posto) values (?,?)"),
                                      {proximo, QCoreApplication::applicationPid()}));
        ASSERT_TRUE(tx.commit()) << sessao.gConn.lastError().toStdString();
    }
}

TEST(EscritaConcorrente, DoisProcessos) {
    QTemporaryDir pasta;
    ASSERT_TRUE(
        MasterLogins(pasta.path()).criar(QStringLiteral("posto"), QStringLiteral("pw"), false));
    {
        ConnectionParams p;
        p.server = *ServerAddress::parse(pasta.path());
        p.baseDados = QStringLiteral("Vendrola0001");
        p.criar = true;
        Connection c;
        ASSERT_TRUE(c.open(p));
        ASSERT_TRUE(
            c.exec(QStringLiteral("create table Numeros (n INTEGER UNIQUE, posto INTEGER)")));
    }
    QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
    env.insert(QStringLiteral("BRASEL_TESTE_PASTA_CONCORRENTE"), pasta.path());
    QProcess postos[2];
    for (QProcess& posto : postos) {
        posto.setProcessEnvironment(env);
        posto.setProcessChannelMode(QProcess::MergedChannels);
        posto.start(QStringLiteral("/proc/self/exe"),
                    {QStringLiteral("--gtest_filter=EscritaConcorrente.Posto")});
    }
    for (QProcess& posto : postos) {
        ASSERT_TRUE(posto.waitForFinished(120000));
        EXPECT_EQ(posto.exitCode(), 0) << posto.readAll().toStdString();
    }
    Sessao sessao;
    preparaSessao(sessao, pasta.path());
    ASSERT_TRUE(Abre_Connexao_Local(sessao, sessao.gConn, 0, 60));
    const auto linha =
        primeiraLinha(sessao.gConn, QStringLiteral("select count(*), count(distinct n), min(n), "
                                                   "max(n), count(distinct posto) from Numeros"));
    ASSERT_TRUE(linha);
    EXPECT_EQ(linha->value(0).toInt(), 2 * kEscritasPorProcesso);
    EXPECT_EQ(linha->value(1).toInt(), 2 * kEscritasPorProcesso);
    EXPECT_EQ(linha->value(2).toInt(), 1);
    EXPECT_EQ(linha->value(3).toInt(), 2 * kEscritasPorProcesso);
    EXPECT_EQ(linha->value(4).toInt(), 2);
}

}  // namespace
}  // namespace brasel::db
