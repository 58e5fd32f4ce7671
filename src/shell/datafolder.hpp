#pragma once

#include <QString>
#include <QStringList>

namespace arbolex::shell {

/// Name of the environment variable that names another data folder.
inline constexpr const char *kDataFolderVariable = "ARBOLEX_DATA_DIR";

/// The places a data folder may come from.
struct DataPlaces {
    /// The program's own folder.
    QString executableFolder;
    /// The default data folder installed with the program (share/arbolex/data);
    /// it exists only beside an installed program.
    QString installedDefaults;
    /// The user's data location (QStandardPaths::AppDataLocation).
    QString userFolder;
};

/// The places of the running program, whose executable is in `executableFolder`.
DataPlaces programDataPlaces(const QString &executableFolder);

/// The program's data folder (price lists, categories, start-up file, error
/// log): the folder given by `--data-dir DIR` among `arguments`, else the one
/// named by ARBOLEX_DATA_DIR, else the program's own folder when it may write
/// there and is not an installed copy, else the user's data location. The
/// user's folder is created and filled from the installed defaults: a file it
/// lacks is copied, a file it holds is never overwritten.
QString dataFolder(const QStringList &arguments, const DataPlaces &places);

/// dataFolder() with the places of the program in `executableFolder`.
QString dataFolder(const QStringList &arguments, const QString &executableFolder);

} // namespace arbolex::shell
