// arbolex-cli estate: every sub-compartment of a forest, from a spreadsheet
// or a GIS layer, grown and valued with the rotation of `rotation`, with the
// estate's harvest forecast.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/rotationinput.hpp"
#include "estateio/estatefiles.hpp"
#include "shell/errorlog.hpp"

#include <QDate>
#include <QJsonDocument>

#include <chrono>
#include <cstdio>
#include <thread>
#include <unistd.h>

namespace arbolex::cli {

namespace {

/// Seconds between two progress lines.
constexpr double kProgressInterval = 0.25;

struct Shard {
    int index = 0;
    int count = 1;
};

/// "K/N", K from 1 to N. Throws UsageError.
Shard readShard(const QString &text) {
    const QStringList parts = text.split(QLatin1Char('/'));
    bool kOk = false;
    bool nOk = false;
    const int k = parts.size() == 2 ? parts[0].toInt(&kOk) : 0;
    const int n = parts.size() == 2 ? parts[1].toInt(&nOk) : 0;
    if (!kOk || !nOk || n < 1 || k < 1 || k > n) {
        throw UsageError{
            QStringLiteral("--shard takes K/N, K from 1 to N (1/4 is the first of 4)")};
    }
    return {k - 1, n};
}

int defaultThreads() {
    return static_cast<int>(std::max(1U, std::thread::hardware_concurrency()));
}

/// The estate job of the command line, recorded in `run`. Throws UsageError.
estateio::EstateJob readJob(const QStringList &arguments, const QString &dataFolder,
                            RunRecord &run) {
    if (arguments.isEmpty() || arguments.first().startsWith(QLatin1String("--"))) {
        throw UsageError{
            QStringLiteral("the input file is missing (arbolex-cli estate INPUT ...)")};
    }
    std::vector<const char *> known = regimeOptionNames();
    for (const char *name : economicsOptionNames()) {
        known.push_back(name);
    }
    known.insert(known.end(),
                 {"rotation", "out", "year", "threads", "shard", "layer", kFormatOption});
    const Options options(arguments.mid(1), known);
    estateio::EstateJob job;
    job.input = arguments.first().toStdString();
    run.input(QStringLiteral("input"), Value::word(arguments.first()));
    job.outFolder = options.has("out") ? options.text("out").toStdString() : std::string(".");
    job.layer = options.has("layer") ? options.text("layer").toStdString() : std::string();
    job.defaults.regime = readRegime(options);
    run.inputs(regimeFields(job.defaults.regime));
    if (options.has("rotation")) {
        job.defaults.rotation = options.wholeNumber("rotation", 1, 200);
        run.input(QStringLiteral("rotation"), Value::whole(*job.defaults.rotation));
    }
    job.defaults.year =
        options.has("year") ? options.wholeNumber("year", 1, 9999) : QDate::currentDate().year();
    job.defaults.economics = readEconomics(options, dataFolder, run);
    // The carbon of every row costs as much as its growth: only when asked.
    job.defaults.economics.carbonAccount = options.has("carbon-price");
    job.settings.threads =
        options.has("threads") ? options.wholeNumber("threads", 1, 1024) : defaultThreads();
    Shard shard;
    if (options.has("shard")) {
        shard = readShard(options.text("shard"));
        job.settings.shardIndex = shard.index;
        job.settings.shardCount = shard.count;
    }
    const Format format = readFormat(options, Format::kCsv);
    job.format = format == Format::kJson  ? estate::TableFormat::kJson
                 : format == Format::kTsv ? estate::TableFormat::kTsv
                                          : estate::TableFormat::kCsv;
    run.inputs(
        {{QStringLiteral("out"), Value::word(QString::fromStdString(job.outFolder))},
         {QStringLiteral("year"), Value::whole(job.defaults.year)},
         {QStringLiteral("threads"), Value::whole(job.settings.threads)},
         {QStringLiteral("shard"), Value::word(QString::number(shard.index + 1) + QLatin1Char('/') +
                                               QString::number(shard.count))},
         {QStringLiteral("format"), Value::word(formatWord(format))}});
    if (!job.layer.empty()) {
        run.input(QStringLiteral("layer"), Value::word(QString::fromStdString(job.layer)));
    }
    return job;
}

/// The members that open each JSON result table: the run record (the input
/// and its files' SHA-256 among them) and the units of the table's figures.
/// The input is read for its checksum only when JSON is asked for.
void prepareJson(estateio::EstateJob &job, RunRecord &run) {
    if (job.format != estate::TableFormat::kJson) {
        return;
    }
    for (const std::string &file : estateio::datasetFiles(job.input)) {
        const QString path = QString::fromStdString(file);
        run.fileRead(path, path);
    }
    job.jsonMembers = [run](const std::vector<estate::ResultColumn> &columns) {
        ResultDocument document(run, units::Table::kEstate);
        QStringList figures;
        for (const estate::ResultColumn &c : columns) {
            if (c.type != estate::ColumnType::kText) {
                figures << QString::fromStdString(c.name);
            }
        }
        document.addStreamedFigures(figures);
        QByteArray members = QJsonDocument(document.json()).toJson(QJsonDocument::Compact);
        // The members without the object's braces: the rows follow them.
        return members.mid(1, members.size() - 2).toStdString();
    };
}

/// "12345 rows, 98000 rows/s, 0:07 left" on one line of a terminal.
class ProgressLine {
public:
    ProgressLine(QTextStream &err, int shardCount) : m_err(err), m_shardCount(shardCount) {}

