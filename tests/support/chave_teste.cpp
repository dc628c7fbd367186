#include "support/chave_teste.h"

#include "documents/chave_assinatura.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>

#include <memory>
#include <stdexcept>

namespace brasel::testing {

namespace {

QString pastaChave() {
    static const std::unique_ptr<QTemporaryDir> pasta = [] {
        auto p = std::make_unique<QTemporaryDir>();
        QString erro;
        if (!p->isValid() ||
            !documents::GeraChave(QDir(p->path()).filePath(QStringLiteral("chave.key")), &erro)) {
            throw std::runtime_error("Sem chave de teste: " + erro.toStdString());
        }
        return p;
    }();
    return pasta->path();
}

bool escreve(const QString& caminho, const QByteArray& dados) {
    QFile f(caminho);
    return f.open(QIODevice::WriteOnly) && f.write(dados) == dados.size();
}

}  // namespace

QString ficheiroChaveTeste() {
    return QDir(pastaChave()).filePath(QStringLiteral("chave.key"));
}

QString ficheiroChavePublicaTeste() {
    return documents::ficheiroPemPublico(ficheiroChaveTeste());
}

void usaChaveTeste(app::Estado& estado) {
    estado.config.ficheiroChave = ficheiroChaveTeste();
    estado.config.numeroCertificado = QStringLiteral("0000");
}

std::optional<bool> confereComOpenssl(const QString& texto, const QString& assinatura) {
    const QString openssl = QStandardPaths::findExecutable(QStringLiteral("openssl"));
    if (openssl.isEmpty()) return std::nullopt;
    QTemporaryDir pasta;
    const QString ficheiroTexto = QDir(pasta.path()).filePath(QStringLiteral("texto.txt"));
    const QString ficheiroAssinatura = QDir(pasta.path()).filePath(QStringLiteral("sig.bin"));
    if (!pasta.isValid() || !escreve(ficheiroTexto, texto.toUtf8()) ||
        !escreve(ficheiroAssinatura, QByteArray::fromBase64(assinatura.toLatin1()))) {
        return false;
    }
    QProcess p;
    p.start(openssl, {QStringLiteral("dgst"), QStringLiteral("-sha1"), QStringLiteral("-verify"),
                      ficheiroChavePublicaTeste(), QStringLiteral("-signature"), ficheiroAssinatura,
                      ficheiroTexto});
    if (!p.waitForFinished(30000)) return false;
    return p.exitStatus() == QProcess::NormalExit && p.exitCode() == 0 &&
           p.readAllStandardOutput().contains("Verified OK");
}

}  // namespace brasel::testing
