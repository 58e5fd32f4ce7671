// arbolex-cli assort: how the stand's volume to 7 cm top divides into the
// fixed top-diameter classes, or into the categories of a category file.
#include "cli/categoryfile.hpp"
#include "cli/command.hpp"
#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/standinput.hpp"

#include <vector>

namespace arbolex::cli {

namespace {

int runAssort(CommandContext &context) {
    StandInput stand;
    std::vector<NamedCategory> named;
    RunRecord run(QStringLiteral("assort"));
    Format format = Format::kTsv;
    try {
        std::vector<const char *> known = standOptionNames();
        known.insert(known.end(), {"categories", kFormatOption});
        const Options options(context.arguments, known);
        stand = readStand(options);
        run.inputs(standFields(stand));
        if (options.has("categories")) {
            const QString file = options.text("categories");
            named = readCategoryFile(file);
            run.input(QStringLiteral("categories"), Value::word(file));
            run.fileRead(file, file);
        }
        format = readFormat(options);
        run.setFormat(format);
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
    Table table({QStringLiteral("class"), QStringLiteral("volume"), QStringLiteral("percent")});
    for (std::size_t i = 0; i < result.count; ++i) {
        table.add({Value::word(names[static_cast<qsizetype>(i)]),
                   Value::number(result.classVolume[i]), Value::number(result.percent(i))});
    }
    writeOutput(context.out,
                fieldsAndTable(format, run,
                               {{QStringLiteral("volume_to_7cm"), Value::number(result.volume)}},
                               QStringLiteral("classes"), table));
    return report.reports() == 0 ? kExitSuccess : kExitEngineFailure;
}

} // namespace

Command assortCommand() {
    return {
        QStringLiteral("assort"),
        QStringLiteral("how the stand's volume divides into top-diameter classes"),
        QStringLiteral("usage: arbolex-cli assort --model M --age A --stocking N --height H\n"
                       "                         (--basal-area G | --dbh D) [--categories FILE]\n"
                       "                         [--format tsv|csv|json] [--data-dir DIR]\n"
                       "\n"
                       "Prints \"# volume_to_7cm\" (m3/ha), then a line per class after the\n"
                       "header class, volume (m3/ha), percent (of the volume to 7 cm top): the\n"
                       "classes 7-14, 14-20 and >20 cm, or the categories of FILE; in JSON\n"
                       "volume_to_7cm and classes.\n"
                       "The method is described in docs/assortments.md.\n"
                       "\n") +
            standOptionsHelp() +
            QStringLiteral(
                "  --categories FILE  categories in the format of UD_Assort.qdm (name,\n"
                "                     small end, big end, five times); those whose small\n"
                "                     end is 0 are left out\n") +
            formatOptionHelp(),
        &runAssort};
}

} // namespace arbolex::cli
