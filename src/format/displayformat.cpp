#include "format/displayformat.hpp"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <optional>

namespace arbolex::format {

namespace {

/// Significant decimal digits a double is taken to carry before rounding.
constexpr int kSignificantDigits = 15;

struct Pattern {
    int integerZeros = 0; ///< mandatory integer digits
    int minDecimals = 0;  ///< '0' after the point
    int maxDecimals = 0;  ///< '0' and '#' after the point
    bool hasPoint = false;
};

Pattern parsePattern(std::string_view pattern) {
    Pattern p;
    for (const char c : pattern) {
        if (c == '.') {
            p.hasPoint = true;
        } else if (c == '0') {
            if (p.hasPoint) {
                ++p.minDecimals;
                ++p.maxDecimals;
            } else {
                ++p.integerZeros;
            }
        } else if (c == '#' && p.hasPoint) {
            ++p.maxDecimals;
        }
    }
    return p;
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isSign(char c) {
    return c == '+' || c == '-';
}

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\v' || c == '\f';
}

std::string_view trimmed(std::string_view text) {
    while (!text.empty() && isBlank(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isBlank(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

} // namespace

namespace {

/// Room for the digits of any finite double under any pattern: 309 integer
/// digits, or 323 zeros and 15 digits after the point, and a carry.
constexpr std::size_t kDigitRoom = 360;

/// `value` (finite) formatted with `p` into `out`, which holds at least
/// kDigitRoom + the pattern's mandatory digits + 2 characters; returns the
/// length. The text of formatNumber, built in place: a number shown in the
/// table or read back from it makes no string on the way.
std::size_t formatInto(double value, const Pattern &p, char *out) {
    // The magnitude as 15 significant digits "d.dddddddddddddde±XX".
    std::array<char, 40> text{};
    const auto result = std::to_chars(text.data(), text.data() + text.size(), std::fabs(value),
                                      std::chars_format::scientific, kSignificantDigits - 1);
    const char *const begin = text.data();
    const char *e = std::find(begin, static_cast<const char *>(result.ptr), 'e');
    int exponent = 0;
    std::from_chars(e + (e[1] == '+' ? 2 : 1), result.ptr, exponent);
    const int pointAt = exponent + 1; // digits before the point
    char mantissa[kSignificantDigits];
    mantissa[0] = text[0];
    std::copy(begin + 2, e, mantissa + 1);

    // The integer digits, then the decimals, in one run of digits.
    std::array<char, kDigitRoom> digits{};
    std::size_t integerCount = 0;
    std::size_t decimalCount = 0;
    if (value == 0.0) {
        // nothing: both parts stay empty
    } else if (pointAt <= 0) {
        const auto zeros = static_cast<std::size_t>(-pointAt);
        std::fill_n(digits.data(), zeros, '0');
        std::copy_n(mantissa, kSignificantDigits, digits.data() + zeros);
        decimalCount = zeros + kSignificantDigits;
    } else if (pointAt >= kSignificantDigits) {
        integerCount = static_cast<std::size_t>(pointAt);
        std::copy_n(mantissa, kSignificantDigits, digits.data());
        std::fill(digits.data() + kSignificantDigits, digits.data() + integerCount, '0');
    } else {
        integerCount = static_cast<std::size_t>(pointAt);
        decimalCount = kSignificantDigits - integerCount;
        std::copy_n(mantissa, kSignificantDigits, digits.data());
    }

    // Round half away from zero to the pattern's decimals.
    const auto maxDecimals = static_cast<std::size_t>(p.maxDecimals);
    char *first = digits.data() + 1; // room for a carry out of the left end
    std::memmove(first, digits.data(), integerCount + decimalCount);
    if (decimalCount > maxDecimals) {
        const bool up = first[integerCount + maxDecimals] >= '5';
        decimalCount = maxDecimals;
        if (up) {
            char *digit = first + integerCount + decimalCount;
            bool carry = true;
            while (carry && digit != first) {
                --digit;
                if (*digit != '9') {
                    ++*digit;
                    carry = false;
                } else {
                    *digit = '0';
                }
            }
            if (carry) {
                *--first = '1';
                ++integerCount;
            }
        }
    }

    // Optional decimals lose their trailing zeros; mandatory ones are padded.
    const auto minDecimals = static_cast<std::size_t>(p.minDecimals);
    const char *decimals = first + integerCount;
    while (decimalCount > minDecimals && decimals[decimalCount - 1] == '0') {
        --decimalCount;
    }
    const std::size_t decimalZeros = decimalCount < minDecimals ? minDecimals - decimalCount : 0;

    const char *integer = first;
    while (integerCount > 0 && *integer == '0') {
        ++integer;
        --integerCount;
    }
    const auto integerZeros = static_cast<std::size_t>(p.integerZeros);
    const std::size_t leadingZeros = integerCount < integerZeros ? integerZeros - integerCount : 0;

    const bool isZero =
        std::all_of(integer, integer + integerCount, [](char c) { return c == '0'; }) &&
        std::all_of(decimals, decimals + decimalCount, [](char c) { return c == '0'; });
    char *o = out;
    if (value < 0 && !isZero) {
        *o++ = '-';
    }
    o = std::fill_n(o, leadingZeros, '0');
    o = std::copy_n(integer, integerCount, o);
    if (p.hasPoint) {
        *o++ = '.';
        o = std::copy_n(decimals, decimalCount, o);
        o = std::fill_n(o, decimalZeros, '0');
    }
    return static_cast<std::size_t>(o - out);
}

/// Powers of ten that a double holds exactly, 10^0 to 10^15.
constexpr std::array<double, 16> kExactPowersOfTen = {1e0, 1e1, 1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                                      1e8, 1e9, 1e10, 1e11, 1e12, 1e13, 1e14, 1e15};

/// Largest scaled figure taken by shownByScaling: far below 2^52, where a
/// double still holds every whole number and its fraction exactly.
constexpr double kLargestScaled = 1e15;

/// The figure of formatInto(value, p) read back, computed without its text
/// where that gives the same double: the text is ±K / 10^d for the whole
/// number K nearest to |value| · 10^d (d the pattern's decimals), so its
/// value is the correctly rounded quotient K / 10^d. K is taken from the
/// scaled double when that lies far enough from a half that neither the
/// rounding of the scaling nor that of the 15 significant digits the text is
/// rounded from can move it across; std::nullopt leaves it to the text.
std::optional<double> shownByScaling(double value, const Pattern &p) {
    if (p.maxDecimals >= static_cast<int>(kExactPowersOfTen.size())) {
        return std::nullopt;
    }
    const double scale = kExactPowersOfTen[static_cast<std::size_t>(p.maxDecimals)];
    const double scaled = std::fabs(value) * scale;
    if (!(scaled < kLargestScaled)) {
        return std::nullopt;
    }
    const double whole = std::floor(scaled);
    const double fraction = scaled - whole;
    // 15 significant digits are within 5e-15 of the value, relatively, and
    // the product within 2^-53 of the exact one.
    const double margin = scaled * 1e-14 + 1e-300;
    if (std::fabs(fraction - 0.5) <= margin) {
        return std::nullopt;
    }
    const double k = fraction > 0.5 ? whole + 1.0 : whole;
    if (k == 0.0) {
        return 0.0; // the text of a figure that rounds to zero has no sign
    }
    const double shown = k / scale;
    return value < 0.0 ? -shown : shown;
}

/// Room formatInto needs for the pattern `p`.
std::size_t roomFor(const Pattern &p) {
    return kDigitRoom + static_cast<std::size_t>(p.integerZeros + p.minDecimals) + 2;
}

} // namespace

std::string formatNumber(double value, std::string_view pattern) {
    if (!std::isfinite(value)) {
        return generalNumber(value);
    }
    const Pattern p = parsePattern(pattern);
    std::string out(roomFor(p), '\0');
    out.resize(formatInto(value, p, out.data()));
    return out;
}

double shownValue(double value, std::string_view pattern) {
    if (!std::isfinite(value)) {
        return val(generalNumber(value));
    }
    const Pattern p = parsePattern(pattern);
    if (const std::optional<double> shown = shownByScaling(value, p)) {
        return *shown;
    }
    const std::size_t room = roomFor(p);
    if (room > kDigitRoom + 64) {
        return val(formatNumber(value, pattern)); // a pattern of very many zeros
    }
    std::array<char, kDigitRoom + 64> text;
    return val(std::string_view(text.data(), formatInto(value, p, text.data())));
}

std::string generalNumber(double value) {
    if (value == 0.0) {
        return "0"; // no "-0"
    }
    std::array<char, 40> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    return {buffer.data(), result.ptr};
}

std::string singleText(float value) {
    if (value == 0.0f) {
        return "0";
    }
    std::array<char, 40> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    return {buffer.data(), result.ptr};
}

bool isNumeric(std::string_view text) {
    const std::string_view t = trimmed(text);
    std::size_t i = 0;
    const std::size_t n = t.size();
    if (i < n && isSign(t[i])) {
        ++i;
    }
    int mantissaDigits = 0;
    bool point = false;
    for (; i < n; ++i) {
        if (isDigit(t[i])) {
            ++mantissaDigits;
        } else if (t[i] == '.' && !point) {
            point = true;
        } else {
            break;
        }
    }
    if (mantissaDigits == 0) {
        return false;
    }
    if (i < n && (t[i] == 'e' || t[i] == 'E')) {
        ++i;
        if (i < n && isSign(t[i])) {
            ++i;
        }
        int exponentDigits = 0;
        for (; i < n && isDigit(t[i]); ++i) {
            ++exponentDigits;
        }
        if (exponentDigits == 0) {
            return false;
        }
    }
    return i == n;
}

double val(std::string_view text) {
    if (!isNumeric(text)) {
        return 0.0;
    }
    std::string_view t = trimmed(text);
    if (t.front() == '+') {
        t.remove_prefix(1); // from_chars takes no plus sign
    }
    double value = 0.0;
    const auto result = std::from_chars(t.data(), t.data() + t.size(), value);
    // A value beyond the range of a double counts as 0.
    return result.ec == std::errc() ? value : 0.0;
}

} // namespace arbolex::format
