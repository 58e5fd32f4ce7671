// arbolex-cli grow: type a stand into the main window, press Grow, print the
// table as the grid shows it.
#include "cli/command.hpp"
#include "cli/gridoutput.hpp"
#include "cli/headlesssession.hpp"
#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/standinput.hpp"
#include "shell/vbformat.hpp"

namespace arbolex::cli {

namespace {

using workflow::MainControl;

/// The grid in the format asked for.
QByteArray gridOutput(Format format, const RunRecord &run, const work::ProjectionTable &table) {
    if (format == Format::kJson) {
        ResultDocument document(run);
        document.insert(QStringLiteral("columns"), QJsonArray::fromStringList(gridKeys(table)));
        document.insert(QStringLiteral("rows"), gridJson(table));
        return document.bytes();
    }
    TextOutput text(format);
    text.table(gridTable(table, false));
    return text.bytes();
}

int grow(CommandContext &context) {
    try {
        const Options options(context.arguments, {"model", "age", "stocking", "height",
                                                  "basal-area", "dbh", "to", "by", kFormatOption});
        const int model = options.wholeNumber("model", 0, 21);
        const int diameterGiven = options.oneOf({"basal-area", "dbh"});
        const Format format = readFormat(options);
        RunRecord run(QStringLiteral("grow"));
        run.input(QStringLiteral("model"), Value::whole(model));
        // Messages of the window go to stderr, the table to stdout.
        HeadlessSession session(context.dataFolder, context.err);
        workflow::MainWindowLogic &main = session.main();
        main.mnuModel_Click(model);
        auto type = [&](MainControl c, const char *option) {
            const double typed = options.number(option);
            run.input(inputKey(option), Value::exact(typed));
            main.typeText(c, shell::generalNumber(typed));
        };
        type(MainControl::txtFromA, "age");
        type(MainControl::txtFromN, "stocking");
        type(MainControl::txtFromH, "height");
        if (diameterGiven == 0) {
            type(MainControl::txtFromB, "basal-area");
        } else {
            type(MainControl::txtFromD, "dbh");
        }
        type(MainControl::txtToA, "to");
        type(MainControl::txtByA, "by");
        run.setFormat(format);
        main.cmdGrow_Click();
        context.err.flush();
        if (main.table().empty()) {
            return kExitBadArguments; // the window refused the stand; stderr says why
        }
        writeOutput(context.out, gridOutput(format, run, main.table()));
        return session.interactive().messagesShown() > 0 ? kExitEngineFailure : kExitSuccess;
    } catch (const UsageError &e) {
        context.err << "arbolex-cli grow: " << e.text << '\n';
        return kExitBadArguments;
    }
}

} // namespace

Command growCommand() {
    return {QStringLiteral("grow"),
            QStringLiteral("grow a stand as the main window does and print its table"),
            QStringLiteral(
                "usage: arbolex-cli grow --model M --age A --stocking N --height H\n"
                "                        (--basal-area G | --dbh D) --to T --by S\n"
                "                        [--format tsv|csv|json] [--data-dir DIR]\n"
                "\n"
                "Types the stand into the main window's fields, presses Grow and prints the\n"
                "projection table as the grid shows it, header row first (the marker of the\n"
                "rows the summary carries as an empty cell); in JSON one object per row with\n"
                "its label, in_summary and the figures by key. The window's checks\n"
                "apply: a refused stand prints its message on stderr and exits with 2; a\n"
                "projection that failed part-way prints the rows it made and exits with 1.\n"),
            &grow};
}

} // namespace arbolex::cli
