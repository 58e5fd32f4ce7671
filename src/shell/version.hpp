#pragma once

#include <QString>

namespace arbolex::shell {

/// The program's name, as the windows, the user settings and the user's data
/// location know it.
QString programName();

/// The version of the project (CMakeLists.txt), printed by `--version`.
QString programVersion();

/// Names the running program. Both programs call it first, so that they share
/// one user data location (QStandardPaths::AppDataLocation).
void nameProgram();

} // namespace arbolex::shell
