// Window placement and interest rate in the per-user settings.
#include "shell/settings.hpp"

#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::shell {
namespace {

TEST(SettingsTest, PlacementIsCentredUnlessAStoredOneShows) {
    QTemporaryDir dir;
    QSettings settings(dir.filePath(QStringLiteral("arbolex.ini")), QSettings::IniFormat);
    const QRect screen(0, 0, 1920, 1080);
    const QRect centred(360, 160, 1200, 760);
    EXPECT_EQ(readMainPlacement(settings, screen), centred);
    EXPECT_EQ(readMainPlacement(settings, QRect(1920, 30, 1280, 1024)),
              QRect(1960, 162, 1200, 760));
    EXPECT_EQ(readMainPlacement(settings, QRect(0, 0, 1024, 600)), QRect(0, 0, 1024, 600));

    writeMainPlacement(settings, QRect(40, 60, 900, 500));
    EXPECT_EQ(readMainPlacement(settings, screen), QRect(40, 60, 900, 500));
    writeMainPlacement(settings, QRect(1900, 1070, 900, 500)); // mostly off the screen
    EXPECT_EQ(readMainPlacement(settings, screen), centred);
    writeMainPlacement(settings, QRect(40, 60, 900, 500));
    settings.setValue(QStringLiteral("Settings/MainTop"), QStringLiteral("top"));
    EXPECT_EQ(readMainPlacement(settings, screen), centred);

    EXPECT_EQ(readInterestRate(settings), 5.0);
    writeInterestRate(settings, 3.75);
    settings.sync();
    QSettings reread(settings.fileName(), QSettings::IniFormat);
    EXPECT_EQ(readInterestRate(reread), 3.75);
}

} // namespace
} // namespace arbolex::shell
