#include "ui/controltext.hpp"

#include <QAbstractButton>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QScreen>

#include <algorithm>

namespace arbolex::ui {

QString controlText(const QWidget *w) {
    if (const auto *field = qobject_cast<const QLineEdit *>(w)) {
        return field->text();
    }
    if (const auto *label = qobject_cast<const QLabel *>(w)) {
        return label->text();
    }
    if (const auto *button = qobject_cast<const QAbstractButton *>(w)) {
        return button->text();
    }
    if (const auto *box = qobject_cast<const QGroupBox *>(w)) {
        return box->title();
    }
    return {};
}

void setControlText(QWidget *w, const QString &value) {
    if (auto *field = qobject_cast<QLineEdit *>(w)) {
        field->setText(value);
    } else if (auto *label = qobject_cast<QLabel *>(w)) {
        label->setText(value);
    } else if (auto *button = qobject_cast<QAbstractButton *>(w)) {
        button->setText(value);
    } else if (auto *box = qobject_cast<QGroupBox *>(w)) {
        box->setTitle(value);
    }
}

void showCentredOverParent(QWidget *window) {
    window->adjustSize();
    const QWidget *main = window->parentWidget();
    const QScreen *where = main != nullptr ? main->screen() : window->screen();
    const QRect available = where->availableGeometry();
    const QRect over = main != nullptr && main->isVisible() ? main->frameGeometry() : available;
    // Before its first showing the window has no frame yet: take the main
    // window's, which the window manager draws alike.
    QSize frame = window->frameGeometry().size();
    if (!window->isVisible() && main != nullptr && main->isVisible()) {
        frame += main->frameGeometry().size() - main->size();
    }
    QRect placed(QPoint(0, 0), frame);
    placed.moveCenter(over.center());
    // Never partly off the screen, whatever the main window's placement.
    placed.moveLeft(std::clamp(placed.left(), available.left(),
                               std::max(available.left(), available.right() - placed.width())));
    placed.moveTop(std::clamp(placed.top(), available.top(),
                              std::max(available.top(), available.bottom() - placed.height())));
    window->move(placed.topLeft());
    window->show();
    window->raise();
    window->activateWindow();
}

} // namespace arbolex::ui
