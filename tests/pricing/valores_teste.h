#pragma once

#include "common/currency.h"

#include <QString>

#include <ostream>
#include <stdexcept>

namespace brasel {

// Failures show amounts as decimal text.
inline void PrintTo(const Currency& valor, std::ostream* os) {
    *os << valor.toPlainText().toStdString();
}

}  // namespace brasel

namespace brasel::pricing::teste {

// An amount written as decimal text in a table of cases; a typo fails loudly.
inline Currency V(const char* texto) {
    const auto valor = Currency::parse(QString::fromLatin1(texto));
    if (!valor) throw std::invalid_argument(texto);
    return *valor;
}

}  // namespace brasel::pricing::teste
