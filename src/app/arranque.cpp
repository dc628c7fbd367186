#include "app/arranque.h"

#include "app/config_cfg.h"
#include "common/versao.h"

#include <QDir>
#include <QFile>
#include <QLocale>
#include <QUuid>

#include <clocale>
#include <iterator>

namespace brasel::app {

namespace {

const QString kSeparador = QStringLiteral("<@>");
const QString kOpcaoConfig = QStringLiteral("--config");

}  // namespace

ArgumentosPrograma lerArgumentos(const QStringList& argumentos) {
    ArgumentosPrograma r;
    QStringList resto;
    for (qsizetype i = 1; i < argumentos.size(); ++i) {
        const QString& a = argumentos[i];
        if (a == kOpcaoConfig && i + 1 < argumentos.size()) {
            r.config = argumentos[++i];
        } else if (a.startsWith(kOpcaoConfig + QLatin1Char('='))) {
            r.config = a.mid(kOpcaoConfig.size() + 1);
        } else {
            resto.append(a);
        }
    }
    r.linhaComando = resto.join(QLatin1Char(' '));
    return r;
}

AccaoLinhaComando LeLinhaComando(const QString& linha, Estado& estado,
                                 const QString& pastaPrograma) {
    const QString texto = linha.trimmed();
    if (!texto.startsWith(kSeparador)) return AccaoLinhaComando::Continuar;

    const QStringList campos = texto.mid(kSeparador.size()).split(kSeparador);
    if (campos.size() > 1) estado.gServidor = campos[1];
    if (campos.size() > 3) estado.gLogin = campos[3];
    if (campos.size() > 4) estado.gPassword = campos[4];

    if (campos[0].trimmed().toUpper() != QLatin1String("ACT_CHK")) {
        return AccaoLinhaComando::Continuar;
    }
    // The updater only looks for the file; the process ends whether or not it could be made.
    QFile marca(QDir(pastaPrograma).filePath(versaoTexto12() + QStringLiteral(".txt")));
    if (marca.open(QIODevice::WriteOnly | QIODevice::Truncate)) marca.close();
    return AccaoLinhaComando::Terminar;
}

void forcarFormatoNumeros() {
    QLocale::setDefault(QLocale::c());
    std::setlocale(LC_NUMERIC, "C");
}

void preencheEstadoInicial(Estado& estado) {
    static const char* const kMeses[] = {"Janeiro",  "Fevereiro", "Março",    "Abril",
                                         "Maio",     "Junho",     "Julho",    "Agosto",
                                         "Setembro", "Outubro",   "Novembro", "Dezembro"};
    for (std::size_t i = 0; i < std::size(kMeses); ++i) {
        estado.gMeses[i + 1] = QString::fromUtf8(kMeses[i]);
    }
    estado.gSimbolo = QStringLiteral("%");
}

QString GetUID() {
    return QUuid::createUuid().toString(QUuid::WithBraces).toUpper();
}

QString WTS_NomeCliente() {
    for (const char* variavel : {"SSH_CLIENT", "SSH_CONNECTION"}) {
        const QString valor = qEnvironmentVariable(variavel).trimmed();
        if (!valor.isEmpty()) return TextoAte(valor, QLatin1Char(' '));
    }
    return {};
}

QString WTS_NomeUtilizador() {
    if (WTS_NomeCliente().isEmpty()) return {};
    for (const char* variavel : {"USER", "LOGNAME", "USERNAME"}) {
        const QString valor = qEnvironmentVariable(variavel).trimmed();
        if (!valor.isEmpty()) return valor;
    }
    return {};
}

}  // namespace brasel::app
