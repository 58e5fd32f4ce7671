#pragma once

#include "shell/interactive.hpp"

#include <QList>
#include <QPointer>
#include <QWidget>

#include <memory>

class QMessageBox;

namespace arbolex::ui {

/// Message boxes and questions on the screen, over the window given as parent.
class QtInteractive : public shell::IInteractive {
public:
    explicit QtInteractive(QWidget *parent = nullptr) : m_parent(parent) {}

    void setParentWidget(QWidget *parent) { m_parent = parent; }
    /// Answers the next question with `yes` without asking (scripts); for the
    /// question before unsaved work is discarded, yes saves and no discards.
    void queueAnswer(bool yes) { m_answers.append(yes); }

    void message(const QString &title, const QString &text, int style) override;
    bool askYesNo(const QString &title, const QString &text) override;
    shell::UnsavedChoice askSaveDiscardCancel(const QString &title, const QString &text) override;

    /// The box of a message in `style` (icon and buttons), not yet shown.
    static std::unique_ptr<QMessageBox> messageBox(QWidget *parent, const QString &title,
                                                   const QString &text, int style);
    /// Messages break their lines with CR LF or LF CR (or a lone CR or LF);
    /// every such pair or single character becomes one line break.
    static QString lineBreaks(const QString &text);

private:
    QPointer<QWidget> m_parent;
    QList<bool> m_answers;
};

} // namespace arbolex::ui
