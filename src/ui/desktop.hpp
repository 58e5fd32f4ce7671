#pragma once

// The desktop program's windows over one session: the main window and every
// window it opens, their menus and buttons connected to the session's
// logics, the settings, the clipboard and the copies of the data files the
// exit writes over. main.cpp builds one and starts it; a runner script
// (arbolex --script) drives it as it drives the program without a screen.

#include "cli/scripttarget.hpp"
#include "session/session.hpp"
#include "shell/datahistory.hpp"
#include "ui/assortpriceswindow.hpp"
#include "ui/assortuserwindow.hpp"
#include "ui/assortwindow.hpp"
#include "ui/carbonpricewindow.hpp"
#include "ui/documentmenu.hpp"
#include "ui/economicswindow.hpp"
#include "ui/estatewindow.hpp"
#include "ui/mainwindow.hpp"
#include "ui/npvwindow.hpp"
#include "ui/qtclipboard.hpp"
#include "ui/qtinteractive.hpp"
#include "ui/thinwindow.hpp"
#include "ui/timberpriceswindow.hpp"

#include <QRect>
#include <QSettings>
#include <QString>

namespace arbolex::ui {

/// What a desktop may be given instead of its own: message boxes that are
/// recorded rather than shown, settings in a file of their own (the tests).
struct DesktopServices {
    shell::IInteractive *interactive = nullptr;
    QSettings *settings = nullptr;
};

class Desktop : public cli::ScriptTarget {
public:
    /// The windows over the data folder `dataFolder`; `programFolder` holds
    /// the program (where the user's data places are found).
    Desktop(const QString &dataFolder, const QString &programFolder,
            const DesktopServices &services = {});
    ~Desktop() override;
    Desktop(const Desktop &) = delete;
    Desktop &operator=(const Desktop &) = delete;

    /// Ends the work the windows run away from the window's thread, before the program ends.
    void shutDown();
    /// The main window's load on `screen` (the primary screen when empty):
    /// placement, start-up file, model, prices; the work becomes an unsaved,
    /// unchanged "Untitled" document.
    void load(const QRect &screen = {});
    /// Runs the runner script `path` on the windows; its errors and what it
    /// prints go to stderr. False when the script stopped at a wrong line.
    bool runScript(const QString &path);

    // ScriptTarget
    session::Session &session() override { return m_session; }
    void queueAnswer(bool yes) override { m_interactive.queueAnswer(yes); }
    QString clipboardText() const override;
    /// Waits for the work the windows run away from the window's thread.
    void waitForWork() override;
    void settle() override;
    void quitAfterScript() override { m_quitAfterScript = true; }
    /// "charts stand|increments|cashflow|carbon", "frmEconomics rotation|optimiser|
    /// sensitivity|montecarlo", "frmEstate table|chart|closed".
    QString show(const QString &window, const QString &page) override;

    MainWindow &mainWindow() { return m_window; }
    ThinWindow &thinWindow() { return m_thinWindow; }
    NpvWindow &npvWindow() { return m_npvWindow; }
    TimberPricesWindow &pricesWindow() { return m_pricesWindow; }
    AssortWindow &assortWindow() { return m_assortWindow; }
    AssortUserWindow &assortUserWindow() { return m_assortUserWindow; }
    EconomicsWindow &economicsWindow() { return m_economicsWindow; }
    AssortPricesWindow &assortPricesWindow() { return m_assortPricesWindow; }
    CarbonPriceWindow &carbonPriceWindow() { return m_carbonPriceWindow; }
    EstateWindow &estateWindow() { return m_estateWindow; }
    QSettings &settings() { return *m_settings; }

private:
    QSettings m_ownSettings;
    QSettings *m_settings;
    QtInteractive m_interactive;
    shell::IInteractive &m_asking;
    QtClipboard m_clipboard;
    MainWindow m_window;
    ThinWindow m_thinWindow{&m_window};
    NpvWindow m_npvWindow{&m_window};
    TimberPricesWindow m_pricesWindow{&m_window};
    AssortWindow m_assortWindow{&m_window};
    AssortUserWindow m_assortUserWindow{&m_window};
    EconomicsWindow m_economicsWindow{&m_window};
    AssortPricesWindow m_assortPricesWindow{&m_window};
    CarbonPriceWindow m_carbonPriceWindow{&m_window};
    EstateWindow m_estateWindow{&m_window};
    DocumentMenu m_documentMenu;
    shell::DataHistory m_history;
    session::Session m_session;
    bool m_quitAfterScript = false;
};

} // namespace arbolex::ui
