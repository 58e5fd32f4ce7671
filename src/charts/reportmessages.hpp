#pragma once

// Every text of the printed report, in one place: a changed caption is one edit.

#include <QString>

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

} // namespace arbolex::charts::text
