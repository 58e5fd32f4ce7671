// ARBOLEX: the desktop program. Builds the engine, the prices and the main
// window with its logic, loads the main window, then lets the user choose the
// model in the model choice window.
#include "economics/prices.hpp"
#include "engine/grow.hpp"
#include "shell/datafolder.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "ui/mainwindow.hpp"
#include "ui/modelchoicedialog.hpp"
#include "ui/qtinteractive.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QApplication>
#include <QCommandLineParser>
#include <QScreen>
#include <QSettings>
#include <QTimer>

namespace {

using arbolex::workflow::MainControl;

/// Grows a young Sitka spruce stand with model 0, as a user would type it:
/// a way to look at a filled main window without a keyboard.
void demoGrow(arbolex::workflow::MainWindowLogic &logic) {
    logic.mnuModel_Click(0);
    logic.typeText(MainControl::txtFromA, QStringLiteral("15"));
    logic.typeText(MainControl::txtFromN, QStringLiteral("2500"));
    logic.typeText(MainControl::txtFromH, QStringLiteral("7"));
    logic.typeText(MainControl::txtFromB, QStringLiteral("20"));
    logic.typeText(MainControl::txtFromD, QString());
    logic.typeText(MainControl::txtToA, QStringLiteral("50"));
    logic.typeText(MainControl::txtByA, QStringLiteral("5"));
    logic.cmdGrow_Click();
}

/// The options of the command line.
struct Options {
    explicit Options(QCommandLineParser &parser) {
        parser.setApplicationDescription(arbolex::ui::text::programPurpose());
        parser.addHelpOption();
        parser.addVersionOption();
        demo.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(dataDir);
        parser.addOption(noIntro);
        parser.addOption(demo);
    }

    QCommandLineOption dataDir{QStringLiteral("data-dir"),
                               QStringLiteral("Folder of the price lists, the user categories, "
                                              "the start-up file and the error log (default: "
                                              "ARBOLEX_DATA_DIR, else the program's folder)."),
                               QStringLiteral("DIR")};
    QCommandLineOption noIntro{QStringLiteral("no-intro"),
                               QStringLiteral("Open the main window directly, with the model of "
                                              "the start-up file.")};
    QCommandLineOption demo{QStringLiteral("demo-grow")};
};

void nameApplication() {
    QCoreApplication::setOrganizationName(arbolex::ui::text::programName());
    QCoreApplication::setApplicationName(arbolex::ui::text::programName());
    QCoreApplication::setApplicationVersion(arbolex::ui::text::programVersion());
}

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
        nameApplication();
        QCommandLineParser parser;
        const Options options(parser);
        parser.process(core); // prints and ends the program
        return 0;
    }

    QApplication app(argc, argv);
    nameApplication();
    QCommandLineParser parser;
    const Options options(parser);
    parser.process(app);

    const QString folder =
        arbolex::shell::dataFolder(QCoreApplication::arguments(), app.applicationDirPath());
    arbolex::shell::ErrorLog log(folder);
    arbolex::ui::QtInteractive interactive;
    arbolex::shell::EngineReport report(interactive, log);
    arbolex::engine::Grow grow(&report);
    arbolex::economics::Prices prices;
    QSettings settings;

    arbolex::ui::MainWindow window;
    interactive.setParentWidget(&window);
    arbolex::workflow::MainWindowLogic logic(grow, prices, log, folder, window, interactive);
    window.attach(logic, settings);
    logic.Form_Load(settings, QGuiApplication::primaryScreen()->availableGeometry());

    if (parser.isSet(options.demo)) {
        QTimer::singleShot(0, &window, [&logic] { demoGrow(logic); });
    }
    if (parser.isSet(options.noIntro)) {
        window.show();
    } else {
        arbolex::ui::ModelChoiceDialog choice(window, folder, grow.modelId());
        if (choice.exec() != QDialog::Accepted) {
            return 0;
        }
    }
    app.exec();
    return 0;
}