    bool operator()(long long done, long long inInput) {
        const auto now = std::chrono::steady_clock::now();
        const double seconds = std::chrono::duration<double>(now - m_start).count();
        if (seconds - m_shown < kProgressInterval) {
            return true;
        }
        m_shown = seconds;
        const double rate = seconds > 0.0 ? static_cast<double>(done) / seconds : 0.0;
        char line[128];
        const int written =
            std::snprintf(line, sizeof line, "\restate: %lld rows, %.0f rows/s", done, rate);
        m_err << QLatin1String(line, written);
        const long long total = inInput >= 0 ? inInput / m_shardCount : -1;
        if (total > done && rate > 0.0) {
            const auto left = static_cast<long long>(static_cast<double>(total - done) / rate);
            std::snprintf(line, sizeof line, ", %lld:%02lld left   ", left / 60, left % 60);
            m_err << line;
        }
        m_err << Qt::flush;
        m_used = true;
        return true;
    }

    void finish() {
        if (m_used) {
            m_err << '\n';
        }
    }

private:
    QTextStream &m_err;
    int m_shardCount;
    std::chrono::steady_clock::time_point m_start = std::chrono::steady_clock::now();
    double m_shown = 0.0;
    bool m_used = false;
};

int runEstate(CommandContext &context) {
    estateio::EstateJob job;
    RunRecord run(QStringLiteral("estate"));
    try {
        job = readJob(context.arguments, context.dataFolder, run);
    } catch (const UsageError &error) {
        context.err << "arbolex-cli estate: " << error.text << '\n';
        return kExitBadArguments;
    }
    prepareJson(job, run);
    shell::ErrorLog log(context.dataFolder);
    ProgressLine progressLine(context.err, job.settings.shardCount);
    estateio::EstateCallbacks callbacks;
    callbacks.failureLine = [&](const std::string &line) {
        log.append(QString::fromStdString(line));
    };
    // A person watching a terminal sees the rows go by; a script's stderr
    // carries only messages.
    if (isatty(fileno(stderr)) != 0) {
        callbacks.progress = [&](long long done, long long inInput) {
            return progressLine(done, inInput);
        };
    }
    estate::RunSummary summary;
    try {
        summary = estateio::runEstateFiles(job, callbacks);
    } catch (const estateio::GdalError &error) {
        progressLine.finish();
        context.err << "arbolex-cli estate: " << QString::fromStdString(error.what()) << '\n';
        return kExitBadArguments;
    }
    progressLine.finish();
    const long long bad = summary.refused + summary.failed;
    if (bad > 0) {
        context.err << "arbolex-cli estate: " << bad << " of " << summary.rows
                    << " rows not grown (see "
                    << QString::fromStdString(
                           estateio::resultFileName(estateio::kErrorsTable, job.format))
                    << ")\n";
        return kExitEngineFailure;
    }
    return kExitSuccess;
}

} // namespace

Command estateCommand() {
    return {QStringLiteral("estate"),
            QStringLiteral("every sub-compartment of a forest, and its harvest forecast"),
            QStringLiteral(
                "usage: arbolex-cli estate INPUT [--out DIR] [--layer NAME] [--year Y]\n"
                "                          [--thin-from AGE --thin-every YEARS --thin-volume M3\n"
                "                           [--thin-until AGE]] [--rotation R] [--rate P]\n"
                "                          [--establishment-cost C] [--annual-cost C]\n"
                "                          [--prices current|user|longterm|private]\n"
                "                          [--threads N] [--shard K/N] [--format csv|tsv|json]\n"
                "                          [--data-dir DIR]\n"
                "\n"
                "INPUT is a CSV file with a header row, or a GeoPackage, Shapefile or any\n"
                "vector layer GDAL reads (--layer NAME, default the first). Its columns, by name\n"
                "in any order: id, model, age, stocking, top_height, basal_area or dbh, area_ha,\n"
                "and optionally thin_from, thin_every, thin_volume, thin_until and rotation\n"
                "(empty: the command line's value; no rotation anywhere: the economic\n"
                "rotation). Other columns are carried through to the results. A CSV file whose\n"
                "fields are separated by semicolons may write its numbers with a decimal comma\n"
                "(\"7,0\"), as a spreadsheet with European settings exports it.\n"
                "Each row is grown and valued as `arbolex-cli rotation` does. Writes in DIR\n"
                "(default .): subcompartments.csv (one line per input row, in input order),\n"
                "forecast.csv (harvests by calendar year from Y, default this year, for the\n"
                "estate (\"all\") and by species), errors.csv (line, id, message of every row not\n"
                "grown) and, for a GIS layer, subcompartments.gpkg with the input's geometry.\n"
                "--threads N grows rows on N threads (default: all cores); the output is the\n"
                "same whatever N. --shard K/N takes every N-th row from the K-th: the parts of\n"
                "several runs merge by line, and their forecasts add up. --format tsv or json\n"
                "writes the tables as .tsv or .json files instead (default csv; docs/cli.md).\n"
                "Exit status: 0 every row grown, 1 some rows not grown, 2 the command line\n"
                "or the input is wrong.\n"
                "\n") +
                regimeOptionsHelp() +
                QStringLiteral("  --rotation R        final-cut age, years\n") +
                economicsOptionsHelp(),
            &runEstate};
}

} // namespace arbolex::cli
