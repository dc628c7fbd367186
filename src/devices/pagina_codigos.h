#pragma once

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// Text as a ticket printer set to the Portuguese code page (860) prints it: the 36 accented
// letters and signs of Portuguese go to their code-page-860 bytes; every other character goes
// to its single-byte Windows code (Windows-1252), so ü, ñ and the like reach the printer
// untranslated. A character that has no single-byte Windows code becomes "?".
QByteArray TraduzCaracteres(const QString& texto);

}  // namespace brasel::devices
