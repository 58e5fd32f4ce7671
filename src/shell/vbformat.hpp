#pragma once

#include <QString>
#include <QStringView>

namespace arbolex::shell {

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
QString formatNumber(double value, QStringView pattern);

/// Plain number text: the shortest text that reads back as the same double,
/// with '.' ("40", "0.5", "12.25", "1e+20").
QString generalNumber(double value);

/// The same at single precision, so 0.1f gives "0.1".
QString singleText(float value);

} // namespace arbolex::shell
