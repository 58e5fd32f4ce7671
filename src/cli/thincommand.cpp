// arbolex-cli thin: the stand after a thinning prescribed by its residual
// basal area, stocking or volume, as the thinning preview computes it.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/standinput.hpp"

#include <iterator>

namespace arbolex::cli {

namespace {

enum Residual { kResidualBasalArea, kResidualStocking, kResidualVolume };

/// The options of the residual kinds, in the order of Residual.
constexpr const char *kResidualOptions[] = {"residual-ba", "residual-stocking", "residual-volume"};

int runThin(CommandContext &context) {
    StandInput stand;
    int kind = kResidualBasalArea;
    float residual = 0.0f;
    Format format = Format::kTsv;
    try {
        std::vector<const char *> known = standOptionNames();
        known.insert(known.end(), std::begin(kResidualOptions), std::end(kResidualOptions));
        known.push_back(kFormatOption);
        const Options options(context.arguments, known);
        stand = readStand(options);
        kind = options.oneOf({kResidualOptions[0], kResidualOptions[1], kResidualOptions[2]});
        residual = options.single(kResidualOptions[kind]);
        format = readFormat(options);
    } catch (const UsageError &error) {
        context.err << "arbolex-cli thin: " << error.text << '\n';
        return kExitBadArguments;
    }
    RunRecord run(QStringLiteral("thin"));
    run.inputs(standFields(stand));
    run.input(inputKey(kResidualOptions[kind]), Value::number(residual));
    run.setFormat(format);

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    // The volume reads the site index, so it comes first.
    const bool siteIndexOk = selectModelAndSiteIndex(grow, stand);
    const float h = stand.height;
    const float n = stand.stocking;
    const float g = stand.basalArea;
    float residualBasalArea = 0.0f;
    float residualStocking = 0.0f;
    bool solved = true;
    switch (kind) {
    case kResidualBasalArea:
        residualBasalArea = residual;
        residualStocking = grow.NRES(h, n, g, residualBasalArea);
        break;
    case kResidualStocking:
        residualStocking = residual;
        residualBasalArea = static_cast<float>(grow.BRES(h, n, g, residualStocking));
        break;
    default:
        solved = grow.NEWTON(n, g, h, residual, residualStocking, residualBasalArea);
        break;
    }
    const float volume = grow.GetV7(residualBasalArea, residualStocking, h);

    Table table(
        {QStringLiteral("basal_area"), QStringLiteral("stocking"), QStringLiteral("volume")});
    table.add(
        {Value::number(residualBasalArea), Value::number(residualStocking), Value::number(volume)});
    writeOutput(context.out, fieldsAndTable(format, run, standPreamble(grow, siteIndexOk),
                                            QStringLiteral("residual"), table, true));
    return siteIndexOk && solved && report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command thinCommand() {
    return {
        QStringLiteral("thin"),
        QStringLiteral("the stand after a thinning to a residual basal area, stocking or "
                       "volume"),
        QStringLiteral("usage: arbolex-cli thin --model M --age A --stocking N --height H\n"
                       "                       (--basal-area G | --dbh D)\n"
                       "                       (--residual-ba X | --residual-stocking X |\n"
                       "                        --residual-volume X) [--format tsv|csv|json]\n"
                       "                       [--data-dir DIR]\n"
                       "\n"
                       "Thins the stand along the model's thinning response (models without\n"
                       "one fail). Prints \"# site_index\", \"# model\", then one line after the\n"
                       "header basal_area (m2/ha), stocking (stems/ha), volume (m3/ha to 7 cm\n"
                       "top); in JSON site_index, model and residual.\n"
                       "\n") +
            standOptionsHelp() +
            QStringLiteral("  --residual-ba X        basal area left, m2/ha; the stocking follows\n"
                           "  --residual-stocking X  stems left per ha; the basal area follows\n"
                           "  --residual-volume X    volume left, m3/ha; basal area and stocking\n"
                           "                         follow by Newton's method\n") +
            formatOptionHelp(),
        &runThin};
}

} // namespace arbolex::cli
