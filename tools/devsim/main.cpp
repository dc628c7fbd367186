// devsim: plays the workstation's serial devices on pseudo-terminals, so that Brasel's bytes go
// through the real serial path and a person (or a test) reads what each device understood.
//
//   devsim --pasta DIR [--servidor S --empresa CCCC --login L --password P]
//          [--impressora COMn[:CODIGO]] [--display COMn] [--cs300 COMn[:opções]]
//          [--d70 COMn[:opções]]
//
// Each device gets the link DIR/COMn to its terminal and DIR/portas.cfg maps COMn to it (point
// line 4 of Config.cfg there). With a company, the printer decodes the codes of its ImpTaloes
// row; otherwise those of a common ESC/POS printer. Transcripts go to DIR/COMn.txt as they change.
#include "balancas.h"
#include "display.h"
#include "impressora.h"
#include "servidor_dispositivo.h"

#include "db/connections.h"
#include "devices/definicao_impressora.h"

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QTextStream>
#include <QTimer>

#include <csignal>
#include <cstdio>
#include <memory>
#include <vector>

namespace {

using namespace devsim;

// The codes of a common ESC/POS printer set to code page 860.
brasel::devices::CodigosImpressora codigosEscPos() {
    brasel::devices::CodigosImpressora c;
    c.abrirCaixa = QByteArrayLiteral("\x1Bp\x00\x19\xFA");
    c.feedNLines = QByteArrayLiteral(
        "\x1B"
        "d");
    c.smallOn = QByteArrayLiteral("\x1B!\x01");
    c.mediumOn = QByteArrayLiteral("\x1B!\x10");
    c.largeOn = QByteArrayLiteral("\x1B!\x30");
    c.largeOff = QByteArrayLiteral("\x1B!\x00");
    c.corte = QByteArrayLiteral("\x1DVB\x00");
    c.cor0 = QByteArrayLiteral("\x1Br\x00");
    c.cor1 = QByteArrayLiteral("\x1Br\x01");
    c.reset = QByteArrayLiteral("\x1B@");
    c.internacional = QByteArrayLiteral("\x1Bt\x03");
    return c;
}

struct Ligado {
    QString porta;  // "COM1"
    std::unique_ptr<ServidorDispositivo> servidor;
    QString ultima;
};

void terminar(int) {
    QCoreApplication::quit();
}

}  // namespace

