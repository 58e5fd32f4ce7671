#include "ui/desktop.hpp"

#include "cli/scriptrunner.hpp"
#include "shell/datafolder.hpp"
#include "ui/chartpane.hpp"
#include "ui/chartpanel.hpp"
#include "ui/reportmenu.hpp"

#include <QAction>
#include <QClipboard>
#include <QCoreApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QGuiApplication>
#include <QMenu>
#include <QPushButton>
#include <QScreen>
#include <QTabWidget>
#include <QTextStream>
#include <QTimer>

namespace arbolex::ui {

namespace {
/// Longest a script waits for work away from the window's thread, ms.
constexpr qint64 kLongestWait = 60000;
/// How long the windows' events run between two looks at the work, ms.
constexpr int kEventSlice = 50;
} // namespace

Desktop::Desktop(const QString &dataFolder, const QString &programFolder,
                 const DesktopServices &services)
    : m_settings(services.settings != nullptr ? services.settings : &m_ownSettings),
      m_asking(services.interactive != nullptr ? *services.interactive : m_interactive),
      m_documentMenu(m_window.fileMenu(), &m_window),
      // Copies of the data files the exit writes over, in the user's data location.
      m_history(shell::DataHistory::folderIn(shell::programDataPlaces(programFolder).userFolder)),
      m_session(dataFolder,
                {m_window, m_thinWindow, m_assortWindow, m_assortUserWindow, m_npvWindow,
                 m_pricesWindow, m_economicsWindow, m_assortPricesWindow, m_carbonPriceWindow,
                 m_estateWindow, m_asking, m_clipboard, m_settings, &m_documentMenu}) {
    session::Session &s = m_session;
    m_interactive.setParentWidget(&m_window);
    m_window.attach(s.main(), *m_settings);
    s.main().attachDataHistory(&m_history);
    m_window.attachDataHistory(m_history, dataFolder);
    m_thinWindow.attach(s.thinning());
    m_npvWindow.attach(s.npv());
    m_pricesWindow.attach(s.timberPrices());
    m_assortWindow.attach(s.assort());
    m_assortUserWindow.attach(s.assortUser());
    m_economicsWindow.attach(s.economics());
    m_window.reportMenu()->attachEconomics(s.economics());
    m_assortPricesWindow.attach(s.assortPrices());
    m_carbonPriceWindow.attach(s.carbonPrice());
    m_estateWindow.attach(s.estate());
    // The charts beside the table follow the cash flow typed in its window.
    QObject::connect(&s.work(), &work::StandWork::cashFlowChanged, &m_window,
                     &MainWindow::refreshCharts);
    QObject::connect(m_window.assortUserAction(), &QAction::triggered, &m_window,
                     [&s] { s.assortUser().mnuAssortUser_Click(); });
    QObject::connect(m_window.economicsButton(), &QPushButton::clicked, &m_window,
                     [&s] { s.economics().cmdEconomics_Click(); });
    QObject::connect(m_npvWindow.economicsButton(), &QPushButton::clicked, &m_window,
                     [&s] { s.economics().cmdEconomics_Click(); });
    QObject::connect(m_window.assortPricesAction(), &QAction::triggered, &m_window,
                     [&s] { s.assortPrices().show(); });
}

Desktop::~Desktop() = default;

void Desktop::load(const QRect &screen) {
    m_session.main().Form_Load(
        *m_settings,
        screen.isEmpty() ? QGuiApplication::primaryScreen()->availableGeometry() : screen);
    // The sub-compartment as a document: the File menu, the report entries,
    // the estate, and the question before the window closes on unsaved work.
    m_window.reportMenu()->addTo(*m_window.fileMenu());
    document::DocumentController &documents = m_session.documents();
    m_documentMenu.attach(documents);
    m_window.setCloseCheck([&documents] { return documents.maySafelyDiscard(); });
    documents.start();
    m_estateWindow.addOpenEntry(*m_window.fileMenu(), m_documentMenu.recentMenu()->menuAction());
}

void Desktop::shutDown() {
    m_economicsWindow.waitForWork();
    m_estateWindow.waitForWork();
}

void Desktop::waitForWork() {
    // The windows' events go on, so the work's results reach them.
    QElapsedTimer waited;
    waited.start();
    while ((m_session.economics().optimising() || m_session.estate().running()) &&
           waited.elapsed() < kLongestWait) {
        QCoreApplication::processEvents(QEventLoop::AllEvents, kEventSlice);
    }
}

void Desktop::settle() {
    QCoreApplication::processEvents();
}

QString Desktop::clipboardText() const {
    return QGuiApplication::clipboard()->text();
}

QString Desktop::show(const QString &window, const QString &page) {
    const auto pick = [&](const QStringList &pages) {
        return pages.indexOf(page);
    };
    if (window == QLatin1String("charts")) {
        const auto chart = pick({QStringLiteral("stand"), QStringLiteral("increments"),
                                 QStringLiteral("cashflow"), QStringLiteral("carbon")});
        if (chart >= 0) {
            m_window.chartPane()->panel()->setCurrent(static_cast<ChartPanel::Chart>(chart));
            return {};
        }
    } else if (window == QLatin1String("frmEconomics")) {
        const auto tab = pick({QStringLiteral("rotation"), QStringLiteral("optimiser"),
                               QStringLiteral("sensitivity"), QStringLiteral("montecarlo")});
        if (tab >= 0) {
            m_economicsWindow.tabs()->setCurrentIndex(static_cast<int>(tab));
            return {};
        }
    } else if (window == QLatin1String("frmEstate")) {
        if (page == QLatin1String("closed")) {
            m_estateWindow.hide();
            return {};
        }
        const auto tab = pick({QStringLiteral("table"), QStringLiteral("chart")});
        if (tab >= 0) {
            m_estateWindow.tabs()->setCurrentIndex(static_cast<int>(tab));
            return {};
        }
    }
    return QStringLiteral("'show ") + window + QLatin1Char(' ') + page +
           QStringLiteral("': no such page");
}

bool Desktop::runScript(const QString &path) {
    QFile file(path);
    QTextStream err(stderr);
    if (!file.open(QIODevice::ReadOnly | QIODevice::Text)) {
        err << "arbolex: cannot read the script " << path << '\n';
        return false;
    }
    cli::ScriptRunner runner(*this, err);
    const cli::ScriptRunner::Outcome outcome =
        runner.run(QString::fromUtf8(file.readAll()).split(QLatin1Char('\n')));
    if (!outcome.ok()) {
        err << path << ':' << outcome.line << ": " << outcome.error << '\n';
    }
    err.flush();
    if (m_quitAfterScript) {
        QTimer::singleShot(0, QCoreApplication::instance(), &QCoreApplication::quit);
    }
    return outcome.ok();
}

} // namespace arbolex::ui
