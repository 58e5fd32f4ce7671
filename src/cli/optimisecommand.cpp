// arbolex-cli optimise: the regimes of the largest LEV, NPV or total
// production for one stand, and the gain over the user's own regime.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"
#include "rotation/optimiser.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

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
                                     {"volume", rotation::Objective::kVolume}};

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
    throw UsageError{QStringLiteral("--objective takes lev, npv or volume")};
}

QJsonValue orNull(bool thins, double x) {
    return thins ? QJsonValue(x) : QJsonValue(QJsonValue::Null);
}

QJsonObject candidateJson(const Candidate &c) {
    const rotation::Regime &g = c.regime;
    const bool thins = g.thins();
    return {{QStringLiteral("thin_from"), orNull(thins, g.thinFrom)},
            {QStringLiteral("thin_every"), orNull(thins, g.thinEvery)},
            {QStringLiteral("thin_volume"), orNull(thins, formatNumber(g.thinVolume).toDouble())},
            {QStringLiteral("thin_until"), orNull(thins, g.thinUntil.value_or(0))},
            {QStringLiteral("rotation"), c.rotation},
            {QStringLiteral("npv"), moneyJson(c.npv)},
            {QStringLiteral("lev"), moneyJson(c.lev)},
            {QStringLiteral("volume"), formatNumber(c.volume).toDouble()}};
}

QString candidateLine(const QString &label, const Candidate &c) {
    const rotation::Regime &g = c.regime;
    const bool thins = g.thins();
    auto field = [&](double x) {
        return thins ? formatNumber(x) : QString();
    };
    return label + QLatin1Char('\t') + field(g.thinFrom) + QLatin1Char('\t') + field(g.thinEvery) +
           QLatin1Char('\t') + field(g.thinVolume) + QLatin1Char('\t') +
           field(g.thinUntil.value_or(0)) + QLatin1Char('\t') + QString::number(c.rotation) +
           QLatin1Char('\t') + moneyText(c.npv) + QLatin1Char('\t') + moneyText(c.lev) +
           QLatin1Char('\t') + formatNumber(c.volume) + QLatin1Char('\n');
}

int runOptimise(CommandContext &context) {
    const QString command = QStringLiteral("optimise");
    RotationInput in;
    rotation::OptimiserSettings settings;
    try {
        const Options options(context.arguments, rotationOptionNames({"objective", "max-removal",
                                                                      "min-stocking", "top"}));
        in = readRotationInput(options, context.dataFolder);
        settings.objective = readObjective(options);
        if (options.has("max-removal")) {
            const double percent = options.positive("max-removal");
            if (percent > 100.0) {
                throw UsageError{QStringLiteral("--max-removal is a percentage up to 100")};
            }
            settings.maxRemovalShare = percent / 100.0;
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
    if (in.format == QLatin1String("json")) {
        QJsonArray best;
        for (const Candidate &c : result->best) {
            best.append(candidateJson(c));
        }
        QJsonObject o{{QStringLiteral("model"), QString::fromStdString(grow.label())},
                      {QStringLiteral("rate"), in.economics.ratePercent},
                      {QStringLiteral("valuation"), valuationName(in.economics)},
                      {QStringLiteral("regimes_grown"), result->regimesGrown},
                      {QStringLiteral("best"), best}};
        if (current) {
            o.insert(QStringLiteral("current"), candidateJson(*current));
            o.insert(QStringLiteral("gain"), settings.objective == rotation::Objective::kVolume
                                                 ? QJsonValue(*gain)
                                                 : moneyJson(gain));
        }
        context.out << QJsonDocument(o).toJson(QJsonDocument::Indented);
    } else {
        writeRotationPreamble(context.out, grow, in.economics);
        context.out << "rank\tthin_from\tthin_every\tthin_volume\tthin_until\trotation\tnpv\tlev"
                       "\tvolume\n";
        for (std::size_t i = 0; i < result->best.size(); ++i) {
            context.out << candidateLine(QString::number(i + 1), result->best[i]);
        }
        if (current) {
            context.out << candidateLine(QStringLiteral("current"), *current) << "# gain\t"
                        << formatNumber(*gain) << '\n';
        }
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
            "                            [--objective lev|npv|volume] [--rate P]\n"
            "                            [--establishment-cost C] [--annual-cost C]\n"
            "                            [--prices LIST] [--valuation stand|assortment]\n"
            "                            [--assortment-prices FILE] [--max-removal PERCENT]\n"
            "                            [--min-stocking N] [--top K] [--format tsv|json]\n"
            "\n"
            "Searches the first thinning age, the years between thinnings, the volume per\n"
            "thinning (or none) and the rotation age for the largest objective: a coarse\n"
            "grid searched exhaustively, then refined in whole years and 5 m3/ha around\n"
            "the best. A thinning may remove at most --max-removal percent of the standing\n"
            "volume (default 35) and leave at least --min-stocking stems/ha (default 400).\n"
            "Prints the K best (default 5): thin_from, thin_every, thin_volume, thin_until\n"
            "(empty or null without thinning), rotation, npv, lev (euro/ha) and volume\n"
            "(total production, m3/ha). With a REGIME (or --rotation), \"current\" holds\n"
            "its figures and \"gain\" what the best adds to the objective.\n"
            "\n") +
            standOptionsHelp() + regimeOptionsHelp() +
            QStringLiteral("  --rotation R              final-cut age of the current regime\n") +
            economicsOptionsHelp() +
            QStringLiteral(
                "  --objective lev|npv|volume  what to maximise (default lev)\n"
                "  --max-removal PERCENT     largest removal per thinning (default 35)\n"
                "  --min-stocking N          smallest stocking a thinning leaves (default 400)\n"
                "  --top K                   regimes to print (default 5)\n"
                "  --format tsv|json         output format (default tsv)\n"),
        &runOptimise};
}

} // namespace arbolex::cli
