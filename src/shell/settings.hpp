#pragma once

#include <QRect>
#include <QString>
#include <QStringList>

class QSettings;

namespace arbolex::shell {

/// Per-user settings section of the program.
inline constexpr const char *kSettingsSection = "Settings";

/// Size of the main window when no usable placement is stored, pixels.
inline constexpr int kDefaultMainWidth = 1200;
inline constexpr int kDefaultMainHeight = 760;

/// Interest rate when none is stored, percent.
inline constexpr double kDefaultInterestRate = 5.0;

/// Main window placement from "MainLeft", "MainTop", "MainWidth" and
/// "MainHeight". When one is missing or not a number, the size is not
/// positive, or the window would not show at least 100 × 50 pixels of
/// `availableScreen`, the window gets the default size (shrunk to the screen)
/// centred on `availableScreen`. A stored size larger than the screen is shrunk to it.
QRect readMainPlacement(QSettings &settings, const QRect &availableScreen);

/// Stores the main window placement.
void writeMainPlacement(QSettings &settings, const QRect &placement);

/// Interest rate, percent, from "InterestRate"; kDefaultInterestRate when
/// missing or not a number.
double readInterestRate(QSettings &settings);

void writeInterestRate(QSettings &settings, double percent);

/// Most recent documents listed in Open Recent.
inline constexpr int kRecentFileCount = 8;

/// The recent documents, newest first, at most kRecentFileCount ("RecentFiles").
QStringList readRecentFiles(QSettings &settings);
void writeRecentFiles(QSettings &settings, const QStringList &files);

/// The folder a document was last opened from or saved in ("LastFolder"),
/// empty when none.
QString readLastFolder(QSettings &settings);
void writeLastFolder(QSettings &settings, const QString &folder);

} // namespace arbolex::shell
