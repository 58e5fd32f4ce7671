#pragma once

// The subcommands of the command-line program. Each lives in a file of its own
// and is one entry of the table in main.cpp: to add a command, write
// `Command fooCommand()` in foocommand.cpp, declare it below and list it there.

#include <QString>
#include <QStringList>
#include <QTextStream>

namespace arbolex::cli {

/// Exit statuses of the program.
enum ExitStatus : int {
    kExitSuccess = 0,
    /// The engine failed: a projection or a solve did not complete, or the
    /// engine reported a failure.
    kExitEngineFailure = 1,
    /// The command line is wrong; stderr says what is wrong.
    kExitBadArguments = 2,
};

/// What a command runs with.
struct CommandContext {
    /// The arguments after the command's name.
    QStringList arguments;
    /// The data folder: `--data-dir DIR`, else ARBOLEX_DATA_DIR, else the
    /// executable's folder. The error log is written there.
    QString dataFolder;
    QTextStream &out;
    QTextStream &err;
};

struct Command {
    /// The word that selects the command ("project").
    QString name;
    /// One line for the overview of `arbolex-cli --help`.
    QString summary;
    /// The text of `arbolex-cli <name> --help`: synopsis and options.
    QString help;
    /// Runs the command; returns the exit status.
    int (*run)(CommandContext &context);
};

Command projectCommand();
Command thinCommand();
Command growCommand();
Command runCommand();
Command assortCommand();
Command rotationCommand();
Command optimiseCommand();
Command uncertaintyCommand();
Command estateCommand();
/// Built only with the windows' libraries (ARBOLEX_WITH_REPORT): it draws charts.
Command reportCommand();

} // namespace arbolex::cli
