// ARBOLEX: the desktop program. Builds the engine, the prices, the main window
// and the thinning window with their logic, loads the main window, then lets
// the user choose the model in the model choice window.
#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "document/documentcontroller.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/npvwindowlogic.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "engine/grow.hpp"
#include "estatewindow/estatewindowlogic.hpp"
#include "prices/prices.hpp"
#include "shell/datafolder.hpp"
#include "shell/datahistory.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "shell/version.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/assortpriceswindow.hpp"
#include "ui/assortuserwindow.hpp"
#include "ui/assortwindow.hpp"
#include "ui/chartpane.hpp"
#include "ui/chartpanel.hpp"
#include "ui/documentmenu.hpp"
#include "ui/economicswindow.hpp"
#include "ui/estatewindow.hpp"
#include "ui/mainwindow.hpp"
#include "ui/modelchoicedialog.hpp"
#include "ui/npvwindow.hpp"
#include "ui/qtclipboard.hpp"
#include "ui/qtinteractive.hpp"
#include "ui/reportmenu.hpp"
#include "ui/thinwindow.hpp"
#include "ui/timberpriceswindow.hpp"
#include "ui/windowtexts.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QAction>
#include <QApplication>
#include <QCommandLineParser>
#include <QDir>
#include <QFile>
#include <QMenu>
#include <QPushButton>
#include <QScreen>
#include <QSettings>
#include <QTabWidget>
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

/// Grows the stand of the rotation demonstrations (Sitka spruce, age 15, 2500
/// stems/ha, 9 m, 22 m²/ha, 10 ha) to `to` by 5 years.
void growRotationStand(MainWindowLogic &logic, const QString &to) {
    logic.mnuModel_Click(0);
    logic.typeText(MainControl::txtFromA, QStringLiteral("15"));
    logic.typeText(MainControl::txtFromN, QStringLiteral("2500"));
    logic.typeText(MainControl::txtFromH, QStringLiteral("9"));
    logic.typeText(MainControl::txtFromB, QStringLiteral("22"));
    logic.typeText(MainControl::txtFromD, QString());
    logic.typeText(MainControl::txtNetArea, QStringLiteral("10"));
    logic.typeText(MainControl::txtToA, to);
    logic.typeText(MainControl::txtByA, QStringLiteral("5"));
    logic.cmdGrow_Click();
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
    growRotationStand(logic, QStringLiteral("30"));
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
        npv.typeInCell(1, arbolex::work::kCfOperation, QStringLiteral("Planting"));
        npv.typeInCell(1, arbolex::work::kCfCost, QStringLiteral("2500"));
        npv.typeInCell(6, arbolex::work::kCfOperation, QStringLiteral("Cleaning"));
        npv.typeInCell(6, arbolex::work::kCfCost, QStringLiteral("300"));
        npv.cmdNPV_Click();
    }
    return true;
}

