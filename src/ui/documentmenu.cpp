#include "ui/documentmenu.hpp"

#include "document/documentcontroller.hpp"
#include "document/documentmessages.hpp"
#include "ui/identificationdialog.hpp"

#include <QAction>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QMenu>

namespace arbolex::ui {

DocumentMenu::DocumentMenu(QMenu *menu, QWidget *window)
    : QObject(window), m_menu(menu), m_window(window) {
    m_menu->setObjectName(QStringLiteral("mnuFile"));
    const auto add = [this](const QString &caption, const char *name, auto handler,
                            const QKeySequence &shortcut = {}) {
        QAction *action = m_menu->addAction(caption);
        action->setObjectName(QLatin1String(name));
        action->setShortcut(shortcut);
        connect(action, &QAction::triggered, this, [this, handler] {
            if (m_controller != nullptr) {
                handler(*m_controller);
            }
        });
        return action;
    };
    using document::DocumentController;
    add(
        document::text::menuNew(), "mnuNew", [](DocumentController &c) { c.fileNew(); },
        QKeySequence::New);
    add(
        document::text::menuOpen(), "mnuOpen", [](DocumentController &c) { c.fileOpen(); },
        QKeySequence::Open);
    m_recent = m_menu->addMenu(document::text::menuRecent());
    m_recent->setObjectName(QStringLiteral("mnuRecent"));
    m_menu->addSeparator();
    add(
        document::text::menuSave(), "mnuSave", [](DocumentController &c) { c.save(); },
        QKeySequence::Save);
    add(
        document::text::menuSaveAs(), "mnuSaveAs", [](DocumentController &c) { c.saveAs(); },
        QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_S));
    m_menu->addSeparator();
    add(document::text::menuIdentification(), "mnuIdentification",
        [](DocumentController &c) { c.editIdentification(); });
    m_menu->addSeparator();
    add(document::text::menuClose(), "mnuClose", [](DocumentController &c) { c.fileClose(); });
    QAction *exit = m_menu->addAction(document::text::menuExit());
    exit->setObjectName(QStringLiteral("mnuExit"));
    connect(exit, &QAction::triggered, m_window, &QWidget::close);
    recentFilesChanged({});
}

void DocumentMenu::attach(document::DocumentController &controller) {
    m_controller = &controller;
}

QString DocumentMenu::chooseFileToOpen(const QString &folder) {
    return QFileDialog::getOpenFileName(m_window, document::text::titleOpen(), folder,
                                        document::text::fileFilter());
}

QString DocumentMenu::chooseFileToSave(const QString &suggestedPath) {
    return QFileDialog::getSaveFileName(m_window, document::text::titleSaveAs(), suggestedPath,
                                        document::text::fileFilter());
}

bool DocumentMenu::editIdentification(work::SubCompartment &id) {
    IdentificationDialog dialog(id, m_window);
    if (dialog.exec() != QDialog::Accepted) {
        return false;
    }
    id = dialog.identification();
    return true;
}

void DocumentMenu::recentFilesChanged(const QStringList &files) {
    m_recent->clear();
    int number = 1;
    for (const QString &file : files) {
        // "&1 Kilbrack 12b.arbolex", the folder as the hint.
        QAction *entry = m_recent->addAction(QLatin1Char('&') + QString::number(number++) +
                                             QLatin1Char(' ') + QFileInfo(file).fileName());
        entry->setToolTip(QDir::toNativeSeparators(file));
        entry->setStatusTip(QDir::toNativeSeparators(file));
        connect(entry, &QAction::triggered, this, [this, file] {
            if (m_controller != nullptr) {
                m_controller->open(file);
            }
        });
    }
    if (files.isEmpty()) {
        m_recent->addAction(document::text::noRecentFiles())->setEnabled(false);
    }
}

} // namespace arbolex::ui
