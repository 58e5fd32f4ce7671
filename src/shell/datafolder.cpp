#include "shell/datafolder.hpp"

#include <QDir>

namespace arbolex::shell {

QString dataFolder(const QStringList &arguments, const QString &executableFolder) {
    const qsizetype at = arguments.indexOf(QStringLiteral("--data-dir"));
    if (at >= 0 && at + 1 < arguments.size()) {
        return QDir(arguments.at(at + 1)).absolutePath();
    }
    const QString fromEnvironment = qEnvironmentVariable(kDataFolderVariable);
    if (!fromEnvironment.isEmpty()) {
        return QDir(fromEnvironment).absolutePath();
    }
    return executableFolder;
}

} // namespace arbolex::shell
