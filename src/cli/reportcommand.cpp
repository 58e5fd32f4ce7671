// arbolex-cli report: the printed report of a sub-compartment as a PDF, drawn
// without a screen, from a saved sub-compartment or a runner script (the same
// lines as `arbolex-cli run`); the PDF is the one File → Export Report… writes.
#include "charts/reportcontent.hpp"
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/scriptrunner.hpp"
#include "document/opendocument.hpp"
#include "report/reportwriter.hpp"

#include <QFile>
#include <QSettings>
#include <QTemporaryDir>

namespace arbolex::cli {

namespace {

int runReport(CommandContext &context) {
    // A sub-compartment saved by the windows (FILE.arbolex), or a script
    // that builds one.
    QStringList arguments = context.arguments;
    QString documentPath;
    if (!arguments.isEmpty() && !arguments.first().startsWith(QLatin1String("--"))) {
        documentPath = arguments.takeFirst();
    }
    QString scriptPath;
    QString outPath;
    try {
        const Options options(arguments, {"script", "out"});
        outPath = options.text("out");
        if (options.has("script") == !documentPath.isEmpty()) {
            throw UsageError{QStringLiteral("give either FILE.arbolex or --script SCRIPT")};
        }
        if (options.has("script")) {
            scriptPath = options.text("script");
        }
    } catch (const UsageError &e) {
        context.err << "arbolex-cli report: " << e.text << '\n';
        return kExitBadArguments;
    }
    QByteArray script;
    if (!scriptPath.isEmpty()) {
        QFile file(scriptPath);
        if (!file.open(QIODevice::ReadOnly | QIODevice::Text)) {
            context.err << "arbolex-cli report: cannot read the script " << scriptPath << '\n';
            return kExitBadArguments;
        }
        script = file.readAll();
    }
    // Messages go to stderr: the result is the file.
    HeadlessSession session(context.dataFolder, context.err);
    // Nothing of the run is kept: its settings live in a scratch file and the
    // unload (which saves the start-up file and the prices) is not run.
    QTemporaryDir scratch;
    QSettings settings(scratch.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    // The main window's load, then the script's lines (none for a document).
    const ScriptRunner::Outcome outcome = runScriptText(script, session, settings, context.err);
    if (!outcome.ok()) {
        context.err << scriptPath << ':' << outcome.line << ": " << outcome.error << '\n';
        return kExitBadArguments;
    }
    QString fault;
    if (!documentPath.isEmpty() &&
        !document::openDocumentInto(documentPath, session.main(), fault)) {
        context.err << "arbolex-cli report: " << fault << '\n';
        return kExitBadArguments;
    }
    const int pages = report::writeReportPdf(
        charts::reportContent(session.work(), session.economics()), outPath, report::printedNow());
    if (pages == 0) {
        context.err << "arbolex-cli report: cannot write " << outPath << '\n';
        return kExitEngineFailure;
    }
    context.out << outPath << '\t' << pages << " pages\n";
    return kExitSuccess;
}

} // namespace

Command reportCommand() {
    return {QStringLiteral("report"),
            QStringLiteral("the printed report of a rotation as a PDF, without a screen"),
            QStringLiteral(
                "usage: arbolex-cli report FILE.arbolex --out REPORT.pdf [--data-dir DIR]\n"
                "       arbolex-cli report --script SCRIPT --out REPORT.pdf [--data-dir DIR]\n"
                "\n"
                "Opens the sub-compartment saved in FILE.arbolex, or runs SCRIPT as\n"
                "`arbolex-cli run` does (messages go to stderr), then writes its report\n"
                "as an A4 landscape PDF: the identification, the\n"
                "model, the stand at the start, site index and yield class, the projection\n"
                "table, the summary, the cash flow with its net present value, and the\n"
                "charts of stand development, increments and cash flow. When SCRIPT\n"
                "valued the rotation in the economics window (press cmdEconomics or\n"
                "frmEconomics.cmdCompute), a last page holds its figures, NPV, LEV and MAI\n"
                "by rotation age and, once it ran the optimiser, the best regimes.\n"
                "Once the rotation has a final cut, its carbon account follows: what it\n"
                "is of, its totals, the constants with their sources, its chart and the\n"
                "account year by year.\n"
                "Nothing in the data folder is changed. Prints REPORT.pdf<TAB>N pages.\n"
                "Exit status: 0 written, 1 the PDF cannot be written, 2 the command line,\n"
                "the document or the script is wrong.\n"),
            &runReport};
}

} // namespace arbolex::cli
