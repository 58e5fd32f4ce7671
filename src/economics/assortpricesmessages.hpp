#pragma once

// Every text of the assortment prices window `frmAssortPrices`, in one place.

#include <QString>

namespace arbolex::economics::text {

inline QString assortPricesCaption() {
    return QStringLiteral("Assortment Prices");
}
inline QString assortPricesMenu() {
    return QStringLiteral("Assortment &prices...");
}
/// The timber prices window's command that opens the window.
inline QString assortPricesButton() {
    return QStringLiteral("Assortment Prices...");
}
/// Heading of the column of class captions.
inline QString assortClassHeading() {
    return QStringLiteral("Top diameter");
}
/// Heading of the column of prices.
inline QString assortPriceHeading() {
    return QStringLiteral("\u20ac / m3");
}
/// What each class is sold as, beside its price.
inline QString productOf(int classIndex) {
    switch (classIndex) {
    case 0:
        return QStringLiteral("pulpwood");
    case 1:
        return QStringLiteral("pallet wood");
    default:
        return QStringLiteral("sawlog");
    }
}
inline QString lblAsmtDesc() {
    return QStringLiteral("Standing prices (\u20ac / m3) by top diameter, the classes of the "
                          "assortment report. Valued by assortments, every thinning and the "
                          "final cut is divided into these classes and each class is sold at "
                          "its own price.");
}
inline QString closeAsmtPrices() {
    return QStringLiteral("Close");
}
/// The accepted price of a class is out of range.
inline QString priceOutOfRange(const QString &classCaption, const QString &highest) {
    return QStringLiteral("FAULT - The price of ") + classCaption +
           QStringLiteral(" must be from 0 to ") + highest + QStringLiteral(" \u20ac / m3.");
}

} // namespace arbolex::economics::text
