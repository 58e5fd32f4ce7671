// arbolex-cli uncertainty: how much of a rotation's value survives when prices,
// interest rates and costs move: Monte Carlo draws and a tornado.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"
#include "rotation/uncertainty.hpp"

#include <QJsonArray>
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

/// The percentiles of NPV and LEV, a row each.
Table percentileTable(const rotation::MonteCarloResult &mc) {
    Table table({QStringLiteral("figure"), QStringLiteral("p5"), QStringLiteral("p50"),
                 QStringLiteral("p95")});
    for (const auto &[name, p] : {std::pair{"npv", &mc.npv}, std::pair{"lev", &mc.lev}}) {
        table.add({Value::word(QLatin1String(name)), Value::money(p->p5), Value::money(p->p50),
                   Value::money(p->p95)});
    }
    return table;
}

Table tornadoTable(const std::vector<rotation::TornadoBar> &bars) {
    Table table({QStringLiteral("factor"), QStringLiteral("npv_low"), QStringLiteral("npv_high"),
                 QStringLiteral("lev_low"), QStringLiteral("lev_high")});
    for (const rotation::TornadoBar &b : bars) {
        table.add({Value::word(QString::fromStdString(b.factor)), Value::money(b.npvLow),
                   Value::money(b.npvHigh), Value::money(b.levLow), Value::money(b.levHigh)});
    }
    return table;
}

Value probabilityOfLoss(const rotation::MonteCarloResult &mc) {
    return Value::number(mc.probabilityNpvBelowZero);
}

QByteArray toText(Format format, const Fields &preamble, const rotation::MonteCarloResult &mc,
                  const std::vector<rotation::TornadoBar> &bars) {
    TextOutput text(format);
    text.comments(preamble);
    text.table(percentileTable(mc));
    text.blank();
    text.fields({{QStringLiteral("probability_npv_below_zero"), probabilityOfLoss(mc)}});
    text.title(QStringLiteral("histogram"));
    Table histogram(
        {QStringLiteral("npv_from"), QStringLiteral("npv_to"), QStringLiteral("draws")});
    const double width = (mc.npvHighest - mc.npvLowest) / static_cast<double>(mc.histogram.size());
    for (std::size_t i = 0; i < mc.histogram.size(); ++i) {
        histogram.add({Value::money(mc.npvLowest + width * static_cast<double>(i)),
                       Value::money(mc.npvLowest + width * static_cast<double>(i + 1)),
                       Value::whole(mc.histogram[i])});
    }
    text.table(histogram);
    text.title(QStringLiteral("tornado"));
    text.table(tornadoTable(bars));
    return text.bytes();
}

QByteArray toJson(const RunRecord &run, const Fields &preamble, int age,
                  const rotation::MonteCarloSettings &settings,
                  const rotation::MonteCarloResult &mc,
                  const std::vector<rotation::TornadoBar> &bars) {
    const Table percentiles = percentileTable(mc);
    auto percentilesOf = [&](std::size_t row) {
        QJsonObject o = percentiles.jsonRow(row);
        o.remove(QStringLiteral("figure"));
        return o;
    };
    QJsonArray counts;
    for (const int n : mc.histogram) {
        counts.append(n);
    }
    ResultDocument document(run);
    document.insert(preamble);
    document.insert({{QStringLiteral("rotation"), Value::whole(age)},
                     {QStringLiteral("draws"), Value::whole(settings.draws)},
                     {QStringLiteral("seed"), Value::whole(static_cast<qint64>(settings.seed))},
                     {QStringLiteral("probability_npv_below_zero"), probabilityOfLoss(mc)}});
    document.insert(QStringLiteral("npv"), percentilesOf(0));
    document.insert(QStringLiteral("lev"), percentilesOf(1));
    document.insert(QStringLiteral("histogram"),
                    QJsonObject{{QStringLiteral("npv_lowest"), Value::money(mc.npvLowest).json()},
                                {QStringLiteral("npv_highest"), Value::money(mc.npvHighest).json()},
                                {QStringLiteral("counts"), counts}});
    document.insert(QStringLiteral("tornado"), tornadoTable(bars).json());
    return document.bytes();
}

int runUncertainty(CommandContext &context) {
    const QString command = QStringLiteral("uncertainty");
    RotationInput in;
    rotation::MonteCarloSettings settings;
    RunRecord run(command);
    try {
        QStringList arguments = context.arguments;
        const auto range = takeRateRange(arguments);
        const Options options(arguments, rotationOptionNames({"draws", "seed", "price-spread",
                                                              "cost-spread", "carbon-spread"}));
        in = readRotationInput(options, context.dataFolder, run);
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
        if (options.has("carbon-spread")) {
            if (!in.economics.carbon.counts()) {
                throw UsageError{QStringLiteral("--carbon-spread needs --carbon-price")};
            }
            settings.carbonSpread = options.number("carbon-spread");
        }
        if (settings.priceSpread < 0.0 || settings.costSpread < 0.0 ||
            settings.carbonSpread < 0.0) {
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
    run.inputs({{QStringLiteral("draws"), Value::whole(settings.draws)},
                {QStringLiteral("seed"), Value::whole(static_cast<qint64>(settings.seed))},
                {QStringLiteral("price_spread"), Value::exact(settings.priceSpread)},
                {QStringLiteral("cost_spread"), Value::exact(settings.costSpread)}});
    if (in.economics.carbon.counts()) {
        run.input(QStringLiteral("carbon_spread"), Value::exact(settings.carbonSpread));
    }
    run.input(QStringLiteral("rate_range"), QJsonArray{Value::exact(settings.rateLow).json(),
                                                       Value::exact(settings.rateHigh).json()});

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
    const Fields preamble = rotationPreamble(grow, in.economics);
    if (in.format == Format::kJson) {
        writeOutput(context.out, toJson(run, preamble, age, settings, mc, bars));
    } else {
        Fields withRotation = preamble;
        withRotation.push_back({QStringLiteral("rotation"), Value::whole(age)});
        writeOutput(context.out, toText(in.format, withRotation, mc, bars));
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
                "                               [--assortment-prices FILE]\n"
                "                               [--carbon-price C [--carbon-money flow|units]\n"
                "                                [--carbon-spread SD]]\n"
                "                               [--format tsv|csv|json]\n"
                "\n"
                "Grows the rotation once (at --rotation, else its economic rotation) and\n"
                "values it N times (default 10000) with a price level drawn log-normal\n"
                "(median 1, log standard deviation SD, default 0.2), an interest rate drawn\n"
                "uniformly from LO to HI percent (default: --rate) and a cost level drawn\n"
                "log-normal (default SD 0). The same seed (default 1) gives the same draws.\n"
                "Prints the 5th, 50th and 95th percentiles of NPV and LEV (euro/ha), the\n"
                "probability that NPV is below 0, a histogram of NPV and a tornado: NPV and\n"
                "LEV with timber prices +-20 %, the rate +-1 point, costs +-20 % and volume\n"
                "+-10 %, one at a time. With --carbon-price the carbon money counts, its\n"
                "price level is drawn log-normal too (default SD 0.3) and the tornado gets\n"
                "carbon price +-20 %.\n"
                "\n") +
                standOptionsHelp() + regimeOptionsHelp() + economicsOptionsHelp() +
                formatOptionHelp(),
            &runUncertainty};
}

} // namespace arbolex::cli
