// ARBOLEX: the desktop program. Builds the engine, the prices, the main window
// and the thinning window with their logic, loads the main window, then lets
// the user choose the model in the model choice window.
#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/npvwindowlogic.hpp"
#include "economics/prices.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "engine/grow.hpp"
#include "shell/datafolder.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "shell/version.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/assortpriceswindow.hpp"
#include "ui/assortuserwindow.hpp"
#include "ui/assortwindow.hpp"
#include "ui/mainwindow.hpp"
#include "ui/modelchoicedialog.hpp"
#include "ui/npvwindow.hpp"
#include "ui/qtclipboard.hpp"
#include "ui/qtinteractive.hpp"
#include "ui/thinwindow.hpp"
#include "ui/timberpriceswindow.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAction>
#include <QApplication>
#include <QCommandLineParser>
#include <QScreen>
#include <QSettings>
#include <QTimer>

namespace {

using arbolex::thinning::ThinControl;
using arbolex::thinning::ThinWindowLogic;
using arbolex::workflow::MainControl;
using arbolex::workflow::MainWindowLogic;

/// Grows a young Sitka spruce stand with model 0 (age 15, 2500 stems/ha, 7 m,
/// 20 m²/ha) to `to` by 5 years, as a user would type it: a way to look at a
/// filled main window without a keyboard.
void demoGrow(MainWindowLogic &logic, const QString &to = QStringLiteral("50")) {
    logic.mnuModel_Click(0);
    logic.typeText(MainControl::txtFromA, QStringLiteral("15"));
    logic.typeText(MainControl::txtFromN, QStringLiteral("2500"));
    logic.typeText(MainControl::txtFromH, QStringLiteral("7"));
    logic.typeText(MainControl::txtFromB, QStringLiteral("20"));
    logic.typeText(MainControl::txtFromD, QString());
    logic.typeText(MainControl::txtToA, to);
    logic.typeText(MainControl::txtByA, QStringLiteral("5"));
    logic.cmdGrow_Click();
}

/// The thinning demonstrations, each from the same young stand:
///   open     the thinning window just opened on the last row, at 30;
///   preview  the same after previewing a removal of 60 m³/ha;
///   loop     30 m³/ha thinned at 20, then every 5 years until 50, and the
///            thinning window left, so the table is in view.
/// False for an unknown stage.
bool demoThin(MainWindowLogic &logic, ThinWindowLogic &thin, const QString &stage) {
    if (stage == QLatin1String("open") || stage == QLatin1String("preview")) {
        demoGrow(logic, QStringLiteral("30"));
        logic.cmdThin_Click();
        if (stage == QLatin1String("preview")) {
            thin.typeText(ThinControl::txtRemV, QStringLiteral("60"));
            thin.press(ThinControl::cmdThin);
        }
        return true;
    }
    if (stage == QLatin1String("loop")) {
        demoGrow(logic, QStringLiteral("20"));
        logic.cmdThin_Click();
        thin.typeText(ThinControl::txtRemV, QStringLiteral("30"));
        thin.press(ThinControl::cmdThin);
        thin.press(ThinControl::chkActivLoop);
        thin.typeText(ThinControl::txtThinFreq, QStringLiteral("5"));
        thin.typeText(ThinControl::txtThinUntil, QStringLiteral("50"));
        thin.press(ThinControl::cmdLoop);
        thin.press(ThinControl::cmdCancel);
        return true;
    }
    return false;
}

/// The rotation demonstrations, from a Sitka spruce stand (age 15, 2500
/// stems/ha, 9 m, 22 m²/ha, 10 ha) thinned by 50 m³/ha at 30 and grown to 60:
///   finalcut  the main window after the final cut;
///   summary   the rotation summary;
///   npv       the net present value window at 5 %, a planting cost in the
///             first year.
/// False for an unknown stage.
bool demoRotation(MainWindowLogic &logic, ThinWindowLogic &thin,
                  arbolex::economics::NpvWindowLogic &npv, const QString &stage) {
    if (stage != QLatin1String("finalcut") && stage != QLatin1String("summary") &&
        stage != QLatin1String("npv")) {
        return false;
    }
    logic.mnuModel_Click(0);
    logic.typeText(MainControl::txtFromA, QStringLiteral("15"));
    logic.typeText(MainControl::txtFromN, QStringLiteral("2500"));
    logic.typeText(MainControl::txtFromH, QStringLiteral("9"));
    logic.typeText(MainControl::txtFromB, QStringLiteral("22"));
    logic.typeText(MainControl::txtFromD, QString());
    logic.typeText(MainControl::txtNetArea, QStringLiteral("10"));
    logic.typeText(MainControl::txtToA, QStringLiteral("30"));
    logic.typeText(MainControl::txtByA, QStringLiteral("5"));
    logic.cmdGrow_Click();
    logic.cmdThin_Click();
    thin.typeText(ThinControl::txtRemV, QStringLiteral("50"));
    thin.press(ThinControl::cmdThin);
    thin.press(ThinControl::cmdAccept);
    logic.typeText(MainControl::txtToA, QStringLiteral("60"));
    logic.cmdGrow_Click();
    logic.cmdFinalCut_Click();
    if (stage == QLatin1String("summary")) {
        logic.cmdSummary_Click();
    } else if (stage == QLatin1String("npv")) {
        logic.cmdNPV_Click();
        npv.typeInCell(1, arbolex::economics::kCfOperation, QStringLiteral("Planting"));
        npv.typeInCell(1, arbolex::economics::kCfCost, QStringLiteral("2500"));
        npv.typeInCell(6, arbolex::economics::kCfOperation, QStringLiteral("Cleaning"));
        npv.typeInCell(6, arbolex::economics::kCfCost, QStringLiteral("300"));
        npv.cmdNPV_Click();
    }
    return true;
}

/// The assortment demonstrations:
///   growth    the report of the growth row at 35 of the grown stand;
///   thinning  the report of the trees a 60 m³/ha thinning at 30 removes;
///   rows      that thinning accepted with its three reports kept, then grown
///             on to 50, so the assortment rows are in view;
///   user      the user categories window with four categories in use;
///   user-report  the report of the growth row at 35 over those categories.
/// False for an unknown stage.
bool demoAssort(MainWindowLogic &logic, ThinWindowLogic &thin,
                arbolex::assortments::AssortWindowLogic &assort,
                arbolex::assortments::AssortUserLogic &user, const QString &stage) {
    using arbolex::assortments::AssortControl;
    using arbolex::assortments::AssortUserControl;
    if (stage == QLatin1String("growth")) {
        demoGrow(logic);
        logic.select(5, 5);
        logic.cmdAssort_Click();
        return true;
    }
    if (stage == QLatin1String("thinning") || stage == QLatin1String("rows")) {
        demoGrow(logic, QStringLiteral("30"));
        logic.cmdThin_Click();
        thin.typeText(ThinControl::txtRemV, QStringLiteral("60"));
        thin.press(ThinControl::cmdThin);
        if (stage == QLatin1String("thinning")) {
            thin.cmdAssort_Click(1);
            return true;
        }
        for (int kind = 0; kind < 3; ++kind) {
            thin.cmdAssort_Click(kind);
            assort.press(AssortControl::cmdAccept);
        }
        thin.press(ThinControl::cmdAccept);
        logic.typeText(MainControl::txtToA, QStringLiteral("50"));
        logic.cmdGrow_Click();
        return true;
    }
    if (stage == QLatin1String("user") || stage == QLatin1String("user-report")) {
        demoGrow(logic);
        user.mnuAssortUser_Click();
        for (const int index : {1, 2, 3, 4}) {
            user.press(AssortUserControl::chkUse, index);
        }
        user.press(AssortUserControl::chkUserCategories, 0);
        if (stage == QLatin1String("user-report")) {
            user.press(AssortUserControl::cmdOK, 0);
            logic.select(5, 5);
            logic.cmdAssort_Click();
        }
        return true;
    }
    return false;
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
        demoThin.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoThin);
        demoRotation.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoRotation);
        demoPrices.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoPrices);
        demoAssort.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoAssort);
        demoAssortPrices.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoAssortPrices);
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
    QCommandLineOption demo{QStringLiteral("demo-grow")};
    QCommandLineOption demoThin{QStringLiteral("demo-thin"), QString(), QStringLiteral("STAGE")};
    QCommandLineOption demoRotation{QStringLiteral("demo-rotation"), QString(),
                                    QStringLiteral("STAGE")};
    /// Opens the timber prices window, as Show Timber Prices does.
    QCommandLineOption demoPrices{QStringLiteral("demo-prices")};
    QCommandLineOption demoAssort{QStringLiteral("demo-assort"), QString(),
                                  QStringLiteral("STAGE")};
    /// Opens the assortment prices window with changes allowed.
    QCommandLineOption demoAssortPrices{QStringLiteral("demo-assort-prices")};
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
    arbolex::shell::ErrorLog log(folder);
    arbolex::ui::QtInteractive interactive;
    arbolex::shell::EngineReport report(interactive, log);
    arbolex::engine::Grow grow(&report);
    arbolex::economics::Prices prices;
    QSettings settings;

    arbolex::ui::MainWindow window;
    interactive.setParentWidget(&window);
    MainWindowLogic logic(grow, prices, log, folder, window, interactive);
    window.attach(logic, settings);
    // The thinning window opens over the main window; the main window's thin
    // command reaches it through its logic.
    arbolex::ui::ThinWindow thinWindow(&window);
    ThinWindowLogic thinLogic(logic, thinWindow, interactive);
    thinWindow.attach(thinLogic);
    logic.attachThinning(&thinLogic);
    // The net present value window, and the clipboard every table is copied to.
    arbolex::ui::QtClipboard clipboard;
    arbolex::ui::NpvWindow npvWindow(&window);
    arbolex::economics::NpvWindowLogic npvLogic(logic.cashFlow(), logic.timberRevenue(), log,
                                                npvWindow, interactive, clipboard);
    npvWindow.attach(npvLogic);
    logic.attachNpv(&npvLogic);
    logic.attachClipboard(&clipboard);
    // The timber prices window too opens over the main window.
    arbolex::ui::TimberPricesWindow pricesWindow(&window);
    arbolex::economics::TimberPricesWindowLogic pricesLogic(prices, log, pricesWindow);
    pricesWindow.attach(pricesLogic);
    logic.attachTimberPrices(&pricesLogic);
    // The assortment report opens over whichever window asked for it; the
    // user categories window from the main window's menu.
    arbolex::ui::AssortWindow assortWindow(&window);
    arbolex::assortments::AssortWindowLogic assortLogic(logic, assortWindow, interactive);
    assortWindow.attach(assortLogic);
    logic.attachAssortments(&assortLogic);
    thinLogic.attachAssortments(&assortLogic);
    arbolex::ui::AssortUserWindow assortUserWindow(&window);
    arbolex::assortments::AssortUserLogic assortUserLogic(prices.data(), assortLogic.session(),
                                                          assortUserWindow, interactive);
    assortUserWindow.attach(assortUserLogic);
    QObject::connect(window.assortUserAction(), &QAction::triggered, &window,
                     [&assortUserLogic] { assortUserLogic.mnuAssortUser_Click(); });
    // The assortment prices from the same menu.
    arbolex::ui::AssortPricesWindow assortPricesWindow(&window);
    arbolex::economics::AssortPricesWindowLogic assortPricesLogic(prices.data(), log,
                                                                  assortPricesWindow, interactive);
    assortPricesWindow.attach(assortPricesLogic);
    pricesLogic.attachAssortmentPrices(&assortPricesLogic);
    QObject::connect(window.assortPricesAction(), &QAction::triggered, &window,
                     [&assortPricesLogic] { assortPricesLogic.show(); });
    logic.Form_Load(settings, QGuiApplication::primaryScreen()->availableGeometry());

    if (parser.isSet(options.demoRotation)) {
        const QString stage = parser.value(options.demoRotation);
        if (stage != QLatin1String("finalcut")) {
            interactive.queueAnswer(true); // view the net present value
        }
        QTimer::singleShot(0, &window, [&logic, &thinLogic, &npvLogic, stage] {
            if (!demoRotation(logic, thinLogic, npvLogic, stage)) {
                qWarning("unknown rotation demonstration: %s", qPrintable(stage));
            }
        });
    } else if (parser.isSet(options.demoAssort)) {
        const QString stage = parser.value(options.demoAssort);
        QTimer::singleShot(0, &window, [&, stage] {
            if (!demoAssort(logic, thinLogic, assortLogic, assortUserLogic, stage)) {
                qWarning("unknown assortment demonstration: %s", qPrintable(stage));
            }
        });
    } else if (parser.isSet(options.demoThin)) {
        const QString stage = parser.value(options.demoThin);
        QTimer::singleShot(0, &window, [&logic, &thinLogic, stage] {
            if (!demoThin(logic, thinLogic, stage)) {
                qWarning("unknown thinning demonstration: %s", qPrintable(stage));
            }
        });
    } else if (parser.isSet(options.demoAssortPrices)) {
        QTimer::singleShot(0, &window, [&assortPricesLogic] {
            assortPricesLogic.show();
            assortPricesLogic.cmdChangeAsmtPrices_Click();
        });
    } else if (parser.isSet(options.demoPrices)) {
        QTimer::singleShot(0, &window, [&logic] { logic.cmdShowTimberPrice_Click(); });
    } else if (parser.isSet(options.demo)) {
        QTimer::singleShot(0, &window, [&logic] { demoGrow(logic); });
    }
    if (parser.isSet(options.noIntro)) {
        window.show();
        if (parser.isSet(options.quitWhenShown)) {
            QTimer::singleShot(0, &app, &QCoreApplication::quit);
        }
    } else {
        arbolex::ui::ModelChoiceDialog choice(window, folder, grow.modelId());
        if (choice.exec() != QDialog::Accepted) {
            return 0;
        }
    }
    app.exec();
    return 0;
}
