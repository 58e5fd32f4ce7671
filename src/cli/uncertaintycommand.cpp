// arbolex-cli uncertainty: how much of a rotation's value survives when prices,
// interest rates and costs move: Monte Carlo draws and a tornado.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"
#include "rotation/uncertainty.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace arbolex::cli {

namespace {

/// Takes "--rate-range LO HI" out of the arguments (the option parser reads
/// one value per option). Throws UsageError.
std::optional<std::pair<QString, QString>> takeRateRange(QStringList &arguments) {
    const qsizetype at = arguments.indexOf(QStringLiteral("--rate-range"));
    if (at < 0) {
        return std::nullopt;
    }
    if (at + 2 >= arguments.size() || arguments[at + 1].startsWith(QLatin1String("--")) ||
        arguments[at + 2].startsWith(QLatin1String("--"))) {
        throw UsageError{QStringLiteral("--rate-range takes two rates, LO and HI")};
    }
    std::pair<QString, QString> range{arguments[at + 1], arguments[at + 2]};
    arguments.remove(at, 3);
    return range;
}

double rate(const QString &text) {
    bool ok = false;
    const double x = text.toDouble(&ok);
    if (!ok || !(x > 0.0)) {
        throw UsageError{QStringLiteral("--rate-range: \"") + text +
                         QStringLiteral("\" is not a rate above 0")};
    }
    return x;
}

QJsonObject percentilesJson(const rotation::Percentiles &p) {
    return {{QStringLiteral("p5"), moneyJson(p.p5)},
            {QStringLiteral("p50"), moneyJson(p.p50)},
            {QStringLiteral("p95"), moneyJson(p.p95)}};
}

void writeTsv(QTextStream &out, const rotation::MonteCarloResult &mc,
              const std::vector<rotation::TornadoBar> &bars) {
    out << "figure\tp5\tp50\tp95\n";
    out << "npv\t" << moneyText(mc.npv.p5) << '\t' << moneyText(mc.npv.p50) << '\t'
        << moneyText(mc.npv.p95) << '\n';
    out << "lev\t" << moneyText(mc.lev.p5) << '\t' << moneyText(mc.lev.p50) << '\t'
        << moneyText(mc.lev.p95) << '\n';
    out << "probability_npv_below_zero\t" << formatNumber(mc.probabilityNpvBelowZero) << '\n';
    out << "\n# histogram\nnpv_from\tnpv_to\tdraws\n";
    const double width = (mc.npvHighest - mc.npvLowest) / static_cast<double>(mc.histogram.size());
    for (std::size_t i = 0; i < mc.histogram.size(); ++i) {
        out << moneyText(mc.npvLowest + width * static_cast<double>(i)) << '\t'
            << moneyText(mc.npvLowest + width * static_cast<double>(i + 1)) << '\t'
            << mc.histogram[i] << '\n';
    }
    out << "\n# tornado\nfactor\tnpv_low\tnpv_high\tlev_low\tlev_high\n";
    for (const rotation::TornadoBar &b : bars) {
        out << QString::fromStdString(b.factor) << '\t' << moneyText(b.npvLow) << '\t'
            << moneyText(b.npvHigh) << '\t' << moneyText(b.levLow) << '\t' << moneyText(b.levHigh)
            << '\n';
    }
}

int runUncertainty(CommandContext &context) {
    const QString command = QStringLiteral("uncertainty");
    RotationInput in;
    rotation::MonteCarloSettings settings;
    try {
        QStringList arguments = context.arguments;
        const auto range = takeRateRange(arguments);
        const Options options(
            arguments, rotationOptionNames({"draws", "seed", "price-spread", "cost-spread"}));
        in = readRotationInput(options, context.dataFolder);
        if (options.has("draws")) {
            settings.draws = options.wholeNumber("draws", 1, 10'000'000);
        }
        if (options.has("seed")) {
            settings.seed =
                static_cast<std::uint64_t>(options.wholeNumber("seed", 0, 2'000'000'000));
        }
        if (options.has("price-spread")) {
            settings.priceSpread = options.number("price-spread");
        }
        if (options.has("cost-spread")) {
            settings.costSpread = options.number("cost-spread");
        }
        if (settings.priceSpread < 0.0 || settings.costSpread < 0.0) {
            throw UsageError{QStringLiteral("a spread must not be negative")};
        }
        settings.rateLow = range ? rate(range->first) : in.economics.ratePercent;
        settings.rateHigh = range ? rate(range->second) : in.economics.ratePercent;
        if (settings.rateHigh < settings.rateLow) {
            throw UsageError{QStringLiteral("--rate-range: LO is above HI")};
        }
    } catch (const UsageError &error) {
        context.err << "arbolex-cli uncertainty: " << error.text << '\n';
        return kExitBadArguments;
    }

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    const GrownRotation grown = growRotation(grow, in, command, context.err);
    if (!grown.path) {
        return grown.status;
    }
    const int age = grown.rotation;
    const rotation::MonteCarloResult mc =
        rotation::monteCarlo(*grown.path, age, in.economics, settings);
    const std::vector<rotation::TornadoBar> bars =
        rotation::tornado(*grown.path, age, in.economics);
    if (in.format == QLatin1String("json")) {
        QJsonArray tornado;
        for (const rotation::TornadoBar &b : bars) {
            tornado.append(QJsonObject{{QStringLiteral("factor"), QString::fromStdString(b.factor)},
                                       {QStringLiteral("npv_low"), moneyJson(b.npvLow)},
                                       {QStringLiteral("npv_high"), moneyJson(b.npvHigh)},
                                       {QStringLiteral("lev_low"), moneyJson(b.levLow)},
                                       {QStringLiteral("lev_high"), moneyJson(b.levHigh)}});
        }
        QJsonArray counts;
        for (const int n : mc.histogram) {
            counts.append(n);
        }
        const QJsonObject o{
            {QStringLiteral("rotation"), age},
            {QStringLiteral("rate"), in.economics.ratePercent},
            {QStringLiteral("valuation"), valuationName(in.economics)},
            {QStringLiteral("draws"), settings.draws},
            {QStringLiteral("seed"), static_cast<qint64>(settings.seed)},
            {QStringLiteral("npv"), percentilesJson(mc.npv)},
            {QStringLiteral("lev"), percentilesJson(mc.lev)},
            {QStringLiteral("probability_npv_below_zero"), mc.probabilityNpvBelowZero},
            {QStringLiteral("histogram"),
             QJsonObject{{QStringLiteral("npv_lowest"), moneyJson(mc.npvLowest)},
                         {QStringLiteral("npv_highest"), moneyJson(mc.npvHighest)},
                         {QStringLiteral("counts"), counts}}},
            {QStringLiteral("tornado"), tornado}};
        context.out << QJsonDocument(o).toJson(QJsonDocument::Indented);
    } else {
        writeRotationPreamble(context.out, grow, in.economics);
        context.out << "# rotation\t" << age << '\n';
        writeTsv(context.out, mc, bars);
    }
    return report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command uncertaintyCommand() {
    return {QStringLiteral("uncertainty"),
            QStringLiteral("Monte Carlo and tornado of a rotation's NPV and LEV"),
            QStringLiteral(
                "usage: arbolex-cli uncertainty --model M --age A --stocking N --height H\n"
                "                               (--basal-area G | --dbh D) [REGIME]\n"
                "                               [--rotation R] [--draws N] [--seed S]\n"
                "                               [--price-spread SD] [--rate-range LO HI]\n"
                "                               [--cost-spread SD] [--rate P] [costs]\n"
                "                               [--prices LIST] [--valuation stand|assortment]\n"
                "                               [--assortment-prices FILE] [--format tsv|json]\n"
                "\n"
                "Grows the rotation once (at --rotation, else its economic rotation) and\n"
                "values it N times (default 10000) with a price level drawn log-normal\n"
                "(median 1, log standard deviation SD, default 0.2), an interest rate drawn\n"
                "uniformly from LO to HI percent (default: --rate) and a cost level drawn\n"
                "log-normal (default SD 0). The same seed (default 1) gives the same draws.\n"
                "Prints the 5th, 50th and 95th percentiles of NPV and LEV (euro/ha), the\n"
                "probability that NPV is below 0, a histogram of NPV and a tornado: NPV and\n"
                "LEV with timber prices +-20 %, the rate +-1 point, costs +-20 % and volume\n"
                "+-10 %, one at a time.\n"
                "\n") +
                standOptionsHelp() + regimeOptionsHelp() + economicsOptionsHelp() +
                QStringLiteral("  --format tsv|json         output format (default tsv)\n"),
            &runUncertainty};
}

} // namespace arbolex::cli
