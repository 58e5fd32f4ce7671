#pragma once

// The texts the work writes into its rows and its summary, in one place.

#include <QString>
#include <QStringList>

namespace arbolex::work::text {

// Row labels
inline QString rowLabelGrowth() {
    return QStringLiteral("G yr");
}
inline QString rowLabelThinning() {
    return QStringLiteral("T yr");
}
inline QString rowLabelFinalCut() {
    return QStringLiteral("FC yr");
}

/// Text of the marker cell of the rows the summary carries (start, thinnings,
/// final cut): a tab, blank on the screen and dropped by every copy.
inline QString summaryMarker() {
    return QStringLiteral("\t");
}
/// "O.R." stands in both volume cells when the volume is 0 or less.
inline QString outOfRange() {
    return QStringLiteral("O.R.");
}

// The summary
inline QString summaryLabelCaption() {
    return QStringLiteral("Event");
}
inline QString summaryStart() {
    return QStringLiteral("Start");
}
inline QString summaryThinning() {
    return QStringLiteral("Thinning");
}
inline QString summaryFinalCut() {
    return QStringLiteral("Final cut");
}
inline QString summaryTotalProduction() {
    return QStringLiteral("Total production");
}
inline QString summaryTotalThinned() {
    return QStringLiteral("Total thinned");
}
inline QString summaryMaximumMai() {
    return QStringLiteral("Maximum MAI");
}
inline QString summaryYieldClass() {
    return QStringLiteral("Yield class");
}

/// Headers of the columns of the cash flow (`NPV_Grid`), in order.
inline QStringList cashFlowHeaders() {
    return {QStringLiteral("Year"),
            QStringLiteral("Operation"),
            QStringLiteral("Cost (€/ha)"),
            QStringLiteral("Timber Revenue (€/ha)"),
            QStringLiteral("Other Revenues (€/ha)"),
            QStringLiteral("Total Revenues (€/ha)"),
            QStringLiteral("Cash Flow (€/ha)"),
            QStringLiteral("Discounted Cash Flow (€/ha)")};
}

} // namespace arbolex::work::text
