#include "ui/fieldinput.hpp"

#include "workflow/growfrompanel.hpp"

#include <QKeyEvent>
#include <QLineEdit>

namespace arbolex::ui {

bool refusedByKeyFilter(const QKeyEvent &key) {
    if (key.modifiers() & (Qt::ControlModifier | Qt::AltModifier)) {
        return false;
    }
    for (const QChar c : key.text()) {
        if (c.isPrint() && !workflow::GrowFromPanel::KeyFilter(c)) {
            return true;
        }
    }
    return false;
}

QChar priceFieldKey(const QKeyEvent &key) {
    if (key.key() == Qt::Key_Backspace || key.key() == Qt::Key_Delete) {
        return {u'\b'};
    }
    if (!(key.modifiers() & (Qt::ControlModifier | Qt::AltModifier)) && !key.text().isEmpty() &&
        key.text().front().isPrint()) {
        return key.text().front();
    }
    return {};
}

bool isPriceFieldShortcut(const QKeyEvent &key) {
    return key.matches(QKeySequence::Paste) || key.matches(QKeySequence::Cut) ||
           key.matches(QKeySequence::Undo) || key.matches(QKeySequence::Redo);
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
