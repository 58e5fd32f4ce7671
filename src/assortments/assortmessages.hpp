#pragma once

// Every text of the assortment report window `frmAssort`, the user categories
// window `frmAssortUser`, the assortment commands and the assortment rows.

#include <QString>

namespace arbolex::assortments::text {

inline QString crlf() {
    return QStringLiteral("\r\n");
}

// ---- Report window ---------------------------------------------------------------

inline QString captionLead() {
    return QStringLiteral("Assortment at age ");
}
inline QString titleCrop() {
    return QStringLiteral("Crop assortment");
}
inline QString titlePreThin() {
    return QStringLiteral("Pre-[Actual]-Thin Crop assortment");
}
inline QString titlePostActual() {
    return QStringLiteral("Post-[Actual]-Thin Crop assortment");
}
inline QString titleThinning() {
    return QStringLiteral("Thinning assortment");
}
inline QString titleRackThinning() {
    return QStringLiteral("Rack-thin assortment");
}
inline QString titlePostThin() {
    return QStringLiteral("Post-thin crop assortment");
}
inline QString titlePostRackThin() {
    return QStringLiteral("Post-rack thin crop assortment");
}
inline QString volumeColumn() {
    return QStringLiteral("Volume (m3/ha)");
}
inline QString percentColumn() {
    return QStringLiteral("Share (%)");
}
inline QString topDiameterColumn() {
    return QStringLiteral("Top diameter");
}
inline QString class714() {
    return QStringLiteral("7-14 cm");
}
inline QString class1420() {
    return QStringLiteral("14-20 cm");
}
inline QString class20() {
    return QStringLiteral(">20 cm");
}
inline QString totalRow() {
    return QStringLiteral("To 7 cm top");
}
inline QString okButton() {
    return QStringLiteral("&OK");
}
inline QString acceptButton() {
    return QStringLiteral("&Accept");
}
inline QString cancelButton() {
    return QStringLiteral("&Cancel");
}
inline QString okHint() {
    return QStringLiteral("Close the report.");
}
inline QString acceptHint() {
    return QStringLiteral("Keep the report as an assortment row of the projection table.");
}
inline QString cancelHint() {
    return QStringLiteral("Close the report and forget it.");
}
inline QString notesFixed() {
    return QStringLiteral("Top-diameter classes of the volume to 7 cm top over bark: pulpwood "
                          "7-14 cm, pallet wood 14-20 cm, sawlog over 20 cm.");
}

// User-defined report
inline QString userCategory() {
    return QStringLiteral("Category");
}
inline QString userDiameters() {
    return QStringLiteral("Top diameter (cm)");
}
inline QString userVolume() {
    return QStringLiteral("m3/ha");
}
inline QString userPercent() {
    return QStringLiteral("%");
}
inline QString developmentPre() {
    return QStringLiteral("Thinning development: pre-thin m3/ha");
}
inline QString developmentRemoved() {
    return QStringLiteral("removed m3/ha");
}
inline QString developmentPost() {
    return QStringLiteral("post-thin m3/ha");
}
inline QString openEnded() {
    return QStringLiteral(" and over");
}
inline QString noCategoryInUse() {
    return QStringLiteral("FAULT - No user assortment category is in use.");
}

// ---- Commands ----------------------------------------------------------------------

inline QString mainAssortButton() {
    return QStringLiteral("Assort");
}
inline QString mainAssortHint() {
    return QStringLiteral("Predict crop assortment in non-thin years.");
}
inline QString singleGrowthRow() {
    return QStringLiteral(
        "FAULT - Select a single growth projection row not associated with a thinning");
}
inline QString notGrowthRow() {
    return QStringLiteral("FAULT - the selected row is not a growth projection row");
}
inline QString useThinCommand() {
    return QStringLiteral(
        "FAULT - Use Thin cmd for assortments of rows associated with a thinning");
}
inline QString thinAssortRow() {
    return QStringLiteral("Assortment");
}
inline QString thinAssortButton() {
    return QStringLiteral("Assort");
}
inline QString thinAssortHint(int kind) {
    switch (kind) {
    case 0:
        return QStringLiteral("Assortment of the crop before the thinning.");
    case 1:
        return QStringLiteral("Assortment of the trees the thinning removes.");
    default:
        return QStringLiteral("Assortment of the crop after the thinning.");
    }
}
inline QString backwardThinning() {
    return QStringLiteral("BACKWARD THINNING has been detected.") + crlf() +
           QStringLiteral("Please transmit the details of your operation to the support team.");
}
inline QString previewFirst() {
    return QStringLiteral("FAULT - Press Thin to preview the thinning before asking for its "
                          "assortment.");
}

// ---- Assortment rows -----------------------------------------------------------------

inline QString rowLabelCrop() {
    return QStringLiteral("AC yr");
}
inline QString rowLabelThinning() {
    return QStringLiteral("AT yr");
}
inline QString rowLabelPostThin() {
    return QStringLiteral("AP yr");
}
inline QString rowCaptionPercent(const QString &cls) {
    return cls + QStringLiteral("(%)");
}
inline QString rowCaptionVolume(const QString &cls) {
    return cls + QStringLiteral("(m3/ha)");
}
/// The fixed classes as the rows name them.
inline QString rowClass(int i) {
    switch (i) {
    case 0:
        return QStringLiteral("7-14");
    case 1:
        return QStringLiteral("14-20");
    default:
        return QStringLiteral(">20");
    }
}

// ---- User categories window -----------------------------------------------------------

inline QString userWindowCaption() {
    return QStringLiteral("User assortment categories");
}
inline QString userFlag() {
    return QStringLiteral("Build assortment reports over the categories in use");
}
inline QString userName() {
    return QStringLiteral("Name");
}
inline QString userSmallEnd() {
    return QStringLiteral("Small end (cm)");
}
inline QString userBigEnd() {
    return QStringLiteral("Big end (cm)");
}
inline QString userInUse() {
    return QStringLiteral("In use");
}
inline QString userNotes() {
    return QStringLiteral("Top diameters in whole centimetres; a big end of 0 sets no upper "
                          "limit. Categories may overlap: each is computed on its own.");
}
inline QString menuAssortments() {
    return QStringLiteral("&Assortments");
}
inline QString userMenu() {
    return QStringLiteral("Assortment &categories...");
}
inline QString categoryLead(int index, const QString &name) {
    return QStringLiteral("FAULT - Category ") + QString::number(index) + QStringLiteral(" (") +
           name + QStringLiteral("): ");
}
inline QString negativeDiameter() {
    return QStringLiteral("diameters cannot be negative.");
}
inline QString smallEndUnder7() {
    return QStringLiteral("the small-end diameter cannot be under 7 cm.");
}
inline QString bigEndNotAbove() {
    return QStringLiteral(
        "the big-end diameter must be above the small-end diameter (or 0 for no upper limit).");
}
inline QString notANumber() {
    return QStringLiteral("the diameters must be numbers.");
}

} // namespace arbolex::assortments::text
