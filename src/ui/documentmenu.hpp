#pragma once

#include "document/idocumentdialogs.hpp"

#include <QObject>

class QMenu;
class QWidget;

namespace arbolex::document {
class DocumentController;
}

namespace arbolex::ui {

/// The File menu of the main window (New, Open…, Save, Save As…, Open
/// Recent, Close, the identification) over the document controller, and the
/// file and identification dialogs the controller asks for.
class DocumentMenu : public QObject, public document::IDocumentDialogs {
    Q_OBJECT
public:
    /// Fills `menu`; the dialogs open over `window`.
    DocumentMenu(QMenu *menu, QWidget *window);

    void attach(document::DocumentController &controller);

    // IDocumentDialogs
    QString chooseFileToOpen(const QString &folder) override;
    QString chooseFileToSave(const QString &suggestedPath) override;
    bool editIdentification(work::SubCompartment &id) override;
    void recentFilesChanged(const QStringList &files) override;

    QMenu *recentMenu() const { return m_recent; }

private:
    QMenu *m_menu;
    QMenu *m_recent = nullptr;
    QWidget *m_window;
    document::DocumentController *m_controller = nullptr;
};

} // namespace arbolex::ui
