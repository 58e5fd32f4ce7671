#pragma once

// What every window's numeric fields share: the key filter applied to a key
// press, and moving the focus into a field with its text selected.

#include <QChar>

class QKeyEvent;
class QWidget;

namespace arbolex::ui {

/// True when the key press types a character that the numeric key filter
/// discards. Editing keys and shortcuts carry no printable text and pass.
bool refusedByKeyFilter(const QKeyEvent &key);

/// What a key press types into a price field for its key filter: '\b' for
/// Backspace and Delete, the printable character typed, or a null character
/// for keys that type nothing (arrows, shortcuts).
QChar priceFieldKey(const QKeyEvent &key);

/// True for the shortcuts that would put into a price field anything other
/// than what was typed: paste, cut, undo and redo.
bool isPriceFieldShortcut(const QKeyEvent &key);

/// True when a key press into a price field must not reach it: a shortcut
/// that would put anything else into it, or a character `keyPress` (the
/// field's KeyPress handler of its logic) refuses.
template <class KeyPress> bool refusedPriceKey(const QKeyEvent &key, KeyPress keyPress) {
    if (isPriceFieldShortcut(key)) {
        return true;
    }
    const QChar typed = priceFieldKey(key);
    return !typed.isNull() && !keyPress(typed);
}

/// Puts the focus on `control`, selecting a field's text so typing replaces it.
void focusControl(QWidget *control);

} // namespace arbolex::ui
