#include "pos/teclado.h"

namespace brasel::pos {

namespace {

// The accented vowels of each dead key, in the order of "AEIOU"; a space marks a vowel the
// key does not take.
QString acentuadas(QChar acento) {
    if (acento == u'´') return QStringLiteral("ÁÉÍÓÚ");
    if (acento == u'`') return QStringLiteral("ÀÈÌÒÙ");
    if (acento == u'~') return QStringLiteral("Ã  Õ ");
    return {};
}

}  // namespace

void Teclado::CarregaLetra(const QString& letra) {
    QString tecla = letra.toUpper();
    if (tecla.size() == 1) {
        const qsizetype vogal = QStringLiteral("AEIOU").indexOf(tecla.at(0));
        const QString tabela = acentuadas(acento_);
        if (vogal >= 0 && vogal < tabela.size() && tabela.at(vogal) != u' ')
            tecla = tabela.at(vogal);
    }
    resultado_ += capsLock_ ? tecla : tecla.toLower();
    acento_ = QChar();
}

void Teclado::apaga() {
    if (!resultado_.isEmpty()) resultado_.chop(1);
}

void Teclado::acrescenta(const QString& texto) {
    resultado_ += texto;
    acento_ = QChar();
}

ValorTeclado lerValorTeclado(const QString& texto) {
    QString t = texto.trimmed();
    if (t.isEmpty()) return {};
    ValorTeclado v;
    v.valido = false;
    int separadores = 0;
    int digitos = 0;
    for (qsizetype i = 0; i < t.size(); ++i) {
        const QChar c = t.at(i);
        if ((c == u'-' || c == u'+') && i == 0) continue;
        if (c == u'.' || c == u',') {
            ++separadores;
            t[i] = u'.';
        } else if (c >= u'0' && c <= u'9') {
            ++digitos;
        } else {
            return v;
        }
    }
    if (separadores > 1 || digitos == 0) return v;
    v.valor = Currency::parse(t);
    v.valido = v.valor.has_value();
    return v;
}

}  // namespace brasel::pos
