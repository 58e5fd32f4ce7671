// A whole rotation scripted as a new user would write it: grow, thin, grow
// on, fell and value the cash flow.
#include "cli/runnerfixture.hpp"
#include "work/worktexts.hpp"

#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "shell/vbtext.hpp"

namespace arbolex::testing {
namespace {

const QStringList kRotation =
    QStringLiteral("model 0\nset txtFromA 15\nset txtFromN 2500\nset txtFromH 9\nset txtFromB 22\n"
                   "set txtNetArea 10\nset txtToA 30\nset txtByA 5\npress cmdGrow\n"
                   "press cmdThin\nset frmThin.txtRemV 50\npress frmThin.cmdThin\n"
                   "press frmThin.cmdAccept\nset txtToA 60\npress cmdGrow\nanswer yes\n"
                   "press cmdFinalCut\npress cmdNPV")
        .split(QLatin1Char('\n'));

class RunnerRotationTest : public RunnerTest {
protected:
    RunnerRotationTest() {
        workflow::MainWindowLogic &main = session.main();
        prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_DATA_SOURCE), main.prices().data(),
                                   main.errorLog());
        main.prices().selectPriceSet(prices::kCurrentPrices);
    }

    /// What the script printed after the rotation, without its question line.
    QStringList after(const QStringList &lines) {
        const cli::ScriptRunner::Outcome done = run(kRotation + lines);
        EXPECT_TRUE(done.ok()) << done.line << ": " << done.error.toStdString();
        QStringList shown = printed();
        shown.removeIf([](const QString &l) { return l.startsWith(QStringLiteral("ASK\t")); });
        return shown;
    }
};

// What the windows do with these is tested with the windows; here, that a
// script reaches the cash flow's grid, the clipboard, the selection and a
// switched-off button as a user would.
TEST_F(RunnerRotationTest, ScriptReachesTheCashFlowGridTheClipboardAndTheSelection) {
    const QStringList shown = after(
        {QStringLiteral("set frmNPV.txtInterestRate 0"), QStringLiteral("press frmNPV.cmdNPV"),
         QStringLiteral("print frmNPV.txtNPV"), QStringLiteral("set frmNPV.NPV_Grid(1,2) 1000"),
         QStringLiteral("press frmNPV.cmdNPV"), QStringLiteral("print frmNPV.txtNPV"),
         QStringLiteral("press frmNPV.CmdCopyToClipboard"), QStringLiteral("print clipboard")});
    ASSERT_GE(shown.size(), 4) << output.toStdString();
    EXPECT_EQ(shell::val(shown[0]) - shell::val(shown[1]), 1000.0) << "the cost of the first year";
    EXPECT_TRUE(shown.contains(work::text::cashFlowHeaders().join(u'\t')));

    EXPECT_EQ(runner.runLine(QStringLiteral("press cmdGrow")),
              QStringLiteral("'cmdGrow' is switched off"));
    for (const char *line :
         {"select 5 12", "answer yes", "press cmdDeleteRows", "set txtToA 40", "press cmdGrow"}) {
        EXPECT_EQ(runner.runLine(QLatin1String(line)), QString()) << line;
    }
    const work::ProjectionTable &table = session.main().table();
    ASSERT_EQ(table.lastRow(), 6) << "15 to 40";
    EXPECT_EQ(table.row(6).cells.value(work::kColAge), QStringLiteral("40"));
}

} // namespace
} // namespace arbolex::testing
