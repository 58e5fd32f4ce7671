#pragma once

#include "shell/interactive.hpp"

#include <QList>
#include <QString>

namespace arbolex::testing {

/// Records every message box and question; answers Yes unless `answers` says otherwise.
class FakeInteractive : public shell::IInteractive {
public:
    struct Message {
        QString title;
        QString text;
        int style = 0;
    };
    void message(const QString &title, const QString &text, int style) override {
        messages.append({title, text, style});
    }
    bool askYesNo(const QString &title, const QString &text) override {
        questions.append({title, text, 0});
        return answers.isEmpty() || answers.takeFirst();
    }
    /// Answers the unsaved-work question from `unsavedAnswers` (Cancel when empty).
    shell::UnsavedChoice askSaveDiscardCancel(const QString &title, const QString &text) override {
        questions.append({title, text, 0});
        return unsavedAnswers.isEmpty() ? shell::UnsavedChoice::Cancel
                                        : unsavedAnswers.takeFirst();
    }
    QList<Message> messages, questions;
    QList<bool> answers;
    QList<shell::UnsavedChoice> unsavedAnswers;
};

} // namespace arbolex::testing
