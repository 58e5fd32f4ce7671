#include "economics/assortpricescontrols.hpp"

#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {

constexpr std::array<const char *, kAssortPricesControlCount> kNames = {
    "txtAsmtVal", "lblAsmtCat", "lblAsmtDesc", "cmdChangeAsmtPrices", "cmdCloseAsmtPrices"};

/// Elements of a control: one per class for the arrays, 1 for the others.
int elements(AssortPricesControl control) {
    return control == AssortPricesControl::txtAsmtVal || control == AssortPricesControl::lblAsmtCat
               ? rotation::kAssortmentClassCount
               : 1;
}

} // namespace

QString controlName(AssortPricesItem item) {
    QString name = shell::controlNameIn(kNames, item.control);
    if (elements(item.control) == 1) {
        return name;
    }
    return name + QLatin1Char('(') + QString::number(item.index) + QLatin1Char(')');
}

std::optional<AssortPricesItem> assortPricesItemFromName(const QString &name) {
    const auto found = shell::controlElementNamedIn<AssortPricesControl>(kNames, name, elements);
    if (!found) {
        return std::nullopt;
    }
    return AssortPricesItem{found->first, found->second};
}

} // namespace arbolex::economics
