#include "economics/timberpricescontrols.hpp"

#include "economics/pricedata.hpp"
#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kTimberPricesControlCount> kNames = {
    "txtTimbVal",      "lblTimbCat",        "fraTimbPrice", "OptCurentPrices", "OptUserPrices",
    "OptNPVprices",    "OptOvraPrices",     "lblCTP",       "lblUTP",          "lblnpvTP",
    "lblOVRA_TP",      "lblNote",           "lblNote2",     "lblNote_OVRA1",   "lblNote_OVRA2",
    "cmdChangePrices", "cmdClosePricesList"};
} // namespace

int elementCount(TimberPricesControl control) {
    switch (control) {
    case TimberPricesControl::txtTimbVal:
        return kPriceFieldCount;
    case TimberPricesControl::lblTimbCat:
        return kPriceClassCount;
    case TimberPricesControl::fraTimbPrice:
        return kPriceBlockCount;
    default:
        return 1;
    }
}

QString controlName(TimberPricesItem item) {
    QString name = shell::controlNameIn(kNames, item.control);
    if (elementCount(item.control) == 1) {
        return name;
    }
    return name + QLatin1Char('(') + QString::number(item.index) + QLatin1Char(')');
}

std::optional<TimberPricesItem> timberPricesItemFromName(const QString &name) {
    const qsizetype open = name.indexOf(QLatin1Char('('));
    const auto control =
        shell::controlNamedIn<TimberPricesControl>(kNames, open < 0 ? name : name.left(open));
    if (!control) {
        return std::nullopt;
    }
    const bool isArray = elementCount(*control) > 1;
    if (open < 0) {
        return isArray ? std::nullopt : std::optional(TimberPricesItem{*control, 0});
    }
    if (!isArray || !name.endsWith(QLatin1Char(')'))) {
        return std::nullopt;
    }
    bool ok = false;
    const int index = name.mid(open + 1, name.size() - open - 2).toInt(&ok);
    if (!ok || index < 0 || index >= elementCount(*control)) {
        return std::nullopt;
    }
    return TimberPricesItem{*control, index};
}

bool isPriceOption(TimberPricesControl control) {
    return control >= TimberPricesControl::OptCurentPrices &&
           control <= TimberPricesControl::OptOvraPrices;
}

} // namespace arbolex::economics
