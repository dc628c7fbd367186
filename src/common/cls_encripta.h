#pragma once

#include <QString>

namespace brasel {

// The company-list cipher: the passwords of the server list are stored under Blowfish with a
// fixed key, as upper-case hexadecimal text so that they survive the settings store. The text is
// taken as UTF-8, the mode is ECB with PKCS#7 padding, and an empty text stays empty.
class clsEncripta {
  public:
    // Algorithm 0 is Blowfish, the only one the program uses; any other number gives "".
    static QString Encripta(int algoritmo, const QString& chave, const QString& texto);
    // "" when the text is not a cipher text of that key.
    static QString Desencripta(int algoritmo, const QString& chave, const QString& texto);

    // The key every stored company-list password is encrypted with.
    static QString chaveEmpresas();
};

}  // namespace brasel
