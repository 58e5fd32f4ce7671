#pragma once

#include <QString>

namespace arbolex::shell {

/// True when `text`, without its surrounding blanks, is a plain decimal number:
/// an optional sign, digits with at most one '.' (".5" and "5." count, "." does
/// not) and an optional exponent ("1e5", "2.5E-3"). The decimal separator is
/// always '.', whatever the locale.
bool isNumeric(const QString &text);

/// The value of `text` when isNumeric(text), else 0.
double val(const QString &text);

} // namespace arbolex::shell
