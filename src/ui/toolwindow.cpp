#include "ui/toolwindow.hpp"

#include <QCloseEvent>
#include <QKeyEvent>

#include <algorithm>

namespace arbolex::ui {

ToolDialog::ToolDialog(QWidget *main, const QString &name, const QString &caption) : QDialog(main) {
    setObjectName(name);
    setWindowTitle(caption);
    setModal(false);
    setSizeGripEnabled(false);
}

void ToolDialog::reject() {
    if (!runClosing()) {
        QDialog::reject();
    }
}

void ToolDialog::closeEvent(QCloseEvent *event) {
    if (isVisible()) {
        runClosing();
    }
    event->accept();
}

int ToolDialog::watchKeys(QWidget *field) {
    field->installEventFilter(this);
    m_watched.push_back(field);
    return static_cast<int>(m_watched.size()) - 1;
}

bool ToolDialog::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() == QEvent::KeyPress) {
        const auto found = std::find(m_watched.begin(), m_watched.end(), watched);
        if (found != m_watched.end() && refusesKey(static_cast<int>(found - m_watched.begin()),
                                                   *static_cast<QKeyEvent *>(event))) {
            return true;
        }
    }
    return QDialog::eventFilter(watched, event);
}

} // namespace arbolex::ui
