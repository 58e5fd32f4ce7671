#pragma once

// The key filter the price fields share: typed digits and one decimal point.

#include <QChar>
#include <QString>

namespace arbolex::economics {

/// The typed character of the Backspace key.
inline constexpr QChar kBackspace(u'\b');

/// Whether a price field that takes typing and holds `fieldText` accepts
/// `key`: digits, Backspace, and the decimal point while it holds none.
bool priceKeyAccepted(const QString &fieldText, QChar key);

/// What a price field holds once emptied and typed `typed` into, each
/// character through priceKeyAccepted.
QString typedPrice(const QString &typed);

} // namespace arbolex::economics
