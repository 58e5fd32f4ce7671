// arbolex-cli rotation: a regime applied to the stand, grown to its final cut
// and valued: net present value, land expectation value, annuity, forest
// value, internal rate of return, break-even price factor and the rotation
// explorer (docs/economics.md).
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <optional>

namespace arbolex::cli {

namespace {

using rotation::Harvest;

/// A single-precision quantity as the tables print it ("%.9g").
QJsonValue quantity(double x) {
    return formatNumber(x).toDouble();
}

QString irrNote(valuation::IrrOutcome outcome) {
    switch (outcome) {
    case valuation::IrrOutcome::kRoot:
        return {};
    case valuation::IrrOutcome::kNoSignChange:
        return QStringLiteral("no sign change");
    case valuation::IrrOutcome::kNoRoot:
        return QStringLiteral("no root");
    case valuation::IrrOutcome::kMoreThanOneRoot:
        return QStringLiteral("more than one root");
    }
    return {};
}

/// The classes of a harvest valued by assortments, as the assortment report
/// names them, with their volumes (m³/ha).
QJsonObject assortmentsJson(const Harvest &h) {
    QJsonObject o;
    for (std::size_t i = 0; i < h.assortments.size(); ++i) {
        o.insert(QLatin1String(rotation::kAssortmentClassCaptions.at(i)),
                 quantity(h.assortments.at(i)));
    }
    return o;
}

QJsonObject harvestJson(const Harvest &h, bool withStocking, bool byAssortments) {
    QJsonObject o{{QStringLiteral("age"), h.age},
                  {QStringLiteral("volume"), quantity(h.volume)},
                  {QStringLiteral("mean_tree_volume"), h.meanTreeVolume},
                  {QStringLiteral("revenue"), moneyJson(h.revenue)}};
    if (withStocking) {
        o.insert(QStringLiteral("stocking"), quantity(h.stocking));
    }
    if (byAssortments) {
        o.insert(QStringLiteral("assortments"), assortmentsJson(h));
    }
    return o;
}

struct Report {
    const rotation::GrowthPath &path;
    const rotation::RotationValue &value;
    const rotation::RotationExplorer &explorer;
    const rotation::Economics &economics;

