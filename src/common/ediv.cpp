#include "common/ediv.h"

#include <array>

namespace brasel {

namespace {

// Windows-1252 codes 0x80..0x9F. The five codes it leaves undefined keep their Latin-1 control
// character, so every one of the 256 codes has exactly one character and back.
constexpr std::array<char16_t, 32> kCp1252Altos = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0x008D, 0x017D, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

QChar deCodigo(unsigned char codigo) {
    if (codigo >= 0x80 && codigo <= 0x9F) return QChar(kCp1252Altos[codigo - 0x80]);
    return QChar(static_cast<char16_t>(codigo));
}

// Characters without a Windows-1252 code become "?", as the system's conversion does.
unsigned char paraCodigo(QChar c) {
    const char16_t u = c.unicode();
    if (u < 0x80 || (u >= 0xA0 && u <= 0xFF)) return static_cast<unsigned char>(u);
    for (std::size_t i = 0; i < kCp1252Altos.size(); ++i) {
        if (kCp1252Altos[i] == u) return static_cast<unsigned char>(0x80 + i);
    }
    return '?';
}

QString transforma(const QString& texto) {
    QString out;
    out.reserve(texto.size());
    for (const QChar c : texto) {
        const unsigned invertido = ~static_cast<unsigned>(paraCodigo(c)) & 0xFFu;
        const unsigned trocado = ((invertido & 0x0Fu) << 4) | (invertido >> 4);
        out.append(deCodigo(static_cast<unsigned char>(trocado)));
    }
    return out;
}

}  // namespace

QString EDiv::Encrypt(const QString& texto) {
    return transforma(texto);
}

QString EDiv::Decrypt(const QString& texto) {
    return transforma(texto);
}

}  // namespace brasel
