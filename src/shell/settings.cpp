#include "shell/settings.hpp"

#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"

#include <QSettings>

#include <algorithm>
#include <cmath>
#include <optional>

namespace arbolex::shell {

namespace {

constexpr QLatin1String kMainLeft("MainLeft");
constexpr QLatin1String kMainTop("MainTop");
constexpr QLatin1String kMainWidth("MainWidth");
constexpr QLatin1String kMainHeight("MainHeight");
constexpr QLatin1String kInterestRate("InterestRate");

/// Least part of the window, pixels, that must lie on the screen to keep a stored placement.
constexpr int kMinVisibleWidth = 100;
constexpr int kMinVisibleHeight = 50;

/// Values are kept as number text with '.', so any settings store reads them back.
std::optional<double> readNumber(QSettings &settings, QLatin1String key) {
    const QString text = settings.value(key).toString();
    if (!isNumeric(text)) {
        return std::nullopt;
    }
    return val(text);
}

void writeNumber(QSettings &settings, QLatin1String key, double value) {
    settings.setValue(key, generalNumber(value));
}

int toPixels(double value) {
    return static_cast<int>(std::clamp(std::round(value), -1.0e6, 1.0e6));
}

QRect centred(const QRect &screen) {
    const int width = std::min(kDefaultMainWidth, screen.width());
    const int height = std::min(kDefaultMainHeight, screen.height());
    return {screen.x() + (screen.width() - width) / 2, screen.y() + (screen.height() - height) / 2,
            width, height};
}

} // namespace

QRect readMainPlacement(QSettings &settings, const QRect &availableScreen) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    const auto left = readNumber(settings, kMainLeft);
    const auto top = readNumber(settings, kMainTop);
    const auto width = readNumber(settings, kMainWidth);
    const auto height = readNumber(settings, kMainHeight);
    settings.endGroup();
    if (!left || !top || !width || !height) {
        return centred(availableScreen);
    }
    QRect placement(toPixels(*left), toPixels(*top),
                    std::min(toPixels(*width), availableScreen.width()),
                    std::min(toPixels(*height), availableScreen.height()));
    const QRect visible = placement.intersected(availableScreen);
    if (placement.width() <= 0 || placement.height() <= 0 ||
        visible.width() < std::min(kMinVisibleWidth, placement.width()) ||
        visible.height() < std::min(kMinVisibleHeight, placement.height())) {
        return centred(availableScreen);
    }
    return placement;
}

void writeMainPlacement(QSettings &settings, const QRect &placement) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    writeNumber(settings, kMainLeft, placement.x());
    writeNumber(settings, kMainTop, placement.y());
    writeNumber(settings, kMainWidth, placement.width());
    writeNumber(settings, kMainHeight, placement.height());
    settings.endGroup();
}

double readInterestRate(QSettings &settings) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    const auto rate = readNumber(settings, kInterestRate);
    settings.endGroup();
    return rate.value_or(kDefaultInterestRate);
}

void writeInterestRate(QSettings &settings, double percent) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    writeNumber(settings, kInterestRate, percent);
    settings.endGroup();
}

QStringList readRecentFiles(QSettings &settings) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    QStringList files = settings.value(QStringLiteral("RecentFiles")).toStringList();
    settings.endGroup();
    files.removeAll(QString());
    files.removeDuplicates();
    return files.mid(0, kRecentFileCount);
}

void writeRecentFiles(QSettings &settings, const QStringList &files) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    settings.setValue(QStringLiteral("RecentFiles"), files.mid(0, kRecentFileCount));
    settings.endGroup();
}

QString readLastFolder(QSettings &settings) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    const QString folder = settings.value(QStringLiteral("LastFolder")).toString();
    settings.endGroup();
    return folder;
}

void writeLastFolder(QSettings &settings, const QString &folder) {
    settings.beginGroup(QLatin1String(kSettingsSection));
    settings.setValue(QStringLiteral("LastFolder"), folder);
    settings.endGroup();
}

} // namespace arbolex::shell
