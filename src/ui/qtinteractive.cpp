#include "ui/qtinteractive.hpp"

#include <QMessageBox>

namespace arbolex::ui {

QString QtInteractive::lineBreaks(const QString &text) {
    QString out;
    out.reserve(text.size());
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar c = text.at(i);
        if (c != u'\r' && c != u'\n') {
            out.append(c);
            continue;
        }
        out.append(u'\n');
        // The other half of a CR LF or LF CR pair belongs to the same break.
        const QChar other = c == u'\r' ? QChar(u'\n') : QChar(u'\r');
        if (i + 1 < text.size() && text.at(i + 1) == other) {
            ++i;
        }
    }
    return out;
}

std::unique_ptr<QMessageBox> QtInteractive::messageBox(QWidget *parent, const QString &title,
                                                       const QString &text, int style) {
    QMessageBox::Icon icon = QMessageBox::NoIcon;
    QMessageBox::StandardButtons buttons = QMessageBox::Ok;
    switch (style) {
    case shell::kCritical:
        icon = QMessageBox::Critical;
        break;
    case shell::kQuestion:
        icon = QMessageBox::Question;
        break;
    case shell::kExclamation:
        icon = QMessageBox::Warning;
        break;
    case shell::kExclamationOkCancel:
        icon = QMessageBox::Warning;
        buttons = QMessageBox::Ok | QMessageBox::Cancel;
        break;
    case shell::kInformation:
        icon = QMessageBox::Information;
        break;
    default:
        break;
    }
    auto box = std::make_unique<QMessageBox>(icon, title, lineBreaks(text), buttons, parent);
    box->setTextFormat(Qt::PlainText);
    return box;
}

void QtInteractive::message(const QString &title, const QString &text, int style) {
    messageBox(m_parent, title, text, style)->exec();
}

bool QtInteractive::askYesNo(const QString &title, const QString &text) {
    if (!m_answers.isEmpty()) {
        return m_answers.takeFirst();
    }
    QMessageBox box(QMessageBox::Question, title, lineBreaks(text),
                    QMessageBox::Yes | QMessageBox::No, m_parent);
    box.setTextFormat(Qt::PlainText);
    return box.exec() == QMessageBox::Yes;
}

shell::UnsavedChoice QtInteractive::askSaveDiscardCancel(const QString &title,
                                                         const QString &text) {
    // A queued yes saves and a queued no discards, as in the headless session.
    if (!m_answers.isEmpty()) {
        return m_answers.takeFirst() ? shell::UnsavedChoice::Save : shell::UnsavedChoice::Discard;
    }
    QMessageBox box(QMessageBox::Warning, title, lineBreaks(text),
                    QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, m_parent);
    box.setTextFormat(Qt::PlainText);
    box.setDefaultButton(QMessageBox::Save);
    switch (box.exec()) {
    case QMessageBox::Save:
        return shell::UnsavedChoice::Save;
    case QMessageBox::Discard:
        return shell::UnsavedChoice::Discard;
    default:
        return shell::UnsavedChoice::Cancel;
    }
}

} // namespace arbolex::ui
