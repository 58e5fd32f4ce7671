#include "cli/scriptrunner.hpp"

#include "cli/assortpricescript.hpp"
#include "cli/assortscript.hpp"
#include "cli/carbonpricescript.hpp"
#include "cli/documentscript.hpp"
#include "cli/economicsscript.hpp"
#include "cli/gridoutput.hpp"
#include "shell/tableexport.hpp"

#include <QElapsedTimer>
#include <QFile>
#include <QRegularExpression>
#include <QSettings>
#include <QTemporaryDir>

namespace arbolex::cli {

using workflow::MainControl;

ScriptRunner::ScriptRunner(ScriptTarget &session, QTextStream &out)
    : m_session(session), m_out(out), m_documents(session.session().documents()) {
    m_documents.start();
    workflow::MainWindowLogic &main = session.main();
    m_commands = {
        {QStringLiteral("cmdGrow"),
         [&main] {
             main.cmdGrow_Click();
         }},
        {QStringLiteral("cmdThin"),
         [&main] {
             main.cmdThin_Click();
         }},
        {QStringLiteral("cmdClear"),
         [&main] {
             main.cmdClear_Click();
         }},
        {QStringLiteral("cmdClearAll"),
         [&main] {
             main.ClearAll();
         }},
        {QStringLiteral("cmdUseRow"),
         [&main] {
             main.UseFlxRow();
         }},
        {QStringLiteral("cmdChangePrices"),
         [&main] {
             main.cmdChangePrices_Click();
         }},
        {QStringLiteral("cmdShowTimberPrice"),
         [&main] {
             main.cmdShowTimberPrice_Click();
         }},
        {QStringLiteral("mnuThreshold"),
         [&main] {
             main.TrhesholdInfo();
         }},
        {QStringLiteral("mnuWarn"),
         [&main] {
             main.Warn();
         }},
        {QStringLiteral("cmdFinalCut"),
         [&main] {
             main.cmdFinalCut_Click();
         }},
        {QStringLiteral("cmdSummary"),
         [&main] {
             main.cmdSummary_Click();
         }},
        {QStringLiteral("cmdNPV"),
         [&main] {
             main.cmdNPV_Click();
         }},
        {QStringLiteral("cmdDeleteRows"),
         [&main] {
             main.cmdDeleteRows_Click();
         }},
        {QStringLiteral("mnuCopyTable"),
         [&main] {
             main.CopyTable(false);
         }},
        {QStringLiteral("mnuCopySummary"),
         [&main] {
             main.CopyTable(true);
         }},
    };
}

ScriptRunner::Outcome ScriptRunner::run(const QStringList &lines) {
    for (int i = 0; i < lines.size(); ++i) {
        QString error;
        try {
            error = runLine(lines.at(i));
        } catch (const ScriptStop &stop) {
            error = stop.reason;
        }
        if (!error.isEmpty()) {
            return {i + 1, error};
        }
    }
    return {};
}

QString ScriptRunner::runLine(const QString &rawLine) {
    QString line = rawLine;
    const qsizetype hash = line.indexOf(QLatin1Char('#'));
    if (hash >= 0) {
        line.truncate(hash);
    }
    line = line.trimmed();
    if (line.isEmpty()) {
        return {};
    }
    const QString command = line.section(QLatin1Char(' '), 0, 0, QString::SectionSkipEmpty);
    const QString rest = line.mid(command.size()).trimmed();
    const QString control = rest.section(QLatin1Char(' '), 0, 0, QString::SectionSkipEmpty);
    const QString text = rest.mid(control.size()).trimmed();

    if (command == QLatin1String("model")) {
        bool ok = false;
        const int id = rest.toInt(&ok);
        if (!ok) {
            return QStringLiteral("model needs a number");
        }
        m_session.main().mnuModel_Click(id);
        return {};
    }
    if (const auto document = runDocumentCommand(m_documents, m_session, command, rest, m_out)) {
        return *document;
    }
    if (command == QLatin1String("set")) {
        return set(control, text);
    }
    if (command == QLatin1String("press")) {
        return press(control);
    }
    if (command == QLatin1String("print")) {
        return print(control);
    }
    if (command == QLatin1String("select")) {
        const QStringList rows = rest.split(QLatin1Char(' '), Qt::SkipEmptyParts);
        bool ok1 = false;
        bool ok2 = true;
        const int row = rows.value(0).toInt(&ok1);
        const int end = rows.size() > 1 ? rows.value(1).toInt(&ok2) : row;
        if (rows.isEmpty() || rows.size() > 2 || !ok1 || !ok2) {
            return QStringLiteral("select needs ROW [ENDROW]");
        }
        m_session.main().select(row, end);
        return {};
    }
    if (command == QLatin1String("answer")) {
        if (rest != QLatin1String("yes") && rest != QLatin1String("no")) {
            return QStringLiteral("answer needs yes or no");
        }
        m_session.queueAnswer(rest == QLatin1String("yes"));
        return {};
    }
    if (command == QLatin1String("time")) {
        // Runs the rest of the line and prints how long it took, the windows
        // drawn: "TIME<TAB>line<TAB>milliseconds".
        QElapsedTimer timer;
        timer.start();
        QString error = runLine(rest);
        m_session.settle();
        const double ms = static_cast<double>(timer.nsecsElapsed()) / 1e6;
        m_out << "TIME\t" << rest << '\t' << QString::number(ms, 'f', 1) << '\n';
        return error;
    }
    if (command == QLatin1String("quit")) {
        m_session.quitAfterScript();
        return {};
    }
    if (command == QLatin1String("wait")) {
        m_session.waitForWork();
        return {};
    }
    if (command == QLatin1String("show")) {
        return m_session.show(control, text);
    }
    return QStringLiteral("unknown command '") + command + QLatin1Char('\'');
}

namespace {
constexpr QLatin1String kThinWindow("frmThin.");
constexpr QLatin1String kNpvWindow("frmNPV.");

/// The net present value window's control `name` names ("frmNPV.txtNPV"), if any.
std::optional<economics::NpvControl> npvControl(const QString &name) {
    if (!name.startsWith(kNpvWindow)) {
        return std::nullopt;
    }
    return economics::npvControlFromName(name.mid(kNpvWindow.size()));
}

/// The cell (row, column) of "frmNPV.NPV_Grid(ROW,COL)", if `name` is one.
std::optional<std::pair<int, int>> npvGridCell(const QString &name) {
    static const QRegularExpression cell(QStringLiteral(R"(^frmNPV\.NPV_Grid\((\d+),(\d+)\)$)"));
    const QRegularExpressionMatch match = cell.match(name);
    if (!match.hasMatch()) {
        return std::nullopt;
    }
    return std::pair{match.captured(1).toInt(), match.captured(2).toInt()};
}

/// The thinning-window control `name` names ("frmThin.txtRemV"), if any.
std::optional<thinning::ThinControl> thinControl(const QString &name) {
    if (!name.startsWith(kThinWindow)) {
        return std::nullopt;
    }
    return thinning::thinControlFromName(name.mid(kThinWindow.size()));
}

/// The net present value window takes typing and presses only while it is
/// open, as on the screen: its grid is filled when it opens.
QString npvWindowClosed(const QString &control) {
    return QStringLiteral("'") + control +
           QStringLiteral("': the net present value window is not open");
}

constexpr QLatin1String kTimberPricesWindow("frmTimberPrices.");

/// The timber-prices control `name` names ("frmTimberPrices.txtTimbVal(13)"), if any.
std::optional<economics::TimberPricesItem> timberPricesItem(const QString &name) {
    if (!name.startsWith(kTimberPricesWindow)) {
        return std::nullopt;
    }
    return economics::timberPricesItemFromName(name.mid(kTimberPricesWindow.size()));
}
} // namespace

QString ScriptRunner::set(const QString &control, const QString &text) {
    if ((npvGridCell(control) || npvControl(control)) && !m_session.npvView().isShown()) {
        return npvWindowClosed(control);
    }
    if (const auto cell = npvGridCell(control)) {
        // The window offers only the cells of its grid.
        const std::vector<QStringList> &grid = m_session.npv().grid();
        const auto row = static_cast<std::size_t>(cell->first);
        if (row >= grid.size() || cell->second >= grid[row].size()) {
            return noControl(QStringLiteral("cell"), control);
        }
        m_session.npv().typeInCell(cell->first, cell->second, text);
        return {};
    }
    if (npvControl(control) == economics::NpvControl::txtInterestRate) {
        m_session.npv().typeInterestRate(text);
        return {};
    }
    if (const auto prices = timberPricesItem(control)) {
        if (prices->control != economics::TimberPricesControl::txtTimbVal) {
            return noControl(QStringLiteral("field"), control);
        }
        m_session.timberPrices().typeText(prices->index, text);
        return {};
    }
    if (const auto assort = setAssortControl(m_session, control, text)) {
        return *assort;
    }
    if (const auto economics = setEconomicsControl(m_session, control, text)) {
        return *economics;
    }
    if (const auto asmtPrices = setAssortPricesControl(m_session, control, text)) {
        return *asmtPrices;
    }
    if (const auto carbonPrice = setCarbonPriceControl(m_session, control, text)) {
        return *carbonPrice;
    }
    if (const auto thin = thinControl(control)) {
        if (!thinning::isThinField(*thin)) {
            return noControl(QStringLiteral("field"), control);
        }
        m_session.thinning().typeText(*thin, text);
        return {};
    }
    const auto main = workflow::mainControlFromName(control);
    if (!main || !workflow::isNumericField(*main)) {
        return noControl(QStringLiteral("field"), control);
    }
    m_session.main().typeText(*main, text);
    return {};
}

QString ScriptRunner::press(const QString &control) {
    static const QRegularExpression estateRow(QStringLiteral(R"(^frmEstate\.grdEstate\((\d+)\)$)"));
    if (const QRegularExpressionMatch row = estateRow.match(control); row.hasMatch()) {
        m_session.estate().openSubCompartment(row.captured(1).toInt());
        return {};
    }
    if (const auto prices = timberPricesItem(control)) {
        if (!m_session.timberPrices().press(prices->control)) {
            return noControl(QStringLiteral("command"), control);
        }
        return {};
    }
    if (const auto assort = pressAssortControl(m_session, control)) {
        return *assort;
    }
    if (const auto economics = pressEconomicsControl(m_session, control)) {
        return *economics;
    }
    if (const auto asmtPrices = pressAssortPricesControl(m_session, control)) {
        return *asmtPrices;
    }
    if (const auto carbonPrice = pressCarbonPriceControl(m_session, control)) {
        return *carbonPrice;
    }
    if (const auto thin = thinControl(control)) {
        if (!m_session.thinning().press(*thin)) {
            return noControl(QStringLiteral("command"), control);
        }
        return {};
    }
    if (const auto npv = npvControl(control)) {
        if (!m_session.npvView().isShown()) {
            return npvWindowClosed(control);
        }
        if (!m_session.npv().press(*npv)) {
            return noControl(QStringLiteral("command"), control);
        }
        return {};
    }
    const auto found = m_commands.find(control);
    if (found == m_commands.end()) {
        return noControl(QStringLiteral("command"), control);
    }
    // A switched-off button cannot be pressed, on the screen or here.
    const auto main = workflow::mainControlFromName(control);
    if (main && !m_session.mainView().isEnabled(*main)) {
        return QStringLiteral("'") + control + QStringLiteral("' is switched off");
    }
    found->second();
    return {};
}

QString ScriptRunner::print(const QString &control) {
    if (const auto assort = printAssortControl(m_session, control, m_out)) {
        return *assort;
    }
    if (const auto economics = printEconomicsControl(m_session, control, m_out)) {
        return *economics;
    }
    if (const auto asmtPrices = printAssortPricesControl(m_session, control, m_out)) {
        return *asmtPrices;
    }
    if (const auto carbonPrice = printCarbonPriceControl(m_session, control, m_out)) {
        return *carbonPrice;
    }
    if (control == QLatin1String("flxMain")) {
        TextOutput text(Format::kTsv);
        text.table(gridTable(m_session.main().table(), true));
        m_out << QString::fromUtf8(text.bytes());
        return {};
    }
    if (control == QLatin1String("flxSummary")) {
        m_out << shell::tabSeparated(m_session.main().summaryGrid());
        return {};
    }
    if (control == QLatin1String("flxSummaryCarbon")) {
        const workflow::CarbonSummary &carbon = m_session.main().summaryCarbon();
        m_out << carbon.heading << '\n';
        for (const auto &[caption, value] : carbon.figures) {
            m_out << caption << '\t' << value << '\n';
        }
        return {};
    }
    if (control == QLatin1String("clipboard")) {
        m_out << m_session.clipboardText();
        return {};
    }
    if (control == QLatin1String("frmNPV.NPV_Grid")) {
        m_out << shell::tabSeparated(m_session.npv().grid());
        return {};
    }
    if (const auto npv = npvControl(control)) {
        m_out << m_session.npvView().text(*npv) << '\n';
        return {};
    }
    if (const auto thin = thinControl(control)) {
        const thinning::IThinView &view = m_session.thinView();
        if (*thin == thinning::ThinControl::chkActivLoop) {
            m_out << (view.isChecked(*thin) ? "1" : "0") << '\n';
        } else {
            m_out << view.text(*thin) << '\n';
        }
        return {};
    }
    if (const auto prices = timberPricesItem(control)) {
        const economics::ITimberPricesView &view = m_session.timberPricesView();
        if (economics::isPriceOption(prices->control)) {
            m_out << (view.isChecked(prices->control) ? "1" : "0") << '\n';
        } else {
            m_out << view.text(*prices) << '\n';
        }
        return {};
    }
    const auto main = workflow::mainControlFromName(control);
    if (!main) {
        return noControl(QStringLiteral("control"), control);
    }
    m_out << m_session.mainView().text(*main) << '\n';
    return {};
}

ScriptRunner::Outcome runScriptText(const QByteArray &script, ScriptTarget &session,
                                    QSettings &settings, QTextStream &out) {
    const QStringList lines = QString::fromUtf8(script).split(QLatin1Char('\n'));
    session.main().Form_Load(settings, QRect(0, 0, 1280, 800));
    ScriptRunner runner(session, out);
    ScriptRunner::Outcome outcome = runner.run(lines);
    out.flush();
    return outcome;
}

int runScriptFile(const QString &scriptPath, const QString &dataFolder, QTextStream &out,
                  QTextStream &err) {
    QFile file(scriptPath);
    if (!file.open(QIODevice::ReadOnly | QIODevice::Text)) {
        err << "arbolex-cli: cannot read the script " << scriptPath << '\n';
        return 2;
    }
    HeadlessSession session(dataFolder, out);
    // A run without a screen has no window placement worth keeping: its
    // settings live in a scratch file, never in the user's own settings.
    QTemporaryDir scratch;
    QSettings settings(scratch.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    const ScriptRunner::Outcome outcome = runScriptText(file.readAll(), session, settings, out);
    if (!outcome.ok()) {
        err << scriptPath << ':' << outcome.line << ": " << outcome.error << '\n';
        return 2;
    }
    session.main().Form_Unload(settings);
    return 0;
}

} // namespace arbolex::cli
