#pragma once

// Every text of the timber prices window `frmTimberPrices`, in one place.

#include <QString>

namespace arbolex::economics::text {

inline QString timberPricesCaption() {
    return QStringLiteral("Timber Prices");
}

/// Heading of the column of class captions, shown by the window beside them.
inline QString classHeading() {
    return QStringLiteral("Mean tree volume") + QLatin1Char('\n') + QStringLiteral("(m3 per tree)");
}

// Option buttons: each chooses its list as the prices in use.
inline QString optCurentPrices() {
    return QStringLiteral("Current Timber Prices:");
}
inline QString optUserPrices() {
    return QStringLiteral("User Defined Timber Prices:");
}
inline QString optNPVprices() {
    return QStringLiteral("Long Term Average Timber Prices:");
}
inline QString optOvraPrices() {
    return QStringLiteral("Current Private Sector Prices") + QLatin1Char('\n') +
           QStringLiteral("(Source: OVRA)");
}

// What each list is.
inline QString lblCTP() {
    return QStringLiteral("Average standing prices (\u20ac / m3) for last full calendar year as "
                          "published by Forvane.");
}
inline QString lblUTP() {
    return QStringLiteral("Standing prices (\u20ac / m3) as defined by you the user.");
}
inline QString lblnpvTP() {
    return QStringLiteral("Average standing prices (\u20ac / m3) for last 15 years (Source: "
                          "Forvane), index linked using Wholesale Prices Indices as supplied by "
                          "the Central Statistics Office.");
}
/// The private-sector period follows on the next line: first date, " to ", last date.
inline QString lblOVRA_TP(const QString &from, const QString &to) {
    return QStringLiteral("Average private sector standing roundwood prices (\u20ac / m3) for "
                          "the period") +
           QLatin1Char('\n') + from + QStringLiteral(" to ") + to;
}

// Frames around the four blocks of prices.
inline QString fraCurrent() {
    return QStringLiteral("Current Timber Prices");
}
inline QString fraUser() {
    return QStringLiteral("User Defined Timber Prices");
}
inline QString fraLongTerm() {
    return QStringLiteral("Long Term Average Timber Prices");
}
inline QString fraOvra() {
    return QStringLiteral("OVRA Timber Prices");
}

// Notes
inline QString lblNote() {
    return QStringLiteral("NOTE 1:");
}
inline QString lblNote2() {
    return QStringLiteral("If the user avails of the NPV function, ARBOLEX will automatically use "
                          "Long Term Average Timber Prices in this calculation.");
}
inline QString lblNote_OVRA1() {
    return QStringLiteral("NOTE 2:");
}
inline QString lblNote_OVRA2() {
    return QStringLiteral(
        "The Current Private Sector Prices are compiled by OVRA, the growers' association, from "
        "the sales of standing timber reported by its members. They are averages over all species "
        "and all sale lots sold in the period, and are meant for the valuation of long-term "
        "forestry investments. Similar prices may not be achieved in all parts of the country or "
        "for all sale lots.");
}

// Commands
inline QString allowChanges() {
    return QStringLiteral("Allow Changes");
}
inline QString acceptChanges() {
    return QStringLiteral("Accept Changes");
}
inline QString closePricesList() {
    return QStringLiteral("Close Price Option");
}

} // namespace arbolex::economics::text
