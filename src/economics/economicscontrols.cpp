#include "economics/economicscontrols.hpp"

#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kEconomicsControlCount> kNames = {
    "txtInterestRate", "txtEstablishmentCost",
    "txtAnnualCost",   "txtDraws",
    "txtSeed",         "txtPriceSpread",
    "txtRateLow",      "txtRateHigh",
    "txtCostSpread",   "cboValuation",
    "lblStand",        "lblRegime",
    "lblRate",         "lblNPV",
    "lblLEV",          "lblEAA",
    "lblForestValue",  "lblIRR",
    "lblBreakEven",    "lblRotation",
    "lblBiological",   "lblEconomic",
    "lblMAI",          "lblYieldClass",
    "lblOptimiser",    "lblMonteCarlo",
    "cmdCompute",      "cmdOptimise",
    "cmdCancel",       "cmdApply",
    "cmdMonteCarlo",   "cmdClose"};
} // namespace

QString economicsControlName(EconomicsControl control) {
    return shell::controlNameIn(kNames, control);
}

std::optional<EconomicsControl> economicsControlFromName(const QString &name) {
    return shell::controlNamedIn<EconomicsControl>(kNames, name);
}

bool isEconomicsField(EconomicsControl control) {
    return control <= EconomicsControl::cboValuation;
}

} // namespace arbolex::economics
