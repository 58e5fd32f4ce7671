#pragma once

// What the windows do alike with their controls: the text of a control
// whatever its kind, and showing a window centred over the main window.

#include <QString>

class QWidget;

namespace arbolex::ui {

/// The text a control shows: a field's text, a label's or button's caption, a
/// frame's title; empty for any other widget.
QString controlText(const QWidget *control);
/// Sets the text `controlText` reads.
void setControlText(QWidget *control, const QString &text);

/// Shows `window` centred over its parent window (over the screen when the
/// parent is hidden), whole on the screen, and brings it to the front.
void showCentredOverParent(QWidget *window);

} // namespace arbolex::ui
