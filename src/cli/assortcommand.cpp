// arbolex-cli assort: how the stand's volume to 7 cm top divides into the
// fixed top-diameter classes, or into the categories of a category file.
#include "cli/categoryfile.hpp"
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/standinput.hpp"

#include <vector>

namespace arbolex::cli {

namespace {

int runAssort(CommandContext &context) {
    StandInput stand;
    std::vector<NamedCategory> named;
    try {
        std::vector<const char *> known = standOptionNames();
        known.push_back("categories");
        const Options options(context.arguments, known);
        stand = readStand(options);
        if (options.has("categories")) {
            named = readCategoryFile(options.text("categories"));
        }
    } catch (const UsageError &error) {
        context.err << "arbolex-cli assort: " << error.text << '\n';
        return kExitBadArguments;
    }

    StreamReport report(context.err, context.dataFolder);
    engine::Grow grow(&report);
    // The volume reads the site index, so it comes first.
    const bool siteIndexOk = selectModelAndSiteIndex(grow, stand);
    std::vector<engine::AssortmentCategory> categories;
    QStringList names;
    for (const NamedCategory &c : named) {
        categories.push_back(c.bounds);
        names << c.name;
    }
    if (names.isEmpty()) {
        names = {QStringLiteral("7-14"), QStringLiteral("14-20"), QStringLiteral(">20")};
    }
    engine::Assortment result;
    if (!siteIndexOk ||
        !grow.AsmtB(stand.basalArea, stand.stocking, stand.height, categories, result)) {
        return kExitEngineFailure;
    }
    context.out << "# volume_to_7cm\t" << formatNumber(result.volume) << '\n'
                << "class\tvolume\tpercent\n";
    for (std::size_t i = 0; i < result.count; ++i) {
        context.out << names[static_cast<qsizetype>(i)] << '\t'
                    << formatNumber(result.classVolume[i]) << '\t'
                    << formatNumber(result.percent(i)) << '\n';
    }
    return report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command assortCommand() {
    return {
        QStringLiteral("assort"),
        QStringLiteral("how the stand's volume divides into top-diameter classes"),
        QStringLiteral("usage: arbolex-cli assort --model M --age A --stocking N --height H\n"
                       "                         (--basal-area G | --dbh D) [--categories FILE]\n"
                       "                         [--data-dir DIR]\n"
                       "\n"
                       "Prints \"# volume_to_7cm\" (m3/ha), then a tab-separated line per class\n"
                       "after the header class, volume (m3/ha), percent (of the volume to 7 cm\n"
                       "top): the classes 7-14, 14-20 and >20 cm, or the categories of FILE.\n"
                       "The method is described in docs/assortments.md.\n"
                       "\n") +
            standOptionsHelp() +
            QStringLiteral(
                "  --categories FILE  categories in the format of UD_Assort.qdm (name,\n"
                "                     small end, big end, five times); those whose small\n"
                "                     end is 0 are left out\n"),
        &runAssort};
}

} // namespace arbolex::cli
