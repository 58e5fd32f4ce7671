// arbolex-cli report: the printed report of a sub-compartment as a PDF, drawn
// without a screen. The rotation is built by a runner script (the same lines
// as `arbolex-cli run`); the PDF is the one File → Export Report… writes.
#include "charts/reportcontent.hpp"
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/scriptrunner.hpp"
#include "report/reportwriter.hpp"

#include <QFile>
#include <QSettings>
#include <QTemporaryDir>

namespace arbolex::cli {

namespace {

int runReport(CommandContext &context) {
    QString scriptPath;
    QString outPath;
    try {
        const Options options(context.arguments, {"script", "out"});
        scriptPath = options.text("script");
        outPath = options.text("out");
    } catch (const UsageError &e) {
        context.err << "arbolex-cli report: " << e.text << '\n';
        return kExitBadArguments;
    }
    QFile script(scriptPath);
    if (!script.open(QIODevice::ReadOnly | QIODevice::Text)) {
        context.err << "arbolex-cli report: cannot read the script " << scriptPath << '\n';
        return kExitBadArguments;
    }
    // Messages of the script go to stderr: the result is the file.
    HeadlessSession session(context.dataFolder, context.err);
    // Nothing of the run is kept: its settings live in a scratch file and the
    // unload (which saves the start-up file and the prices) is not run.
    QTemporaryDir scratch;
    QSettings settings(scratch.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    const ScriptRunner::Outcome outcome =
        runScriptText(script.readAll(), session, settings, context.err);
    if (!outcome.ok()) {
        context.err << scriptPath << ':' << outcome.line << ": " << outcome.error << '\n';
        return kExitBadArguments;
    }
    const int pages = report::writeReportPdf(charts::reportContent(session.main()), outPath,
                                             report::printedNow());
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
                "usage: arbolex-cli report --script SCRIPT --out REPORT.pdf [--data-dir DIR]\n"
                "\n"
                "Runs SCRIPT as `arbolex-cli run` does (its messages go to stderr), then\n"
                "writes the report of the sub-compartment as an A4 landscape PDF: the\n"
                "model, the stand at the start, site index and yield class, the projection\n"
                "table, the summary, the cash flow with its net present value, and the\n"
                "charts of stand development, increments and cash flow. Nothing in the\n"
                "data folder is changed. Prints REPORT.pdf<TAB>N pages.\n"
                "Exit status: 0 written, 1 the file cannot be written, 2 the command line\n"
                "or the script is wrong.\n"),
            &runReport};
}

} // namespace arbolex::cli
