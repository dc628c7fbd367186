#pragma once

#include <QByteArray>

#include <initializer_list>

namespace brasel::testing {

// The bytes with these values, as a test writes the codes a device expects.
inline QByteArray bytes(std::initializer_list<int> valores) {
    QByteArray b;
    for (int v : valores)
        b.append(static_cast<char>(v));
    return b;
}

}  // namespace brasel::testing
