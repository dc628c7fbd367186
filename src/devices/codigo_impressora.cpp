#include "devices/codigo_impressora.h"

namespace brasel::devices {

namespace {

constexpr int kPosicoesVistas = 100;
constexpr int kCamposCodigo = 6;

}  // namespace

QString ExtraiCodigo(int n, const QString& texto) {
    QString digitos;
    int campo = 1;
    const qsizetype fim = std::min<qsizetype>(texto.size(), kPosicoesVistas);
    for (qsizetype i = 0; i < fim; ++i) {
        const QChar c = texto.at(i);
        if (c == QLatin1Char('+')) {
            ++campo;
        } else if (campo == n && c >= QLatin1Char('0') && c <= QLatin1Char('9')) {
            digitos += c;
        }
    }
    return digitos;
}

QByteArray ConstroiCodigo(const QString& texto) {
    QByteArray codigo;
    for (int campo = 1; campo <= kCamposCodigo; ++campo) {
        bool ok = false;
        const int valor = ExtraiCodigo(campo, texto).toInt(&ok);
        if (ok && valor >= 0 && valor <= 255) codigo.append(static_cast<char>(valor));
    }
    return codigo;
}

}  // namespace brasel::devices
