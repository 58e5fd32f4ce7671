#pragma once

#include "rotation/assortmentprices.hpp"

#include <QString>

#include <optional>

namespace arbolex::economics {

/// The controls of the assortment prices window `frmAssortPrices`. The first
/// two are control arrays of one element per top-diameter class:
/// `txtAsmtVal`(0 to 2), the prices, and `lblAsmtCat`(0 to 2), their captions.
enum class AssortPricesControl {
    txtAsmtVal,
    lblAsmtCat,
    lblAsmtDesc,
    cmdChangeAsmtPrices,
    cmdCloseAsmtPrices,
};

inline constexpr int kAssortPricesControlCount =
    static_cast<int>(AssortPricesControl::cmdCloseAsmtPrices) + 1;

/// One control of the window: a single control (index 0) or one element of
/// a control array.
struct AssortPricesItem {
    AssortPricesControl control = AssortPricesControl::txtAsmtVal;
    int index = 0;
    friend bool operator==(const AssortPricesItem &, const AssortPricesItem &) = default;
};

/// The control's name: "cmdChangeAsmtPrices", or "txtAsmtVal(2)" for an element.
QString controlName(AssortPricesItem item);
/// The control named `name`, if the window has one (an element only within
/// its array's bounds).
std::optional<AssortPricesItem> assortPricesItemFromName(const QString &name);

} // namespace arbolex::economics
