// arbolex-cli: the engine without a screen. One word selects a subcommand from
// the table below; every subcommand lives in a file of its own.
#include "cli/command.hpp"
#include "shell/datafolder.hpp"
#include "shell/version.hpp"

#include <QCoreApplication>
#ifdef ARBOLEX_WITH_REPORT
#include <QApplication>
#endif

#include <algorithm>
#include <memory>
#include <vector>

namespace {

using arbolex::cli::Command;

/// The subcommands, in the order the help lists them. A new command is one
/// entry here (and its file).
const std::vector<Command> &commands() {
    static const std::vector<Command> table = {
        arbolex::cli::projectCommand(),     arbolex::cli::thinCommand(),
        arbolex::cli::growCommand(),        arbolex::cli::assortCommand(),
        arbolex::cli::rotationCommand(),    arbolex::cli::optimiseCommand(),
        arbolex::cli::uncertaintyCommand(), arbolex::cli::estateCommand(),
        arbolex::cli::runCommand(),
#ifdef ARBOLEX_WITH_REPORT
        arbolex::cli::reportCommand(),
#endif
    };
    return table;
}

QString overview() {
    QString text = QStringLiteral("usage: arbolex-cli <command> [options]\n"
                                  "       arbolex-cli <command> --help\n"
                                  "       arbolex-cli --version\n"
                                  "\n"
                                  "commands:\n");
    for (const Command &c : commands()) {
        text += QStringLiteral("  ") + c.name.leftJustified(12) + c.summary + QLatin1Char('\n');
    }
    text += QStringLiteral(
        "\n"
        "Every command that prints a result takes --format tsv|csv|json; the JSON carries\n"
        "the run record that reproduces it and the units of its figures (docs/cli.md).\n"
        "Engine messages and failure lines go to stderr as MSG<TAB>title<TAB>text<TAB>style\n"
        "and LOG<TAB>line; failure lines are also appended to ErrorLog.txt in the data\n"
        "folder: --data-dir DIR, else $ARBOLEX_DATA_DIR, else the program's folder, or\n"
        "for an installed program the user's data location (filled from the defaults).\n"
        "Exit status: 0 done, 1 the engine failed, 2 the command line is wrong.\n");
    return text;
}

bool isHelp(const QString &word) {
    return word == QLatin1String("--help") || word == QLatin1String("-h");
}

/// The report draws its charts with Qt Charts, whose items are graphics
/// widgets: that command alone runs a widget application, on the offscreen
/// platform unless another is asked for, so it needs no screen. Every other
/// command is a core application.
std::unique_ptr<QCoreApplication> makeApplication(int &argc, char *argv[]) {
#ifdef ARBOLEX_WITH_REPORT
    if (argc > 1 && qstrcmp(argv[1], "report") == 0) {
        if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) {
            qputenv("QT_QPA_PLATFORM", "offscreen");
        }
        return std::make_unique<QApplication>(argc, argv);
    }
#endif
    return std::make_unique<QCoreApplication>(argc, argv);
}

} // namespace

int main(int argc, char *argv[]) {
    const std::unique_ptr<QCoreApplication> application = makeApplication(argc, argv);
    QTextStream out(stdout);
    QTextStream err(stderr);
    arbolex::shell::nameProgram();
    const QStringList arguments = QCoreApplication::arguments().mid(1);

    if (arguments.isEmpty()) {
        err << overview();
        return arbolex::cli::kExitBadArguments;
    }
    if (arguments.first() == QLatin1String("--version")) {
        out << "arbolex-cli " << arbolex::shell::programVersion() << '\n';
        return arbolex::cli::kExitSuccess;
    }
    if (isHelp(arguments.first())) {
        out << overview();
        for (const Command &c : commands()) {
            out << '\n' << c.name << ":\n" << c.help;
        }
        return arbolex::cli::kExitSuccess;
    }
    for (const Command &c : commands()) {
        if (c.name != arguments.first()) {
            continue;
        }
        const QStringList rest = arguments.mid(1);
        if (std::any_of(rest.begin(), rest.end(), isHelp)) {
            out << c.help;
            return arbolex::cli::kExitSuccess;
        }
        arbolex::cli::CommandContext context{
            rest, arbolex::shell::dataFolder(rest, QCoreApplication::applicationDirPath()), out,
            err};
        return c.run(context);
    }
    err << "arbolex-cli: unknown command \"" << arguments.first() << "\"\n\n" << overview();
    return arbolex::cli::kExitBadArguments;
}
