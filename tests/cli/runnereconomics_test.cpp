// The economics window scripted: open it on a felled rotation, optimise,
// apply the best regime and print the figures.
#include "cli/runnerfixture.hpp"

#include "prices/pricedata.hpp"

namespace arbolex::testing {
namespace {

class RunnerEconomicsTest : public RunnerTest {
protected:
    RunnerEconomicsTest() {
        workflow::MainWindowLogic &main = session.main();
        prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_DATA_SOURCE), main.prices().data(),
                                   main.errorLog());
    }
};

const QStringList kFelledStand = {
    QStringLiteral("model 0"),           QStringLiteral("set txtFromA 15"),
    QStringLiteral("set txtFromN 2500"), QStringLiteral("set txtFromH 7"),
    QStringLiteral("set txtFromB 20"),   QStringLiteral("set txtToA 45"),
    QStringLiteral("set txtByA 5"),      QStringLiteral("press cmdGrow"),
    QStringLiteral("answer yes"),        QStringLiteral("press cmdFinalCut"),
};

TEST_F(RunnerEconomicsTest, OptimiseApplyTheBestAndPrintTheFigures) {
    const cli::ScriptRunner::Outcome done =
        run(kFelledStand + QStringList{QStringLiteral("press cmdEconomics"),
                                       QStringLiteral("set frmEconomics.txtInterestRate 3"),
                                       QStringLiteral("press frmEconomics.cmdCompute"),
                                       QStringLiteral("press frmEconomics.cmdOptimise"),
                                       QStringLiteral("print frmEconomics.grdRegimes"),
                                       QStringLiteral("answer yes"),
                                       QStringLiteral("press frmEconomics.cmdApply(1)"),
                                       QStringLiteral("print frmEconomics")});
    ASSERT_TRUE(done.ok()) << done.line << ": " << done.error.toStdString();
    const QStringList lines = printed();
    const auto best = std::find_if(lines.begin(), lines.end(), [](const QString &l) {
        return l.startsWith(QStringLiteral("1\t"));
    });
    ASSERT_NE(best, lines.end()) << output.toStdString();
    const QString rotation = best->split(QLatin1Char('\t')).value(5);
    // The table now ends with the best regime's final cut.
    const work::ProjectionTable &table = session.main().table();
    EXPECT_TRUE(session.work().felled());
    EXPECT_EQ(table.row(table.lastRow()).cells.value(work::kColAge), rotation);
    EXPECT_TRUE(lines.contains(QStringLiteral("lblRotation\t") + rotation +
                               QStringLiteral(" years (the final cut of the table)")))
        << output.toStdString();
    EXPECT_TRUE(output.contains(QStringLiteral("lblRate\tAt 3.00 % a year")));
}

TEST_F(RunnerEconomicsTest, ItsControlsWaitForTheWindow) {
    const cli::ScriptRunner::Outcome refused =
        run(kFelledStand + QStringList{QStringLiteral("press frmEconomics.cmdOptimise")});
    EXPECT_EQ(refused.line, kFelledStand.size() + 1);
    EXPECT_TRUE(refused.error.contains(QStringLiteral("not open")));
}

} // namespace
} // namespace arbolex::testing
