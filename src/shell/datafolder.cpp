#include "shell/datafolder.hpp"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>

namespace arbolex::shell {

namespace {

/// Copies every default file that `folder` lacks. A copy takes the installed
/// file's permissions, which may be read-only: the exit must write it.
void fillFromDefaults(const QString &folder, const QString &defaults) {
    QDir().mkpath(folder);
    QDirIterator shipped(defaults, QDir::Files);
    while (shipped.hasNext()) {
        shipped.next();
        const QString target = QDir(folder).filePath(shipped.fileName());
        if (!QFileInfo::exists(target) && QFile::copy(shipped.filePath(), target)) {
            QFile::setPermissions(target, QFile::permissions(target) | QFile::WriteOwner);
        }
    }
}

} // namespace

DataPlaces programDataPlaces(const QString &executableFolder) {
    return {executableFolder,
            QDir(executableFolder).absoluteFilePath(QStringLiteral(ARBOLEX_INSTALLED_DEFAULTS)),
            QStandardPaths::writableLocation(QStandardPaths::AppDataLocation)};
}

QString dataFolder(const QStringList &arguments, const DataPlaces &places) {
    const qsizetype at = arguments.indexOf(QStringLiteral("--data-dir"));
    if (at >= 0 && at + 1 < arguments.size()) {
        return QDir(arguments.at(at + 1)).absolutePath();
    }
    const QString fromEnvironment = qEnvironmentVariable(kDataFolderVariable);
    if (!fromEnvironment.isEmpty()) {
        return QDir(fromEnvironment).absolutePath();
    }
    // An installed copy never writes beside itself, even where it could (an
    // installation in the user's own ~/.local, or one run by root).
    const bool installed = QFileInfo(places.installedDefaults).isDir();
    if (!installed && QFileInfo(places.executableFolder).isWritable()) {
        return places.executableFolder;
    }
    fillFromDefaults(places.userFolder, places.installedDefaults);
    return places.userFolder;
}

QString dataFolder(const QStringList &arguments, const QString &executableFolder) {
    return dataFolder(arguments, programDataPlaces(executableFolder));
}

} // namespace arbolex::shell
