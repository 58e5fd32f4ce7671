// The charts beside the table follow the table, and the report menu writes
// the report or says why it could not.
#include "ui/guifixture.hpp"

#include "charts/reportmessages.hpp"
#include "shell/testfiles.hpp"
#include "ui/chartpane.hpp"
#include "ui/chartpanel.hpp"
#include "ui/reportmenu.hpp"

#include <QCoreApplication>

namespace arbolex::testing {
namespace {

using ui::ChartPanel;

class ChartPaneTest : public MainWindowGuiTest {
protected:
    ChartPanel &panel() { return *window.chartPane()->panel(); }

    void growTo(const QString &to) {
        logic.typeText(MainControl::txtFromA, QStringLiteral("15"));
        logic.typeText(MainControl::txtFromN, QStringLiteral("2500"));
        logic.typeText(MainControl::txtFromH, QStringLiteral("7"));
        logic.typeText(MainControl::txtFromB, QStringLiteral("20"));
        logic.typeText(MainControl::txtToA, to);
        logic.typeText(MainControl::txtByA, QStringLiteral("5"));
        logic.cmdGrow_Click();
        QCoreApplication::processEvents(); // the charts are drawn once the command is done
    }
};

TEST_F(ChartPaneTest, ChartsFollowTheTableAndWaitWhileHidden) {
    EXPECT_TRUE(panel().data(ChartPanel::kStand).empty());
    growTo(QStringLiteral("30"));
    EXPECT_EQ(panel().data(ChartPanel::kStand).series.front().points.back().x, 30.0);
    EXPECT_TRUE(panel().data(ChartPanel::kCashFlow).empty()) << "no final cut yet";

    // Hidden, the pane does not draw; shown again, it catches up.
    window.chartPane()->toggleViewAction()->setChecked(false);
    logic.typeText(MainControl::txtToA, QStringLiteral("40"));
    logic.cmdGrow_Click();
    QCoreApplication::processEvents();
    EXPECT_EQ(panel().data(ChartPanel::kStand).series.front().points.back().x, 30.0);
    window.show();
    window.chartPane()->toggleViewAction()->setChecked(true);
    QCoreApplication::processEvents();
    EXPECT_EQ(panel().data(ChartPanel::kStand).series.front().points.back().x, 40.0);

    logic.cmdClear_Click();
    QCoreApplication::processEvents();
    EXPECT_TRUE(panel().data(ChartPanel::kStand).empty());
}

TEST_F(ChartPaneTest, ReportThatCannotBeWrittenIsToldAndLogged) {
    growTo(QStringLiteral("30"));
    const QString nowhere = dir.filePath(QStringLiteral("no-such-folder/report.pdf"));
    EXPECT_FALSE(window.reportMenu()->exportReport(nowhere));
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, charts::text::writeFailed(nowhere));
    EXPECT_TRUE(readBytes(log.path()).contains("in frmMain.mnuExportReport_Click()"));

    EXPECT_TRUE(window.reportMenu()->exportReport(dir.filePath(QStringLiteral("report.pdf"))));
    EXPECT_EQ(interactive.messages.size(), 1);
}

} // namespace
} // namespace arbolex::testing
