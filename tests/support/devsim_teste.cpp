#include "support/devsim_teste.h"

#include <QDir>
#include <QFile>

#include <stdexcept>

namespace brasel::testing {

namespace {

// Every port of the test is mapped into its folder, so a port with no device playing is a path
// that does not exist, never a real serial port of the machine.
constexpr int kPortasMapeadas = 16;

void escreve(const QString& caminho, const QString& texto) {
    QFile f(caminho);
    if (!f.open(QIODevice::WriteOnly | QIODevice::Truncate) || f.write(texto.toUtf8()) < 0)
        throw std::runtime_error("Não foi possível escrever " + caminho.toStdString());
}

}  // namespace

DevsimTeste::DevsimTeste() {
    if (!pasta_.isValid()) throw std::runtime_error("Sem pasta temporária para os dispositivos");
    escreveMapa();
    const QDir dir(pasta_.path());
    escreve(configCfg(), dir.path() + QStringLiteral("\n") +
                             dir.filePath(QStringLiteral("chave.txt")) +
                             QStringLiteral("\n0000/AT\n") + ficheiroMapa() + QStringLiteral("\n") +
                             dir.path() + QStringLiteral("\n"));
}

DevsimTeste::~DevsimTeste() = default;

devsim::ServidorDispositivo& DevsimTeste::liga(int porta,
                                               std::shared_ptr<devsim::Dispositivo> dispositivo) {
    servidores_.erase(porta);
    auto servidor =
        std::make_unique<devsim::ServidorDispositivo>(std::move(dispositivo), caminho(porta));
    if (!servidor->activo()) throw std::runtime_error("Sem terminal para o dispositivo");
    return *servidores_.insert_or_assign(porta, std::move(servidor)).first->second;
}

QString DevsimTeste::caminho(int porta) const {
    return QDir(pasta_.path()).filePath(QStringLiteral("COM%1").arg(porta));
}

QString DevsimTeste::ficheiroMapa() const {
    return QDir(pasta_.path()).filePath(QStringLiteral("portas.txt"));
}

QString DevsimTeste::configCfg() const {
    return QDir(pasta_.path()).filePath(QStringLiteral("Config.cfg"));
}

void DevsimTeste::escreveMapa() const {
    QString linhas;
    for (int porta = 1; porta <= kPortasMapeadas; ++porta)
        linhas += QStringLiteral("COM%1=%2\n").arg(porta).arg(caminho(porta));
    escreve(ficheiroMapa(), linhas);
}

}  // namespace brasel::testing
