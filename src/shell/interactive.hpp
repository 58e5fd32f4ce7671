#pragma once

#include <QString>

namespace arbolex::shell {

/// Message-box styles: icon plus buttons, as the messages have always used them.
enum MessageStyle : int {
    kCritical = 16,            ///< stop icon, OK
    kQuestion = 32,            ///< question icon
    kExclamation = 48,         ///< exclamation icon, OK
    kExclamationOkCancel = 49, ///< exclamation icon, OK and Cancel
    kInformation = 64,         ///< information icon, OK
};

/// Answers to the question asked before unsaved work is discarded.
enum class UnsavedChoice { Save, Discard, Cancel };

/// Message boxes and questions. Window logic asks the user only through this,
/// so tests and the headless runner can script every answer.
class IInteractive {
public:
    virtual ~IInteractive() = default;
    /// Shows a message box and waits until it is closed.
    virtual void message(const QString &title, const QString &text, int style) = 0;
    /// Asks a Yes/No question; true for Yes.
    virtual bool askYesNo(const QString &title, const QString &text) = 0;
    /// Asks whether to save unsaved work before it is discarded (Save /
    /// Discard / Cancel). Where only Yes and No can be answered (a script),
    /// Yes saves and No discards.
    virtual UnsavedChoice askSaveDiscardCancel(const QString &title, const QString &text) {
        return askYesNo(title, text) ? UnsavedChoice::Save : UnsavedChoice::Discard;
    }
};

} // namespace arbolex::shell
