#include "economics/carbonpricecontrols.hpp"

#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kCarbonPriceControlCount> kNames = {
    "txtCarbonPrice", "OptPaymentNone",       "OptPaymentFlow",     "OptPaymentUnits",
    "lblPaymentNone", "lblPaymentFlow",       "lblPaymentUnits",    "lblCarbonDesc",
    "lblConstants",   "cmdChangeCarbonPrice", "cmdCloseCarbonPrice"};
} // namespace

QString carbonPriceControlName(CarbonPriceControl control) {
    return shell::controlNameIn(kNames, control);
}

std::optional<CarbonPriceControl> carbonPriceControlFromName(const QString &name) {
    return shell::controlNamedIn<CarbonPriceControl>(kNames, name);
}

bool isPaymentOption(CarbonPriceControl control) {
    return control >= CarbonPriceControl::OptPaymentNone &&
           control <= CarbonPriceControl::OptPaymentUnits;
}

} // namespace arbolex::economics