    bool byAssortments() const { return economics.valuation == rotation::Valuation::kAssortments; }
};

QJsonObject toJson(const Report &r, const engine::Grow &grow) {
    const rotation::RotationValue &v = r.value;
    QJsonArray thinnings;
    for (const Harvest &t : v.thinnings) {
        thinnings.append(harvestJson(t, true, r.byAssortments()));
    }
    QJsonArray cashflow;
    for (const rotation::CashFlowYear &c : v.cashflow) {
        cashflow.append(QJsonObject{{QStringLiteral("age"), c.age},
                                    {QStringLiteral("cost"), moneyJson(c.cost)},
                                    {QStringLiteral("revenue"), moneyJson(c.revenue)}});
    }
    QJsonArray byAge;
    for (const rotation::RotationRow &row : r.explorer.rows) {
        byAge.append(QJsonObject{{QStringLiteral("age"), row.age},
                                 {QStringLiteral("volume"), quantity(row.volume)},
                                 {QStringLiteral("mai"), row.mai},
                                 {QStringLiteral("npv"), moneyJson(row.npv)},
                                 {QStringLiteral("lev"), moneyJson(row.lev)},
                                 {QStringLiteral("forest_value"), moneyJson(row.forestValue)}});
    }
    QJsonObject o{{QStringLiteral("model"), QString::fromStdString(grow.label())},
                  {QStringLiteral("site_index"), quantity(r.path.siteIndex)},
                  {QStringLiteral("present_age"), r.path.presentAge},
                  {QStringLiteral("rate"), r.economics.ratePercent},
                  {QStringLiteral("valuation"), valuationName(r.economics)},
                  {QStringLiteral("rotation"), v.rotation},
                  {QStringLiteral("economic_rotation"), r.explorer.economicRotation},
                  {QStringLiteral("biological_rotation"), r.explorer.biologicalRotation},
                  {QStringLiteral("yield_class"), v.yieldClass},
                  {QStringLiteral("mai"), v.mai},
                  {QStringLiteral("npv"), moneyJson(v.npv)},
                  {QStringLiteral("lev"), moneyJson(v.lev)},
                  {QStringLiteral("eaa"), moneyJson(v.eaa)},
                  {QStringLiteral("forest_value"), moneyJson(v.forestValue)},
                  {QStringLiteral("irr"), v.irr.outcome == valuation::IrrOutcome::kRoot
                                              ? QJsonValue(v.irr.ratePercent)
                                              : QJsonValue(QJsonValue::Null)},
                  {QStringLiteral("break_even_price_factor"),
                   v.breakEvenPriceFactor ? QJsonValue(*v.breakEvenPriceFactor)
                                          : QJsonValue(QJsonValue::Null)},
                  {QStringLiteral("thinnings"), thinnings},
                  {QStringLiteral("final_cut"), harvestJson(v.finalCut, false, r.byAssortments())},
                  {QStringLiteral("cashflow"), cashflow},
                  {QStringLiteral("by_age"), byAge}};
    if (v.irr.outcome != valuation::IrrOutcome::kRoot) {
        o.insert(QStringLiteral("irr_note"), irrNote(v.irr.outcome));
    }
    return o;
}

void writeTsv(QTextStream &out, const Report &r, const engine::Grow &grow) {
    const rotation::RotationValue &v = r.value;
    writeRotationPreamble(out, grow, r.economics);
    out << "rotation\t" << v.rotation << '\n'
        << "economic_rotation\t" << r.explorer.economicRotation << '\n'
        << "biological_rotation\t" << r.explorer.biologicalRotation << '\n'
        << "yield_class\t" << v.yieldClass << '\n'
        << "mai\t" << formatNumber(v.mai) << '\n'
        << "npv\t" << moneyText(v.npv) << '\n'
        << "lev\t" << moneyText(v.lev) << '\n'
        << "eaa\t" << moneyText(v.eaa) << '\n'
        << "forest_value\t" << moneyText(v.forestValue) << '\n'
        << "irr\t"
        << (v.irr.outcome == valuation::IrrOutcome::kRoot ? formatNumber(v.irr.ratePercent)
                                                          : irrNote(v.irr.outcome))
        << '\n'
        << "break_even_price_factor\t"
        << (v.breakEvenPriceFactor ? formatNumber(*v.breakEvenPriceFactor) : QString()) << '\n';
    out << "\n# harvests\nkind\tage\tvolume\tstocking\tmean_tree_volume\trevenue";
    if (r.byAssortments()) {
        for (const std::string_view caption : rotation::kAssortmentClassCaptions) {
            out << '\t' << QLatin1String(caption);
        }
    }
    out << '\n';
    auto harvestLine = [&](const char *kind, const Harvest &h) {
        out << kind << '\t' << h.age << '\t' << formatNumber(h.volume) << '\t'
            << formatNumber(h.stocking) << '\t' << formatNumber(h.meanTreeVolume) << '\t'
            << moneyText(h.revenue);
        if (r.byAssortments()) {
            for (const float volume : h.assortments) {
                out << '\t' << formatNumber(volume);
            }
        }
        out << '\n';
    };
    for (const Harvest &t : v.thinnings) {
        harvestLine("thinning", t);
    }
    harvestLine("final_cut", v.finalCut);
    out << "\n# cashflow\nage\tcost\trevenue\n";
    for (const rotation::CashFlowYear &c : v.cashflow) {
        out << c.age << '\t' << moneyText(c.cost) << '\t' << moneyText(c.revenue) << '\n';
    }
    out << "\n# by_age\nage\tvolume\tmai\tnpv\tlev\tforest_value\n";
    for (const rotation::RotationRow &row : r.explorer.rows) {
        out << row.age << '\t' << formatNumber(row.volume) << '\t' << formatNumber(row.mai) << '\t'
            << moneyText(row.npv) << '\t' << moneyText(row.lev) << '\t'
            << moneyText(row.forestValue) << '\n';
    }
}

int runRotation(CommandContext &context) {
    RotationInput in;
    try {
        const Options options(context.arguments, rotationOptionNames());
        in = readRotationInput(options, context.dataFolder);
    } catch (const UsageError &error) {
        context.err << "arbolex-cli rotation: " << error.text << '\n';
        return kExitBadArguments;
    }

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    const QString command = QStringLiteral("rotation");
    const GrownRotation grown = growRotation(grow, in, command, context.err);
    if (!grown.path) {
        return grown.status;
    }
    const rotation::GrowthPath &path = *grown.path;
    const rotation::RotationExplorer explorer =
        rotation::exploreRotations(path, in.regime, in.economics);
    const rotation::RotationValue value =
        rotation::valueRotation(path, grown.rotation, in.economics);
    const Report r{path, value, explorer, in.economics};
    if (in.format == QLatin1String("json")) {
        context.out << QJsonDocument(toJson(r, grow)).toJson(QJsonDocument::Indented);
    } else {
        writeTsv(context.out, r, grow);
    }
    return report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command rotationCommand() {
    return {QStringLiteral("rotation"),
            QStringLiteral("a regime grown to its final cut and valued (NPV, LEV, IRR, ...)"),
            QStringLiteral(
                "usage: arbolex-cli rotation --model M --age A --stocking N --height H\n"
                "                            (--basal-area G | --dbh D)\n"
                "                            [--thin-from AGE --thin-every YEARS --thin-volume M3\n"
                "                             [--thin-until AGE]] [--rotation R] [--rate P]\n"
                "                            [--establishment-cost C] [--annual-cost C]\n"
                "                            [--prices current|user|longterm|private]\n"
                "                            [--valuation stand|assortment]\n"
                "                            [--assortment-prices FILE]\n"
                "                            [--format tsv|json] [--data-dir DIR]\n"
                "\n"
                "Grows the stand year by year to the model's age limit, thinning the given\n"
                "volume at the regime's ages (the thinning window's volume method), and fells\n"
                "it at the rotation age R (without --rotation, the economic rotation: the\n"
                "age of the largest land expectation value). Thinnings are valued at the\n"
                "standing price of the removal's mean tree, the final cut at that of the\n"
                "crop's mean tree; with --valuation assortment each harvest is divided into\n"
                "the top-diameter classes 7-14, 14-20 and >20 cm, each class sold at its\n"
                "assortment price. Money is euro/ha; the rate in percent.\n"
                "Prints the figures (npv, lev, eaa, forest_value, irr, break_even_price_factor,\n"
                "yield_class, the rotations), the harvests, the cash flow from age 0 to R and\n"
                "the rotation explorer (by_age: the final cut at every age after the last\n"
                "thinning). An irr that does not exist reads \"no sign change\", \"no root\" or\n"
                "\"more than one root\" (null in JSON, with irr_note).\n"
                "\n") +
                standOptionsHelp() + regimeOptionsHelp() +
                QStringLiteral("  --rotation R              final-cut age, years\n") +
                economicsOptionsHelp() +
                QStringLiteral("  --format tsv|json         output format (default tsv)\n"),
            &runRotation};
}

} // namespace arbolex::cli
