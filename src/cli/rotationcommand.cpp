// arbolex-cli rotation: a regime applied to the stand, grown to its final cut
// and valued: net present value, land expectation value, annuity, forest
// value, internal rate of return, break-even price factor and the rotation
// explorer (docs/economics.md).
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/rotationinput.hpp"
#include "cli/standinput.hpp"

#include <QJsonArray>
#include <QJsonObject>

namespace arbolex::cli {

namespace {

using rotation::Harvest;

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

struct Report {
    const rotation::GrowthPath &path;
    const rotation::RotationValue &value;
    const rotation::RotationExplorer &explorer;
    const rotation::Economics &economics;

    bool byAssortments() const { return economics.valuation == rotation::Valuation::kAssortments; }
};

/// The rotation's figures: "key<TAB>value" lines, members of the JSON.
Fields figures(const Report &r) {
    const rotation::RotationValue &v = r.value;
    const bool rooted = v.irr.outcome == valuation::IrrOutcome::kRoot;
    return {{QStringLiteral("rotation"), Value::whole(v.rotation)},
            {QStringLiteral("economic_rotation"), Value::whole(r.explorer.economicRotation)},
            {QStringLiteral("biological_rotation"), Value::whole(r.explorer.biologicalRotation)},
            {QStringLiteral("yield_class"), Value::whole(v.yieldClass)},
            {QStringLiteral("mai"), Value::number(v.mai)},
            {QStringLiteral("npv"), Value::money(v.npv)},
            {QStringLiteral("lev"), Value::money(v.lev)},
            {QStringLiteral("eaa"), Value::money(v.eaa)},
            {QStringLiteral("forest_value"), Value::money(v.forestValue)},
            {QStringLiteral("irr"),
             rooted ? Value::number(v.irr.ratePercent) : Value::note(irrNote(v.irr.outcome))},
            {QStringLiteral("break_even_price_factor"),
             v.breakEvenPriceFactor ? Value::number(*v.breakEvenPriceFactor) : Value()}};
}

/// The figures of a harvest, in the columns of harvestColumns after "kind".
std::vector<Value> harvestCells(const Harvest &h, bool byAssortments) {
    std::vector<Value> cells = {Value::whole(h.age), Value::number(h.volume),
                                Value::number(h.stocking), Value::number(h.meanTreeVolume),
                                Value::money(h.revenue)};
    if (byAssortments) {
        for (const float volume : h.assortments) {
            cells.push_back(Value::number(volume));
        }
    }
    return cells;
}

QStringList harvestColumns(bool byAssortments) {
    QStringList columns = {QStringLiteral("age"), QStringLiteral("volume"),
                           QStringLiteral("stocking"), QStringLiteral("mean_tree_volume"),
                           QStringLiteral("revenue")};
    if (byAssortments) {
        for (const std::string_view caption : rotation::kAssortmentClassCaptions) {
            columns << QLatin1String(caption);
        }
    }
    return columns;
}

/// A harvest in JSON: the thinning's stocking, and its classes as one object.
QJsonObject harvestJson(const Harvest &h, bool withStocking, bool byAssortments) {
    Table one(harvestColumns(byAssortments));
    one.add(harvestCells(h, byAssortments));
    QJsonObject o = one.jsonRow(0);
    QJsonObject classes;
    for (const std::string_view caption : rotation::kAssortmentClassCaptions) {
        const QString key = QLatin1String(caption);
        if (o.contains(key)) {
            classes.insert(key, o.take(key));
        }
    }
    if (byAssortments) {
        o.insert(QStringLiteral("assortments"), classes);
    }
    if (!withStocking) {
        o.remove(QStringLiteral("stocking"));
    }
    return o;
}

/// The cash flow by age; with a column of carbon money when carbon counts.
Table cashflowTable(const rotation::RotationValue &v, bool withCarbon) {
    QStringList columns = {QStringLiteral("age"), QStringLiteral("cost"),
                           QStringLiteral("revenue")};
    if (withCarbon) {
        columns << QStringLiteral("carbon");
    }
    Table table(columns);
    for (const rotation::CashFlowYear &c : v.cashflow) {
        std::vector<Value> cells = {Value::whole(c.age), Value::money(c.cost),
                                    Value::money(c.revenue)};
        if (withCarbon) {
            cells.push_back(Value::money(c.carbon));
        }
        table.add(std::move(cells));
    }
    return table;
}

/// The carbon account by age, t CO₂e/ha.
Table carbonTable(const carbon::Account &account) {
    Table table({QStringLiteral("age"), QStringLiteral("stock_trees_tco2e_ha"),
                 QStringLiteral("stock_products_tco2e_ha"), QStringLiteral("net_removal_tco2e_ha"),
                 QStringLiteral("emissions_tco2e_ha"), QStringLiteral("units_tco2e_ha")});
    for (const carbon::AccountYear &y : account.years) {
        table.add({Value::whole(y.age), Value::number(y.trees), Value::number(y.products),
                   Value::number(y.netRemoval), Value::number(y.emissions),
                   Value::number(y.units)});
    }
    return table;
}

/// The carbon account's totals and the money split into timber and carbon.
Fields carbonFigures(const Report &r) {
    const rotation::RotationValue &v = r.value;
    const carbon::Account &a = v.carbon;
    const bool counts = r.economics.carbon.counts();
    // The crop at the final cut, before it is felled.
    const double felled = a.years.empty() ? 0.0 : a.years.back().harvested;
    const double removed = a.years.empty() ? 0.0 : a.years.back().cumulativeNetRemoval;
    return {
        {QStringLiteral("stock_final_cut_tco2e_ha"), Value::number(felled)},
        {QStringLiteral("long_term_average_tco2e_ha"), Value::number(a.longTermAverage)},
        {QStringLiteral("net_removal_total_tco2e_ha"), Value::number(removed)},
        {QStringLiteral("units_total_tco2e_ha"), Value::number(a.unitsTotal)},
        {QStringLiteral("npv_timber"), Value::money(v.npvTimber)},
        {QStringLiteral("npv_carbon"), Value::money(v.npvCarbon)},
        {QStringLiteral("lev_timber"), Value::money(v.levTimber)},
        {QStringLiteral("lev_carbon"), Value::money(v.levCarbon)},
        {QStringLiteral("carbon_price"), counts ? Value::exact(r.economics.carbon.price) : Value()},
        {QStringLiteral("carbon_money"),
         Value::word(QLatin1String(carbon::paymentName(r.economics.carbon.payment)))}};
}

QJsonObject carbonJson(const Report &r) {
    QJsonObject o;
    for (const auto &[key, value] : carbonFigures(r)) {
        if (key == QLatin1String("carbon_price")) {
            o.insert(QStringLiteral("price"), value.json());
        } else if (key == QLatin1String("carbon_money")) {
            o.insert(QStringLiteral("money"), value.json());
        } else {
            o.insert(key, value.json());
        }
    }
    o.insert(QStringLiteral("by_age"), carbonTable(r.value.carbon).json());
    return o;
}

Table byAgeTable(const rotation::RotationExplorer &explorer) {
    Table table({QStringLiteral("age"), QStringLiteral("volume"), QStringLiteral("mai"),
                 QStringLiteral("npv"), QStringLiteral("lev"), QStringLiteral("forest_value")});
    for (const rotation::RotationRow &row : explorer.rows) {
        table.add({Value::whole(row.age), Value::number(row.volume), Value::number(row.mai),
                   Value::money(row.npv), Value::money(row.lev), Value::money(row.forestValue)});
    }
    return table;
}

QByteArray toJson(const Report &r, const engine::Grow &grow, const RunRecord &run) {
    const rotation::RotationValue &v = r.value;
    QJsonArray thinnings;
    for (const Harvest &t : v.thinnings) {
        thinnings.append(harvestJson(t, true, r.byAssortments()));
    }
    ResultDocument document(run);
    document.insert(rotationPreamble(grow, r.economics));
    document.insert(figures(r));
    document.insert(QStringLiteral("site_index"), Value::number(r.path.siteIndex).json());
    document.insert(QStringLiteral("present_age"), r.path.presentAge);
    if (v.irr.outcome != valuation::IrrOutcome::kRoot) {
        document.insert(QStringLiteral("irr_note"), irrNote(v.irr.outcome));
    }
    document.insert(QStringLiteral("thinnings"), thinnings);
    document.insert(QStringLiteral("final_cut"), harvestJson(v.finalCut, false, r.byAssortments()));
    document.insert(QStringLiteral("cashflow"),
                    cashflowTable(v, r.economics.carbon.counts()).json());
    document.insert(QStringLiteral("by_age"), byAgeTable(r.explorer).json());
    document.insert(QStringLiteral("carbon"), carbonJson(r));
    return document.bytes();
}

QByteArray toText(Format format, const Report &r, const engine::Grow &grow) {
    const rotation::RotationValue &v = r.value;
    TextOutput text(format);
    text.comments(rotationPreamble(grow, r.economics));
    text.fields(figures(r));
    QStringList columns = harvestColumns(r.byAssortments());
    columns.prepend(QStringLiteral("kind"));
    Table harvests(columns);
    auto add = [&](const char *kind, const Harvest &h) {
        std::vector<Value> cells = harvestCells(h, r.byAssortments());
        cells.insert(cells.begin(), Value::word(QLatin1String(kind)));
        harvests.add(std::move(cells));
    };
    for (const Harvest &t : v.thinnings) {
        add("thinning", t);
    }
    add("final_cut", v.finalCut);
    text.title(QStringLiteral("harvests"));
    text.table(harvests);
    text.title(QStringLiteral("cashflow"));
    text.table(cashflowTable(v, r.economics.carbon.counts()));
    text.title(QStringLiteral("by_age"));
    text.table(byAgeTable(r.explorer));
    text.title(QStringLiteral("carbon"));
    text.fields(carbonFigures(r));
    text.title(QStringLiteral("carbon_by_age"));
    text.table(carbonTable(v.carbon));
    return text.bytes();
}

int runRotation(CommandContext &context) {
    RunRecord run(QStringLiteral("rotation"));
    RotationInput in;
    try {
        const Options options(context.arguments, rotationOptionNames());
        in = readRotationInput(options, context.dataFolder, run);
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
    writeOutput(context.out,
                in.format == Format::kJson ? toJson(r, grow, run) : toText(in.format, r, grow));
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
                "                            [--carbon-price C [--carbon-money flow|units]]\n"
                "                            [--format tsv|csv|json] [--data-dir DIR]\n"
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
                "Then the carbon account of the rotation (docs/carbon.md): by age the carbon\n"
                "in the trees and in products, the year's net removal and emissions and the\n"
                "units issued, t CO2e/ha, and its totals; with --carbon-price the carbon\n"
                "money counts in npv, lev, the rotations and the cash flow (column carbon),\n"
                "and npv_timber/npv_carbon, lev_timber/lev_carbon split them.\n"
                "\n") +
                standOptionsHelp() + regimeOptionsHelp() +
                QStringLiteral("  --rotation R              final-cut age, years\n") +
                economicsOptionsHelp() + formatOptionHelp(),
            &runRotation};
}

} // namespace arbolex::cli
