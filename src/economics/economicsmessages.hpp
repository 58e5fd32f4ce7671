#pragma once

// Every text the economics window shows, in one place.

#include <QString>
#include <QStringList>

namespace arbolex::economics::economicstext {

inline QString economicsCaption() {
    return QStringLiteral("Economics of the rotation");
}
inline QString titleEconomics() {
    return QStringLiteral("Economics");
}
inline QString buttonEconomics() {
    return QStringLiteral("Economics…");
}
inline QString hintEconomics() {
    return QStringLiteral("Value of the rotation (NPV, LEV, IRR), the best rotation age, the "
                          "regime optimiser and how sure the figures are.");
}
inline QString tabRotation() {
    return QStringLiteral("Rotation");
}
inline QString tabOptimiser() {
    return QStringLiteral("Optimiser");
}
inline QString tabSensitivity() {
    return QStringLiteral("Sensitivity");
}
inline QString tabMonteCarlo() {
    return QStringLiteral("Monte Carlo");
}
inline QString labelInterestRate() {
    return QStringLiteral("Interest rate (%):");
}
inline QString labelEstablishmentCost() {
    return QStringLiteral("Establishment cost (€/ha):");
}
inline QString labelValuation() {
    return QStringLiteral("Valued by:");
}
/// The two valuations of the choice cboValuation; a script may type the
/// first word ("standing", "assortment").
inline QString valuationStanding() {
    return QStringLiteral("Standing price of the mean tree");
}
inline QString valuationAssortments() {
    return QStringLiteral("Assortment prices (7-14, 14-20, >20 cm)");
}
inline QString labelAnnualCost() {
    return QStringLiteral("Annual cost (€/ha/yr):");
}
inline QString labelDraws() {
    return QStringLiteral("Draws:");
}
inline QString labelSeed() {
    return QStringLiteral("Seed:");
}
inline QString labelPriceSpread() {
    return QStringLiteral("Price spread (%):");
}
inline QString labelRateFrom() {
    return QStringLiteral("Rate from (%):");
}
inline QString labelRateTo() {
    return QStringLiteral("to (%):");
}
inline QString labelCostSpread() {
    return QStringLiteral("Cost spread (%):");
}
inline QString labelCarbonSpread() {
    return QStringLiteral("Carbon price spread (%):");
}
inline QString hintCarbonSpread() {
    return QStringLiteral("Standard deviation of the logarithm of the carbon price level, "
                          "drawn only when carbon is paid.");
}
inline QString buttonCompute() {
    return QStringLiteral("Compute");
}
inline QString buttonOptimise() {
    return QStringLiteral("Optimise");
}
inline QString buttonCancel() {
    return QStringLiteral("Cancel");
}
inline QString buttonApply() {
    return QStringLiteral("Apply");
}
inline QString hintEstablishmentCost() {
    return QStringLiteral("Paid at planting: it counts in the LEV, the annuity, the IRR, the "
                          "break-even and the economic rotation, never in the NPV of the stand "
                          "standing today. Kept with the sub-compartment.");
}
inline QString hintAnnualCost() {
    return QStringLiteral("Paid every year from age 1 to the final cut, in every figure. Kept "
                          "with the sub-compartment.");
}
inline QString hintApply() {
    return QStringLiteral("Writes the chosen regime into the projection table: clear, grow, "
                          "thin and final cut, as if typed by hand.");
}
inline QString buttonRun() {
    return QStringLiteral("Run");
}
inline QString buttonClose() {
    return QStringLiteral("Close");
}

// ---- Figures ------------------------------------------------------------------

inline QString figureNpv() {
    return QStringLiteral("Net present value (NPV)");
}
inline QString figureLev() {
    return QStringLiteral("Land expectation value (LEV)");
}
inline QString figureEaa() {
    return QStringLiteral("Equivalent annual annuity");
}
inline QString figureForestValue() {
    return QStringLiteral("Forest value (stand and land)");
}
inline QString figureIrr() {
    return QStringLiteral("Internal rate of return");
}
inline QString figureBreakEven() {
    return QStringLiteral("Break-even price factor");
}
inline QString figureRotation() {
    return QStringLiteral("Rotation valued");
}
inline QString figureBiological() {
    return QStringLiteral("Biological rotation");
}
inline QString figureEconomic() {
    return QStringLiteral("Economic rotation");
}
inline QString figureMai() {
    return QStringLiteral("MAI at the final cut");
}
/// What the figures mean, in a forester's words, under them.
inline QString figureNotes() {
    return QStringLiteral(
        "NPV: the stand's cash flows from today to the final cut, discounted to today. "
        "LEV: bare land planted now and managed this way for ever. Annuity: the LEV as a "
        "yearly rent. Forest value: the NPV and, after the final cut, the land's LEV. "
        "IRR: the rate at which planting just pays. Break-even: the share of today's timber "
        "prices at which the LEV is 0. Timber at the prices named above (long-term average "
        "standing prices, or assortment prices); money per hectare. The costs and other "
        "revenues typed into the net present value window count in every figure; the "
        "establishment cost, paid at planting, in all but the NPV.");
}
inline QString figureYieldClass() {
    return QStringLiteral("Yield class");
}

// ---- Timber and carbon ------------------------------------------------------------------

inline QString columnTimber() {
    return QStringLiteral("Timber");
}
inline QString columnCarbon() {
    return QStringLiteral("Carbon");
}
inline QString columnTotal() {
    return QStringLiteral("Total");
}
inline QString rowNpv() {
    return QStringLiteral("NPV");
}
inline QString rowLev() {
    return QStringLiteral("LEV");
}
/// The carbon money named, over the side-by-side figures.
inline QString carbonHeading(const QString &pricing) {
    return QStringLiteral("Timber and ") + pricing;
}
inline QString carbonNotPaid() {
    return QStringLiteral("not paid");
}
/// What paying carbon does to the economic rotation.
inline QString carbonMovesRotation(const QString &pricing, int without, int with) {
    return QStringLiteral("%1 moves the economic rotation from %2 to %3 years.")
        .arg(pricing)
        .arg(without)
        .arg(with);
}
inline QString carbonKeepsRotation(const QString &pricing, int age) {
    return QStringLiteral("%1 leaves the economic rotation at %2 years.").arg(pricing).arg(age);
}
inline QString carbonNotCounted() {
    return QStringLiteral("Carbon is not paid: every figure is the timber's. Choose a payment "
                          "in the carbon price window (Timber Prices → Carbon Price...).");
}
/// The side-by-side figures as one line each on the report's economics page.
inline QString figureNpvSplit() {
    return QStringLiteral("NPV: timber + carbon");
}
inline QString figureLevSplit() {
    return QStringLiteral("LEV: timber + carbon");
}
inline QString figureCarbon() {
    return QStringLiteral("Carbon");
}
inline QString markEconomicWithoutCarbon() {
    return QStringLiteral("Timber alone");
}
inline QString noFigure() {
    return QStringLiteral("—");
}
inline QString irrNoSignChange() {
    return QStringLiteral("none: every cash flow has one sign, so there is no outlay to earn "
                          "a return on");
}
inline QString irrNoRoot() {
    return QStringLiteral("none: no rate from −99 % to 1000 % makes the value 0");
}
inline QString irrMoreThanOneRoot() {
    return QStringLiteral("none: more than one rate makes the value 0");
}
inline QString breakEvenNone() {
    return QStringLiteral("none: the timber earns nothing");
}

/// Carbon and other revenues alone pay for the land.
inline QString breakEvenLandPays() {
    return QStringLiteral("none: the land pays without timber revenue");
}

// ---- Captions of the panels, charts and tables ---------------------------------------

/// "at 3.00 % a year": every panel names the rate its figures used.
inline QString atRate(const QString &rate) {
    return QStringLiteral("at ") + rate + QStringLiteral(" % a year");
}
inline QString panelValue() {
    return QStringLiteral("Value of your regime");
}
inline QString panelRotations() {
    return QStringLiteral("NPV, LEV and MAI by rotation age");
}
inline QString panelOptimiser() {
    return QStringLiteral("The five regimes of the largest LEV");
}
inline QString panelTornadoNpv() {
    return QStringLiteral("NPV with one factor moved");
}
inline QString panelTornadoLev() {
    return QStringLiteral("LEV with one factor moved");
}
inline QString panelMonteCarlo() {
    return QStringLiteral("NPV over random prices, rates and costs");
}
inline QString axisRotationAge() {
    return QStringLiteral("Rotation age (years)");
}
inline QString axisMoney() {
    return QStringLiteral("€/ha");
}
inline QString axisMai() {
    return QStringLiteral("MAI (m³/ha/yr)");
}
inline QString axisNpv() {
    return QStringLiteral("NPV (€/ha)");
}
inline QString axisDraws() {
    return QStringLiteral("Draws");
}
inline QString seriesNpv() {
    return QStringLiteral("NPV (€/ha)");
}
inline QString seriesLev() {
    return QStringLiteral("LEV (€/ha)");
}
inline QString seriesMai() {
    return QStringLiteral("MAI (m³/ha/yr)");
}
inline QString markBiological() {
    return QStringLiteral("Biological");
}
inline QString markEconomic() {
    return QStringLiteral("Economic");
}
inline QString seriesLow() {
    return QStringLiteral("Low end");
}
inline QString seriesHigh() {
    return QStringLiteral("High end");
}
/// Headers of the optimiser's table, in order.
inline QStringList regimeHeaders() {
    return {QStringLiteral("Rank"),
            QStringLiteral("First thinning\n(age)"),
            QStringLiteral("Every\n(years)"),
            QStringLiteral("Volume\n(m³/ha)"),
            QStringLiteral("Last thinning\n(age)"),
            QStringLiteral("Rotation\n(years)"),
            QStringLiteral("LEV\n(€/ha)"),
            QStringLiteral("NPV\n(€/ha)"),
            QStringLiteral("Production\n(m³/ha)"),
            QStringLiteral("Gain in LEV\n(€/ha)")};
}
/// How the optimiser searched, under its table: a thinning removes at most
/// `removalPercent` of the standing volume and leaves `minStocking` stems/ha.
inline QString optimiserNotes(const QString &removalPercent, const QString &minStocking) {
    return QStringLiteral(
               "The search grows every regime of a coarse grid (first thinning every third "
               "year, every 3, 5, 7 or 10 years, 20 to 80 m³/ha a thinning, or no thinning) "
               "and every final cut, then refines around the best in whole years and 5 m³/ha. "
               "A thinning removes at most ") +
           removalPercent + QStringLiteral(" % of the standing volume and leaves at least ") +
           minStocking +
           QStringLiteral(" stems/ha. Production is the standing volume at the final cut and "
                          "all thinnings; the gain is the regime's LEV less yours.");
}
inline QString regimeYours() {
    return QStringLiteral("Yours");
}
inline QString noThinning() {
    return QStringLiteral("no thinning");
}

// ---- Messages --------------------------------------------------------------------

inline QString faultRate() {
    return QStringLiteral("FAULT - the interest rate must be a number above 0: the land "
                          "expectation value needs interest.");
}
inline QString faultCost() {
    return QStringLiteral("FAULT - a cost must be a number of 0 or more (€/ha).");
}
inline QString faultDraws() {
    return QStringLiteral("FAULT - the draws must be a whole number from 100 to 100000.");
}
inline QString faultSeed() {
    return QStringLiteral("FAULT - the seed must be a whole number.");
}
inline QString faultSpread() {
    return QStringLiteral("FAULT - a spread must be a number from 0 to 100 (%).");
}
inline QString faultRateRange() {
    return QStringLiteral("FAULT - the rates of the draws must be above 0, the first below "
                          "the second.");
}
inline QString noStand() {
    return QStringLiteral("FAULT - there is no stand to value: grow the sub-compartment first.");
}
inline QString nothingToApply() {
    return QStringLiteral("FAULT - run the optimiser and choose one of its regimes first.");
}
inline QString applyStopped() {
    return QStringLiteral("ERROR - the regime could not be written into the table: ");
}
inline QString optimiserFailed() {
    return QStringLiteral("ERROR - the optimiser could not grow the stand: ");
}

} // namespace arbolex::economics::economicstext
