#pragma once

#include <QString>
#include <QVariant>

#include <compare>
#include <cstdint>
#include <optional>
#include <stdexcept>

namespace brasel {

// An amount that does not fit in the fixed-point range; raised by the arithmetic and caught by
// the money routines, which return their failure value instead of a wrapped number.
class CurrencyOverflow : public std::overflow_error {
  public:
    CurrencyOverflow() : std::overflow_error("amount out of range") {}
};

// Money, prices, quantities and points: a signed count of ten-thousandths. Built only from
// integers, decimal text or an explicit rounding conversion (CCur), never implicitly from double.
class Currency {
  public:
    static constexpr std::int64_t kScale = 10000;

    constexpr Currency() = default;
    constexpr explicit Currency(int units) : raw_(std::int64_t{units} * kScale) {}

    static constexpr Currency fromRaw(std::int64_t tenThousandths) {
        Currency c;
        c.raw_ = tenThousandths;
        return c;
    }
    // Whole units from a 64-bit integer; out of range raises CurrencyOverflow.
    static Currency fromUnits(std::int64_t units);
    // Decimal text with "." as decimal separator and an optional sign; at most four decimals are
    // kept exactly, further digits are rounded ties to even. Empty or malformed text gives nullopt.
    static std::optional<Currency> parse(QStringView text);
    // A value read back from the database: integer, decimal text or double (four decimals,
    // ties to even). Null and anything unreadable give zero.
    static Currency fromVariant(const QVariant& value);

    constexpr std::int64_t raw() const { return raw_; }
    double toDouble() const { return static_cast<double>(raw_) / kScale; }
    bool isZero() const { return raw_ == 0; }

    // Plain text with "." and exactly `decimals` decimals (0..4), rounded ties to even when fewer
    // than four: the form stored in text columns and bound to engines that take decimal text.
    QString toText(int decimals = 4) const;
    // Shortest exact text: "1.5", "-3", "0.0001".
    QString toPlainText() const;

    Currency operator-() const;
    Currency& operator+=(Currency other);
    Currency& operator-=(Currency other);
    friend Currency operator+(Currency a, Currency b) { return a += b; }
    friend Currency operator-(Currency a, Currency b) { return a -= b; }
    // The exact product rounded to four decimals, ties to even.
    friend Currency operator*(Currency a, Currency b);
    // Division yields a double: what follows is a percentage or goes back through CCur.
    friend double operator/(Currency a, Currency b) { return a.toDouble() / b.toDouble(); }

    // Amounts scaled by a percentage or a rate. The double is taken as the decimal it was written
    // as (its shortest text, kept to 18 decimals) and the product or quotient is computed exactly
    // before one rounding to four decimals, ties to even: what CCur(amount * factor) means without
    // the error of carrying the amount in a double. A non-finite factor, a zero divisor or a
    // result out of range raises CurrencyOverflow.
    Currency percentOf(double percent) const;       // amount * percent / 100
    Currency withPercent(double percent) const;     // amount * (1 + percent / 100)
    Currency withoutPercent(double percent) const;  // amount / (1 + percent / 100)
    Currency times(double factor) const;            // amount * factor
    Currency dividedBy(double divisor) const;       // amount / divisor
    // a * b / c exactly, rounded once to four decimals, ties to even: a share of an amount in
    // proportion to two others. A zero c raises CurrencyOverflow.
    static Currency mulDiv(Currency a, Currency b, Currency c);

    friend constexpr bool operator==(Currency, Currency) = default;
    friend constexpr std::strong_ordering operator<=>(Currency a, Currency b) {
        return a.raw_ <=> b.raw_;
    }

  private:
    std::int64_t raw_ = 0;
};

// value / divisor rounded to a whole number, ties to even: the one rounding of every conversion
// of amounts. A zero divisor raises CurrencyOverflow.
__int128 divideTiesToEven(__int128 value, __int128 divisor);

// The currency conversion of a double: four decimals, ties to even, decided on the shortest
// decimal text of the double so that 1.00005 is a tie and not 1.0000499999. Out of range raises
// CurrencyOverflow; NaN gives zero.
Currency CCur(double value);

}  // namespace brasel
