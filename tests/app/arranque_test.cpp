#include "app/arranque.h"
#include "common/versao.h"
#include "support/apoio_arranque.h"

#include <QDir>
#include <QFile>
#include <QLocale>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <clocale>
#include <cstdio>
#include <optional>

namespace brasel::app {
namespace {

TEST(LeLinhaComando, ProtocoloDoActualizador) {
    struct Caso {
        const char* linha;
        AccaoLinhaComando accao;
        const char* servidor;  // expected after the call; every case starts from "antes"
        const char* login;
        const char* password;
    };
    const Caso casos[] = {
        {"<@>ACT_CHK<@>srv<@>7<@>ana<@>pw<@>x", AccaoLinhaComando::Terminar, "srv", "ana", "pw"},
        {"  <@>act_chk  ", AccaoLinhaComando::Terminar, "antes", "antes", "antes"},
        {"<@>ABRIR<@>/srv/dados<@>abc<@>ana", AccaoLinhaComando::Continuar, "/srv/dados", "ana",
         "antes"},
        {"<@>ABRIR<@>srv", AccaoLinhaComando::Continuar, "srv", "antes", "antes"},
        {"<@>ABRIR<@><@><@><@>", AccaoLinhaComando::Continuar, "", "", ""},
        {"ACT_CHK<@>srv<@>7<@>ana<@>pw", AccaoLinhaComando::Continuar, "antes", "antes", "antes"},
        {"x <@>ACT_CHK", AccaoLinhaComando::Continuar, "antes", "antes", "antes"},
        {"", AccaoLinhaComando::Continuar, "antes", "antes", "antes"},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.linha);
        QTemporaryDir pasta;
        Estado estado;
        estado.gServidor = estado.gLogin = estado.gPassword = QStringLiteral("antes");
        EXPECT_EQ(LeLinhaComando(QString::fromUtf8(c.linha), estado, pasta.path()), c.accao);
        EXPECT_EQ(estado.gServidor, QString::fromUtf8(c.servidor));
        EXPECT_EQ(estado.gLogin, QString::fromUtf8(c.login));
        EXPECT_EQ(estado.gPassword, QString::fromUtf8(c.password));

        // Only ACT_CHK leaves a file, and only the version file.
        const QStringList ficheiros = QDir(pasta.path()).entryList(QDir::Files);
        if (c.accao == AccaoLinhaComando::Terminar) {
            ASSERT_EQ(ficheiros, QStringList{versaoTexto12() + QStringLiteral(".txt")});
            EXPECT_EQ(QFile(QDir(pasta.path()).filePath(ficheiros[0])).size(), 0);
        } else {
            EXPECT_TRUE(ficheiros.isEmpty());
        }
    }
}

TEST(LeLinhaComando, NomeDoFicheiroDaVersao) {
    EXPECT_EQ(versaoTexto12(1, 0, 0) + QStringLiteral(".txt"), QStringLiteral("000100000000.txt"));
}

TEST(LerArgumentos, ConfigSeparadaDaLinhaDoActualizador) {
    struct Caso {
        QStringList argumentos;
        const char* linha;
        const char* config;
    };
    const Caso casos[] = {
        {{QStringLiteral("brasel")}, "", ""},
        {{QStringLiteral("brasel"), QStringLiteral("--config"), QStringLiteral("/etc/C.cfg")},
         "",
         "/etc/C.cfg"},
        {{QStringLiteral("brasel"), QStringLiteral("--config=/x/C.cfg"),
          QStringLiteral("<@>ACT_CHK<@>a")},
         "<@>ACT_CHK<@>a",
         "/x/C.cfg"},
        {{QStringLiteral("brasel"), QStringLiteral("<@>ABRIR<@>Servidor"), QStringLiteral("Um<@>0"),
          QStringLiteral("--config"), QStringLiteral("c.cfg")},
         "<@>ABRIR<@>Servidor Um<@>0",
         "c.cfg"},
        {{QStringLiteral("brasel"), QStringLiteral("--config")}, "--config", ""},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.argumentos.join(QLatin1Char('|')).toStdString());
        const ArgumentosPrograma a = lerArgumentos(c.argumentos);
        EXPECT_EQ(a.linhaComando, QString::fromUtf8(c.linha));
        EXPECT_EQ(a.config, QString::fromUtf8(c.config));
    }
}

