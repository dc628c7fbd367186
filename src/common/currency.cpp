#include "common/currency.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <string>

namespace brasel {

namespace {

constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();

std::int64_t checked(__int128 value) {
    if (value > kMax || value < std::numeric_limits<std::int64_t>::min()) throw CurrencyOverflow();
    return static_cast<std::int64_t>(value);
}

}  // namespace

__int128 divideTiesToEven(__int128 value, __int128 divisor) {
    if (divisor == 0) throw CurrencyOverflow();
    if (divisor < 0) {
        value = -value;
        divisor = -divisor;
    }
    __int128 quotient = value / divisor;
    __int128 remainder = value % divisor;
    if (remainder < 0) remainder = -remainder;
    const __int128 twice = remainder * 2;
    if (twice > divisor || (twice == divisor && (quotient % 2 != 0))) {
        quotient += value < 0 ? -1 : 1;
    }
    return quotient;
}

namespace {

constexpr __int128 kInt128Max = ~static_cast<unsigned __int128>(0) >> 1;

// Reads [sign]digits[.digits][e[sign]digits] into units of 10^-decimals, ties to even beyond
// them. Returns false on anything else or when the value leaves the 128-bit range.
bool parseScaled(std::string_view text, int decimals, __int128& out) {
    std::size_t i = 0;
    bool negative = false;
    if (i < text.size() && (text[i] == '+' || text[i] == '-')) negative = text[i++] == '-';
    __int128 mantissa = 0;
    int digits = 0;
    int scale = 0;  // digits after the decimal point that entered the mantissa
    bool anyDigit = false;
    bool pastPoint = false;
    bool droppedNonZero = false;
    int dropped = 0;
    for (; i < text.size(); ++i) {
        const char c = text[i];
        if (c == '.') {
            if (pastPoint) return false;
            pastPoint = true;
            continue;
        }
        if (c < '0' || c > '9') break;
        anyDigit = true;
        if (digits < 30) {
            mantissa = mantissa * 10 + (c - '0');
            if (mantissa != 0) ++digits;
            if (pastPoint) ++scale;
        } else {
            // Beyond 30 significant digits only whether something non-zero follows matters.
            if (c != '0') droppedNonZero = true;
            if (!pastPoint) ++dropped;
        }
    }
    if (!anyDigit) return false;
    int exponent = dropped;
    if (i < text.size() && (text[i] == 'e' || text[i] == 'E')) {
        std::size_t j = i + 1;
        if (j < text.size() && text[j] == '+') ++j;
        int value = 0;
        auto [ptr, ec] = std::from_chars(text.data() + j, text.data() + text.size(), value);
        if (ec != std::errc() || ptr != text.data() + text.size()) return false;
        exponent += value;
    } else if (i != text.size()) {
        return false;
    }
    // value = mantissa * 10^(exponent - scale); we want it * 10^decimals.
    int shift = exponent - scale + decimals;
    if (shift >= 0) {
        for (int k = 0; k < shift; ++k) {
            if (mantissa > kInt128Max / 10) return false;
            mantissa *= 10;
        }
    } else {
        if (shift < -36) {
            mantissa = 0;
        } else {
            __int128 divisor = 1;
            for (int k = 0; k < -shift; ++k)
                divisor *= 10;
            __int128 quotient = mantissa / divisor;
            const __int128 twice = (mantissa % divisor) * 2;
            if (twice > divisor || (twice == divisor && (droppedNonZero || quotient % 2 != 0))) {
                ++quotient;
            }
            mantissa = quotient;
        }
    }
    out = negative ? -mantissa : mantissa;
    return true;
}

// Ten-thousandths of decimal text; false when malformed or out of the 64-bit range.
bool parseDecimal(std::string_view text, std::int64_t& out) {
    __int128 value = 0;
    if (!parseScaled(text, 4, value)) return false;
    if (value > kMax || value < std::numeric_limits<std::int64_t>::min()) return false;
    out = static_cast<std::int64_t>(value);
    return true;
}

// Factors are kept to 18 decimals: enough for any rate or percentage typed or stored, and an
// amount times one still fits in 128 bits before the division.
constexpr __int128 kFactorScale = 1'000'000'000'000'000'000;

// A double divided by 10^shift, as the decimal it was written as, in units of 10^-18.
__int128 factorOf(double value, int shift) {
    if (!std::isfinite(value)) throw CurrencyOverflow();
    char buffer[64];
    auto [end, ec] = std::to_chars(buffer, buffer + sizeof buffer, value);
    if (ec != std::errc()) throw CurrencyOverflow();
    __int128 factor = 0;
    if (!parseScaled(std::string_view(buffer, end - buffer), 18 - shift, factor)) {
        throw CurrencyOverflow();
    }
    return factor;
}

// raw * numerator / denominator, rounded once. When the product leaves 128 bits the quotient
// cannot fit 64 bits either (every denominator used here is at most 10^18 times smaller).
Currency mulDivRound(std::int64_t raw, __int128 numerator, __int128 denominator) {
    __int128 product = 0;
    if (__builtin_mul_overflow(static_cast<__int128>(raw), numerator, &product)) {
        throw CurrencyOverflow();
    }
    return Currency::fromRaw(checked(divideTiesToEven(product, denominator)));
}

__int128 onePlusPercent(double percent) {
    __int128 sum = 0;
    if (__builtin_add_overflow(kFactorScale, factorOf(percent, 2), &sum)) throw CurrencyOverflow();
    return sum;
}

}  // namespace

Currency Currency::fromUnits(std::int64_t units) {
    return fromRaw(checked(static_cast<__int128>(units) * kScale));
}

std::optional<Currency> Currency::parse(QStringView text) {
    const QByteArray latin = text.trimmed().toLatin1();
    std::int64_t raw = 0;
    if (!parseDecimal(std::string_view(latin.constData(), latin.size()), raw)) return std::nullopt;
    return fromRaw(raw);
}

Currency Currency::fromVariant(const QVariant& value) {
    if (value.isNull() || !value.isValid()) return Currency();
    switch (value.typeId()) {
        case QMetaType::Int:
        case QMetaType::LongLong:
        case QMetaType::UInt:
        case QMetaType::Short:
        case QMetaType::Bool:
            return fromUnits(value.toLongLong());
        case QMetaType::Double:
        case QMetaType::Float:
            return CCur(value.toDouble());
        default: {
            auto parsed = parse(value.toString());
            return parsed ? *parsed : Currency();
        }
    }
}

QString Currency::toText(int decimals) const {
    if (decimals < 0) decimals = 0;
    if (decimals > 4) decimals = 4;
    __int128 divisor = 1;
    for (int k = decimals; k < 4; ++k)
        divisor *= 10;
    const __int128 scaled = divideTiesToEven(raw_, divisor);
    const bool negative = scaled < 0;
    unsigned __int128 magnitude = negative ? -scaled : scaled;
    std::uint64_t unitDivisor = 1;
    for (int k = 0; k < decimals; ++k)
        unitDivisor *= 10;
    const auto units = static_cast<std::uint64_t>(magnitude / unitDivisor);
    const auto fraction = static_cast<std::uint64_t>(magnitude % unitDivisor);
    QString text = negative ? QStringLiteral("-") : QString();
    text += QString::number(units);
    if (decimals > 0) {
        text += QLatin1Char('.');
        text += QStringLiteral("%1").arg(fraction, decimals, 10, QLatin1Char('0'));
    }
    return text;
}

QString Currency::toPlainText() const {
    QString text = toText(4);
    while (text.endsWith(QLatin1Char('0')))
        text.chop(1);
    if (text.endsWith(QLatin1Char('.'))) text.chop(1);
    if (text == QStringLiteral("-0")) text = QStringLiteral("0");
    return text;
}

Currency Currency::operator-() const {
    return fromRaw(checked(-static_cast<__int128>(raw_)));
}

Currency& Currency::operator+=(Currency other) {
    raw_ = checked(static_cast<__int128>(raw_) + other.raw_);
    return *this;
}

Currency& Currency::operator-=(Currency other) {
    raw_ = checked(static_cast<__int128>(raw_) - other.raw_);
    return *this;
}

Currency operator*(Currency a, Currency b) {
    const __int128 product = static_cast<__int128>(a.raw_) * b.raw_;
    return Currency::fromRaw(checked(divideTiesToEven(product, Currency::kScale)));
}

Currency Currency::percentOf(double percent) const {
    return mulDivRound(raw_, factorOf(percent, 2), kFactorScale);
}

Currency Currency::withPercent(double percent) const {
    return mulDivRound(raw_, onePlusPercent(percent), kFactorScale);
}

Currency Currency::withoutPercent(double percent) const {
    return mulDivRound(raw_, kFactorScale, onePlusPercent(percent));
}

Currency Currency::times(double factor) const {
    return mulDivRound(raw_, factorOf(factor, 0), kFactorScale);
}

Currency Currency::dividedBy(double divisor) const {
    return mulDivRound(raw_, kFactorScale, factorOf(divisor, 0));
}

Currency Currency::mulDiv(Currency a, Currency b, Currency c) {
    return mulDivRound(a.raw_, b.raw_, c.raw_);
}

Currency CCur(double value) {
    if (std::isnan(value)) return Currency();
    if (std::isinf(value)) throw CurrencyOverflow();
    char buffer[64];
    auto [end, ec] = std::to_chars(buffer, buffer + sizeof buffer, value);
    if (ec != std::errc()) throw CurrencyOverflow();
    std::int64_t raw = 0;
    if (!parseDecimal(std::string_view(buffer, end - buffer), raw)) throw CurrencyOverflow();
    return Currency::fromRaw(raw);
}

}  // namespace brasel
