#include "prices/carbonsettingsfile.hpp"

#include "shell/errorlog.hpp"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

namespace arbolex::prices {

namespace {

constexpr QLatin1String kGetLabel(" in procedure GetCarbonSettingsFromFile of Module Misc");
constexpr QLatin1String kWriteLabel(" in procedure WriteCarbonSettingsInFile of Module Misc");

QString quotedName(const QString &path) {
    return QLatin1Char('"') + QFileInfo(path).fileName() + QLatin1Char('"');
}

} // namespace

CarbonSettingsReading readCarbonSettings(const QString &path) {
    const QString name = quotedName(path);
    QFile file(path);
    if (!file.exists()) {
        return {std::nullopt, true, name + QStringLiteral(": the file is missing")};
    }
    if (!file.open(QIODevice::ReadOnly)) {
        return {std::nullopt, false, name + QStringLiteral(": ") + file.errorString()};
    }
    const QByteArray bytes = file.readAll();
    const carbon::CarbonReading read =
        carbon::readCarbonText(std::string_view(bytes.constData(), bytes.size()));
    if (!read.settings) {
        return {std::nullopt, false,
                name + QStringLiteral(": ") + QString::fromStdString(read.fault)};
    }
    return {read.settings, false, {}};
}

void GetCarbonSettingsFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log) {
    const CarbonSettingsReading read =
        readCarbonSettings(QDir(dataFolder).filePath(QLatin1String(kCarbonFile)));
    if (!read.settings) {
        log.append(QStringLiteral("FAULT - ") + read.fault +
                   QStringLiteral("; the carbon settings were not read") + kGetLabel);
        return;
    }
    data.carbon = *read.settings;
    data.carbonAtStart = *read.settings;
}

bool carbonSettingsChanged(const PriceData &data) {
    return !(data.carbon == data.carbonAtStart);
}

void WriteCarbonSettingsInFile(const QString &dataFolder, const PriceData &data,
                               shell::ErrorLog &log) {
    const QString path = QDir(dataFolder).filePath(QLatin1String(kCarbonFile));
    QSaveFile file(path);
    const std::string text = carbon::carbonText(data.carbon);
    const bool written = file.open(QIODevice::WriteOnly) &&
                         file.write(text.data(), static_cast<qint64>(text.size())) ==
                             static_cast<qint64>(text.size()) &&
                         file.commit();
    if (!written) {
        log.append(QStringLiteral("FAULT - ") + quotedName(path) +
                   QStringLiteral(" could not be written: ") + file.errorString() + kWriteLabel);
    }
}

} // namespace arbolex::prices
