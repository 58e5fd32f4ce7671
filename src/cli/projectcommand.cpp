// arbolex-cli project: a stand grown from its age to a target age, as the
// grow command does it (site index, transition, start moved to the nearest
// whole year, projection), printed as a table.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/standinput.hpp"
#include "workflow/standmath.hpp"

#include <vector>

namespace arbolex::cli {

namespace {
/// Mean DBH of a projected state, cm.
float diameter(const engine::StandState &s) {
    float basalArea = s.basalArea;
    float stocking = s.stocking;
    return workflow::dbhFromBasalArea(basalArea, stocking);
}
} // namespace

namespace {

int runProject(CommandContext &context) {
    StandInput stand;
    float target = 0.0f;
    float step = 0.0f;
    try {
        std::vector<const char *> known = standOptionNames();
        known.insert(known.end(), {"to", "by"});
        const Options options(context.arguments, known);
        stand = readStand(options);
        target = options.single("to");
        step = options.positive("by");
    } catch (const UsageError &error) {
        context.err << "arbolex-cli project: " << error.text << '\n';
        return kExitBadArguments;
    }

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

    writePreamble(context.out, grow, siteIndexOk);
    context.out << "age\ttop_height\tstocking\tbasal_area\tvolume\tdbh\n";
    for (const engine::StandState &s : states) {
        context.out << formatNumber(s.age) << '\t' << formatNumber(s.topHeight) << '\t'
                    << formatNumber(s.stocking) << '\t' << formatNumber(s.basalArea) << '\t'
                    << formatNumber(s.volume) << '\t' << formatNumber(diameter(s)) << '\n';
    }
    return siteIndexOk && projected && report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command projectCommand() {
    return {
        QStringLiteral("project"),
        QStringLiteral("grow a stand to a target age and print its states"),
        QStringLiteral("usage: arbolex-cli project --model M --age A --stocking N --height H\n"
                       "                          (--basal-area G | --dbh D) --to T --by S\n"
                       "                          [--data-dir DIR]\n"
                       "\n"
                       "Grows the stand from age A to age T by steps of S years: the site\n"
                       "index, the start moved to the nearest whole year, then one state per\n"
                       "step and a last shorter step landing on T (T below A grows backwards).\n"
                       "Prints \"# site_index\", \"# model\", then a tab-separated table:\n"
                       "age, top_height (m), stocking (stems/ha), basal_area (m2/ha),\n"
                       "volume (m3/ha to 7 cm top), dbh (cm).\n"
                       "\n") +
            standOptionsHelp() +
            QStringLiteral("  --to T             age to grow to, years (rounded to a whole year)\n"
                           "  --by S             step, years, above 0\n"),
        &runProject};
}

} // namespace arbolex::cli
