// The runner's reach into the assortment windows.
#include "mocks/qtprinters.hpp"

#include "cli/runnerfixture.hpp"

namespace arbolex::testing {
namespace {

using AssortRunnerTest = RunnerTest;

// The thinning window's reports as rows: outputs_test.py (RunnerTest).
TEST_F(AssortRunnerTest, CategoriesWindowAndUserReport) {
    ASSERT_TRUE(
        runScript(QLatin1String(kYoungStand) +
                  QStringLiteral("set txtToA 30\nset txtByA 5\npress cmdGrow\npress cmdThin\n"
                                 "set frmThin.txtRemV 60\npress frmThin.cmdThin\n"
                                 "press frmThin.cmdCancel\npress mnuAssortUser\n"
                                 "set frmAssortUser.txtName(1) Stakes\n"
                                 "set frmAssortUser.txtSmall(1) 8\n"
                                 "set frmAssortUser.txtBig(1) 12\n"
                                 "press frmAssortUser.chkUse(1)\n"
                                 "press frmAssortUser.chkUserCategories\n"
                                 "press frmAssortUser.cmdOK\n"
                                 "print frmAssortUser.chkUse(1)\nselect 3\n"
                                 "press cmdAssort\nprint frmAssort"))
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
        const cli::ScriptRunner::Outcome stopped = runScript(QLatin1String(line));
        EXPECT_FALSE(stopped.ok()) << line;
        EXPECT_TRUE(stopped.error.startsWith(QStringLiteral("no "))) << line;
    }
}

} // namespace
} // namespace arbolex::testing
