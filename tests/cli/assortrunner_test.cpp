// The runner's reach into the assortment windows.
#include "mocks/qtprinters.hpp"

#include "cli/runnerfixture.hpp"

namespace arbolex::testing {
namespace {

/// Runs a script given as one text, lines split at line ends.
class AssortRunnerTest : public RunnerTest {
protected:
    cli::ScriptRunner::Outcome run(const QString &script) {
        return RunnerTest::run(script.split(QLatin1Char('\n')));
    }
};

constexpr const char *kGrowAndThin =
    "model 0\n"
    "set txtFromA 15\nset txtFromN 2500\nset txtFromH 7\n"
    "set txtFromB 20\nset txtToA 30\nset txtByA 5\n"
    "press cmdGrow\n"
    "press cmdThin\nset frmThin.txtRemV 60\npress frmThin.cmdThin\n";

// The thinning window's reports as rows: outputs_test.py (RunnerTest).
TEST_F(AssortRunnerTest, CategoriesWindowAndUserReport) {
    ASSERT_TRUE(
        run(QLatin1String(kGrowAndThin) + QStringLiteral("press frmThin.cmdCancel\n"
                                                         "press mnuAssortUser\n"
                                                         "set frmAssortUser.txtName(1) Stakes\n"
                                                         "set frmAssortUser.txtSmall(1) 8\n"
                                                         "set frmAssortUser.txtBig(1) 12\n"
                                                         "press frmAssortUser.chkUse(1)\n"
                                                         "press frmAssortUser.chkUserCategories\n"
                                                         "press frmAssortUser.cmdOK\n"
                                                         "print frmAssortUser.chkUse(1)\n"
                                                         "select 3\n"
                                                         "press cmdAssort\n"
                                                         "print frmAssort"))
            .ok())
        << output.toStdString();
    const QStringList lines = printed();
    ASSERT_EQ(lines.size(), 5) << output.toStdString();
    EXPECT_EQ(lines[0], QStringLiteral("1"));
    EXPECT_EQ(lines[1], QStringLiteral("Assortment at age 25"));
    EXPECT_EQ(lines[2], QStringLiteral("Crop assortment"));
    EXPECT_EQ(lines[3], QStringLiteral("Category\tTop diameter (cm)\tm3/ha\t%"));
    EXPECT_TRUE(lines[4].startsWith(QStringLiteral("Stakes\t8 - 12\t")));
}

TEST_F(AssortRunnerTest, UnknownControlsStopTheScript) {
    for (const char *line :
         {"press frmThin.cmdAssort(3)", "press frmAssort.lblDesc", "set frmAssortUser.chkUse(1) 1",
          "set frmAssortUser.txtName(6) x", "print frmAssort.lblNothing"}) {
        const cli::ScriptRunner::Outcome stopped = run(QLatin1String(line));
        EXPECT_FALSE(stopped.ok()) << line;
        EXPECT_TRUE(stopped.error.startsWith(QStringLiteral("no "))) << line;
    }
}

} // namespace
} // namespace arbolex::testing
