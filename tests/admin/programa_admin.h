#pragma once

#include <QDir>
#include <QFileInfo>
#include <QProcess>
#include <QString>
#include <QStringList>

namespace brasel::admin {

struct Resultado {
    int codigo = -1;
    QString saida;
    QString erros;
};

// The brasel-admin built beside the tests (build/src next to build/tests), unless BRASEL_ADMIN
// says where it is.
inline QString programaAdmin() {
    const QString indicado = qEnvironmentVariable("BRASEL_ADMIN");
    if (!indicado.isEmpty()) return indicado;
    const QDir testes(QFileInfo(QStringLiteral("/proc/self/exe")).canonicalPath());
    return testes.filePath(QStringLiteral("../src/brasel-admin"));
}

// Runs brasel-admin with the arguments and waits for it.
inline Resultado correrAdmin(const QStringList& argumentos) {
    QProcess processo;
    processo.start(programaAdmin(), argumentos);
    Resultado r;
    if (!processo.waitForFinished(120000)) {
        r.erros = processo.errorString();
        return r;
    }
    r.codigo = processo.exitStatus() == QProcess::NormalExit ? processo.exitCode() : -1;
    r.saida = QString::fromUtf8(processo.readAllStandardOutput());
    r.erros = QString::fromUtf8(processo.readAllStandardError());
    return r;
}

}  // namespace brasel::admin
