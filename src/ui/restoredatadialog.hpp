#pragma once

#include <QDialog>

class QPushButton;
class QTreeWidget;

namespace arbolex::shell {
class DataHistory;
}
namespace arbolex::workflow {
class MainWindowLogic;
}

namespace arbolex::ui {

/// Help → "Restore data files…": the copies the data history keeps of the
/// price lists and categories, newest first; Restore puts the chosen copy back
/// (the file it replaces is kept in turn) and the lists are read again.
class RestoreDataDialog : public QDialog {
    Q_OBJECT
public:
    RestoreDataDialog(const shell::DataHistory &history, QString dataFolder,
                      workflow::MainWindowLogic &logic, QWidget *parent = nullptr);

    /// Restores the selected copy after the user confirms.
    void restoreSelected();

private:
    void listCopies();

    const shell::DataHistory &m_history;
    QString m_dataFolder;
    workflow::MainWindowLogic &m_logic;
    QTreeWidget *m_copies = nullptr;
    QPushButton *m_restore = nullptr;
};

} // namespace arbolex::ui
