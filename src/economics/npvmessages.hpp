#pragma once

// Every text the net present value window shows, in one place.

#include <QString>
#include <QStringList>

namespace arbolex::economics::text {

inline QString npvCaption() {
    return QStringLiteral("Net Present Value");
}
inline QString titleNetPresentValue() {
    return QStringLiteral("Net Present Value");
}
inline QString typeInterestRate() {
    return QStringLiteral("Please type in a value for the Interest Rate");
}
inline QString copiedToClipboard() {
    return QStringLiteral("Net Present Value data succesfully Copied to the Clipboard.");
}
inline QString copyFailed() {
    return QStringLiteral("ERROR - difficulty in transferring Net Present Value data.");
}
inline QString buttonCompute() {
    return QStringLiteral("Compute");
}
inline QString buttonCopy() {
    return QStringLiteral("Copy to Clipboard");
}
inline QString buttonClose() {
    return QStringLiteral("Close");
}
inline QString labelInterestRate() {
    return QStringLiteral("Interest rate (%):");
}
inline QString labelNetPresentValue() {
    return QStringLiteral("Net present value (€/ha):");
}
inline QString hintGrid() {
    return QStringLiteral("Type costs, other revenues and operations into the grid; Enter "
                          "computes and moves down.");
}

} // namespace arbolex::economics::text
