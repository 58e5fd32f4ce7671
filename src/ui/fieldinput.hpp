#pragma once

// What every window's numeric fields share: the key filter applied to a key
// press, and moving the focus into a field with its text selected.

class QKeyEvent;
class QWidget;

namespace arbolex::ui {

/// True when the key press types a character that the numeric key filter
/// discards. Editing keys and shortcuts carry no printable text and pass.
bool refusedByKeyFilter(const QKeyEvent &key);

/// Puts the focus on `control`, selecting a field's text so typing replaces it.
void focusControl(QWidget *control);

} // namespace arbolex::ui
