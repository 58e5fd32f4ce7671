#pragma once

#include <QString>

#include <optional>
#include <vector>

namespace arbolex::economics {

/// The controls of the economics window `frmEconomics` that its logic reads or
/// sets.
enum class EconomicsControl {
    // what the money is counted with
    txtInterestRate,
    txtEstablishmentCost,
    txtAnnualCost,
    // the Monte Carlo draws
    txtDraws,
    txtSeed,
    txtPriceSpread,
    txtRateLow,
    txtRateHigh,
    txtCostSpread,
    txtCarbonSpread,
    // how the harvests are valued: by the mean tree's standing price or by assortments
    cboValuation,
    // what the window tells
    lblStand,
    lblRegime,
    lblRate,
    lblNPV,
    lblLEV,
    lblEAA,
    lblForestValue,
    lblIRR,
    lblBreakEven,
    lblRotation,
    lblBiological,
    lblEconomic,
    lblMAI,
    lblYieldClass,
    // timber and carbon side by side: the carbon money named, NPV and LEV of
    // each and their total, and what carbon does to the economic rotation
    lblCarbon,
    lblNpvTimber,
    lblNpvCarbon,
    lblNpvTotal,
    lblLevTimber,
    lblLevCarbon,
    lblLevTotal,
    lblCarbonRotation,
    lblOptimiser,
    lblMonteCarlo,
    // commands
    cmdCompute,
    cmdOptimise,
    cmdCancel,
    cmdApply,
    cmdMonteCarlo,
    cmdClose,
};

inline constexpr int kEconomicsControlCount = static_cast<int>(EconomicsControl::cmdClose) + 1;

/// The control's name ("txtInterestRate").
QString economicsControlName(EconomicsControl control);
/// The control named `name`, if the window has one.
std::optional<EconomicsControl> economicsControlFromName(const QString &name);
/// True for the fields the user types into (and the valuation choice).
bool isEconomicsField(EconomicsControl control);

/// A figure of the panel "Value of your regime": its caption and the label
/// that shows it.
struct EconomicsFigure {
    QString caption;
    EconomicsControl label;
};
/// The figures of the panel in order, from the net present value to the
/// yield class; the window and the report show them alike.
std::vector<EconomicsFigure> valueFigures();

} // namespace arbolex::economics
