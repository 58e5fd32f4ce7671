// arbolex-cli grow: type a stand into the main window, press Grow, print the
// table as the grid shows it.
#include "cli/command.hpp"
#include "cli/headlesssession.hpp"
#include "cli/options.hpp"
#include "shell/vbformat.hpp"

namespace arbolex::cli {

namespace {

using workflow::MainControl;

QString csvCell(QString cell) {
    if (cell.contains(QLatin1Char(',')) || cell.contains(QLatin1Char('"'))) {
        cell.replace(QLatin1Char('"'), QStringLiteral("\"\""));
        return QLatin1Char('"') + cell + QLatin1Char('"');
    }
    return cell;
}

QString jsonString(QString s) {
    s.replace(QLatin1Char('\\'), QStringLiteral("\\\\"))
        .replace(QLatin1Char('"'), QStringLiteral("\\\""));
    return QLatin1Char('"') + s + QLatin1Char('"');
}

void printGrid(const std::vector<QStringList> &grid, const QString &format, QTextStream &out) {
    if (format == QLatin1String("json")) {
        auto array = [](const QStringList &cells) {
            QStringList quoted;
            for (const QString &c : cells) {
                quoted << jsonString(c);
            }
            return QLatin1Char('[') + quoted.join(QStringLiteral(", ")) + QLatin1Char(']');
        };
        out << "{\n  \"columns\": " << array(grid.front()) << ",\n  \"rows\": [";
        for (std::size_t r = 1; r < grid.size(); ++r) {
            out << (r == 1 ? "\n    " : ",\n    ") << array(grid[r]);
        }
        out << "\n  ]\n}\n";
        return;
    }
    const QChar separator = format == QLatin1String("csv") ? QLatin1Char(',') : QLatin1Char('\t');
    for (const QStringList &row : grid) {
        QStringList cells;
        for (const QString &c : row) {
            cells << (separator == QLatin1Char(',') ? csvCell(c) : c);
        }
        out << cells.join(separator) << '\n';
    }
}

int grow(CommandContext &context) {
    QString format = QStringLiteral("tsv");
    QStringList arguments = context.arguments;
    const qsizetype at = arguments.indexOf(QStringLiteral("--format"));
    if (at >= 0) {
        format = arguments.value(at + 1);
        arguments.remove(at, std::min<qsizetype>(2, arguments.size() - at));
        if (format != QLatin1String("tsv") && format != QLatin1String("csv") &&
            format != QLatin1String("json")) {
            context.err << "arbolex-cli grow: --format takes tsv, csv or json\n";
            return kExitBadArguments;
        }
    }
    try {
        const Options options(
            arguments, {"model", "age", "stocking", "height", "basal-area", "dbh", "to", "by"});
        const int model = options.wholeNumber("model", 0, 21);
        const int diameterGiven = options.oneOf({"basal-area", "dbh"});
        // Messages of the window go to stderr, the table to stdout.
        HeadlessSession session(context.dataFolder, context.err);
        workflow::MainWindowLogic &main = session.main();
        main.mnuModel_Click(model);
        auto type = [&](MainControl c, const char *option) {
            main.typeText(c, shell::generalNumber(options.number(option)));
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
        main.cmdGrow_Click();
        context.err.flush();
        if (main.table().empty()) {
            return kExitBadArguments; // the window refused the stand; stderr says why
        }
        printGrid(main.table().visibleGrid(), format, context.out);
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
                "projection table as the grid shows it, header row first. The window's checks\n"
                "apply: a refused stand prints its message on stderr and exits with 2; a\n"
                "projection that failed part-way prints the rows it made and exits with 1.\n"),
            &grow};
}

} // namespace arbolex::cli
