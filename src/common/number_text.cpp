#include "common/number_text.h"

#include <QLocale>

namespace brasel {

namespace {

// The text in the "." decimal form that Currency and QLocale::c() read.
QString normalizado(QStringView texto, QChar separadorMilhares, QChar separadorDecimal) {
    QString limpo;
    limpo.reserve(texto.size());
    for (const QChar c : texto.trimmed()) {
        if (c == separadorMilhares) continue;
        limpo += c == separadorDecimal ? QChar(u'.') : c;
    }
    return limpo;
}

}  // namespace

double TextoParaNumero(QStringView texto, QChar separadorMilhares, QChar separadorDecimal) {
    bool ok = false;
    const double valor =
        QLocale::c().toDouble(normalizado(texto, separadorMilhares, separadorDecimal), &ok);
    return ok ? valor : 0.0;
}

std::optional<Currency> TextoParaValor(QStringView texto, QChar separadorMilhares,
                                       QChar separadorDecimal) {
    return Currency::parse(normalizado(texto, separadorMilhares, separadorDecimal));
}

QString NumeroParaTexto(Currency valor, int decimais, QChar separadorMilhares,
                        QChar separadorDecimal) {
    const QString simples = valor.toText(decimais);
    const bool negativo = simples.startsWith(u'-');
    const qsizetype ponto = simples.indexOf(u'.');
    const QString inteiros =
        simples.mid(negativo ? 1 : 0, (ponto < 0 ? simples.size() : ponto) - (negativo ? 1 : 0));
    QString texto;
    for (qsizetype i = 0; i < inteiros.size(); ++i) {
        if (i > 0 && (inteiros.size() - i) % 3 == 0) texto += separadorMilhares;
        texto += inteiros[i];
    }
    if (negativo) texto.prepend(u'-');
    if (ponto >= 0) texto += separadorDecimal + simples.mid(ponto + 1);
    return texto;
}

QString NumeroParaTexto(double valor, int decimais, QChar separadorMilhares,
                        QChar separadorDecimal) {
    try {
        return NumeroParaTexto(CCur(valor), decimais, separadorMilhares, separadorDecimal);
    } catch (const CurrencyOverflow&) {
        QString texto = QString::number(valor, 'f', qBound(0, decimais, 4));
        texto.replace(u'.', separadorDecimal);
        return texto;
    }
}

}  // namespace brasel
