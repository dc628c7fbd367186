#pragma once

#include <QString>

namespace brasel {

// The character cipher of stored user passwords: every 8-bit character has its bits inverted and
// its two halves swapped. Encrypt and Decrypt are the same transformation; applied twice it gives
// the text back, and the length never changes.
class EDiv {
  public:
    static QString Encrypt(const QString& texto);
    static QString Decrypt(const QString& texto);
};

}  // namespace brasel
