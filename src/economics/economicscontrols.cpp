#include "economics/economicscontrols.hpp"

#include "economics/economicsmessages.hpp"
#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kEconomicsControlCount> kNames = {"txtInterestRate",
                                                                     "txtEstablishmentCost",
                                                                     "txtAnnualCost",
                                                                     "txtDraws",
                                                                     "txtSeed",
                                                                     "txtPriceSpread",
                                                                     "txtRateLow",
                                                                     "txtRateHigh",
                                                                     "txtCostSpread",
                                                                     "txtCarbonSpread",
                                                                     "cboValuation",
                                                                     "lblStand",
                                                                     "lblRegime",
                                                                     "lblRate",
                                                                     "lblNPV",
                                                                     "lblLEV",
                                                                     "lblEAA",
                                                                     "lblForestValue",
                                                                     "lblIRR",
                                                                     "lblBreakEven",
                                                                     "lblRotation",
                                                                     "lblBiological",
                                                                     "lblEconomic",
                                                                     "lblMAI",
                                                                     "lblYieldClass",
                                                                     "lblCarbon",
                                                                     "lblNpvTimber",
                                                                     "lblNpvCarbon",
                                                                     "lblNpvTotal",
                                                                     "lblLevTimber",
                                                                     "lblLevCarbon",
                                                                     "lblLevTotal",
                                                                     "lblCarbonRotation",
                                                                     "lblOptimiser",
                                                                     "lblMonteCarlo",
                                                                     "cmdCompute",
                                                                     "cmdOptimise",
                                                                     "cmdCancel",
                                                                     "cmdApply",
                                                                     "cmdMonteCarlo",
                                                                     "cmdClose"};
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

std::vector<EconomicsFigure> valueFigures() {
    namespace et = economicstext;
    using C = EconomicsControl;
    return {
        {et::figureNpv(), C::lblNPV},
        {et::figureLev(), C::lblLEV},
        {et::figureEaa(), C::lblEAA},
        {et::figureForestValue(), C::lblForestValue},
        {et::figureIrr(), C::lblIRR},
        {et::figureBreakEven(), C::lblBreakEven},
        {et::figureRotation(), C::lblRotation},
        {et::figureBiological(), C::lblBiological},
        {et::figureEconomic(), C::lblEconomic},
        {et::figureMai(), C::lblMAI},
        {et::figureYieldClass(), C::lblYieldClass},
    };
}

} // namespace arbolex::economics
