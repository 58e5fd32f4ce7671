#include "economics/pricefieldkeys.hpp"

namespace arbolex::economics {

bool priceKeyAccepted(const QString &fieldText, QChar key) {
    if (key.isDigit() || key == kBackspace) {
        return true;
    }
    return key == QLatin1Char('.') && !fieldText.contains(QLatin1Char('.'));
}

QString typedPrice(const QString &typed) {
    QString text;
    for (const QChar c : typed) {
        // Backspace is accepted but types nothing into an emptied field's end.
        if (c != kBackspace && priceKeyAccepted(text, c)) {
            text += c;
        }
    }
    return text;
}

} // namespace arbolex::economics
