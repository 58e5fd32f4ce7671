#pragma once

// Every text of the carbon price window `frmCarbonPrice`, and the words the
// other windows and the report use for carbon, in one place.

#include <QString>
#include <QStringList>

namespace arbolex::economics::carbontext {

inline QString carbonPriceCaption() {
    return QStringLiteral("Carbon Price");
}
/// The timber prices window's command that opens the window.
inline QString carbonPriceButton() {
    return QStringLiteral("Carbon Price...");
}
inline QString lblCarbonDesc() {
    return QStringLiteral(
        "The price of a tonne of CO\u2082 the trees take up, and how it is paid. Once paid, "
        "carbon money is one more column of the rotation's cash flow: the economics "
        "window's NPV and LEV, its explorer, optimiser, tornado and Monte Carlo draws count "
        "it. Unpaid, the carbon account is shown and nothing else changes.");
}
inline QString labelPrice() {
    return QStringLiteral("Carbon price:");
}
inline QString unitPrice() {
    return QStringLiteral("\u20ac / t CO\u2082e");
}
inline QString headingPayment() {
    return QStringLiteral("Paid");
}
inline QString optPaymentNone() {
    return QStringLiteral("Not at all");
}
inline QString optPaymentFlow() {
    return QStringLiteral("On the flow");
}
inline QString optPaymentUnits() {
    return QStringLiteral("On units");
}
inline QString lblPaymentNone() {
    return QStringLiteral("The carbon account is shown, never counted in the cash flow.");
}
inline QString lblPaymentFlow() {
    return QStringLiteral("Each year's net removal is paid, each year's release charged.");
}
inline QString lblPaymentUnits() {
    return QStringLiteral("The carbon units issued at each verification are paid.");
}
inline QString lblConstants() {
    return QStringLiteral("Constants of the carbon account, from the data folder's "
                          "Carbon.qdm (edit the file to change them):");
}
inline QStringList constantHeaders() {
    return {QStringLiteral("Constant"), QStringLiteral("Value"),
            QStringLiteral("What it is, and its source")};
}
inline QString closeCarbonPrice() {
    return QStringLiteral("Close");
}
/// The accepted price is out of range.
inline QString priceOutOfRange(const QString &highest) {
    return QStringLiteral("FAULT - The carbon price must be from 0 to ") + highest +
           QStringLiteral(" \u20ac / t CO\u2082e.");
}

// ---- Carbon in the other windows and the report ---------------------------------------

/// "t CO₂e/ha".
inline QString unitTonnes() {
    return QStringLiteral("t CO\u2082e/ha");
}
/// How carbon is paid, in the words of a sentence ("flow").
inline QString paymentWord(int payment) {
    switch (payment) {
    case 1:
        return QStringLiteral("flow");
    case 2:
        return QStringLiteral("units");
    default:
        return QStringLiteral("not paid");
    }
}
inline QString notCounted() {
    return QStringLiteral("not counted");
}

} // namespace arbolex::economics::carbontext
