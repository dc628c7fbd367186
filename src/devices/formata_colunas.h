#pragma once

#include "common/currency.h"

#include <QString>

namespace brasel::devices {

// Receipts are 40 characters wide; their totals block, printed in medium size, 32.
inline constexpr int kLarguraTalao = 40;
inline constexpr int kLarguraTotais = 32;

// Three columns joined. Each column whose text, trimmed, is not empty is cut to its width and
// padded with blanks to it: on the right for alignment "E" (left-aligned), on the left for "D"
// (right-aligned). An empty column adds nothing, not even blanks.
QString FormataColunas(const QString& texto1, int largura1, const QString& alinhamento1,
                       const QString& texto2 = {}, int largura2 = 0,
                       const QString& alinhamento2 = {}, const QString& texto3 = {},
                       int largura3 = 0, const QString& alinhamento3 = {});

// A printed line: cut or padded with blanks to `largura` characters.
QString LinhaFixa(const QString& texto, int largura = kLarguraTalao);

// An amount as receipts write it: "," before exactly `decimais` decimals (0 to 4, ties to even),
// no thousands grouping: 1234.5 with 2 decimals is "1234,50".
QString ValorTalao(Currency valor, int decimais);

// The decimals of printed amounts: the user's DecimaisImpTaloes when above 0, else the
// company's.
int DecimaisTalao(int decimaisImpTaloes, int casadec);

// A label and an amount in `largura` characters, the amount ending at the last column.
QString LinhaTotal(const QString& rotulo, const QString& valor, int largura = kLarguraTotais);

}  // namespace brasel::devices
