#include "ui/fieldinput.hpp"

#include "workflow/mainwindowlogic.hpp"

#include <QKeyEvent>
#include <QLineEdit>

namespace arbolex::ui {

bool refusedByKeyFilter(const QKeyEvent &key) {
    if (key.modifiers() & (Qt::ControlModifier | Qt::AltModifier)) {
        return false;
    }
    for (const QChar c : key.text()) {
        if (c.isPrint() && !workflow::MainWindowLogic::KeyFilter(c)) {
            return true;
        }
    }
    return false;
}

void focusControl(QWidget *control) {
    if (control == nullptr) {
        return;
    }
    control->setFocus(Qt::OtherFocusReason);
    if (auto *field = qobject_cast<QLineEdit *>(control)) {
        field->selectAll();
    }
}

} // namespace arbolex::ui
