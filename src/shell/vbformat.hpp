#pragma once

#include <QString>
#include <QStringView>

namespace arbolex::shell {

/// format::formatNumber as a QString: `value` in a classic number pattern
/// such as "##0.0", "#0.000", "#", "#.0" or "0.00##".
QString formatNumber(double value, QStringView pattern);

/// format::generalNumber: the shortest text that reads back as the same
/// double, with '.' ("40", "0.5", "12.25", "1e+20").
QString generalNumber(double value);

/// The same at single precision, so 0.1f gives "0.1".
QString singleText(float value);

} // namespace arbolex::shell
