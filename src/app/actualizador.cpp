#include "app/actualizador.h"

#include "common/versao.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>
#include <QStringList>

namespace brasel::app {

namespace {

// A version at the start of a name, and what follows it ("" or ".<anything>").
struct VersaoNoNome {
    Versao versao;
    QString resto;
};

std::optional<VersaoNoNome> versaoNoNome(const QString& nome) {
    static const QRegularExpression junta(QStringLiteral("^(\\d{4})(\\d{4})(\\d{4})(\\..*)?$"));
    static const QRegularExpression pontos(
        QStringLiteral("^(\\d{1,4})\\.(\\d{1,4})\\.(\\d{1,4})(\\..*)?$"));
    for (const QRegularExpression* re : {&junta, &pontos}) {
        const auto m = re->match(nome);
        if (m.hasMatch()) {
            return VersaoNoNome{
                {m.captured(1).toInt(), m.captured(2).toInt(), m.captured(3).toInt()},
                m.captured(4)};
        }
    }
    return std::nullopt;
}

std::optional<Versao> versaoDoFicheiro(const QString& caminho) {
    QFile f(caminho);
    if (!f.open(QIODevice::ReadOnly | QIODevice::Text)) return std::nullopt;
    const QStringList linhas = QString::fromUtf8(f.readAll()).split(QLatin1Char('\n'));
    for (const QString& linha : linhas) {
        if (!linha.trimmed().isEmpty()) return Versao::ler(linha);
    }
    return std::nullopt;
}

}  // namespace

QString Versao::texto() const {
    return QStringLiteral("%1.%2.%3").arg(maior).arg(menor).arg(revisao);
}

Versao Versao::actual() {
    return {versaoMaior(), versaoMenor(), versaoRevisao()};
}

std::optional<Versao> Versao::ler(const QString& texto) {
    const auto v = versaoNoNome(texto.trimmed());
    if (!v || !v->resto.isEmpty()) return std::nullopt;
    return v->versao;
}

std::optional<VersaoDisponivel> VerificaNovasVersoes(const QString& pastaActualizacoes) {
    if (pastaActualizacoes.trimmed().isEmpty()) return std::nullopt;
    const QDir pasta(pastaActualizacoes);
    std::optional<VersaoDisponivel> melhor;
    const auto considerar = [&melhor](const Versao& v, const QString& caminho) {
        if (!melhor || v > melhor->versao) melhor = VersaoDisponivel{v, caminho};
    };
    const auto entradas =
        pasta.entryInfoList(QDir::Files | QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    for (const QFileInfo& e : entradas) {
        if (e.isFile() &&
            e.fileName().compare(QLatin1String("versao.txt"), Qt::CaseInsensitive) == 0) {
            if (auto v = versaoDoFicheiro(e.filePath())) considerar(*v, pasta.absolutePath());
        } else if (const auto v = versaoNoNome(e.fileName())) {
            considerar(v->versao, e.absoluteFilePath());
        }
    }
    return melhor;
}

QString legendaVersoes(const std::optional<VersaoDisponivel>& nova) {
    const Versao mostrada = nova ? nova->versao : Versao::actual();
    return QStringLiteral("Versão Actual [") + Versao::actual().texto() +
           QStringLiteral("]    Versão já disponível na Internet [") + mostrada.texto() +
           QLatin1Char(']');
}

bool ProcessaActualizacoes(const QString& pastaActualizacoes, MessagePort& mensagens) {
    const auto nova = VerificaNovasVersoes(pastaActualizacoes);
    if (!nova || nova->versao <= Versao::actual()) return false;
    mensagens.mensagem(QStringLiteral("Está disponível a versão [") + nova->versao.texto() +
                           QStringLiteral("] do aplicativo em:\r\n") +
                           QDir::toNativeSeparators(nova->caminho),
                       Icone::Informacao);
    return true;
}

}  // namespace brasel::app