/// The chart demonstration: a Sitka spruce stand (age 15, 2500 stems/ha, 9 m,
/// 22 m²/ha, 10 ha) thinned by 40 m³/ha at 25 and every 5 years until 45,
/// grown to 60 and felled; its cash flow at 5 % with planting, cleaning and
/// road costs, computed, and the NPV window closed. `chart` (stand,
/// increments, cashflow) is the tab shown. False for an unknown chart.
bool demoCharts(MainWindowLogic &logic, ThinWindowLogic &thin,
                arbolex::economics::NpvWindowLogic &npv, arbolex::ui::MainWindow &window,
                const QString &chart) {
    using arbolex::ui::ChartPanel;
    const QStringList tabs{QStringLiteral("stand"), QStringLiteral("increments"),
                           QStringLiteral("cashflow")};
    if (!tabs.contains(chart)) {
        return false;
    }
    growRotationStand(logic, QStringLiteral("25"));
    logic.cmdThin_Click();
    thin.typeText(ThinControl::txtRemV, QStringLiteral("40"));
    thin.press(ThinControl::cmdThin);
    thin.press(ThinControl::chkActivLoop);
    thin.typeText(ThinControl::txtThinFreq, QStringLiteral("5"));
    thin.typeText(ThinControl::txtThinUntil, QStringLiteral("45"));
    thin.press(ThinControl::cmdLoop);
    thin.press(ThinControl::cmdCancel);
    logic.typeText(MainControl::txtToA, QStringLiteral("60"));
    logic.cmdGrow_Click();
    logic.cmdFinalCut_Click();
    logic.cmdNPV_Click();
    using arbolex::work::kCfCost;
    using arbolex::work::kCfOperation;
    npv.typeInCell(1, kCfOperation, QStringLiteral("Planting"));
    npv.typeInCell(1, kCfCost, QStringLiteral("2500"));
    npv.typeInCell(3, kCfOperation, QStringLiteral("Cleaning"));
    npv.typeInCell(3, kCfCost, QStringLiteral("400"));
    npv.typeInCell(9, kCfOperation, QStringLiteral("Roads"));
    npv.typeInCell(9, kCfCost, QStringLiteral("600"));
    npv.cmdNPV_Click();
    npv.cmdClose_Click();
    window.chartPane()->panel()->setCurrent(static_cast<ChartPanel::Chart>(tabs.indexOf(chart)));
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

/// The document demonstrations, from the thinning loop's stand saved as
/// "Kilbrack 12b.arbolex" in the temporary folder, with the net area typed
/// afterwards so the caption carries the unsaved mark:
///   open            the main window with that document;
///   identification  the same with the "Sub-compartment" dialog open;
///   fault           a damaged file opened: its "FAULT - " message;
///   question        New pressed over the unsaved change: Save, Discard or Cancel.
/// False for an unknown stage.
bool demoDocument(MainWindowLogic &logic, ThinWindowLogic &thin,
                  arbolex::document::DocumentController &documents, const QString &stage) {
    if (stage != QLatin1String("open") && stage != QLatin1String("identification") &&
        stage != QLatin1String("fault") && stage != QLatin1String("question")) {
        return false;
    }
    demoThin(logic, thin, QStringLiteral("loop"));
    documents.setIdentification({QStringLiteral("Kilbrack"), QStringLiteral("12"),
                                 QStringLiteral("b"),
                                 QStringLiteral("Sitka spruce, planted 1998 on peaty gley")});
    const QDir temp = QDir::temp();
    documents.saveAs(temp.filePath(QStringLiteral("Kilbrack 12b.arbolex")));
    logic.typeText(MainControl::txtNetArea, QStringLiteral("12.5"));
    documents.refreshCaption();
    if (stage == QLatin1String("identification")) {
        documents.editIdentification();
    } else if (stage == QLatin1String("question")) {
        documents.fileNew();
    } else if (stage == QLatin1String("fault")) {
        const QString damaged = temp.filePath(QStringLiteral("Kilbrack 12c.arbolex"));
        QFile file(damaged);
        if (file.open(QIODevice::WriteOnly | QIODevice::Truncate)) {
            file.write("{\n    \"format\": \"ARBOLEX sub-compartment\",\n    \"version\": 1,\n"
                       "    \"model\": 0,\n    \"table\": {\"rows\": [\n");
        }
        file.close();
        documents.open(damaged);
    }
    return true;
}

/// The economics demonstrations, on the rotation of demoRotation's final cut
/// valued at 3 % with 1,800 €/ha to establish and 15 €/ha a year:
///   rotation     the value of the regime and NPV, LEV and MAI by rotation age;
///   optimiser    the optimiser's five best regimes;
///   applied      the best of them applied to the projection table;
///   table        the same, the window closed on the table it wrote;
///   sensitivity  the tornado of NPV and LEV;
///   montecarlo   the Monte Carlo draws of NPV.
/// False for an unknown stage.
bool demoEconomics(MainWindowLogic &logic, ThinWindowLogic &thin,
                   arbolex::economics::NpvWindowLogic &npv,
                   arbolex::economics::EconomicsWindowLogic &economics,
                   arbolex::ui::EconomicsWindow &window, const QString &stage) {
    using arbolex::economics::EconomicsControl;
    const QStringList stages = {QStringLiteral("rotation"),    QStringLiteral("optimiser"),
                                QStringLiteral("sensitivity"), QStringLiteral("montecarlo"),
                                QStringLiteral("applied"),     QStringLiteral("table")};
    if (!stages.contains(stage)) {
        return false;
    }
    demoRotation(logic, thin, npv, QStringLiteral("finalcut"));
    // The window keeps the costs typed; the rate is the cash flow's.
    economics.typeText(EconomicsControl::txtEstablishmentCost, QStringLiteral("1800"));
    economics.typeText(EconomicsControl::txtAnnualCost, QStringLiteral("15"));
    logic.cashFlow().setInterestRate(3.0);
    economics.cmdEconomics_Click();
    const bool applied = stage == QLatin1String("applied") || stage == QLatin1String("table");
    window.tabs()->setCurrentIndex(applied ? 1 : static_cast<int>(stages.indexOf(stage)));
    if (stage == QLatin1String("optimiser") || applied) {
        economics.cmdOptimise_Click();
    }
    if (applied) {
        QTimer::singleShot(2500, &window, [&economics, stage] {
            economics.cmdApply_Click(1);
            if (stage == QLatin1String("table")) {
                economics.cmdClose_Click();
            }
        });
    }
    return true;
}

/// The estate demonstrations, on the example estate (examples/estate.csv of
/// the data folder or of the current folder's data):
///   table   the sub-compartments;
///   chart   the harvest forecast;
///   marked  the same with two rows the program refuses added, in red;
///   opened  the first sub-compartment opened in the main window.
/// False for an unknown stage.
bool demoEstate(arbolex::estatewindow::EstateWindowLogic &estate, arbolex::ui::EstateWindow &window,
                const QString &dataFolder, const QString &stage) {
    const QStringList stages = {QStringLiteral("table"), QStringLiteral("chart"),
                                QStringLiteral("marked"), QStringLiteral("opened")};
    if (!stages.contains(stage)) {
        return false;
    }
    QString path = QDir(dataFolder).filePath(QStringLiteral("examples/estate.csv"));
    if (!QFile::exists(path)) {
        path = QDir::current().filePath(QStringLiteral("data/examples/estate.csv"));
    }
    if (stage == QLatin1String("marked")) {
        QFile example(path);
        path = QDir::temp().filePath(QStringLiteral("arbolex-demo-estate.csv"));
        QFile marked(path);
        if (example.open(QIODevice::ReadOnly) && marked.open(QIODevice::WriteOnly)) {
            marked.write(example.readAll());
            marked.write("GL-04,Glenmore,0,15,lots,7.0,20.0,,3.0,20,5,40,,\n"
                         "AR-04,Ardnish,3,95,1500,20.0,40.0,,2.0,0,,,,\n");
        }
    }
    window.tabs()->setCurrentIndex(stage == QLatin1String("chart") ? 1 : 0);
    estate.openEstate(path);
    if (stage == QLatin1String("opened")) {
        QTimer::singleShot(2500, &window, [&estate, &window] {
            window.hide();
            estate.openSubCompartment(0);
        });
    }
    return true;
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
        demoCharts.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoCharts);
        demoChartTab.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoChartTab);
        demoDocument.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoDocument);
        parser.addPositionalArgument(QStringLiteral("file"),
                                     QStringLiteral("A sub-compartment (.arbolex) to open."),
                                     QStringLiteral("[FILE]"));
        demoEconomics.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoEconomics);
        demoAssortPrices.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoAssortPrices);
        demoEstate.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.addOption(demoEstate);
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
    /// A rotation with thinnings, a final cut and a cash flow, for its charts.
    QCommandLineOption demoCharts{QStringLiteral("demo-charts")};
    /// The chart in view with --demo-charts: stand (the default), increments, cashflow.
    QCommandLineOption demoChartTab{QStringLiteral("demo-chart-tab"), QString(),
                                    QStringLiteral("CHART"), QStringLiteral("stand")};
    QCommandLineOption demoDocument{QStringLiteral("demo-document"), QString(),
                                    QStringLiteral("STAGE")};
    QCommandLineOption demoEconomics{QStringLiteral("demo-economics"), QString(),
                                     QStringLiteral("STAGE")};
    /// Opens the assortment prices window with changes allowed.
    QCommandLineOption demoAssortPrices{QStringLiteral("demo-assort-prices")};
    /// The example estate run: table, chart, or opened (its first row in the main window).
    QCommandLineOption demoEstate{QStringLiteral("demo-estate"), QString(),
                                  QStringLiteral("STAGE")};
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
    arbolex::prices::Prices prices;
    QSettings settings;

    arbolex::ui::MainWindow window;
    interactive.setParentWidget(&window);
    MainWindowLogic logic(grow, prices, log, folder, window, interactive);
    window.attach(logic, settings);
    // Copies of the data files the exit writes over, in the user's data location.
    const arbolex::shell::DataHistory history(arbolex::shell::DataHistory::folderIn(
        arbolex::shell::programDataPlaces(app.applicationDirPath()).userFolder));
    logic.attachDataHistory(&history);
    window.attachDataHistory(history, folder);
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
    QObject::connect(&npvWindow, &arbolex::ui::NpvWindow::cashFlowChanged, &window,
                     &arbolex::ui::MainWindow::refreshCharts);
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
    // The economics window opens from the main window's "Economics…" beside NPV.
    arbolex::ui::EconomicsWindow economicsWindow(&window);
    arbolex::economics::EconomicsWindowLogic economicsLogic(logic, thinLogic, economicsWindow,
                                                            interactive);
    economicsWindow.attach(economicsLogic);
    QObject::connect(window.economicsButton(), &QPushButton::clicked, &window,
                     [&economicsLogic] { economicsLogic.cmdEconomics_Click(); });
    QObject::connect(npvWindow.economicsButton(), &QPushButton::clicked, &window,
                     [&economicsLogic] { economicsLogic.cmdEconomics_Click(); });
    // The assortment prices from the same menu.
    arbolex::ui::AssortPricesWindow assortPricesWindow(&window);
    arbolex::economics::AssortPricesWindowLogic assortPricesLogic(prices.data(), log,
                                                                  assortPricesWindow, interactive);
    assortPricesWindow.attach(assortPricesLogic);
    pricesLogic.attachAssortmentPrices(&assortPricesLogic);
    QObject::connect(window.assortPricesAction(), &QAction::triggered, &window,
                     [&assortPricesLogic] { assortPricesLogic.show(); });
    logic.Form_Load(settings, QGuiApplication::primaryScreen()->availableGeometry());
    // The sub-compartment as a document: the File menu, and the question
    // before the window closes on unsaved work.
    arbolex::ui::DocumentMenu documentMenu(window.fileMenu(), &window);
    window.reportMenu()->addTo(*window.fileMenu());
    arbolex::document::DocumentController documents(logic, interactive, &settings, &documentMenu);
    documentMenu.attach(documents);
    window.setCloseCheck([&documents] { return documents.maySafelyDiscard(); });
    documents.start();
    // The estate window, from File → Open Estate…
    arbolex::ui::EstateWindow estateWindow(&window);
    arbolex::estatewindow::EstateWindowLogic estateLogic(logic, thinLogic, documents, estateWindow,
                                                         interactive);
    estateWindow.attach(estateLogic);
    estateWindow.addOpenEntry(*window.fileMenu(), documentMenu.recentMenu()->menuAction());
    if (const QStringList files = parser.positionalArguments(); !files.isEmpty()) {
        const QString file = files.first();
        QTimer::singleShot(0, &window, [&documents, file] { documents.open(file); });
    }

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
    } else if (parser.isSet(options.demoCharts)) {
        const QString chart = parser.value(options.demoChartTab);
        interactive.queueAnswer(true); // view the net present value
        QTimer::singleShot(0, &window, [&, chart] {
            if (!demoCharts(logic, thinLogic, npvLogic, window, chart)) {
                qWarning("unknown chart demonstration: %s", qPrintable(chart));
            }
        });
    } else if (parser.isSet(options.demoEconomics)) {
        const QString stage = parser.value(options.demoEconomics);
        interactive.queueAnswer(true); // the final cut's offer of the net present value
        interactive.queueAnswer(true); // and again after Apply
        QTimer::singleShot(0, &window, [&, stage] {
            if (!demoEconomics(logic, thinLogic, npvLogic, economicsLogic, economicsWindow,
                               stage)) {
                qWarning("unknown economics demonstration: %s", qPrintable(stage));
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
    } else if (parser.isSet(options.demoDocument)) {
        const QString stage = parser.value(options.demoDocument);
        QTimer::singleShot(0, &window, [&, stage] {
            if (!demoDocument(logic, thinLogic, documents, stage)) {
                qWarning("unknown document demonstration: %s", qPrintable(stage));
            }
        });
    } else if (parser.isSet(options.demoEstate)) {
        const QString stage = parser.value(options.demoEstate);
        interactive.queueAnswer(false); // the final cut's offer of the net present value
        QTimer::singleShot(0, &window, [&, stage] {
            if (!demoEstate(estateLogic, estateWindow, folder, stage)) {
                qWarning("unknown estate demonstration: %s", qPrintable(stage));
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
    economicsWindow.waitForWork();
    estateWindow.waitForWork();
    return 0;
}
