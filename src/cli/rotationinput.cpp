#include "cli/rotationinput.hpp"

#include "carbon/carbonfile.hpp"
#include "cli/command.hpp"
#include "prices/assortmentpricefile.hpp"
#include "prices/carbonsettingsfile.hpp"
#include "prices/costfile.hpp"
#include "prices/prices.hpp"
#include "shell/errorlog.hpp"
#include "shell/settings.hpp"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonObject>

#include <algorithm>
#include <iterator>

namespace arbolex::cli {

namespace {

/// Ages and intervals of a regime, years.
constexpr int kLongestAge = 200;

struct PriceChoice {
    const char *word;
    prices::PriceSet set;
};

constexpr PriceChoice kPriceChoices[] = {{"current", prices::kCurrentPrices},
                                         {"user", prices::kUserPrices},
                                         {"longterm", prices::kLongTermPrices},
                                         {"private", prices::kPrivatePrices}};

/// The price list of --prices as the option names it.
const char *priceListWord(prices::PriceSet set) {
    const auto found = std::find_if(std::begin(kPriceChoices), std::end(kPriceChoices),
                                    [&](const PriceChoice &c) { return c.set == set; });
    return found->word;
}

/// A caption of a price class without its colon (".075 to .124").
QString classCaption(std::string_view caption) {
    if (caption.ends_with(':')) {
        caption.remove_suffix(1);
    }
    return QString::fromLatin1(caption.data(), static_cast<qsizetype>(caption.size()));
}

/// The prices a valuation uses, class by class: the standing prices by
/// mean tree volume and, valued by assortments, the assortment prices.
QJsonObject pricesUsed(const rotation::Economics &economics, prices::PriceSet set) {
    auto prices = [](const auto &captions, const auto &list) {
        QJsonArray out;
        for (std::size_t i = 0; i < list.size(); ++i) {
            out.append(QJsonObject{{QStringLiteral("class"), classCaption(captions.at(i))},
                                   {QStringLiteral("price"), Value::number(list[i]).json()}});
        }
        return out;
    };
    QJsonObject used{
        {QStringLiteral("list"), QLatin1String(priceListWord(set))},
        {QStringLiteral("standing"), prices(rotation::kTimberCategoryCaptions, economics.prices)}};
    if (economics.valuation == rotation::Valuation::kAssortments) {
        used.insert(QStringLiteral("assortments"),
                    prices(rotation::kAssortmentClassCaptions, economics.assortmentPrices));
    }
    return used;
}

/// Records the data folder's price files the prices were read from, in the
/// order they are read, to the first one missing.
void recordPriceFiles(RunRecord &run, const QString &dataFolder) {
    for (const char *name : prices::kFilesReadForPrices) {
        const QString path = QDir(dataFolder).filePath(QLatin1String(name));
        run.fileRead(QLatin1String(name), path);
        if (!QFileInfo::exists(path)) {
            break;
        }
    }
}

double cost(const Options &options, const char *name) {
    const double c = options.number(name);
    if (c < 0.0) {
        throw UsageError{QStringLiteral("--") + QLatin1String(name) +
                         QStringLiteral(" must not be negative")};
    }
    return c;
}

/// --establishment-cost and --annual-cost, each the data folder's cost file's
/// without its option. The file is read whenever it is there, so that the run
/// record lists it however the costs were given; a file that is refused stops
/// the command when a cost is taken from it, and without a file the costs are
/// 0, as the program starts without it. True when the file is there.
bool readCosts(const Options &options, const QString &dataFolder, rotation::Economics &economics) {
    const prices::CostsReading read =
        prices::readCosts(QDir(dataFolder).filePath(QLatin1String(prices::kCostsFile)));
    const bool establishmentGiven = options.has("establishment-cost");
    const bool annualGiven = options.has("annual-cost");
    if (!read.costs && !read.missing && !(establishmentGiven && annualGiven)) {
        throw UsageError{QStringLiteral("costs ") + read.fault};
    }
    const prices::CostDefaults costs = read.costs.value_or(prices::CostDefaults{});
    economics.establishmentCost =
        establishmentGiven ? cost(options, "establishment-cost") : costs.establishment;
    economics.annualCost = annualGiven ? cost(options, "annual-cost") : costs.annual;
    return !read.missing;
}

/// --valuation and --assortment-prices: how harvests are valued, and with
/// which assortment prices (the data folder's file without the option).
void readValuation(const Options &options, const QString &dataFolder,
                   rotation::Economics &economics, RunRecord &run) {
    const QString word =
        options.has("valuation") ? options.text("valuation") : QStringLiteral("stand");
    if (word != QLatin1String("stand") && word != QLatin1String("assortment")) {
        throw UsageError{QStringLiteral("--valuation takes stand or assortment")};
    }
    run.input(QStringLiteral("valuation"), Value::word(word));
    if (word == QLatin1String("stand")) {
        if (options.has("assortment-prices")) {
            throw UsageError{QStringLiteral("--assortment-prices is for --valuation assortment")};
        }
        return;
    }
    const bool given = options.has("assortment-prices");
    const QString path =
        given ? options.text("assortment-prices")
              : QDir(dataFolder).filePath(QLatin1String(prices::kAssortmentPricesFile));
    const prices::AssortmentPricesReading read = prices::readAssortmentPrices(path);
    if (!read.prices) {
        throw UsageError{QStringLiteral("assortment prices ") + read.fault};
    }
    economics.valuation = rotation::Valuation::kAssortments;
    economics.assortmentPrices = *read.prices;
    if (given) {
        run.input(QStringLiteral("assortment_prices"), Value::word(path));
    }
    run.fileRead(given ? path : QLatin1String(prices::kAssortmentPricesFile), path);
}

} // namespace

QString valuationName(const rotation::Economics &economics) {
    return economics.valuation == rotation::Valuation::kAssortments ? QStringLiteral("assortment")
                                                                    : QStringLiteral("stand");
}

std::vector<const char *> regimeOptionNames() {
    return {"thin-from", "thin-every", "thin-volume", "thin-until"};
}

QString regimeOptionsHelp() {
    return QStringLiteral(
        "  --thin-from AGE     age of the first thinning, years (no thinning without it)\n"
        "  --thin-every YEARS  years between thinnings\n"
        "  --thin-volume M3    volume each thinning removes, m3/ha\n"
        "  --thin-until AGE    age of the last thinning (default: up to the final cut)\n");
}

rotation::Regime readRegime(const Options &options) {
    rotation::Regime regime;
    if (!options.has("thin-from") && !options.has("thin-every") && !options.has("thin-volume") &&
        !options.has("thin-until")) {
        return regime;
    }
    regime.thinFrom = options.wholeNumber("thin-from", 1, kLongestAge);
    regime.thinEvery = options.wholeNumber("thin-every", 1, kLongestAge);
    regime.thinVolume = options.positive("thin-volume");
    if (options.has("thin-until")) {
        regime.thinUntil = options.wholeNumber("thin-until", 1, kLongestAge);
    }
    return regime;
}

/// The carbon file of the data folder. Its constants are the carbon
/// account's; the price and the payment count only from --carbon-price and
/// --carbon-money, so that without them every figure is that of timber. A
/// file that is refused stops the command; without a file the constants are
/// the defaults. True when the file was read.
bool readCarbon(const Options &options, const QString &dataFolder, rotation::Economics &economics) {
    const prices::CarbonSettingsReading reading =
        prices::readCarbonSettings(QDir(dataFolder).filePath(QLatin1String(prices::kCarbonFile)));
    if (!reading.settings && !reading.missing) {
        throw UsageError{QStringLiteral("carbon ") + reading.fault};
    }
    if (reading.settings) {
        economics.carbonParameters = reading.settings->parameters;
    }
    const bool read = reading.settings.has_value();
    carbon::Payment payment = carbon::Payment::kFlow;
    if (options.has("carbon-money") &&
        !carbon::paymentFromName(options.text("carbon-money").toStdString(), payment)) {
        throw UsageError{QStringLiteral("--carbon-money takes flow, units or none")};
    }
    if (payment != carbon::Payment::kNone && options.has("carbon-money") &&
        !options.has("carbon-price")) {
        throw UsageError{QStringLiteral("--carbon-money ") + options.text("carbon-money") +
                         QStringLiteral(" needs --carbon-price")};
    }
    if (options.has("carbon-price")) {
        const double price = options.number("carbon-price");
        if (!(price >= 0.0 && price <= carbon::kMaxCarbonPrice)) {
            throw UsageError{QStringLiteral("--carbon-price must be from 0 to ") +
                             QString::number(carbon::kMaxCarbonPrice) +
                             QStringLiteral(" euro per t CO2e")};
        }
        economics.carbon = {price, payment};
    }
    return read;
}

std::vector<const char *> economicsOptionNames() {
    return {"rate",      "establishment-cost", "annual-cost",  "prices",
            "valuation", "assortment-prices",  "carbon-price", "carbon-money"};
}

QString economicsOptionsHelp() {
    return QStringLiteral("  --rate P                  interest rate, percent, above 0 (default ") +
           QString::number(shell::kDefaultInterestRate) +
           QStringLiteral(
               ")\n"
               "  --establishment-cost C    cost at age 0, euro/ha (default: Costs.qdm of\n"
               "                            the data folder)\n"
               "  --annual-cost C           cost of every year, euro/ha (default: Costs.qdm\n"
               "                            of the data folder)\n"
               "  --prices current|user|longterm|private\n"
               "                            price list (default longterm: the long-term\n"
               "                            average prices the net present value uses)\n"
               "  --valuation stand|assortment\n"
               "                            stand: each harvest at the standing price of its\n"
               "                            mean tree (default); assortment: its volumes by\n"
               "                            top-diameter class at the assortment prices\n"
               "  --assortment-prices FILE  the three prices, euro/m3, of 7-14, 14-20 and\n"
               "                            >20 cm (default: AssortPrices.qdm of the data "
               "folder)\n"
               "  --carbon-price C          carbon price, euro per t CO2e: carbon money counts\n"
               "                            in the cash flow (default: none; the constants of\n"
               "                            the carbon account come from Carbon.qdm)\n"
               "  --carbon-money flow|units|none\n"
               "                            flow: paid on each year's net removal, charged on\n"
               "                            each release (default with a price); units: paid\n"
               "                            on the carbon units issued; none: not counted\n");
}

Fields regimeFields(const rotation::Regime &regime) {
    if (!regime.thins()) {
        return {};
    }
    return {{QStringLiteral("thin_from"), Value::whole(regime.thinFrom)},
            {QStringLiteral("thin_every"), Value::whole(regime.thinEvery)},
            {QStringLiteral("thin_volume"), Value::number(regime.thinVolume)},
            {QStringLiteral("thin_until"),
             regime.thinUntil ? Value::whole(*regime.thinUntil) : Value()}};
}

rotation::Economics readEconomics(const Options &options, const QString &dataFolder,
                                  RunRecord &run) {
    rotation::Economics economics;
    economics.ratePercent =
        options.has("rate") ? options.number("rate") : shell::kDefaultInterestRate;
    if (!(economics.ratePercent > 0.0)) {
        throw UsageError{
            QStringLiteral("--rate must be above 0: the land expectation value needs interest")};
    }
    const bool costsFile = readCosts(options, dataFolder, economics);
    const bool carbonFile = readCarbon(options, dataFolder, economics);
    prices::PriceSet set = prices::kLongTermPrices;
    if (options.has("prices")) {
        const QString word = options.text("prices");
        const auto found =
            std::find_if(std::begin(kPriceChoices), std::end(kPriceChoices),
                         [&](const PriceChoice &c) { return word == QLatin1String(c.word); });
        if (found == std::end(kPriceChoices)) {
            throw UsageError{QStringLiteral("--prices takes current, user, longterm or private")};
        }
        set = found->set;
    }
    prices::Prices prices;
    shell::ErrorLog log(dataFolder);
    prices::GetPricesFromFiles(dataFolder, prices.data(), log);
    prices.selectPriceSet(set);
    economics.prices = prices.pricesInUse();
    run.inputs({{QStringLiteral("rate"), Value::exact(economics.ratePercent)},
                {QStringLiteral("establishment_cost"), Value::exact(economics.establishmentCost)},
                {QStringLiteral("annual_cost"), Value::exact(economics.annualCost)},
                {QStringLiteral("prices"), Value::word(QLatin1String(priceListWord(set)))}});
    recordPriceFiles(run, dataFolder);
    if (costsFile) {
        run.fileRead(QLatin1String(prices::kCostsFile),
                     QDir(dataFolder).filePath(QLatin1String(prices::kCostsFile)));
    }
    if (carbonFile) {
        run.fileRead(QLatin1String(prices::kCarbonFile),
                     QDir(dataFolder).filePath(QLatin1String(prices::kCarbonFile)));
    }
    run.inputs({{QStringLiteral("carbon_price"),
                 options.has("carbon-price") ? Value::exact(economics.carbon.price) : Value()},
                {QStringLiteral("carbon_money"),
                 Value::word(QLatin1String(carbon::paymentName(economics.carbon.payment)))}});
    readValuation(options, dataFolder, economics, run);
    run.insert(QStringLiteral("prices_used"), pricesUsed(economics, set));
    return economics;
}

std::vector<const char *> rotationOptionNames(std::initializer_list<const char *> more) {
    std::vector<const char *> known = standOptionNames();
    for (const auto &names : {regimeOptionNames(), economicsOptionNames()}) {
        known.insert(known.end(), names.begin(), names.end());
    }
    known.insert(known.end(), {"rotation", "format"});
    known.insert(known.end(), more.begin(), more.end());
    return known;
}

RotationInput readRotationInput(const Options &options, const QString &dataFolder, RunRecord &run) {
    RotationInput input;
    input.stand = readStand(options);
    run.inputs(standFields(input.stand));
    input.regime = readRegime(options);
    run.inputs(regimeFields(input.regime));
    if (options.has("rotation")) {
        input.rotation = options.wholeNumber("rotation", 1, kLongestAge);
        run.input(QStringLiteral("rotation"), Value::whole(*input.rotation));
    }
    input.format = readFormat(options);
    run.setFormat(input.format);
    input.economics = readEconomics(options, dataFolder, run);
    return input;
}

Fields rotationPreamble(const engine::Grow &grow, const rotation::Economics &economics) {
    Fields fields = standPreamble(grow, true);
    fields.push_back({QStringLiteral("rate"), Value::number(economics.ratePercent)});
    fields.push_back({QStringLiteral("valuation"), Value::word(valuationName(economics))});
    return fields;
}

GrownRotation growRotation(engine::Grow &grow, const RotationInput &input, const QString &command,
                           QTextStream &err) {
    auto refuse = [&](const std::string &text) {
        err << "arbolex-cli " << command << ": " << QString::fromStdString(text) << '\n';
    };
    rotation::GrowthFailure failure;
    std::optional<rotation::GrowthPath> path =
        rotation::growPath(grow, input.stand, input.regime, failure);
    if (!path) {
        refuse(failure.text);
        return {std::nullopt, 0, failure.badInput ? kExitBadArguments : kExitEngineFailure};
    }
    const rotation::RotationChoice choice =
        rotation::chooseRotation(*path, input.regime, input.economics, input.rotation);
    if (choice.problem) {
        refuse(*choice.problem);
        return {std::nullopt, 0, kExitBadArguments};
    }
    return {std::move(path), choice.age, kExitSuccess};
}

} // namespace arbolex::cli
