#pragma once

// Every text of the printed report, in one place: a changed caption is one edit.

#include <QString>
#include <QStringList>

namespace arbolex::charts::text {

inline QString reportTitle() {
    return QStringLiteral("ARBOLEX — Sub-compartment report");
}
inline QString forest() {
    return QStringLiteral("Forest");
}
inline QString compartment() {
    return QStringLiteral("Compartment");
}
inline QString subCompartment() {
    return QStringLiteral("Sub-compartment");
}
inline QString description() {
    return QStringLiteral("Description");
}
inline QString captionModel() {
    return QStringLiteral("Growth model");
}
inline QString printed() {
    return QStringLiteral("Printed");
}
inline QString sectionInputs() {
    return QStringLiteral("Stand at the start of the projection");
}
inline QString sectionProjection() {
    return QStringLiteral("Stand projection");
}
inline QString sectionSummary() {
    return QStringLiteral("Rotation summary");
}
inline QString sectionCashFlow() {
    return QStringLiteral("Cash flow and net present value");
}
inline QString sectionCharts() {
    return QStringLiteral("Charts");
}
inline QString inputAge() {
    return QStringLiteral("Age (yrs)");
}
inline QString inputStocking() {
    return QStringLiteral("Stocking (N/ha)");
}
inline QString inputTopHeight() {
    return QStringLiteral("Top height (m)");
}
inline QString inputBasalArea() {
    return QStringLiteral("Basal area (m²/ha)");
}
inline QString inputDbh() {
    return QStringLiteral("Mean DBH (cm)");
}
inline QString inputNetArea() {
    return QStringLiteral("Net area (ha)");
}
inline QString captionSiteIndex() {
    return QStringLiteral("Site index (m at 30 years)");
}
inline QString captionYieldClass() {
    return QStringLiteral("Yield class (m³/ha/yr)");
}
inline QString notCalculated() {
    return QStringLiteral("not yet calculated");
}
inline QString netPresentValue() {
    return QStringLiteral("Net present value (€/ha)");
}
inline QString interestRate() {
    return QStringLiteral("Interest rate (%)");
}
inline QString noCashFlow() {
    return QStringLiteral("No cash flow: the rotation has not been closed by a final cut with "
                          "its net present value.");
}
inline QString quietYearsLeftOut() {
    return QStringLiteral("Years without an operation, a cost or a revenue are left out.");
}
inline QString emptyTable() {
    return QStringLiteral("The projection table is empty.");
}
inline QString page() {
    return QStringLiteral("Page %1 of %2");
}

inline QString titleExportReport() {
    return QStringLiteral("Export Report");
}
inline QString titleExportChart() {
    return QStringLiteral("Export Chart");
}
/// A report or chart that could not be written to `path`.
inline QString writeFailed(const QString &path) {
    return QStringLiteral("ERROR - The file could not be written:\r\n%1\r\n"
                          "Choose a folder where you may write and try again.")
        .arg(path);
}
inline QString printFailed() {
    return QStringLiteral("ERROR - The report could not be sent to the printer.");
}

// ---- The carbon page ----------------------------------------------------------------------

inline QString carbonTitle() {
    return QStringLiteral("Carbon account of the rotation");
}
inline QString carbonSubCompartment() {
    return QStringLiteral("Sub-compartment");
}
inline QString carbonSpecies() {
    return QStringLiteral("Species, specific gravity");
}
inline QString carbonRotation() {
    return QStringLiteral("Rotation");
}
inline QString carbonPeriod() {
    return QStringLiteral("Account");
}
/// The account's years, and how the years before the table's first are taken.
inline QString carbonPeriodText(int presentAge, int finalCut) {
    return QStringLiteral("from planting (age 0) to the final cut at %2 years; the stand is "
                          "grown from age %1, and the carbon in its trees before that rises "
                          "in a straight line from planting")
        .arg(presentAge)
        .arg(finalCut);
}
inline QString carbonMoney() {
    return QStringLiteral("Carbon money");
}
inline QString carbonTotals() {
    return QStringLiteral("Totals, t CO₂e/ha");
}
inline QString carbonAtFinalCut() {
    return QStringLiteral("In the trees at the final cut (before felling)");
}
inline QString carbonAverage() {
    return QStringLiteral("Long-term average stock");
}
inline QString carbonNetRemoval() {
    return QStringLiteral("Total net removal to the final cut");
}
inline QString carbonUnits() {
    return QStringLiteral("Units issued (after the buffer)");
}
inline QString carbonProductsAtEnd() {
    return QStringLiteral("In products in use at the final cut");
}
inline QString carbonNpv() {
    return QStringLiteral("Carbon revenue NPV");
}
inline QString carbonConstants() {
    return QStringLiteral("Constants of the account and their sources (Carbon.qdm)");
}
inline QString carbonYearly() {
    return QStringLiteral("The account year by year, t CO₂e/ha");
}
/// Captions of the yearly account, in order.
inline QStringList carbonAccountCaptions() {
    return {QStringLiteral("Age"),         QStringLiteral("In the trees"),
            QStringLiteral("In products"), QStringLiteral("Sequestration"),
            QStringLiteral("Harvested"),   QStringLiteral("Emissions"),
            QStringLiteral("Net removal"), QStringLiteral("Cumulative net removal"),
            QStringLiteral("Units issued")};
}
inline QString carbonYearlyNote() {
    return QStringLiteral(
        "Stocks at the end of each year, after its harvest. Net removal: sequestration less "
        "emissions (what a harvest leaves in the forest and the mill loses, and the decay of "
        "the products in use). Units are issued at each verification on the net removal "
        "since the last, less the buffer, and capped at the long-term average stock.");
}

} // namespace arbolex::charts::text
