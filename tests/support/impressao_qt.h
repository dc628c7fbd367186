#pragma once

#include <QString>
#include <QVariant>

#include <ostream>

// Failed expectations show Qt texts as text, not as bytes.
inline void PrintTo(const QString& texto, std::ostream* os) {
    *os << '"' << texto.toStdString() << '"';
}
inline void PrintTo(const QVariant& valor, std::ostream* os) {
    *os << valor.typeName() << '(' << valor.toString().toStdString() << ')';
}
