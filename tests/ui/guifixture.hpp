#pragma once

#include "mocks/programservices.hpp"

#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "ui/desktop.hpp"
#include "ui/mainwindow.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAbstractButton>
#include <QApplication>
#include <QDir>
#include <QFile>
#include <QKeyEvent>
#include <QLineEdit>
#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::testing {

using workflow::MainControl;

/// Presses and releases one key on `widget`, as the keyboard would.
inline void pressKey(QWidget *widget, int key, const QString &text = {}) {
    QKeyEvent press(QEvent::KeyPress, key, Qt::NoModifier, text);
    QApplication::sendEvent(widget, &press);
    QKeyEvent release(QEvent::KeyRelease, key, Qt::NoModifier, text);
    QApplication::sendEvent(widget, &release);
}

/// Types `text` on `widget` one character at a time.
inline void typeKeys(QWidget *widget, const QString &text) {
    for (const QChar c : text) {
        pressKey(widget, c.toUpper().unicode(), QString(c));
    }
}

/// Clicks a button of a window.
inline void click(QWidget *button) {
    qobject_cast<QAbstractButton *>(button)->click();
}

/// The desktop program's windows on the screen (offscreen) over one session,
/// loaded from a temporary copy of the shipped data folder, with settings in a
/// temporary file and message boxes recorded instead of shown.
class MainWindowGuiTest : public ::testing::Test {
protected:
    MainWindowGuiTest() { desktop.load(QRect(0, 0, 1600, 1000)); }

    QLineEdit *field(MainControl c) const { return qobject_cast<QLineEdit *>(window.control(c)); }

    QTemporaryDir dir;
    FakeInteractive interactive;
    bool dataCopied = copyShippedData(dir.path());
    QSettings settings{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    ui::Desktop desktop{dir.path(), dir.path(), {&interactive, &settings}};
    session::Session &session = desktop.session();
    shell::ErrorLog &log = session.errorLog();
    engine::Grow &grow = session.grow();
    prices::Prices &prices = session.prices();
    work::StandWork &work = session.work();
    ui::MainWindow &window = desktop.mainWindow();
    workflow::MainWindowLogic &logic = session.main();
};

} // namespace arbolex::testing
