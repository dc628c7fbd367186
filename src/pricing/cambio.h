#pragma once

#include "app/estado.h"
#include "common/currency.h"

#include <QString>

#include <cstdint>
#include <optional>

namespace brasel::pricing {

// An amount in another currency, kept to six decimals.
struct ValorSeisDecimais {
    std::int64_t milionesimos = 0;

    QString toText() const;      // "12.345678"
    Currency paraValor() const;  // to four decimals, ties to even
    friend bool operator==(ValorSeisDecimais, ValorSeisDecimais) = default;
};

// How Cambios.valor is quoted, chosen by ParamGeral FormulaCalcCambioB: 0 (or empty), the
// company's money one unit of that currency is worth; 1, the units of that currency one unit of
// the company's money buys. Any other value counts as 0.
inline constexpr int kCambioUnidadesPorMoedaEmpresa = 1;

// Converts `Valor` with the rate (Cambios.valor) of `Moeda`: "+" takes an amount in that
// currency into the company's, "-" the company's amount into that currency. With
// FormulaCalcCambioB 0 "+" multiplies by the rate and "-" divides by it; with 1 the other way
// round. The exact result is rounded to six decimals, ties to even. The company's own currency
// (an empty `Moeda` or ParamGeral cambiodef, in either case), another `Sentido`, or a currency
// without a rate (no row, or 0: it converts at 1) leave the value as it is. nullopt out of range.
std::optional<ValorSeisDecimais> ConverteCambio_SEIS_Decimais(app::Estado& estado, Currency Valor,
                                                              const QString& Moeda,
                                                              const QString& Sentido,
                                                              db::Connection* conn = nullptr);

// The number text padded to six decimals: digits after the last non-digit are completed with
// zeros up to six ("12.5" gives "12.500000"); text with no decimals gets "." and six zeros;
// text with six or more decimals is returned as it is.
QString AcertaDecimais(const QString& Texto);

}  // namespace brasel::pricing
