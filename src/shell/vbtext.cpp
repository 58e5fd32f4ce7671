#include "shell/vbtext.hpp"

#include <charconv>

namespace arbolex::shell {

namespace {

bool isDigit(QChar c) {
    return c >= QLatin1Char('0') && c <= QLatin1Char('9');
}
bool isSign(QChar c) {
    return c == QLatin1Char('+') || c == QLatin1Char('-');
}

} // namespace

bool isNumeric(const QString &text) {
    const QString t = text.trimmed();
    qsizetype i = 0;
    const qsizetype n = t.size();
    if (i < n && isSign(t[i])) {
        ++i;
    }
    int mantissaDigits = 0;
    bool point = false;
    for (; i < n; ++i) {
        if (isDigit(t[i])) {
            ++mantissaDigits;
        } else if (t[i] == QLatin1Char('.') && !point) {
            point = true;
        } else {
            break;
        }
    }
    if (mantissaDigits == 0) {
        return false;
    }
    if (i < n && (t[i] == QLatin1Char('e') || t[i] == QLatin1Char('E'))) {
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

double val(const QString &text) {
    if (!isNumeric(text)) {
        return 0.0;
    }
    QByteArray bytes = text.trimmed().toLatin1();
    if (bytes.startsWith('+')) {
        bytes.remove(0, 1); // from_chars takes no plus sign
    }
    double value = 0.0;
    const auto result = std::from_chars(bytes.constData(), bytes.constData() + bytes.size(), value);
    // A value beyond the range of a double counts as 0.
    return result.ec == std::errc() ? value : 0.0;
}

} // namespace arbolex::shell
