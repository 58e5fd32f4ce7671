#pragma once

// Every text of the documents: captions, questions, faults and menu entries.

#include "work/subcompartment.hpp"

#include <QString>

namespace arbolex::document::text {

// ---- The identification -------------------------------------------------------
inline QString captionForest() {
    return work::SubCompartment::forestCaption();
}
inline QString captionCompartment() {
    return work::SubCompartment::compartmentCaption();
}
inline QString captionSubCompartment() {
    return work::SubCompartment::subCompartmentCaption();
}
inline QString captionNotes() {
    return QStringLiteral("Notes");
}
/// Title of the identification dialog.
inline QString titleIdentification() {
    return QStringLiteral("Sub-compartment");
}

// ---- The caption ------------------------------------------------------------------
/// Name of a document never saved.
inline QString untitled() {
    return QStringLiteral("Untitled");
}

// ---- Questions and faults --------------------------------------------------------
inline QString unsavedQuestion(const QString &name) {
    return QStringLiteral("PLEASE CONFIRM - The sub-compartment \"") + name +
           QStringLiteral("\" has changes that are not saved.\r\n"
                          "Save them before going on?");
}
inline QString openFault(const QString &fileName, const QString &reason) {
    return QStringLiteral("FAULT - The file \"") + fileName +
           QStringLiteral("\" cannot be opened: ") + reason +
           QStringLiteral("\r\nNothing in the window has changed.");
}
inline QString saveFault(const QString &fileName, const QString &reason) {
    return QStringLiteral("ERROR - The sub-compartment could not be saved as \"") + fileName +
           QStringLiteral("\": ") + reason +
           QStringLiteral(".\r\nThe file as it was before is unchanged.");
}

// ---- File dialogs and the File menu ------------------------------------------------
inline QString fileFilter() {
    return QStringLiteral("ARBOLEX sub-compartments (*.arbolex)");
}
inline QString titleOpen() {
    return QStringLiteral("Open Sub-compartment");
}
inline QString titleSaveAs() {
    return QStringLiteral("Save Sub-compartment As");
}
inline QString menuFile() {
    return QStringLiteral("&File");
}
inline QString menuNew() {
    return QStringLiteral("&New");
}
inline QString menuOpen() {
    return QStringLiteral("&Open…");
}
inline QString menuSave() {
    return QStringLiteral("&Save");
}
inline QString menuSaveAs() {
    return QStringLiteral("Save &As…");
}
inline QString menuRecent() {
    return QStringLiteral("Open &Recent");
}
inline QString menuClose() {
    return QStringLiteral("&Close");
}
inline QString menuIdentification() {
    return QStringLiteral("Sub-compartment &Identification…");
}
inline QString menuExit() {
    return QStringLiteral("E&xit");
}
/// Open Recent when the list is empty.
inline QString noRecentFiles() {
    return QStringLiteral("(none)");
}

} // namespace arbolex::document::text
