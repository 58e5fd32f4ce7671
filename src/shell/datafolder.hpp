#pragma once

#include <QString>
#include <QStringList>

namespace arbolex::shell {

/// Name of the environment variable that names another data folder.
inline constexpr const char *kDataFolderVariable = "ARBOLEX_DATA_DIR";

/// The program's data folder (price lists, categories, start-up file, error
/// log): the folder given by `--data-dir DIR` among `arguments`, else the one
/// named by ARBOLEX_DATA_DIR, else `executableFolder`.
QString dataFolder(const QStringList &arguments, const QString &executableFolder);

} // namespace arbolex::shell
