#include "app/config_cfg.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QStringList>

namespace brasel::app {

namespace {

constexpr int kLinhas = 5;

// A file saved by a Windows editor may start with a byte-order mark.
QString semMarcaOrdem(QString texto) {
    if (texto.startsWith(QChar(0xFEFF))) texto.remove(0, 1);
    return texto;
}

}  // namespace

QString caminhoConfigCfg() {
    return QDir(QCoreApplication::applicationDirPath()).filePath(QStringLiteral("Config.cfg"));
}

LeituraConfig LeConfigCfg(ConfigCfg& config, MessagePort& mensagens, const QString& caminho) {
    QFile ficheiro(caminho.isEmpty() ? caminhoConfigCfg() : caminho);
    if (!ficheiro.exists()) {
        mensagens.mensagem(QStringLiteral("Aplicativo sem as configuração definidas!"),
                           Icone::Critico);
        return LeituraConfig::Terminar;
    }
    QByteArray conteudo;
    if (ficheiro.open(QIODevice::ReadOnly)) conteudo = ficheiro.readAll();
    if (conteudo.isEmpty()) {
        mensagens.mensagem(QStringLiteral("Não foi possível abrir as configuração definidas!"),
                           Icone::Critico);
        return LeituraConfig::Terminar;
    }

    const QStringList linhas = semMarcaOrdem(QString::fromUtf8(conteudo))
                                   .split(QRegularExpression(QStringLiteral("\r?\n")));
    QString* destino[kLinhas] = {&config.pastaDados, &config.ficheiroChave,
                                 &config.numeroCertificado, &config.mapaPortas,
                                 &config.pastaActualizacoes};
    bool completa = true;
    for (int i = 0; i < kLinhas; ++i) {
        *destino[i] = linhas.value(i).trimmed();
        completa = completa && !destino[i]->isEmpty();
    }
    if (!completa) {
        mensagens.mensagem(QStringLiteral("Não tem as configurações bem definidas!"),
                           Icone::Critico);
        return LeituraConfig::Incompleta;
    }
    return LeituraConfig::Ok;
}

QString TextoAte(const QString& texto, QChar c) {
    const qsizetype i = texto.indexOf(c);
    return i < 0 ? texto : texto.left(i);
}

MapaPortas MapaPortas::ler(const QString& ficheiro) {
    MapaPortas mapa;
    if (ficheiro.isEmpty()) return mapa;
    QFile f(ficheiro);
    if (!f.open(QIODevice::ReadOnly | QIODevice::Text)) return mapa;
    static const QRegularExpression linhaPorta(QStringLiteral("^\\s*COM(\\d+)\\s*=\\s*(.*?)\\s*$"),
                                               QRegularExpression::CaseInsensitiveOption);
    const QStringList linhas = QString::fromUtf8(f.readAll()).split(QLatin1Char('\n'));
    for (const QString& linha : linhas) {
        const auto m = linhaPorta.match(linha);
        bool ok = false;
        const int porta = m.captured(1).toInt(&ok);
        if (m.hasMatch() && ok && porta >= 1 && !m.captured(2).isEmpty()) {
            mapa.portas_.insert(porta, m.captured(2));
        }
    }
    return mapa;
}

QString MapaPortas::dispositivo(int porta) const {
    if (porta < 1) return {};
    return portas_.value(porta, QStringLiteral("/dev/ttyS") + QString::number(porta - 1));
}

}  // namespace brasel::app
