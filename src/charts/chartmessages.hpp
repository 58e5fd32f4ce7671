#pragma once

// Every text of the charts, in one place: a changed caption is one edit.

#include <QString>

namespace arbolex::charts::text {

inline QString axisAge() {
    return QStringLiteral("Age (years)");
}
inline QString axisYear() {
    return QStringLiteral("Year of the rotation (stand age, years)");
}

// Stand development
inline QString titleStand() {
    return QStringLiteral("Stand development");
}
inline QString axisVolume() {
    return QStringLiteral("Volume (m³/ha)");
}
inline QString axisStocking() {
    return QStringLiteral("Stocking (stems/ha)");
}
inline QString axisHeightBasalArea() {
    return QStringLiteral("Top height (m), BA (m²/ha)");
}
inline QString seriesTopHeight() {
    return QStringLiteral("Top height");
}
inline QString seriesStocking() {
    return QStringLiteral("Stocking");
}
inline QString seriesBasalArea() {
    return QStringLiteral("Basal area");
}
inline QString seriesVolume() {
    return QStringLiteral("Standing volume");
}
inline QString seriesTotalProduction() {
    return QStringLiteral("Total production");
}
inline QString noteStand() {
    return QStringLiteral("Thinnings and the final cut show as drops of the standing crop.");
}

// Increments
inline QString titleIncrements() {
    return QStringLiteral("Volume increment");
}
inline QString axisIncrement() {
    return QStringLiteral("Increment (m³/ha/yr)");
}
inline QString seriesCai() {
    return QStringLiteral("Current annual increment (CAI)");
}
inline QString seriesMai() {
    return QStringLiteral("Mean annual increment (MAI)");
}
/// Label of the culmination of the MAI, with the age and the yield class.
inline QString markCulmination(int age, int yieldClass) {
    return QStringLiteral("YC %2 at %1 yrs").arg(age).arg(yieldClass);
}
inline QString noteNotCulminated() {
    return QStringLiteral("The MAI has not culminated yet: no yield class.");
}
inline QString noteYieldClass(int yieldClass) {
    return QStringLiteral("Yield class %1").arg(yieldClass);
}

// Cash flow
inline QString titleCashFlow() {
    return QStringLiteral("Cash flow");
}
inline QString axisCashFlow() {
    return QStringLiteral("Yearly cash flow (€/ha)");
}
inline QString axisCumulative() {
    return QStringLiteral("Cumulative discounted (€/ha)");
}
inline QString unitMoney() {
    return QStringLiteral("€/ha");
}
inline QString seriesCashFlow() {
    return QStringLiteral("Yearly cash flow");
}
inline QString seriesCumulative() {
    return QStringLiteral("Cumulative discounted cash flow");
}
inline QString markPayback(int year) {
    return QStringLiteral("Pays back at %1").arg(year);
}
/// The net present value and its interest rate, e.g. "NPV 1234 €/ha at 5.00 %".
inline QString noteNpv(const QString &npv, const QString &rate) {
    return QStringLiteral("Net present value %1 €/ha at %2 %").arg(npv, rate);
}

// Carbon
inline QString titleCarbon() {
    return QStringLiteral("Carbon");
}
inline QString axisCarbon() {
    return QStringLiteral("Carbon (t CO₂e/ha)");
}
inline QString unitCarbon() {
    return QStringLiteral("t CO₂e/ha");
}
inline QString seriesCarbonTrees() {
    return QStringLiteral("Trees");
}
inline QString seriesCarbonProducts() {
    return QStringLiteral("Products");
}
inline QString seriesNetRemoval() {
    return QStringLiteral("Net removal");
}
inline QString seriesUnits() {
    return QStringLiteral("Units issued");
}
inline QString seriesLongTermAverage() {
    return QStringLiteral("Average stock");
}
/// The long-term average stock and the units issued, t CO₂e/ha.
inline QString noteCarbon(const QString &average, const QString &units) {
    return QStringLiteral("Long-term average %1 t CO₂e/ha · %2 t CO₂e/ha of units issued")
        .arg(average, units);
}
inline QString noteCarbonBeforeFinalCut() {
    return QStringLiteral("The trees of the table's rows: the account of products, removals "
                          "and units follows the final cut.");
}

// Harvest forecast of an estate
inline QString titleHarvest() {
    return QStringLiteral("Harvest forecast by year and species");
}
inline QString axisHarvestVolume() {
    return QStringLiteral("Volume harvested, m³ to 7 cm top");
}
inline QString axisHarvestYear() {
    return QStringLiteral("Year");
}

// The chart panel
/// The tabs' captions, shorter than the charts' titles: four fit beside the table.
inline QString tabStand() {
    return QStringLiteral("Stand");
}
inline QString tabIncrements() {
    return QStringLiteral("Increment");
}
inline QString tabCashFlow() {
    return QStringLiteral("Cash flow");
}
inline QString tabCarbon() {
    return QStringLiteral("Carbon");
}
inline QString buttonExportPng() {
    return QStringLiteral("Export PNG…");
}
inline QString buttonExportSvg() {
    return QStringLiteral("Export SVG…");
}
inline QString filterPng() {
    return QStringLiteral("PNG image (*.png)");
}
inline QString filterSvg() {
    return QStringLiteral("SVG drawing (*.svg)");
}
inline QString emptyStand() {
    return QStringLiteral("Grow a stand to see its chart.");
}
inline QString emptyCarbon() {
    return QStringLiteral("Grow a stand to see the carbon in its trees.");
}
inline QString emptyCashFlow() {
    return QStringLiteral("No cash flow yet: close the rotation with a final cut and "
                          "view its net present value.");
}
inline QString dockCharts() {
    return QStringLiteral("Charts");
}

} // namespace arbolex::charts::text
