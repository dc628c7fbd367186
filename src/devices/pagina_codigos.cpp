#include "devices/pagina_codigos.h"

#include <QList>
#include <QStringView>

#include <array>
#include <utility>

namespace brasel::devices {

namespace {

// The Portuguese characters and their places in code page 860.
constexpr std::array<std::pair<char16_t, unsigned char>, 36> kPagina860{{
    {u'Ç', 128}, {u'é', 130}, {u'â', 131}, {u'ã', 132}, {u'à', 133}, {u'Á', 134},
    {u'ç', 135}, {u'ê', 136}, {u'Ê', 137}, {u'è', 138}, {u'Í', 139}, {u'Ô', 140},
    {u'ì', 141}, {u'Ã', 142}, {u'Â', 143}, {u'É', 144}, {u'À', 145}, {u'È', 146},
    {u'ô', 147}, {u'õ', 148}, {u'ò', 149}, {u'Ú', 150}, {u'ù', 151}, {u'Ì', 152},
    {u'Õ', 153}, {u'Ù', 157}, {u'Ó', 159}, {u'á', 160}, {u'í', 161}, {u'ó', 162},
    {u'ú', 163}, {u'ª', 166}, {u'º', 167}, {u'Ò', 169}, {u'«', 174}, {u'»', 175},
}};

// Windows-1252 between 0x80 and 0x9F, where it differs from Latin-1. Five places are unused
// there; the system conversion keeps their control characters as they are.
constexpr std::array<char32_t, 32> kWindows80{
    U'€', U'\u0081', U'‚',      U'ƒ', U'„',      U'…',      U'†', U'‡',      U'ˆ', U'‰', U'Š',
    U'‹', U'Œ',      U'\u008D', U'Ž', U'\u008F', U'\u0090', U'‘', U'’',      U'“', U'”', U'•',
    U'–', U'—',      U'˜',      U'™', U'š',      U'›',      U'œ', U'\u009D', U'ž', U'Ÿ'};

char byteWindows(char32_t c) {
    if (c < 0x80 || (c >= 0xA0 && c <= 0xFF)) return static_cast<char>(c);
    for (std::size_t i = 0; i < kWindows80.size(); ++i) {
        if (kWindows80[i] == c) return static_cast<char>(0x80 + i);
    }
    return '?';
}

}  // namespace

QByteArray TraduzCaracteres(const QString& texto) {
    QByteArray bytes;
    bytes.reserve(texto.size());
    for (const char32_t c : QStringView(texto).toUcs4()) {
        char byte = byteWindows(c);
        for (const auto& [letra, codigo] : kPagina860) {
            if (letra == c) {
                byte = static_cast<char>(codigo);
                break;
            }
        }
        bytes.append(byte);
    }
    return bytes;
}

}  // namespace brasel::devices
