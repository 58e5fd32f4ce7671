// arbolex-cli project: a stand grown from its age to a target age, as the
// grow command does it (site index, transition, start moved to the nearest
// whole year, projection), printed as a table.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/standinput.hpp"
#include "rotation/standmath.hpp"

#include <vector>

namespace arbolex::cli {

namespace {
/// Mean DBH of a projected state, cm.
float diameter(const engine::StandState &s) {
    float basalArea = s.basalArea;
    float stocking = s.stocking;
    return rotation::dbhFromBasalArea(basalArea, stocking);
}
} // namespace

namespace {

int runProject(CommandContext &context) {
    StandInput stand;
    float target = 0.0f;
    float step = 0.0f;
    Format format = Format::kTsv;
    try {
        std::vector<const char *> known = standOptionNames();
        known.insert(known.end(), {"to", "by", kFormatOption});
        const Options options(context.arguments, known);
        stand = readStand(options);
        target = options.single("to");
        step = options.positive("by");
        format = readFormat(options);
    } catch (const UsageError &error) {
        context.err << "arbolex-cli project: " << error.text << '\n';
        return kExitBadArguments;
    }
    RunRecord run(QStringLiteral("project"));
    run.inputs(standFields(stand));
    run.inputs({{QStringLiteral("to"), Value::number(target)},
                {QStringLiteral("by"), Value::number(step)}});
    run.setFormat(format);

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    const bool siteIndexOk = selectModelAndSiteIndex(grow, stand);
    float siteIndex = grow.siteIndex();
    grow.TM(siteIndex);
    float age = stand.age;
    float basalArea = stand.basalArea;
    float stocking = stand.stocking;
    float height = stand.height;
    // The target is rounded to a whole year with the start.
    grow.STATEYR(age, basalArea, stocking, height, target, siteIndex);
    std::vector<engine::StandState> states;
    const bool projected = grow.PROJ(age, basalArea, stocking, height, target, step, states);

    Table table({QStringLiteral("age"), QStringLiteral("top_height"), QStringLiteral("stocking"),
                 QStringLiteral("basal_area"), QStringLiteral("volume"), QStringLiteral("dbh")});
    for (const engine::StandState &s : states) {
        table.add({Value::number(s.age), Value::number(s.topHeight), Value::number(s.stocking),
                   Value::number(s.basalArea), Value::number(s.volume),
                   Value::number(diameter(s))});
    }
    writeOutput(context.out, fieldsAndTable(format, run, standPreamble(grow, siteIndexOk),
                                            QStringLiteral("states"), table));
    return siteIndexOk && projected && report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command projectCommand() {
    return {
        QStringLiteral("project"),
        QStringLiteral("grow a stand to a target age and print its states"),
        QStringLiteral("usage: arbolex-cli project --model M --age A --stocking N --height H\n"
                       "                          (--basal-area G | --dbh D) --to T --by S\n"
                       "                          [--format tsv|csv|json] [--data-dir DIR]\n"
                       "\n"
                       "Grows the stand from age A to age T by steps of S years: the site\n"
                       "index, the start moved to the nearest whole year, then one state per\n"
                       "step and a last shorter step landing on T (T below A grows backwards).\n"
                       "Prints \"# site_index\", \"# model\", then a table: age, top_height (m),\n"
                       "stocking (stems/ha), basal_area (m2/ha), volume (m3/ha to 7 cm top),\n"
                       "dbh (cm); in JSON the same as site_index, model and states.\n"
                       "\n") +
            standOptionsHelp() +
            QStringLiteral("  --to T             age to grow to, years (rounded to a whole year)\n"
                           "  --by S             step, years, above 0\n") +
            formatOptionHelp(),
        &runProject};
}

} // namespace arbolex::cli
