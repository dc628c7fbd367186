#include "devices/balanca_d70.h"

#include "devices/caracteres_controlo.h"

namespace brasel::devices {

namespace {

using controlo::CR;

bool respostaCompleta(const QByteArray& r) {
    return r.contains(CR);
}

}  // namespace

std::optional<QString> erroEstadoD70(const QByteArray& resposta, int coluna) {
    const QByteArray codigo = resposta.mid(coluna - 1, 4);
    if (codigo.startsWith("??")) return QStringLiteral("Erro de comunicação com a Balança");
    if (codigo == "B300") return QStringLiteral("Balança sem peso definido");
    if (codigo == "2100") return QStringLiteral("Balança Instável");
    if (codigo == "2500") return QStringLiteral("Excedeu a carga máxima permitida");
    return std::nullopt;
}

std::optional<Currency> pesoD70(const QByteArray& resposta) {
    if (!resposta.startsWith('$')) return std::nullopt;
    return Currency::parse(QString::fromLatin1(resposta.mid(1, 9)).trimmed());
}

bool clsD70::Pesagem(Currency, Currency, double segundos) {
    pergunta(QByteArrayLiteral("EX\r"), segundos, respostaCompleta);
    if (auto erro =
            erroEstadoD70(pergunta(QByteArrayLiteral("XZ\r"), segundos, respostaCompleta), 1)) {
        return falha(*erro);
    }
    const QByteArray leitura = pergunta(QByteArrayLiteral("Xn\r"), segundos, respostaCompleta);
    if (auto erro = erroEstadoD70(leitura, 25)) return falha(*erro);
    const auto peso = pesoD70(leitura);
    if (!peso) return falha(QString::fromUtf8(kErroSemCaptura));
    if (*peso < Currency()) return falha(QStringLiteral("Peso não permitido (Valor Negativo)"));
    if (peso->isZero()) return falha(QStringLiteral("Balança sem peso definido"));
    peso_ = *peso;
    return true;
}

bool clsD70::falha(const QString& erro) {
    peso_ = Currency();
    erro_ = erro;
    return false;
}

}  // namespace brasel::devices
