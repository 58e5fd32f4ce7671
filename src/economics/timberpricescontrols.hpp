#pragma once

#include <QString>

#include <optional>

namespace arbolex::economics {

/// The controls of the timber prices window `frmTimberPrices`. The first three
/// are control arrays: `txtTimbVal`(0 to 51), `lblTimbCat`(0 to 12) and
/// `fraTimbPrice`(0 to 3).
enum class TimberPricesControl {
    txtTimbVal,
    lblTimbCat,
    fraTimbPrice,
    // choosing the prices in use, and what each list is
    OptCurentPrices,
    OptUserPrices,
    OptNPVprices,
    OptOvraPrices,
    lblCTP,
    lblUTP,
    lblnpvTP,
    lblOVRA_TP,
    // notes
    lblNote,
    lblNote2,
    lblNote_OVRA1,
    lblNote_OVRA2,
    // commands
    cmdChangePrices,
    cmdClosePricesList,
    /// Opens the assortment prices window.
    cmdAssortPrices,
    /// Opens the carbon price window.
    cmdCarbonPrice,
};

inline constexpr int kTimberPricesControlCount =
    static_cast<int>(TimberPricesControl::cmdCarbonPrice) + 1;

/// Price fields: four blocks of 13, one per list.
inline constexpr int kPriceFieldCount = 52;
/// Number of lists, blocks and frames.
inline constexpr int kPriceBlockCount = 4;

/// One control of the window: a single control (index 0) or one element of
/// a control array.
struct TimberPricesItem {
    TimberPricesControl control = TimberPricesControl::txtTimbVal;
    int index = 0;
    friend bool operator==(const TimberPricesItem &, const TimberPricesItem &) = default;
};

/// Elements of a control: 52, 13 or 4 for the arrays, 1 for the others.
int elementCount(TimberPricesControl control);
/// The control's name: "OptUserPrices", or "txtTimbVal(13)" for an element.
QString controlName(TimberPricesItem item);
/// The control named `name`, if the window has one (an element only within
/// its array's bounds).
std::optional<TimberPricesItem> timberPricesItemFromName(const QString &name);
/// True for the four option buttons.
bool isPriceOption(TimberPricesControl control);

} // namespace arbolex::economics
