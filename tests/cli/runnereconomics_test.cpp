// The economics window scripted: its controls wait for it, and it prints
// its figures.
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

// Optimising and applying through the runner: oneforestry_test.cpp.
TEST_F(RunnerEconomicsTest, ItsControlsWaitForTheWindowAndItsFiguresPrint) {
    // The stand grown to 45 and felled: ten lines, then the window's command.
    const cli::ScriptRunner::Outcome refused =
        runScript(QLatin1String(kYoungStand) +
                  QStringLiteral("set txtToA 45\nset txtByA 5\npress cmdGrow\nanswer yes\n"
                                 "press cmdFinalCut\npress frmEconomics.cmdCompute"));
    EXPECT_EQ(refused.line, 11);
    EXPECT_TRUE(refused.error.contains(QStringLiteral("not open")));

    for (const char *line : {"press cmdEconomics", "set frmEconomics.txtInterestRate 3",
                             "press frmEconomics.cmdCompute", "print frmEconomics"}) {
        EXPECT_EQ(runner.runLine(QLatin1String(line)), QString()) << line;
    }
    out.flush();
    EXPECT_TRUE(output.contains(QStringLiteral("lblRate\tAt 3.00 % a year")))
        << output.toStdString();
    EXPECT_TRUE(
        output.contains(QStringLiteral("lblRotation\t45 years (the final cut of the table)")));
}

} // namespace
} // namespace arbolex::testing
