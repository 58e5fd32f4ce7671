// Number patterns and plain number text: rounding, optional digits, signs, and
// independence from the locale.
#include "shell/vbformat.hpp"

#include "format/displayformat.hpp"

#include <QLocale>

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <vector>

namespace arbolex::shell {
namespace {

TEST(FormatNumberTest, MatchesClassicFormat) {
    const struct {
        double value;
        const char *pattern;
        const char *expected;
    } cases[] = {// half away from zero, on the decimal value; carries into the integer part
                 {2.5, "0", "3"},
                 {-2.5, "0", "-3"},
                 {0.125, "0.00", "0.13"},
                 {1.005, "0.00", "1.01"},
                 {0.1 + 0.2, "0.00##", "0.30"},
                 {9.9996, "#0.000", "10.000"},
                 {99.95, "##0.0", "100.0"},
                 // the integer part in full; without a '0' it is left out at zero
                 {1234.56, "##0.0", "1234.6"},
                 {1e20, "0", "100000000000000000000"},
                 {0.0, "#", ""},
                 {12345.6, "#", "12346"},
                 {0.5, "#.0", ".5"},
                 {0.04, "##0.0", "0.0"},
                 // optional decimals drop trailing zeros down to the mandatory ones
                 {5.0, "0.00##", "5.00"},
                 {5.12345, "0.00##", "5.1235"},
                 {5.1, "0.00##", "5.10"},
                 // a value that rounds to zero has no minus
                 {-0.04, "##0.0", "0.0"},
                 {-0.4, "#", ""},
                 {-0.05, "##0.0", "-0.1"}};
    for (const auto &c : cases) {
        EXPECT_EQ(formatNumber(c.value, QString::fromLatin1(c.pattern)).toStdString(), c.expected)
            << c.value << " with \"" << c.pattern << '"';
    }
}

// A shown figure is taken without its text where the scaled value is far
// from a half; at a half, and where 15 significant digits round the value
// onto one, it must still be the text read back, to the bit.
TEST(FormatNumberTest, ShownValueIsTheTextReadBack) {
    const char *patterns[] = {"#", "0", "#.0", "##0.0", "#0.00", "###0.00", "#0.000", "0.00##"};
    std::vector<double> values = {0.0,
                                  -0.0,
                                  2.5,
                                  -2.5,
                                  0.125,
                                  1.005,
                                  2.675,
                                  9.9996,
                                  99.95,
                                  0.0005,
                                  -0.004,
                                  -0.05,
                                  1234.565,
                                  1e14,
                                  1e-300,
                                  5e-324,
                                  0.1 + 0.2,
                                  249.995,
                                  0.3499999999999999};
    // Decimal halves and the doubles either side of them.
    for (int k = 1; k < 2000; k += 37) {
        for (const double scale : {10.0, 100.0, 1000.0, 10000.0}) {
            const double half = (k + 0.5) / scale;
            values.insert(values.end(),
                          {half, std::nextafter(half, 0.0), std::nextafter(half, 1e9), -half});
        }
    }
    for (const double v : values) {
        for (const char *p : patterns) {
            const double text = format::val(format::formatNumber(v, p));
            EXPECT_EQ(std::bit_cast<std::uint64_t>(format::shownValue(v, p)),
                      std::bit_cast<std::uint64_t>(text))
                << v << " with \"" << p << '"';
        }
    }
}

TEST(FormatNumberTest, ShortestTextWithPointWhateverTheLocale) {
    const QLocale previous;
    QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
    EXPECT_EQ(formatNumber(1234.5, u"##0.00"), QStringLiteral("1234.50"));
    EXPECT_EQ(generalNumber(40.0), QStringLiteral("40"));
    EXPECT_EQ(generalNumber(12.25), QStringLiteral("12.25"));
    EXPECT_EQ(generalNumber(-0.0), QStringLiteral("0"));
    EXPECT_EQ(singleText(0.1f), QStringLiteral("0.1"));
    QLocale::setDefault(previous);
}

} // namespace
} // namespace arbolex::shell
