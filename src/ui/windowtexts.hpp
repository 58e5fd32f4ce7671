#pragma once

// Every text the windows `frmMain`, `frmThin` and `frmModelChoice` show of their
// own (the logic writes the captions, messages and results): a changed caption is
// one edit.

#include "engine/catalogue.hpp"
#include "engine/modeldescription.hpp"
#include "shell/datahistory.hpp"
#include "shell/version.hpp"

#include <QString>
#include <QStringList>

namespace arbolex::ui::text {

// ---- Program --------------------------------------------------------------------

inline QString programName() {
    return shell::programName();
}
inline QString programVersion() {
    return shell::programVersion();
}
inline QString programPurpose() {
    return QStringLiteral("Growth and yield of even-aged conifer plantations: projects a "
                          "sub-compartment with a dynamic yield model, through thinnings to the "
                          "final cut, and values its timber.");
}

/// Entry of the model menu and the model list: identifier, three blanks and
/// the catalogue label, so calibrations sharing a label stay apart. A figure
/// space pads the one-digit identifiers, so the labels line up.
inline QString modelEntry(int modelId) {
    return (modelId < 10 ? QStringLiteral("\u2007") : QString()) + QString::number(modelId) +
           QStringLiteral("   ") +
           QString::fromLatin1(engine::catalogue().at(static_cast<std::size_t>(modelId)).label);
}

/// Entry of the model menu: the list entry, then the species, the regime and
/// what an alternative calibration changes from the base entry it shares its
/// label with.
inline QString modelMenuEntry(int modelId) {
    return modelEntry(modelId) + QStringLiteral("    \u2014  ") +
           QString::fromStdString(engine::modelMenuNote(modelId));
}
/// One line on the model: species, regime, what an alternative changes.
inline QString modelSummary(int modelId) {
    return QString::fromStdString(engine::modelSummary(modelId));
}
/// A few sentences on the model, for tooltips and the model window's description.
inline QString modelDetails(int modelId) {
    return QString::fromStdString(engine::modelDetails(modelId));
}

// ---- Main window ------------------------------------------------------------------

inline QString menuModel() {
    return QStringLiteral("&Model");
}
inline QString menuHelp() {
    return QStringLiteral("&Help");
}
inline QString menuThreshold() {
    return QStringLiteral("&Threshold basal area\u2026");
}
inline QString menuNotes() {
    return QStringLiteral("&Notes on this model\u2026");
}
inline QString menuRestoreData() {
    return QStringLiteral("Restore data files\u2026");
}

// ---- Restore data files --------------------------------------------------------------

inline QString restoreDataTitle() {
    return QStringLiteral("Restore data files");
}
inline QString restoreDataIntro(const QString &folder) {
    return QStringLiteral("Before the price lists and the assortment categories are written at "
                          "exit, the files they replace are kept here, the last %1 of each. "
                          "Restore puts a kept copy back in the data folder (the file it "
                          "replaces is kept in turn) and reads the lists again.\n\nKept in: %2")
        .arg(QString::number(shell::DataHistory::kCopiesKept), folder);
}
inline QStringList restoreDataColumns() {
    return {QStringLiteral("File"), QStringLiteral("Kept on"), QStringLiteral("Size")};
}
inline QString restoreDataButton() {
    return QStringLiteral("&Restore");
}
inline QString restoreDataNone() {
    return QStringLiteral("No copies kept yet.");
}
inline QString restoreDataConfirm(const QString &file, const QString &when) {
    return QStringLiteral("PLEASE CONFIRM - Replace %1 in the data folder with the copy kept on "
                          "%2? The present file is kept in the history first.")
        .arg(file, when);
}
inline QString restoreDataFault(const QString &file, const QString &why) {
    return QStringLiteral("FAULT - %1 could not be restored: %2. Nothing was changed.")
        .arg(file, why);
}
inline QString restoreDataDone(const QString &file, const QString &when) {
    return QStringLiteral("%1 as kept on %2 is back in the data folder, and the price lists and "
                          "categories have been read again.")
        .arg(file, when);
}

inline QString menuEdit() {
    return QStringLiteral("&Edit");
}
inline QString menuCopy() {
    return QStringLiteral("&Copy Table");
}
inline QString menuDeleteRows() {
    return QStringLiteral("&Delete Rows from Selection\u2026");
}
inline QString menuAbout() {
    return QStringLiteral("&About ARBOLEX");
}
inline QString aboutTitle() {
    return QStringLiteral("About ARBOLEX");
}
inline QString aboutText() {
    return QStringLiteral("<h3>") + programName() + QStringLiteral("</h3><p>") + programPurpose() +
           QStringLiteral("</p><p>Version ") + programVersion() + QStringLiteral("</p>");
}

inline QString groupGrowFrom() {
    return QStringLiteral("Grow from");
}
inline QString groupGrowTo() {
    return QStringLiteral("Projection");
}
inline QString groupSite() {
    return QStringLiteral("Site");
}

inline QString labelFromA() {
    return QStringLiteral("Age (yrs)");
}
inline QString labelFromN() {
    return QStringLiteral("Stocking (N/ha)");
}
inline QString labelFromH() {
    return QStringLiteral("Top height (m)");
}
inline QString labelFromB() {
    return QStringLiteral("Basal area (m\u00b2/ha)");
}
inline QString labelFromD() {
    return QStringLiteral("Mean DBH (cm)");
}
inline QString labelToA() {
    return QStringLiteral("Grow to age");
}
inline QString labelByA() {
    return QStringLiteral("Step (yrs)");
}
inline QString labelNetArea() {
    return QStringLiteral("Net area (ha)");
}
inline QString labelSI() {
    return QStringLiteral("Site index");
}
inline QString labelYC() {
    return QStringLiteral("Yield class");
}

inline QString buttonGrow() {
    return QStringLiteral("&Grow");
}
inline QString buttonClear() {
    return QStringLiteral("&Clear");
}
inline QString buttonClearAll() {
    return QStringLiteral("Clear &All");
}
inline QString buttonUseRow() {
    return QStringLiteral("&Use row");
}
inline QString hintUseRow() {
    return QStringLiteral("Continue from the selected row");
}
inline QString buttonThin() {
    return QStringLiteral("&Thin");
}
inline QString hintThin() {
    return QStringLiteral("Mark or edit thinning.");
}
inline QString buttonFinalCut() {
    return QStringLiteral("&Final Cut");
}
inline QString hintFinalCut() {
    return QStringLiteral("Clear-fell the last stand of the table and value it.");
}
inline QString buttonNpv() {
    return QStringLiteral("&NPV\u2026");
}
inline QString hintNpv() {
    return QStringLiteral("Cash flow and net present value of the rotation.");
}
inline QString buttonDeleteRows() {
    return QStringLiteral("&Delete Rows");
}
inline QString hintDeleteRows() {
    return QStringLiteral("Delete the rows from the selected one to the end.");
}
inline QString hintSummary() {
    return QStringLiteral("Switch between the projections and the rotation summary.");
}

// ---- Thinning window ----------------------------------------------------------------

/// Title until the window is loaded on a row (the load writes the age in).
inline QString thinTitle() {
    return QStringLiteral("ARBOLEX \u2014 Thinning");
}
inline QString groupThinDetails() {
    return QStringLiteral("Thinning details");
}
inline QString columnPreThin() {
    return QStringLiteral("Pre-thin");
}
inline QString columnThinning() {
    return QStringLiteral("Thinning");
}
inline QString columnPostThin() {
    return QStringLiteral("Post-thin");
}
inline QString rowThinStocking() {
    return QStringLiteral("Stocking (N/ha)");
}
inline QString rowThinBasalArea() {
    return QStringLiteral("Basal Area (m2/ha)");
}
inline QString rowThinVolume() {
    return QStringLiteral("Volume (m3/ha)");
}
inline QString rowThinMeanDbh() {
    return QStringLiteral("Mean DBH (cm)");
}
inline QString rowThinMeanVolume() {
    return QStringLiteral("Mean Vol. (m3)");
}

inline QString buttonThinClear() {
    return QStringLiteral("&Clear");
}
inline QString hintThinClear() {
    return QStringLiteral("Clear Thinning removals & Post thin columns.");
}
inline QString buttonThinThin() {
    return QStringLiteral("&Thin");
}
inline QString hintThinThin() {
    return QStringLiteral("Calculate Thinning by any of four methods.");
}
inline QString buttonThinCancel() {
    return QStringLiteral("&Cancel");
}
inline QString hintThinCancel() {
    return QStringLiteral("Exit Thinning without performing any new thinning.");
}
inline QString buttonThinAccept() {
    return QStringLiteral("&Accept");
}
inline QString hintThinAccept() {
    return QStringLiteral("Exit Thinning by Saving new thinning or overwriting old thinning.");
}

inline QString groupLoop() {
    return QStringLiteral("Loop");
}
inline QString checkActivLoop() {
    return QStringLiteral("Activate Loop");
}
inline QString labelThinFreq() {
    return QStringLiteral("Thinning Frequence");
}
inline QString labelThinUntil() {
    return QStringLiteral("Thin Until");
}
inline QString buttonLoop() {
    return QStringLiteral("Loop");
}

// ---- Model choice window ------------------------------------------------------------

inline QString choiceTitle() {
    return QStringLiteral("ARBOLEX \u2014 Model choice");
}
inline QString choiceHeading() {
    return QStringLiteral("Choose the growth model");
}
inline QString choiceIntro() {
    return QStringLiteral("Each model follows one species under one regime. Thinned models "
                          "offer thinnings; un-thinned models run to the final cut.");
}
inline QString buttonAcceptChoice() {
    return QStringLiteral("Accept   Choice");
}
inline QString illustrationTitle() {
    return QStringLiteral("ARBOLEX");
}
inline QString illustrationSubtitle() {
    return QStringLiteral("Dynamic yield models for even-aged conifer plantations");
}
inline QString illustrationAxisAge() {
    return QStringLiteral("Age");
}
inline QString illustrationAxisHeight() {
    return QStringLiteral("Top height");
}

// ---- Media files of the introduction, in the data folder ---------------------------------

inline QString introVideo() {
    return QStringLiteral("Spruce.avi");
}
inline QString introCompletePicture() {
    return QStringLiteral("Spruce_Complete.jpg");
}
/// Picture `n` of the introduction's sequence, relative to the data folder.
inline QString introSequencePicture(int n) {
    return QStringLiteral("SpruceImages/Spruce_0") + QString::number(n) + QStringLiteral(".jpg");
}

// The report entries of the File menu, and the View menu
inline QString menuExportReport() {
    return QStringLiteral("Export &Report…");
}
inline QString menuPrint() {
    return QStringLiteral("&Print…");
}
inline QString filterPdf() {
    return QStringLiteral("PDF document (*.pdf)");
}
inline QString menuView() {
    return QStringLiteral("&View");
}

} // namespace arbolex::ui::text
