#include "ui/qtclipboard.hpp"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>

namespace arbolex::ui {

bool QtClipboard::setTable(const QString &plainText, const QString &html) {
    QClipboard *clipboard = QGuiApplication::clipboard();
    if (clipboard == nullptr) {
        return false;
    }
    auto *data = new QMimeData;
    data->setText(plainText);
    data->setHtml(html);
    clipboard->setMimeData(data);
    // The clipboard took the table when it gives the same text back.
    return clipboard->text() == plainText;
}

} // namespace arbolex::ui
