// arbolex-cli assort: how the stand's volume to 7 cm top divides into the
// fixed top-diameter classes, or into the categories of a category file.
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/standinput.hpp"
#include "economics/pricedata.hpp"
#include "shell/seqfile.hpp"

#include <vector>

namespace arbolex::cli {

namespace {

/// A category of the file: its name and bounds.
struct NamedCategory {
    QString name;
    engine::AssortmentCategory bounds;
};

/// Reads the categories of a file in the format of "UD_Assort.qdm" (name,
/// small end, big end, five times); a category whose small end is 0 is not
/// defined and is left out. Throws UsageError when the file cannot be read.
std::vector<NamedCategory> readCategories(const QString &path) {
    shell::SequentialReader in(path);
    if (in.openError().number != 0) {
        throw UsageError{QStringLiteral("cannot read the category file \"%1\": %2")
                             .arg(path, in.openError().description)};
    }
    std::vector<NamedCategory> categories;
    for (int i = 0; i < economics::kUserCategoryCount; ++i) {
        NamedCategory c;
        for (const shell::RuntimeError &e :
             {in.readString(c.name), in.readNumber(c.bounds.smallEnd),
              in.readNumber(c.bounds.bigEnd)}) {
            if (e.number != 0) {
                throw UsageError{QStringLiteral("category %1 of \"%2\": %3")
                                     .arg(QString::number(i + 1), path, e.description)};
            }
        }
        if (c.bounds.smallEnd != 0.0f) {
            categories.push_back(c);
        }
    }
    return categories;
}

int runAssort(CommandContext &context) {
    StandInput stand;
    std::vector<NamedCategory> named;
    try {
        std::vector<const char *> known = standOptionNames();
        known.push_back("categories");
        const Options options(context.arguments, known);
        stand = readStand(options);
        if (options.has("categories")) {
            named = readCategories(options.text("categories"));
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
