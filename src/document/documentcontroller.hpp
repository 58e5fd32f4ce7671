#pragma once

// The File menu of the main window: a sub-compartment as a document that is
// created, opened, saved and closed, the list of recent documents, and the
// question before unsaved work is discarded. The window, the runner and the
// tests all drive it; the table's own commands (Clear, Clear All, the model
// menu) never ask anything.

#include "document/document.hpp"

#include <QMetaObject>
#include <QString>
#include <QStringList>

class QSettings;

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::document {

class IDocumentDialogs;

class DocumentController {
public:
    /// The document of `work`, which `main` puts back when one is opened.
    /// `settings` keeps the recent documents and the last folder; `dialogs`
    /// shows the file and identification dialogs. Either may be null where
    /// files are named directly (a script).
    DocumentController(work::StandWork &work, workflow::IMainCommands &main,
                       shell::IInteractive &interactive, QSettings *settings,
                       IDocumentDialogs *dialogs = nullptr);
    ~DocumentController();
    DocumentController(const DocumentController &) = delete;
    DocumentController &operator=(const DocumentController &) = delete;

    /// Takes the work as it stands after the window's load as an unsaved,
    /// unchanged "Untitled" document; from then on the caption's unsaved mark
    /// follows every change of the work.
    void start();

    // ---- The File menu ----------------------------------------------------------
    /// New: after the question, an empty sub-compartment with the same model,
    /// grow-from fields and prices.
    void fileNew();
    /// Open…: after the question, the file the user chooses.
    void fileOpen();
    /// Opens `path` after the question. A file that cannot be taken gets one
    /// "FAULT - " message and changes nothing. True when it was opened.
    bool open(const QString &path);
    /// Save: to the document's file, or as Save As… for a new one.
    bool save();
    /// Save As…: to the file the user chooses.
    bool saveAs();
    /// Saves to `path`, which becomes the document's file.
    bool saveAs(const QString &path);
    /// Close: after the question, the same empty sub-compartment as New.
    void fileClose();
    /// Sub-compartment identification: edited in its dialog.
    void editIdentification();
    void setIdentification(const work::SubCompartment &id);
    const work::SubCompartment &identification() const;

    /// The work now in the window becomes a new document, never saved and
    /// named `name` until it is: everything in it counts as unsaved. The
    /// caller asks maySafelyDiscard() before it replaces the work.
    void adoptNew(const QString &name);

    /// Asks before unsaved work would be lost (Save / Discard / Cancel);
    /// true when the work may go: nothing unsaved, saved, or discarded.
    bool maySafelyDiscard();

    // ---- State ----------------------------------------------------------------------
    /// The document's file, empty for a document never saved.
    const QString &path() const { return m_path; }
    /// The file's name, or "Untitled".
    QString displayName() const;
    /// True when the work differs from what was last opened or saved.
    bool isModified() const;
    /// Newest first.
    const QStringList &recentFiles() const { return m_recent; }
    /// Puts the document's name and its unsaved mark into the caption.
    void refreshCaption();

private:
    /// The document's file is now `path`, holding exactly the work as it stands.
    void adopt(const QString &path);
    void becomeEmpty();
    /// The work as it stands with an empty table and no identification.
    Document emptyWork() const;
    bool openFile(const QString &path, bool askFirst);
    void rememberRecent(const QString &path);
    QString lastFolder() const;

    work::StandWork &m_work;
    workflow::IMainCommands &m_main;
    shell::IInteractive &m_interactive;
    QSettings *m_settings;
    IDocumentDialogs *m_dialogs;
    QString m_path;
    /// Name of a new document that has none from a file ("Untitled" when empty).
    QString m_newName;
    /// The work as last opened or saved.
    Document m_saved;
    QStringList m_recent;
    QMetaObject::Connection m_followsWork;
};

} // namespace arbolex::document
