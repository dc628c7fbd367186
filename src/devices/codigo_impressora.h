#pragma once

#include <QByteArray>
#include <QString>

namespace brasel::devices {

// Printer and display codes are stored as decimal byte values separated by "+": "27+105" is
// the two bytes 27 and 105.

// The decimal digits of field `n` (fields counted from 1, one more at every "+") among the
// first 100 characters of `texto`; every other character, blanks included, is passed over.
QString ExtraiCodigo(int n, const QString& texto);

// The bytes of a stored code: fields 1 to 6, one byte each. A field that is empty or not 0 to
// 255 is skipped and the later fields still count, so a malformed code comes out shorter and
// an empty text gives no bytes.
QByteArray ConstroiCodigo(const QString& texto);

}  // namespace brasel::devices
