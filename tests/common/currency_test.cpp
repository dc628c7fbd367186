// Currency: the rounding rules every amount goes through, and the ways a double could sneak in.
#include "common/currency.h"

#include "pricing/valores_teste.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace brasel {
namespace {

Currency V(const char* texto) {
    return *Currency::parse(QString::fromLatin1(texto));
}

constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();

// 2^53 + 1 ten-thousandths: the first amount a double cannot hold.
const Currency kAlemDoDouble = Currency::fromRaw((std::int64_t{1} << 53) + 1);

TEST(Currency, ParseRoundsPastFourDecimalsTiesToEven) {
    struct Caso {
        const char* texto;
        std::int64_t raw;
    };
    const Caso casos[] = {
        {"1.23456", 12346},
        {"0.00005", 0},
        {"0.00015", 2},
        {"0.000050001", 1},
        {"-0.00015", -2},
        {"12", 120000},
        {"+3.5", 35000},
        {"1e2", 1000000},
        {"2.5e-4", 2},
        {"3.5e-4", 4},
        {"922337203685477.5807", kMax},
    };
    for (const Caso& c : casos) {
        const auto v = Currency::parse(QString::fromLatin1(c.texto));
        ASSERT_TRUE(v.has_value()) << c.texto;
        EXPECT_EQ(v->raw(), c.raw) << c.texto;
    }
    for (const char* mau : {"", "abc", "1.2.3", "1,5", "922337203685477.5808", "--1"}) {
        EXPECT_FALSE(Currency::parse(QString::fromLatin1(mau)).has_value()) << mau;
    }
}

TEST(Currency, CCurDecidesTiesOnTheShortestTextOfTheDouble) {
    struct Caso {
        double valor;
        std::int64_t raw;
    };
    const Caso casos[] = {
        {1.00005, 10000}, {1.00015, 10002}, {-1.00005, -10000}, {0.1 + 0.2, 3000},
        {2.675, 26750},   {1e-9, 0},        {-0.0, 0},
    };
    for (const Caso& c : casos)
        EXPECT_EQ(CCur(c.valor).raw(), c.raw) << c.valor;
    EXPECT_EQ(CCur(std::nan("")).raw(), 0);
    EXPECT_THROW(CCur(1e30), CurrencyOverflow);
    EXPECT_THROW(CCur(INFINITY), CurrencyOverflow);
}

TEST(Currency, ProductIsExactThenTiesToEven) {
    EXPECT_EQ(V("0.0001") * V("0.5"), V("0"));
    EXPECT_EQ(V("0.0003") * V("0.5"), V("0.0002"));
    EXPECT_EQ(V("-0.0003") * V("0.5"), V("-0.0002"));
    EXPECT_EQ(V("1.2345") * V("1.2345"), V("1.5240"));  // 1.52399025
    EXPECT_EQ(kAlemDoDouble * Currency(1), kAlemDoDouble);
    EXPECT_THROW(Currency::fromRaw(kMax) * Currency(2), CurrencyOverflow);
}

TEST(Currency, OverflowIsRaisedNeverWrapped) {
    EXPECT_THROW(Currency::fromRaw(kMax) + V("0.0001"), CurrencyOverflow);
    EXPECT_THROW(Currency::fromRaw(std::numeric_limits<std::int64_t>::min()) - V("0.0001"),
                 CurrencyOverflow);
    EXPECT_THROW(-Currency::fromRaw(std::numeric_limits<std::int64_t>::min()), CurrencyOverflow);
    EXPECT_THROW(Currency::fromUnits(std::int64_t{1} << 60), CurrencyOverflow);
}

TEST(Currency, PercentagesAreExactDecimalOperations) {
    struct Caso {
        const char* valor;
        double percentagem;
        const char* percentOf;
        const char* withPercent;
        const char* withoutPercent;
    };
    const Caso casos[] = {
        {"100", 23, "23", "123", "81.3008"},
        {"123", 23, "28.29", "151.29", "100"},
        {"0.33", 23, "0.0759", "0.4059", "0.2683"},
        {"1.2345", 10, "0.1234", "1.358", "1.1223"},  // 0.12345 is a tie: to even
        {"1.2355", 10, "0.1236", "1.359", "1.1232"},  // 0.12355 tie the other way
        {"-1.2345", 10, "-0.1234", "-1.358", "-1.1223"},
        {"0.0008", 12.5, "0.0001", "0.0009", "0.0007"},
        {"10", 33.3333, "3.3333", "13.3333", "7.5"},
        {"50", 0, "0", "50", "50"},
    };
    for (const Caso& c : casos) {
        EXPECT_EQ(V(c.valor).percentOf(c.percentagem), V(c.percentOf)) << c.valor;
        EXPECT_EQ(V(c.valor).withPercent(c.percentagem), V(c.withPercent)) << c.valor;
        EXPECT_EQ(V(c.valor).withoutPercent(c.percentagem), V(c.withoutPercent)) << c.valor;
    }
}

TEST(Currency, AmountsPastTheDoubleStayExact) {
    // Through a double these would come back one ten-thousandth off.
    EXPECT_EQ(kAlemDoDouble.percentOf(100), kAlemDoDouble);
    EXPECT_EQ(kAlemDoDouble.times(1.0), kAlemDoDouble);
    EXPECT_EQ(kAlemDoDouble.dividedBy(1.0), kAlemDoDouble);
    EXPECT_EQ(kAlemDoDouble.withPercent(0), kAlemDoDouble);
    EXPECT_EQ(Currency::mulDiv(kAlemDoDouble, Currency(3), Currency(3)), kAlemDoDouble);
    EXPECT_EQ(kAlemDoDouble.percentOf(50).raw(), ((std::int64_t{1} << 52) + 0));  // tie to even
}

TEST(Currency, FactorsAndShares) {
    EXPECT_EQ(V("10").times(0.1), V("1"));
    EXPECT_EQ(V("1").dividedBy(3), V("0.3333"));
    EXPECT_EQ(V("2").dividedBy(3), V("0.6667"));
    EXPECT_EQ(V("-2").dividedBy(3), V("-0.6667"));
    EXPECT_EQ(Currency::mulDiv(V("10"), V("1"), V("3")), V("3.3333"));
    EXPECT_EQ(Currency::mulDiv(V("0.0001"), V("1"), V("2")), V("0"));       // 0.00005: even
    EXPECT_EQ(Currency::mulDiv(V("0.0003"), V("1"), V("2")), V("0.0002"));  // 0.00015: even
    EXPECT_EQ(Currency::mulDiv(V("12.3"), V("100"), V("-173")), V("-7.1098"));
    EXPECT_THROW(V("1").dividedBy(0), CurrencyOverflow);
    EXPECT_THROW(Currency::mulDiv(V("1"), V("1"), Currency()), CurrencyOverflow);
    EXPECT_THROW(V("1").withoutPercent(-100), CurrencyOverflow);
    EXPECT_THROW(V("1").percentOf(std::nan("")), CurrencyOverflow);
    EXPECT_THROW(V("1").times(INFINITY), CurrencyOverflow);
    EXPECT_THROW(Currency::fromRaw(kMax).percentOf(200), CurrencyOverflow);
    EXPECT_THROW(V("1000").times(1e300), CurrencyOverflow);
    EXPECT_EQ(V("1000").times(1e-300), Currency());
}

TEST(Currency, TextAndVariants) {
    EXPECT_EQ(V("1234.5").toText(2), QStringLiteral("1234.50"));
    EXPECT_EQ(V("0.125").toText(2), QStringLiteral("0.12"));
    EXPECT_EQ(V("-0.004").toText(2), QStringLiteral("0.00"));
    EXPECT_EQ(V("-3.1").toPlainText(), QStringLiteral("-3.1"));
    EXPECT_EQ(Currency::fromVariant(QVariant(0.1 + 0.2)), V("0.3"));
    EXPECT_EQ(Currency::fromVariant(QVariant(QStringLiteral("12.34567"))), V("12.3457"));
    EXPECT_EQ(Currency::fromVariant(QVariant(5)), V("5"));
    EXPECT_EQ(Currency::fromVariant(QVariant()), Currency());
    EXPECT_EQ(Currency::fromVariant(QVariant(QStringLiteral("x"))), Currency());
}

}  // namespace
}  // namespace brasel
