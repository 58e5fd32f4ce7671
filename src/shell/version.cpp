#include "shell/version.hpp"

#include <QCoreApplication>

namespace arbolex::shell {

QString programName() {
    return QStringLiteral("ARBOLEX");
}

QString programVersion() {
    return QStringLiteral(ARBOLEX_VERSION); // set for this file alone by src/CMakeLists.txt
}

void nameProgram() {
    QCoreApplication::setOrganizationName(programName());
    QCoreApplication::setApplicationName(programName());
    QCoreApplication::setApplicationVersion(programVersion());
}

} // namespace arbolex::shell
