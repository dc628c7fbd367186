#include "app/instancia_unica.h"

#include "common/settings_store.h"

#include <QDir>

namespace brasel::app {

namespace {

QString pastaDoLock(const QString& pasta) {
    return pasta.isEmpty() ? pastaDefinicoes() : pasta;
}

}  // namespace

InstanciaUnica::InstanciaUnica(const QString& pasta)
    : pasta_(pastaDoLock(pasta)), lock_(QDir(pasta_).filePath(QStringLiteral("brasel.lock"))) {
    // A running instance holds the lock however long it runs: only a dead owner frees it.
    lock_.setStaleLockTime(0);
}

bool InstanciaUnica::adquirir(MessagePort& mensagens) {
    QDir().mkpath(pasta_);
    // Only another holder refuses the start; a folder where no lock can be made does not keep
    // the program from running.
    if (lock_.tryLock(0) || lock_.error() != QLockFile::LockFailedError) return true;
    mensagens.mensagem(QStringLiteral("Só pode iniciar uma instância da aplicação de cada vez!"),
                       Icone::Critico);
    return false;
}

}  // namespace brasel::app
