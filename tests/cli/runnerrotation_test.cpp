// A whole rotation scripted as a new user would write it: grow, thin, grow
// on, fell, read the summary and value the cash flow.
#include "cli/runnerfixture.hpp"
#include "work/worktexts.hpp"

#include "economics/npvmessages.hpp"
#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"

namespace arbolex::testing {
namespace {

const QStringList kRotation = {
    QStringLiteral("model 0"),
    QStringLiteral("set txtFromA 15"),
    QStringLiteral("set txtFromN 2500"),
    QStringLiteral("set txtFromH 9"),
    QStringLiteral("set txtFromB 22"),
    QStringLiteral("set txtNetArea 10"),
    QStringLiteral("set txtToA 30"),
    QStringLiteral("set txtByA 5"),
    QStringLiteral("press cmdGrow"),
    QStringLiteral("press cmdThin"),
    QStringLiteral("set frmThin.txtRemV 50"),
    QStringLiteral("press frmThin.cmdThin"),
    QStringLiteral("press frmThin.cmdAccept"),
    QStringLiteral("set txtToA 60"),
    QStringLiteral("press cmdGrow"),
    QStringLiteral("answer yes"),
    QStringLiteral("press cmdFinalCut"),
    QStringLiteral("press cmdNPV"),
};

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

TEST_F(RunnerRotationTest, NetPresentValueAtTwoRatesAndWithAFirstYearCost) {
    const QStringList shown = after(
        {QStringLiteral("press frmNPV.cmdNPV"), QStringLiteral("print frmNPV.txtNPV"),
         QStringLiteral("set frmNPV.txtInterestRate 0"), QStringLiteral("press frmNPV.cmdNPV"),
         QStringLiteral("print frmNPV.txtNPV"), QStringLiteral("set frmNPV.NPV_Grid(1,2) 1000"),
         QStringLiteral("press frmNPV.cmdNPV"), QStringLiteral("print frmNPV.txtNPV")});
    ASSERT_EQ(shown.size(), 3) << output.toStdString();
    const work::CashFlow &flow = session.work().cashFlow();
    // At 0 % the net present value is the sum of the timber revenues.
    double revenue = 0.0;
    for (int i = 0; i < flow.years(); ++i) {
        revenue += flow.matrix(work::kCfTimberRevenue, i);
    }
    EXPECT_EQ(shown[1], shell::formatNumber(revenue, u"#0"));
    EXPECT_EQ(shell::val(shown[1]) - shell::val(shown[2]), 1000.0);
    EXPECT_LT(shell::val(shown[0]), shell::val(shown[1])) << "discounting at 5 % lowers it";
}

TEST_F(RunnerRotationTest, SummaryGridAndClipboardPrintAsTabSeparatedText) {
    const QStringList shown = after(
        {QStringLiteral("press cmdSummary"), QStringLiteral("print flxSummary"),
         QStringLiteral("press frmNPV.CmdCopyToClipboard"), QStringLiteral("print clipboard")});
    ASSERT_GE(shown.size(), 8);
    EXPECT_TRUE(shown[0].startsWith(QStringLiteral("Event\tAge\tTop Ht\t")));
    EXPECT_TRUE(shown[3].startsWith(QStringLiteral("Final cut\t60\t")));
    EXPECT_TRUE(shown.contains(QStringLiteral("MSG\tNet Present Value\t") +
                               economics::text::copiedToClipboard() + QStringLiteral("\t64")));
    EXPECT_TRUE(shown.contains(work::text::cashFlowHeaders().join(u'\t')));
}

TEST_F(RunnerRotationTest, ASwitchedOffButtonCannotBePressed) {
    ASSERT_FALSE(run(kRotation + QStringList{QStringLiteral("press cmdGrow")}).ok());
    EXPECT_EQ(outcome.line, kRotation.size() + 1);
    EXPECT_EQ(outcome.error, QStringLiteral("'cmdGrow' is switched off"));
}

TEST_F(RunnerRotationTest, DeletedRowsLetTheStandGrowAgain) {
    const QStringList shown =
        after({QStringLiteral("select 5 12"), QStringLiteral("answer yes"),
               QStringLiteral("press cmdDeleteRows"), QStringLiteral("set txtToA 40"),
               QStringLiteral("press cmdGrow"), QStringLiteral("print flxMain")});
    ASSERT_EQ(shown.size(), 1 + 6) << output.toStdString(); // header, 15 to 40
    EXPECT_TRUE(shown.last().startsWith(QStringLiteral("G yr\t40\t")));
}

} // namespace
} // namespace arbolex::testing