TEST(EstadoInicial, MesesESimbolo) {
    Estado estado;
    estado.gSimbolo.clear();
    preencheEstadoInicial(estado);
    EXPECT_EQ(estado.gMeses[0], QString());
    EXPECT_EQ(estado.gMeses[1], QStringLiteral("Janeiro"));
    EXPECT_EQ(estado.gMeses[3], QStringLiteral("Março"));
    EXPECT_EQ(estado.gMeses[8], QStringLiteral("Agosto"));
    EXPECT_EQ(estado.gMeses[12], QStringLiteral("Dezembro"));
    EXPECT_EQ(estado.gSimbolo, QStringLiteral("%"));
}

TEST(GetUID, FormatoDoRegisto) {
    static const QRegularExpression formato(
        QStringLiteral("^\\{[0-9A-F]{8}-[0-9A-F]{4}-[0-9A-F]{4}-[0-9A-F]{4}-[0-9A-F]{12}\\}$"));
    const QString a = GetUID();
    const QString b = GetUID();
    EXPECT_EQ(a.size(), 38);
    EXPECT_TRUE(formato.match(a).hasMatch()) << a.toStdString();
    EXPECT_NE(a, b);
}

TEST(SessaoRemota, ClienteEUtilizador) {
    struct Caso {
        const char* nome;
        QByteArray sshClient;
        QByteArray sshConnection;
        QByteArray user;
        const char* cliente;
        const char* utilizador;
    };
    const Caso casos[] = {
        {"ssh", "10.1.2.3 51234 22", QByteArray(), "ana", "10.1.2.3", "ana"},
        {"so SSH_CONNECTION", QByteArray(), "fe80::1 40000 fe80::2 22", "rui", "fe80::1", "rui"},
        {"local", QByteArray(), QByteArray(), "ana", "", ""},
        {"variavel vazia", "  ", QByteArray(), "ana", "", ""},
    };
    for (const Caso& c : casos) {
        SCOPED_TRACE(c.nome);
        testing::VariavelAmbiente a("SSH_CLIENT", c.sshClient);
        testing::VariavelAmbiente b("SSH_CONNECTION", c.sshConnection);
        testing::VariavelAmbiente u("USER", c.user);
        EXPECT_EQ(WTS_NomeCliente(), QString::fromUtf8(c.cliente));
        EXPECT_EQ(WTS_NomeUtilizador(), QString::fromUtf8(c.utilizador));
    }
}

// A workstation set up in Portuguese writes "1,5": the program's own numbers must still use ".".
TEST(FormatoNumeros, PontoDecimalComLocalePortugues) {
    const QLocale anterior;
    testing::VariavelAmbiente lcAll("LC_ALL", "pt_PT.UTF-8");
    QLocale::setDefault(QLocale(QLocale::Portuguese, QLocale::Portugal));
    ASSERT_EQ(QLocale().toString(1.5), QStringLiteral("1,5"));
    // Where the system has the Portuguese locale, the C library adopts it too.
    const bool temPortugues = std::setlocale(LC_NUMERIC, "pt_PT.UTF-8") != nullptr;

    forcarFormatoNumeros();

    EXPECT_EQ(QLocale().toString(1234.5, 'f', 2), QStringLiteral("1234.50"));
    EXPECT_EQ(QLocale().decimalPoint(), QStringLiteral("."));
    EXPECT_EQ(QLocale().groupSeparator(), QStringLiteral(","));
    bool ok = false;
    EXPECT_DOUBLE_EQ(QLocale().toDouble(QStringLiteral("1,234.5"), &ok), 1234.5);
    EXPECT_TRUE(ok);
    char texto[32];
    std::snprintf(texto, sizeof texto, "%.2f", 1.5);
    EXPECT_STREQ(texto, "1.50") << "locale portugues instalado: " << temPortugues;
    EXPECT_EQ(std::localeconv()->decimal_point[0], '.');
    QLocale::setDefault(anterior);
}

}  // namespace
}  // namespace brasel::app
