#pragma once

#include "common/currency.h"

#include <QChar>
#include <QString>
#include <QStringView>

#include <optional>

namespace brasel {

// The program writes and reads its own number texts with "," grouping thousands and "." before
// the decimals, whatever the operating system's regional settings say.

// A number typed in a box or read back from a list column: every thousands separator is dropped,
// the decimal separator becomes ".", and what remains is read. Empty or unreadable text is 0, as
// an empty cell of a list means nothing there. Percentages only: amounts use TextoParaValor.
double TextoParaNumero(QStringView texto, QChar separadorMilhares = u',',
                       QChar separadorDecimal = u'.');

// The same reading straight into an amount, exact to four decimals (further digits rounded ties
// to even); nullopt when the text is empty or not a number.
std::optional<Currency> TextoParaValor(QStringView texto, QChar separadorMilhares = u',',
                                       QChar separadorDecimal = u'.');

// The twin of the two above: the amount with `decimais` decimals (0 to 4, ties to even) and its
// thousands grouped: 1234567.891 with 2 decimals is "1,234,567.89".
QString NumeroParaTexto(Currency valor, int decimais, QChar separadorMilhares = u',',
                        QChar separadorDecimal = u'.');
// A percentage or rate the same way; one too large for an amount is written without grouping.
QString NumeroParaTexto(double valor, int decimais, QChar separadorMilhares = u',',
                        QChar separadorDecimal = u'.');

}  // namespace brasel
