// arbolex-cli run: the main window's load, a script of user actions, the unload.
#include "cli/command.hpp"
#include "cli/scriptrunner.hpp"

namespace arbolex::cli {

namespace {

int runScript(CommandContext &context) {
    QStringList words;
    for (qsizetype i = 0; i < context.arguments.size(); ++i) {
        if (context.arguments.at(i) == QLatin1String("--data-dir")) {
            ++i; // its value was taken for the data folder
            continue;
        }
        words << context.arguments.at(i);
    }
    if (words.size() != 1 || words.first().startsWith(QLatin1String("--"))) {
        context.err << "arbolex-cli run: give exactly one script file\n";
        return kExitBadArguments;
    }
    return runScriptFile(words.first(), context.dataFolder, context.out, context.err);
}

} // namespace

Command runCommand() {
    return {
        QStringLiteral("run"), QStringLiteral("run a script of user actions without a screen"),
        QStringLiteral(
            "usage: arbolex-cli run SCRIPT [--data-dir DIR]\n"
            "\n"
            "Performs the main window's load, then the script's lines in order, then the\n"
            "unload (which saves the start-up file and the price lists in the data folder).\n"
            "One command per line; '#' starts a comment:\n"
            "  model N                choose model menu entry N\n"
            "  set CONTROL TEXT       type TEXT into a field as a user would, then leave it\n"
            "  press CONTROL          press a button (cmdGrow, cmdThin, cmdClear, cmdClearAll,\n"
            "                         cmdUseRow, frmThin.cmdThin, frmThin.cmdAccept, …)\n"
            "  select ROW [ENDROW]    set the current row and the end of the selection\n"
            "  answer yes|no          the answer to the next question\n"
            "  print flxMain|CONTROL  the grid, header row first, each row's label first\n"
            "                         (tab-separated), or a control's text\n"
            "Controls of the thinning window are named frmThin.NAME.\n"
            "Message boxes print MSG<TAB>title<TAB>text<TAB>style, questions\n"
            "ASK<TAB>title<TAB>text<TAB>answer (CR and LF written as \\r and \\n).\n"
            "Exit status: 0 at the end of the script, 2 for an error of the script\n"
            "(stderr names the line), e.g. a question with no queued answer.\n"),
        &runScript};
}

} // namespace arbolex::cli
