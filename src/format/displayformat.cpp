#include "format/displayformat.hpp"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdlib>

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

/// Adds one unit in the last digit of a string of decimal digits; returns
/// false when the carry runs out of the left end.
bool incrementDigits(std::string &digits) {
    // Reverse iterators rather than std::views::reverse, which clang 14 cannot
    // compile with the standard library of gcc 12 (the fuzzing build).
    for (auto digit = digits.rbegin(); digit != digits.rend(); ++digit) {
        if (*digit != '9') {
            ++*digit;
            return true;
        }
        *digit = '0';
    }
    return false;
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

std::string formatNumber(double value, std::string_view pattern) {
    if (!std::isfinite(value)) {
        return generalNumber(value);
    }
    const Pattern p = parsePattern(pattern);

    // The magnitude as 15 significant digits "d.dddddddddddddde±XX".
    std::array<char, 40> buffer{};
    const auto result =
        std::to_chars(buffer.data(), buffer.data() + buffer.size(), std::fabs(value),
                      std::chars_format::scientific, kSignificantDigits - 1);
    const std::string text(buffer.data(), result.ptr);
    const std::size_t e = text.find('e');
    const std::string mantissa = text.substr(0, 1) + text.substr(2, e - 2);
    const int pointAt = std::atoi(text.c_str() + e + 1) + 1; // digits before the point

    std::string integerDigits;
    std::string decimals;
    if (value == 0.0) {
        // nothing: both parts stay empty
    } else if (pointAt <= 0) {
        decimals = std::string(static_cast<std::size_t>(-pointAt), '0') + mantissa;
    } else if (pointAt >= kSignificantDigits) {
        integerDigits =
            mantissa + std::string(static_cast<std::size_t>(pointAt) - mantissa.size(), '0');
    } else {
        integerDigits = mantissa.substr(0, static_cast<std::size_t>(pointAt));
        decimals = mantissa.substr(static_cast<std::size_t>(pointAt));
    }

    // Round half away from zero to the pattern's decimals.
    const auto maxDecimals = static_cast<std::size_t>(p.maxDecimals);
    if (decimals.size() > maxDecimals) {
        const bool up = decimals[maxDecimals] >= '5';
        decimals.resize(maxDecimals);
        if (up) {
            std::string all = integerDigits + decimals;
            if (!incrementDigits(all)) {
                all.insert(all.begin(), '1');
            }
            integerDigits = all.substr(0, all.size() - decimals.size());
            decimals = all.substr(all.size() - decimals.size());
        }
    }

    // Optional decimals lose their trailing zeros; mandatory ones are padded.
    const auto minDecimals = static_cast<std::size_t>(p.minDecimals);
    while (decimals.size() > minDecimals && decimals.back() == '0') {
        decimals.pop_back();
    }
    decimals.resize(std::max(decimals.size(), minDecimals), '0');

    const std::size_t firstNonZero = integerDigits.find_first_not_of('0');
    integerDigits.erase(0, firstNonZero == std::string::npos ? integerDigits.size() : firstNonZero);
    const auto integerZeros = static_cast<std::size_t>(p.integerZeros);
    if (integerDigits.size() < integerZeros) {
        integerDigits.insert(0, integerZeros - integerDigits.size(), '0');
    }

    const bool isZero = (integerDigits + decimals).find_first_not_of('0') == std::string::npos;
    std::string out;
    if (value < 0 && !isZero) {
        out += '-';
    }
    out += integerDigits;
    if (p.hasPoint) {
        out += '.';
        out += decimals;
    }
    return out;
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
