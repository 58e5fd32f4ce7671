// arbolex-cli optimise: the regimes of the largest LEV, NPV or total
// production for one stand, and the gain over the user's own regime.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"
#include "rotation/optimiser.hpp"

#include <cstdio>

#include <unistd.h>

namespace arbolex::cli {

namespace {

using rotation::Candidate;

struct Objective {
    const char *word;
    rotation::Objective objective;
};

constexpr Objective kObjectives[] = {{"lev", rotation::Objective::kLev},
                                     {"npv", rotation::Objective::kNpv},
                                     {"volume", rotation::Objective::kVolume},
                                     {"carbon", rotation::Objective::kCarbon}};

QString objectiveWord(rotation::Objective objective) {
    for (const Objective &o : kObjectives) {
        if (o.objective == objective) {
            return QLatin1String(o.word);
        }
    }
    return {};
}

rotation::Objective readObjective(const Options &options) {
    if (!options.has("objective")) {
        return rotation::Objective::kLev;
    }
    const QString word = options.text("objective");
    for (const Objective &o : kObjectives) {
        if (word == QLatin1String(o.word)) {
            return o.objective;
        }
    }
    throw UsageError{QStringLiteral("--objective takes lev, npv, volume or carbon")};
}

/// The columns of a regime found, after "rank".
const QStringList kCandidateColumns = {QStringLiteral("thin_from"),   QStringLiteral("thin_every"),
                                       QStringLiteral("thin_volume"), QStringLiteral("thin_until"),
                                       QStringLiteral("rotation"),    QStringLiteral("npv"),
                                       QStringLiteral("lev"),         QStringLiteral("volume")};

/// The columns of the regimes found: kCandidateColumns, and the long-term
/// average carbon stock when carbon counts or is the objective.
QStringList candidateColumns(bool withCarbon) {
    QStringList columns = kCandidateColumns;
    if (withCarbon) {
        columns << QStringLiteral("carbon_stock");
    }
    return columns;
}

/// A regime's figures in the order of candidateColumns; its thinning is
/// empty when it does not thin.
std::vector<Value> candidateCells(const Candidate &c, bool withCarbon) {
    const rotation::Regime &g = c.regime;
    const bool thins = g.thins();
    auto thinning = [&](double x) {
        return thins ? Value::number(x) : Value();
    };
    std::vector<Value> cells = {thinning(g.thinFrom),     thinning(g.thinEvery),
                                thinning(g.thinVolume),   thinning(g.thinUntil.value_or(0)),
                                Value::whole(c.rotation), Value::money(c.npv),
                                Value::money(c.lev),      Value::number(c.volume)};
    if (withCarbon) {
        cells.push_back(Value::number(c.carbonStock));
    }
    return cells;
}

/// The regimes found (and the current one) as a table of candidateColumns.
Table candidateTable(const std::vector<Candidate> &candidates, bool withCarbon) {
    Table table(candidateColumns(withCarbon));
    for (const Candidate &c : candidates) {
        table.add(candidateCells(c, withCarbon));
    }
    return table;
}

int runOptimise(CommandContext &context) {
    const QString command = QStringLiteral("optimise");
    RotationInput in;
    rotation::OptimiserSettings settings;
    double maxRemovalPercent = settings.maxRemovalShare * 100.0;
    RunRecord run(command);
    try {
        const Options options(context.arguments, rotationOptionNames({"objective", "max-removal",
                                                                      "min-stocking", "top"}));
        in = readRotationInput(options, context.dataFolder, run);
        settings.objective = readObjective(options);
        if (options.has("max-removal")) {
            const double percent = options.positive("max-removal");
            if (percent > 100.0) {
                throw UsageError{QStringLiteral("--max-removal is a percentage up to 100")};
            }
            settings.maxRemovalShare = percent / 100.0;
            maxRemovalPercent = percent;
        }
        if (options.has("min-stocking")) {
            settings.minStocking = options.single("min-stocking");
        }
        if (options.has("top")) {
            settings.top = options.wholeNumber("top", 1, 100);
        }
    } catch (const UsageError &error) {
        context.err << "arbolex-cli optimise: " << error.text << '\n';
        return kExitBadArguments;
    }
    run.inputs({{QStringLiteral("objective"), Value::word(objectiveWord(settings.objective))},
                {QStringLiteral("max_removal"), Value::exact(maxRemovalPercent)},
                {QStringLiteral("min_stocking"), Value::number(settings.minStocking)},
                {QStringLiteral("top"), Value::whole(settings.top)}});

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    std::optional<Candidate> current;
    if (in.regime.thins() || in.rotation) {
        const GrownRotation grown = growRotation(grow, in, command, context.err);
        if (!grown.path) {
            return grown.status;
        }
        current = rotation::scoreRotation(*grown.path, in.regime, grown.rotation, in.economics,
                                          settings.objective);
    }
    // A person watching a terminal sees the search advance; a script's stderr
    // carries only messages.
    rotation::Progress progress;
    if (isatty(fileno(stderr)) != 0) {
        progress = [&context](double fraction) {
            context.err << "\roptimise: " << qRound(fraction * 100.0) << " %" << Qt::flush;
            if (fraction >= 1.0) {
                context.err << '\n';
            }
            return true;
        };
    }
    rotation::GrowthFailure failure;
    const std::optional<rotation::OptimiserResult> result =
        rotation::optimise(grow, in.stand, in.economics, settings, failure, progress);
    if (!result) {
        context.err << "arbolex-cli optimise: " << QString::fromStdString(failure.text) << '\n';
        return failure.badInput ? kExitBadArguments : kExitEngineFailure;
    }
    const std::optional<double> gain =
        current && !result->best.empty()
            ? std::optional<double>(result->best.front().score - current->score)
            : std::nullopt;
    const bool forVolume = settings.objective == rotation::Objective::kVolume;
    const bool forCarbon = settings.objective == rotation::Objective::kCarbon;
    const bool withCarbon = forCarbon || in.economics.carbon.counts();
    const Value gainValue = gain ? Value::number(*gain) : Value();
    if (in.format == Format::kJson) {
        ResultDocument document(run);
        Fields fields = rotationPreamble(grow, in.economics);
        fields.push_back({QStringLiteral("regimes_grown"), Value::whole(result->regimesGrown)});
        document.insert(fields);
        document.insert(QStringLiteral("best"), candidateTable(result->best, withCarbon).json());
        if (current) {
            document.insert(QStringLiteral("current"),
                            candidateTable({*current}, withCarbon).jsonRow(0));
            document.insert(QStringLiteral("gain"), gainValue.json());
        }
        if (forVolume) {
            document.setUnit(QStringLiteral("gain"), units::kCubicMetresPerHa);
        } else if (forCarbon) {
            document.setUnit(QStringLiteral("gain"), units::kTonnesCo2ePerHa);
        }
        writeOutput(context.out, document.bytes());
    } else {
        // The current regime is a row beside the best, its gain a line below.
        QStringList columns = candidateColumns(withCarbon);
        columns.prepend(QStringLiteral("rank"));
        Table table(columns);
        auto add = [&](const QString &rank, const Candidate &c) {
            std::vector<Value> cells = candidateCells(c, withCarbon);
            cells.insert(cells.begin(), Value::word(rank));
            table.add(std::move(cells));
        };
        for (std::size_t i = 0; i < result->best.size(); ++i) {
            add(QString::number(i + 1), result->best[i]);
        }
        if (current) {
            add(QStringLiteral("current"), *current);
        }
        TextOutput text(in.format);
        text.comments(rotationPreamble(grow, in.economics));
        text.table(table);
        if (current) {
            text.comment(QStringLiteral("gain"), gainValue);
        }
        writeOutput(context.out, text.bytes());
    }
    return report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command optimiseCommand() {
    return {
        QStringLiteral("optimise"),
        QStringLiteral("the best thinning regimes and rotations for a stand"),
        QStringLiteral(
            "usage: arbolex-cli optimise --model M --age A --stocking N --height H\n"
            "                            (--basal-area G | --dbh D) [REGIME] [--rotation R]\n"
            "                            [--objective lev|npv|volume|carbon] [--rate P]\n"
            "                            [--establishment-cost C] [--annual-cost C]\n"
            "                            [--prices LIST] [--valuation stand|assortment]\n"
            "                            [--assortment-prices FILE] [--max-removal PERCENT]\n"
            "                            [--min-stocking N] [--top K] [--format tsv|csv|json]\n"
            "\n"
            "Searches the first thinning age, the years between thinnings, the volume per\n"
            "thinning (or none) and the rotation age for the largest objective: a coarse\n"
            "grid searched exhaustively, then refined in whole years and 5 m3/ha around\n"
            "the best. A thinning may remove at most --max-removal percent of the standing\n"
            "volume (default 35) and leave at least --min-stocking stems/ha (default 400).\n"
            "Prints the K best (default 5): thin_from, thin_every, thin_volume, thin_until\n"
            "(empty or null without thinning), rotation, npv, lev (euro/ha) and volume\n"
            "(total production, m3/ha), and carbon_stock (the long-term average carbon\n"
            "stock, t CO2e/ha) when carbon is the objective or --carbon-price is given.\n"
            "With --carbon-price, npv and lev include the carbon money. With a REGIME (or\n"
            "--rotation), \"current\" holds its figures and \"gain\" what the best adds to\n"
            "the objective.\n"
            "\n") +
            standOptionsHelp() + regimeOptionsHelp() +
            QStringLiteral("  --rotation R              final-cut age of the current regime\n") +
            economicsOptionsHelp() +
            QStringLiteral(
                "  --objective lev|npv|volume|carbon\n"
                "                            what to maximise (default lev; carbon: the\n"
                "                            long-term average carbon stock)\n"
                "  --max-removal PERCENT     largest removal per thinning (default 35)\n"
                "  --min-stocking N          smallest stocking a thinning leaves (default 400)\n"
                "  --top K                   regimes to print (default 5)\n") +
            formatOptionHelp(),
        &runOptimise};
}

} // namespace arbolex::cli
