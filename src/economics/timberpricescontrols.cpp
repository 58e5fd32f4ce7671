#include "economics/timberpricescontrols.hpp"

#include "prices/pricedata.hpp"
#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kTimberPricesControlCount> kNames = {"txtTimbVal",
                                                                        "lblTimbCat",
                                                                        "fraTimbPrice",
                                                                        "OptCurentPrices",
                                                                        "OptUserPrices",
                                                                        "OptNPVprices",
                                                                        "OptOvraPrices",
                                                                        "lblCTP",
                                                                        "lblUTP",
                                                                        "lblnpvTP",
                                                                        "lblOVRA_TP",
                                                                        "lblNote",
                                                                        "lblNote2",
                                                                        "lblNote_OVRA1",
                                                                        "lblNote_OVRA2",
                                                                        "cmdChangePrices",
                                                                        "cmdClosePricesList",
                                                                        "cmdAssortPrices",
                                                                        "cmdCarbonPrice"};
} // namespace

int elementCount(TimberPricesControl control) {
    switch (control) {
    case TimberPricesControl::txtTimbVal:
        return kPriceFieldCount;
    case TimberPricesControl::lblTimbCat:
        return prices::kPriceClassCount;
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
    const auto found =
        shell::controlElementNamedIn<TimberPricesControl>(kNames, name, elementCount);
    if (!found) {
        return std::nullopt;
    }
    return TimberPricesItem{found->first, found->second};
}

bool isPriceOption(TimberPricesControl control) {
    return control >= TimberPricesControl::OptCurentPrices &&
           control <= TimberPricesControl::OptOvraPrices;
}

} // namespace arbolex::economics