int main(int argc, char** argv) {
    QCoreApplication app(argc, argv);
    QCommandLineParser p;
    p.setApplicationDescription(
        QStringLiteral("Dispositivos simulados do Brasel em pseudo-terminais."));
    p.addHelpOption();
    const QCommandLineOption pasta(QStringLiteral("pasta"),
                                   QStringLiteral("Pasta das ligações e transcrições."),
                                   QStringLiteral("DIR"));
    const QCommandLineOption servidor(QStringLiteral("servidor"),
                                      QStringLiteral("Servidor da empresa."), QStringLiteral("S"));
    const QCommandLineOption empresa(QStringLiteral("empresa"),
                                     QStringLiteral("Código da empresa."), QStringLiteral("CCCC"));
    const QCommandLineOption login(QStringLiteral("login"), QStringLiteral("Login."),
                                   QStringLiteral("L"));
    const QCommandLineOption password(QStringLiteral("password"), QStringLiteral("Password."),
                                      QStringLiteral("P"));
    const QCommandLineOption impressora(
        QStringLiteral("impressora"),
        QStringLiteral("Impressora de talões: COMn[:código ImpTaloes]."), QStringLiteral("COMn"));
    const QCommandLineOption display(QStringLiteral("display"),
                                     QStringLiteral("Mostrador de cliente: COMn."),
                                     QStringLiteral("COMn"));
    const QCommandLineOption cs300(
        QStringLiteral("cs300"),
        QStringLiteral("Balança de preço: COMn[:peso=1.250,preco=15.63,...]."),
        QStringLiteral("COMn"));
    const QCommandLineOption d70(QStringLiteral("d70"),
                                 QStringLiteral("Indicador de peso: COMn[:opções]."),
                                 QStringLiteral("COMn"));
    for (const auto& o :
         {pasta, servidor, empresa, login, password, impressora, display, cs300, d70})
        p.addOption(o);
    p.process(app);

    QTextStream erros(stderr);
    if (!p.isSet(pasta)) {
        erros << "Falta --pasta.\n" << p.helpText();
        return 2;
    }
    const QDir dir(p.value(pasta));
    QDir().mkpath(dir.path());

    std::vector<Ligado> dispositivos;
    auto junta = [&](const QString& valor, std::shared_ptr<devsim::Dispositivo> d) {
        const QString porta = valor.section(QLatin1Char(':'), 0, 0).toUpper();
        dispositivos.push_back(
            {porta, std::make_unique<ServidorDispositivo>(d, dir.filePath(porta)), {}});
    };
    if (p.isSet(impressora)) {
        const QString valor = p.value(impressora);
        brasel::devices::CodigosImpressora codigos = codigosEscPos();
        const QString codigo = valor.section(QLatin1Char(':'), 1);
        if (!codigo.isEmpty() && p.isSet(servidor)) {
            brasel::db::Connection conn;
            QString pw = p.value(password);
            if (!brasel::db::Abre_Connexao(conn, p.value(servidor),
                                           QStringLiteral("Vendrola") + p.value(empresa),
                                           p.value(login), pw, {}, QStringLiteral("SQL"), 30, 10)) {
                erros << "Não foi possível abrir a empresa: " << conn.lastError() << "\n";
                return 1;
            }
            const auto definicao = brasel::devices::LerDefinicaoImpressora(conn, codigo);
            if (!definicao) {
                erros << "A impressora " << codigo << " não existe na empresa.\n";
                return 1;
            }
            codigos = definicao->codigos;
        }
        junta(valor, std::make_shared<ImpressoraTalao>(codigos));
    }
    if (p.isSet(display)) junta(p.value(display), std::make_shared<Display>());
    for (const auto& [opcao, d70Indicador] : {std::pair{cs300, false}, std::pair{d70, true}}) {
        if (!p.isSet(opcao)) continue;
        const auto situacao =
            SituacaoBalanca::deOpcoes(p.value(opcao).section(QLatin1Char(':'), 1));
        if (!situacao) {
            erros << "Opções de balança inválidas: " << p.value(opcao) << "\n";
            return 2;
        }
        if (d70Indicador) {
            junta(p.value(opcao), std::make_shared<IndicadorD70>(*situacao));
        } else {
            junta(p.value(opcao), std::make_shared<BalancaCS300>(*situacao));
        }
    }
    if (dispositivos.empty()) {
        erros << "Nenhum dispositivo pedido.\n" << p.helpText();
        return 2;
    }

    QFile mapa(dir.filePath(QStringLiteral("portas.cfg")));
    if (!mapa.open(QIODevice::WriteOnly | QIODevice::Truncate)) {
        erros << "Não foi possível escrever " << mapa.fileName() << "\n";
        return 1;
    }
    QTextStream saida(stdout);
    for (Ligado& d : dispositivos) {
        if (!d.servidor->iniciar()) {
            erros << "Não foi possível abrir um pseudo-terminal para " << d.porta << "\n";
            return 1;
        }
        mapa.write(
            (d.porta + QLatin1Char('=') + d.servidor->caminho() + QLatin1Char('\n')).toUtf8());
        saida << d.porta << " -> " << d.servidor->caminho() << Qt::endl;
    }
    mapa.close();

    // The transcripts are written out whenever they change.
    QTimer relogio;
    QObject::connect(&relogio, &QTimer::timeout, [&] {
        for (Ligado& d : dispositivos) {
            const QString agora = d.servidor->transcricao();
            if (agora == d.ultima) continue;
            saida << "--- " << d.porta << " ---\n"
                  << agora.mid(agora.startsWith(d.ultima) ? d.ultima.size() : 0) << Qt::endl;
            d.ultima = agora;
            QFile f(dir.filePath(d.porta + QStringLiteral(".txt")));
            if (f.open(QIODevice::WriteOnly | QIODevice::Truncate)) f.write(agora.toUtf8());
        }
    });
    relogio.start(200);
    std::signal(SIGINT, terminar);
    std::signal(SIGTERM, terminar);
    return app.exec();
}
