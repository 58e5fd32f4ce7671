#include "document/documentcontroller.hpp"

#include "document/documentmessages.hpp"
#include "document/documentreader.hpp"
#include "document/documentwriter.hpp"
#include "document/idocumentdialogs.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/interactive.hpp"
#include "shell/settings.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"
#include "workflow/mainmessages.hpp"

#include <QDir>
#include <QFileInfo>

namespace arbolex::document {

DocumentController::DocumentController(work::StandWork &work, workflow::IMainCommands &main,
                                       shell::IInteractive &interactive, QSettings *settings,
                                       IDocumentDialogs *dialogs)
    : m_work(work), m_main(main), m_interactive(interactive), m_settings(settings),
      m_dialogs(dialogs) {
    if (m_settings != nullptr) {
        m_recent = shell::readRecentFiles(*m_settings);
    }
}

DocumentController::~DocumentController() {
    QObject::disconnect(m_followsWork);
}

QString DocumentController::lastFolder() const {
    const QString folder = m_settings != nullptr ? shell::readLastFolder(*m_settings) : QString();
    return folder.isEmpty() ? QDir::homePath() : folder;
}

void DocumentController::start() {
    adopt(QString());
    // From now on the caption's unsaved mark follows every change of the work.
    if (!m_followsWork) {
        m_followsWork =
            QObject::connect(&m_work, &work::StandWork::changed, [this] { refreshCaption(); });
    }
    if (m_dialogs != nullptr) {
        m_dialogs->recentFilesChanged(m_recent);
    }
}

QString DocumentController::displayName() const {
    if (m_path.isEmpty()) {
        return m_newName.isEmpty() ? text::untitled() : m_newName;
    }
    return QFileInfo(m_path).fileName();
}

bool DocumentController::isModified() const {
    return !m_work.snapshot().sameWork(m_saved);
}

void DocumentController::refreshCaption() {
    m_work.setDocumentTitle(displayName(), isModified());
}

void DocumentController::adopt(const QString &path) {
    m_path = path;
    m_newName.clear();
    m_saved = m_work.snapshot();
    if (!path.isEmpty()) {
        rememberRecent(path);
    }
    refreshCaption();
}

void DocumentController::rememberRecent(const QString &path) {
    const QString absolute = QFileInfo(path).absoluteFilePath();
    m_recent.removeAll(absolute);
    m_recent.prepend(absolute);
    m_recent = m_recent.mid(0, shell::kRecentFileCount);
    if (m_settings != nullptr) {
        shell::writeRecentFiles(*m_settings, m_recent);
        shell::writeLastFolder(*m_settings, QFileInfo(absolute).absolutePath());
    }
    if (m_dialogs != nullptr) {
        m_dialogs->recentFilesChanged(m_recent);
    }
}

bool DocumentController::maySafelyDiscard() {
    if (!isModified()) {
        return true;
    }
    switch (m_interactive.askSaveDiscardCancel(workflow::text::titleArbolex(),
                                               text::unsavedQuestion(displayName()))) {
    case shell::UnsavedChoice::Save:
        return save();
    case shell::UnsavedChoice::Discard:
        return true;
    case shell::UnsavedChoice::Cancel:
        break;
    }
    return false;
}

Document DocumentController::emptyWork() const {
    Document empty = m_work.snapshot();
    empty.identification = {};
    empty.rows.clear();
    empty.currentRow = 0;
    empty.selectionEnd = 0;
    empty.standingVolume = 0.0;
    empty.felled = false;
    empty.cashFlow.clear();
    // A new sub-compartment starts with the data folder's costs.
    empty.establishmentCost = m_work.defaultEstablishmentCost();
    empty.annualCost = m_work.defaultAnnualCost();
    return empty;
}

void DocumentController::becomeEmpty() {
    m_main.restore(emptyWork());
    adopt(QString());
}

void DocumentController::adoptNew(const QString &name) {
    m_path.clear();
    m_newName = name;
    m_saved = emptyWork();
    refreshCaption();
}

void DocumentController::fileNew() {
    if (maySafelyDiscard()) {
        becomeEmpty();
    }
}

void DocumentController::fileClose() {
    fileNew();
}

void DocumentController::fileOpen() {
    if (m_dialogs == nullptr || !maySafelyDiscard()) {
        return;
    }
    const QString chosen = m_dialogs->chooseFileToOpen(lastFolder());
    if (chosen.isEmpty()) {
        return;
    }
    // The question has been asked: open without asking twice.
    openFile(chosen, false);
}

bool DocumentController::open(const QString &path) {
    return openFile(path, true);
}

bool DocumentController::openFile(const QString &path, bool askFirst) {
    // The file is read and checked before the question: a file that cannot
    // be taken costs no decision about the work in the window.
    const auto readChecked = [this, &path] {
        QString reason;
        std::optional<Document> document = readDocumentFile(path, reason);
        if (!document) {
            m_interactive.message(workflow::text::titleArbolex(),
                                  text::openFault(QFileInfo(path).fileName(), reason),
                                  shell::kExclamation);
        }
        return document;
    };
    std::optional<Document> document = readChecked();
    if (!document) {
        return false;
    }
    if (askFirst && isModified()) {
        if (!maySafelyDiscard()) {
            return false;
        }
        // Saving the work may have written this very file: read what it holds now.
        document = readChecked();
        if (!document) {
            return false;
        }
    }
    m_main.restore(*document);
    adopt(path);
    return true;
}

bool DocumentController::save() {
    return m_path.isEmpty() ? saveAs() : saveAs(m_path);
}

bool DocumentController::saveAs() {
    if (m_dialogs == nullptr) {
        return false;
    }
    QString suggested = m_path;
    if (suggested.isEmpty()) {
        const work::SubCompartment &id = m_work.identification();
        QString stem = QStringList{id.forest, id.compartment, id.subCompartment}.join(u' ');
        stem = stem.simplified();
        suggested = QDir(lastFolder())
                        .filePath((stem.isEmpty() ? text::untitled() : stem) + QStringLiteral(".") +
                                  QLatin1String(kFileSuffix));
    }
    QString chosen = m_dialogs->chooseFileToSave(suggested);
    if (chosen.isEmpty()) {
        return false;
    }
    if (QFileInfo(chosen).suffix().isEmpty()) {
        chosen += QStringLiteral(".") + QLatin1String(kFileSuffix);
    }
    return saveAs(chosen);
}

bool DocumentController::saveAs(const QString &path) {
    QString reason;
    if (!writeDocumentFile(path, m_work.snapshot(), reason)) {
        m_interactive.message(workflow::text::titleArbolex(),
                              text::saveFault(QFileInfo(path).fileName(), reason),
                              shell::kExclamation);
        m_work.errorLog().append(shell::moduleFaultLine(
            {shell::RuntimeError{shell::RuntimeError::pathFileAccessError().number, reason}, 0},
            QStringLiteral(" in procedure SaveSubCompartment of Module Document")));
        return false;
    }
    adopt(path);
    return true;
}

void DocumentController::editIdentification() {
    if (m_dialogs == nullptr) {
        return;
    }
    work::SubCompartment id = m_work.identification();
    if (m_dialogs->editIdentification(id)) {
        setIdentification(id);
    }
}

const work::SubCompartment &DocumentController::identification() const {
    return m_work.identification();
}

void DocumentController::setIdentification(const work::SubCompartment &id) {
    m_work.setIdentification(id);
    refreshCaption();
}

} // namespace arbolex::document
