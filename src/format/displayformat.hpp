#pragma once

// The texts figures are shown in: classic number patterns ("##0.0", "#0.000",
// "#"), the shortest text of a number, and reading a typed or shown text back
// as a number. Standard library only, so a rotation grown without the windows
// reads a shown figure back exactly as the windows do.

#include <string>
#include <string_view>

namespace arbolex::format {

/// Formats `value` with a classic number pattern such as "##0.0", "#0.000",
/// "#", "#.0" or "0.00##".
///
/// - '0' is a mandatory digit and '#' an optional one; the integer part is
///   always printed in full, whatever the number of '#'.
/// - The decimals are the '0' and '#' after '.': the value is rounded half away
///   from zero to all of them, then trailing zeros are dropped down to the
///   count of '0' ("0.00##": 5 gives "5.00", 5.12345 gives "5.1235").
/// - Rounding works on the value's 15 significant decimal digits, so a number
///   typed as 2.675 rounds to "2.68" although its binary value lies below.
/// - An integer part with no '0' is left out when it is zero ("#" of 0 is "",
///   "#.0" of 0.5 is ".5").
/// - A negative value gets '-', unless it rounds to zero.
/// - The decimal point is always '.', whatever the locale.
std::string formatNumber(double value, std::string_view pattern);

/// Plain number text: the shortest text that reads back as the same double,
/// with '.' ("40", "0.5", "12.25", "1e+20").
std::string generalNumber(double value);

/// The same at single precision, so 0.1f gives "0.1".
std::string singleText(float value);

/// True when `text`, without its surrounding blanks (ASCII white space), is a
/// plain decimal number: an optional sign, digits with at most one '.' (".5"
/// and "5." count, "." does not) and an optional exponent ("1e5", "2.5E-3").
/// The decimal separator is always '.', whatever the locale.
bool isNumeric(std::string_view text);

/// The value of `text` when isNumeric(text), else 0 (a value beyond the range
/// of a double counts as 0 too).
double val(std::string_view text);

/// The figure a shown text holds: `value` formatted with `pattern`, then read
/// back. Where a figure is read back from what the table shows, this says so.
/// The same as val(formatNumber(value, pattern)), without making the text a string.
double shownValue(double value, std::string_view pattern);

} // namespace arbolex::format
