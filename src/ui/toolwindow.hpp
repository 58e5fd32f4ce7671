#pragma once

// What the tool windows over the main window share (the thinning window and
// the timber and assortment price lists): a dialog that is not modal, bound
// once to its logic; Escape and the title bar's close button run the logic's
// own closing command; the keys typed into its fields pass a key filter
// first; and the showing and hiding its view asks for.

#include "ui/controltext.hpp"

#include <QDialog>

#include <vector>

class QKeyEvent;

namespace arbolex::ui {

/// The dialog: its closing and the key filter of its fields.
class ToolDialog : public QDialog {
    Q_OBJECT
public:
    /// Escape: the logic's closing command (a plain reject before there is a logic).
    void reject() override;

protected:
    /// The window `name` with `caption`, over the main window `main`.
    ToolDialog(QWidget *main, const QString &name, const QString &caption);

    /// The title bar's close button: the logic's closing command while shown.
    void closeEvent(QCloseEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

    /// Key presses into `field` pass refusesKey() first; returns the
    /// field's index, counting the watched fields from 0 in this order.
    int watchKeys(QWidget *field);
    /// True when the key pressed into watched field `field` must not reach it.
    virtual bool refusesKey(int field, const QKeyEvent &key) = 0;
    /// Runs the logic's closing command; false before there is a logic.
    virtual bool runClosing() = 0;

private:
    std::vector<const QObject *> m_watched;
};

/// A tool window showing `View` for a `Logic` whose command `closing` means
/// closing the window (Cancel, Close).
template <class View, class Logic> class ToolWindow : public ToolDialog, public View {
public:
    using Handler = void (Logic::*)();

    /// Binds the window to its logic, which must outlive the window.
    void attach(Logic &logic) { m_logic = &logic; }

    void setCaption(const QString &caption) override { setWindowTitle(caption); }
    /// Shows the window centred over the main window and brings it to the front.
    void showCentred() override { showCentredOverParent(this); }
    /// Hides the window; the logic has already done what closing means.
    void close() override { hide(); }
    bool isShown() const override { return isVisible(); }

protected:
    ToolWindow(QWidget *main, const QString &name, const QString &caption, Handler closing)
        : ToolDialog(main, name, caption), m_closing(closing) {}

    Logic *logic() const { return m_logic; }
    /// Runs `handler` of the logic, once it is attached.
    void run(Handler handler) {
        if (m_logic != nullptr) {
            (m_logic->*handler)();
        }
    }

private:
    bool runClosing() override {
        if (m_logic == nullptr) {
            return false;
        }
        (m_logic->*m_closing)();
        return true;
    }

    Logic *m_logic = nullptr;
    Handler m_closing;
};

} // namespace arbolex::ui
