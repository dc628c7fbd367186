#include "display.h"

#include <QMutexLocker>

#include <algorithm>

namespace devsim {

namespace {

// The length of the longest end of `dados` that begins one of `codigos` without being all of
// it: those bytes may be the first part of a code whose rest has not arrived yet.
qsizetype prefixoPendente(const QByteArray& dados, const QList<QByteArray>& codigos) {
    qsizetype maior = 0;
    for (const QByteArray& codigo : codigos) {
        const qsizetype limite = std::min(dados.size(), codigo.size() - 1);
        for (qsizetype n = limite; n > maior; --n) {
            if (codigo.startsWith(dados.right(n))) {
                maior = n;
                break;
            }
        }
    }
    return maior;
}

QList<QByteArray> naoVazios(std::initializer_list<QByteArray> codigos) {
    QList<QByteArray> lista;
    for (const QByteArray& c : codigos) {
        if (!c.isEmpty()) lista.append(c);
    }
    // The longest first, so that a code that begins another never hides it.
    std::stable_sort(lista.begin(), lista.end(),
                     [](const QByteArray& a, const QByteArray& b) { return a.size() > b.size(); });
    return lista;
}

}  // namespace

Display::Display(CodigosDisplay codigos) : codigos_(std::move(codigos)) {}

void Display::recebe(const QByteArray& bytes) {
    QMutexLocker trinco(&mutex_);
    pendente_ += bytes;
    processa();
}

void Display::processa() {
    for (;;) {
        const bool avancou = modo_ == Modo::Comandos ? processaComando() : processaTexto();
        if (!avancou || pendente_.isEmpty()) return;
    }
}

// Outside a line: a code, the start of a code still arriving, or a byte the display ignores.
bool Display::processaComando() {
    const QList<QByteArray> comandos = naoVazios(
        {codigos_.limpa, codigos_.inicializa, codigos_.inicioLinha1, codigos_.inicioLinha2});
    for (const QByteArray& c : comandos) {
        if (!pendente_.startsWith(c)) continue;
        pendente_.remove(0, c.size());
        if (c == codigos_.limpa) {
            linhas_[0].clear();
            linhas_[1].clear();
            eventos_.append(QStringLiteral("[LIMPA]"));
        } else if (c == codigos_.inicializa) {
            eventos_.append(QStringLiteral("[INICIA]"));
        } else {
            modo_ = c == codigos_.inicioLinha1 ? Modo::Linha1 : Modo::Linha2;
            texto_.clear();
        }
        return true;
    }
    if (prefixoPendente(pendente_, comandos) == pendente_.size()) return false;
    eventos_.append(QStringLiteral("[?%1]").arg(static_cast<unsigned char>(pendente_.at(0))));
    pendente_.remove(0, 1);
    return true;
}

// Inside a line: text up to the line's end code; a model without an end code ends the line at
// the next code it knows.
bool Display::processaTexto() {
    const QByteArray& fim = modo_ == Modo::Linha1 ? codigos_.fimLinha1 : codigos_.fimLinha2;
    const QList<QByteArray> terminos =
        fim.isEmpty() ? naoVazios({codigos_.limpa, codigos_.inicializa, codigos_.inicioLinha1,
                                   codigos_.inicioLinha2})
                      : QList<QByteArray>{fim};
    qsizetype ate = -1;
    QByteArray encontrado;
    for (const QByteArray& t : terminos) {
        const qsizetype i = pendente_.indexOf(t);
        if (i >= 0 && (ate < 0 || i < ate)) {
            ate = i;
            encontrado = t;
        }
    }
    const qsizetype disponivel =
        ate >= 0 ? ate : pendente_.size() - prefixoPendente(pendente_, terminos);
    texto_ += pendente_.left(disponivel);
    // The end code is the line's own; a code that starts something else is left for it.
    pendente_.remove(0, disponivel + (ate >= 0 && encontrado == fim ? fim.size() : 0));
    const int n = modo_ == Modo::Linha1 ? 0 : 1;
    linhas_[n] = QString::fromLatin1(texto_).left(std::max(0, codigos_.colunas));
    if (ate < 0) return false;
    terminaLinha();
    return true;
}

void Display::terminaLinha() {
    const QChar numero = modo_ == Modo::Linha1 ? QLatin1Char('1') : QLatin1Char('2');
    eventos_.append(QString(numero) + QLatin1Char('|') + QString::fromLatin1(texto_) +
                    QLatin1Char('|'));
    modo_ = Modo::Comandos;
    texto_.clear();
}

QString Display::transcricao() const {
    return eventos().join(QLatin1Char('\n'));
}

QString Display::linha1() const {
    QMutexLocker trinco(&mutex_);
    return linhas_[0];
}

QString Display::linha2() const {
    QMutexLocker trinco(&mutex_);
    return linhas_[1];
}

QStringList Display::eventos() const {
    QMutexLocker trinco(&mutex_);
    return eventos_;
}

}  // namespace devsim
