// ARBOLEX: the desktop program. Reads the command line, builds the windows
// over one session, loads the main window, then lets the user choose the
// model in the model choice window.
#include "shell/datafolder.hpp"
#include "shell/version.hpp"
#include "ui/desktop.hpp"
#include "ui/modelchoicedialog.hpp"
#include "ui/windowtexts.hpp"

#include <QApplication>
#include <QCommandLineParser>
#include <QTimer>

namespace {

/// The options of the command line.
struct Options {
    explicit Options(QCommandLineParser &parser) {
        parser.setApplicationDescription(arbolex::ui::text::programPurpose());
        parser.addHelpOption();
        parser.addVersionOption();
        parser.addOption(dataDir);
        parser.addOption(noIntro);
        parser.addOption(script);
        parser.addPositionalArgument(QStringLiteral("file"),
                                     QStringLiteral("A sub-compartment (.arbolex) to open."),
                                     QStringLiteral("[FILE]"));
        quitWhenShown.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(quitWhenShown);
    }

    QCommandLineOption dataDir{QStringLiteral("data-dir"),
                               QStringLiteral("Folder of the price lists, the user categories, "
                                              "the start-up file and the error log (default: "
                                              "ARBOLEX_DATA_DIR, else the program's folder)."),
                               QStringLiteral("DIR")};
    QCommandLineOption noIntro{QStringLiteral("no-intro"),
                               QStringLiteral("Open the main window directly, with the model of "
                                              "the start-up file.")};
    QCommandLineOption script{QStringLiteral("script"),
                              QStringLiteral("Once the main window is shown, run the runner "
                                             "script FILE on the windows (see arbolex-cli run)."),
                              QStringLiteral("FILE")};
    /// Ends the program once the main window is on screen: start-up is timed with it.
    QCommandLineOption quitWhenShown{QStringLiteral("quit-when-shown")};
};

/// True when the command line asks only for the usage or the version, which
/// are printed without opening a display.
bool asksForTextOnly(int argc, char *argv[]) {
    for (int i = 1; i < argc; ++i) {
        const QByteArray arg(argv[i]);
        if (arg == "-h" || arg == "--help" || arg == "--help-all" || arg == "-v" ||
            arg == "--version") {
            return true;
        }
    }
    return false;
}

} // namespace

int main(int argc, char *argv[]) {
    if (asksForTextOnly(argc, argv)) {
        QCoreApplication core(argc, argv);
        arbolex::shell::nameProgram();
        QCommandLineParser parser;
        const Options options(parser);
        parser.process(core); // prints and ends the program
        return 0;
    }

    QApplication app(argc, argv);
    arbolex::shell::nameProgram();
    QCommandLineParser parser;
    const Options options(parser);
    parser.process(app);

    const QString folder =
        arbolex::shell::dataFolder(QCoreApplication::arguments(), app.applicationDirPath());
    arbolex::ui::Desktop desktop(folder, app.applicationDirPath());
    desktop.load();
    arbolex::ui::MainWindow &window = desktop.mainWindow();
    if (const QStringList files = parser.positionalArguments(); !files.isEmpty()) {
        const QString file = files.first();
        QTimer::singleShot(0, &window,
                           [&desktop, file] { desktop.session().documents().open(file); });
    }
    if (parser.isSet(options.script)) {
        const QString script = parser.value(options.script);
        QTimer::singleShot(0, &window, [&desktop, script] { desktop.runScript(script); });
    }
    if (parser.isSet(options.noIntro)) {
        window.show();
        if (parser.isSet(options.quitWhenShown)) {
            QTimer::singleShot(0, &app, &QCoreApplication::quit);
        }
    } else {
        arbolex::ui::ModelChoiceDialog choice(window, folder, desktop.session().grow().modelId());
        if (choice.exec() != QDialog::Accepted) {
            return 0;
        }
    }
    app.exec();
    desktop.shutDown();
    return 0;
}
