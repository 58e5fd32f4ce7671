#pragma once

// Every text of the estate window, in one place.

#include <QString>
#include <QStringList>

namespace arbolex::estatewindow::text {

inline QString titleEstate() {
    return QStringLiteral("ARBOLEX --- ESTATE");
}
inline QString progressLabel() {
    return QStringLiteral("Growing and valuing the sub-compartments…");
}
inline QString cancelButton() {
    return QStringLiteral("Cancel");
}
inline QString fileFilter() {
    return QStringLiteral("Estate tables (*.csv *.gpkg *.shp *.geojson);;All files (*)");
}
inline QString openEstateMenu() {
    return QStringLiteral("Open &Estate…");
}
inline QString faultEstateFile(const QString &reason) {
    return QStringLiteral("FAULT - The estate cannot be read: ") + reason;
}
inline QString estateCancelled() {
    return QStringLiteral("The estate run was cancelled: nothing of it is shown.");
}
inline QString alreadyRunning() {
    return QStringLiteral("An estate is being run: wait for it, or cancel it first.");
}
inline QString faultRowNotGrown(const QString &id, const QString &reason) {
    return QStringLiteral("FAULT - Sub-compartment ") + id +
           QStringLiteral(" was not grown, so it cannot be opened:\r\n") + reason;
}
inline QString openStopped(const QString &id, const QString &reason) {
    return QStringLiteral("ERROR - Sub-compartment ") + id +
           QStringLiteral(" could not be replayed in the main window: ") + reason;
}
inline QString summary(long long rows, long long notGrown) {
    return QString::number(rows) + QStringLiteral(" sub-compartments, ") +
           QString::number(notGrown) +
           QStringLiteral(" not grown. Double-click a sub-compartment to open it.");
}
inline QString tabTable() {
    return QStringLiteral("Sub-compartments");
}
inline QString tabChart() {
    return QStringLiteral("Harvest forecast");
}
inline QStringList columnCaptions() {
    return {QStringLiteral("Id"),
            QStringLiteral("Model"),
            QStringLiteral("Area\nha"),
            QStringLiteral("Site index\nm"),
            QStringLiteral("Yield\nclass"),
            QStringLiteral("Thinnings"),
            QStringLiteral("Thinned\nm³"),
            QStringLiteral("Final cut\nage"),
            QStringLiteral("Final cut\nyear"),
            QStringLiteral("Felled\nm³"),
            QStringLiteral("NPV\n€/ha"),
            QStringLiteral("LEV\n€/ha"),
            QStringLiteral("Forest value\n€/ha"),
            QStringLiteral("Status"),
            QStringLiteral("Message")};
}

} // namespace arbolex::estatewindow::text
