// The grow command and the projection table: rows and their cells, the
// increments, continuing a projection, the change check, clearing and the
// yield class.
#include "mainwindowfixture.hpp"
#include "work/worktexts.hpp"

#include "rotation/yieldclass.hpp"
#include "shell/vbformat.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

using namespace workflow;
using namespace work;

TEST_F(MainWindowTest, GrowAppendsOneGrowthRowPerStepWithItsIncrements) {
    typeStand();
    logic.cmdGrow_Click();
    ASSERT_TRUE(interactive.messages.isEmpty()) << interactive.messages[0].text.toStdString();
    const ProjectionTable &t = logic.table();
    ASSERT_EQ(t.rowCount(), 9); // header + ages 15, 20, …, 50
    for (int r = 1; r < t.rowCount(); ++r) {
        const TableRow &row = t.row(r);
        EXPECT_TRUE(row.isGrowth());
        EXPECT_EQ(row.label, work::text::rowLabelGrowth());
        EXPECT_EQ(cell(r, kColAge), QString::number(10 + 5 * r));
        EXPECT_EQ(row.cells.size(), kColumnCount);
        EXPECT_TRUE(cell(r, kColThinStocking).isEmpty());
    }
    // The start row shows the typed stand in its formats.
    EXPECT_EQ(cell(1, kColTopHeight), QStringLiteral("7.0"));
    EXPECT_EQ(cell(1, kColStocking), QStringLiteral("2500"));
    EXPECT_EQ(cell(1, kColDbh), QStringLiteral("10.1"));
    EXPECT_EQ(cell(1, kColBasalArea), QStringLiteral("20.0"));
    EXPECT_EQ(view.text(MainControl::lblSI), QStringLiteral("16.0"));
    // Volume per tree uses the rounded stocking.
    const RowRecord &last = t.row(8).record;
    EXPECT_EQ(cell(8, kColVolumePerTree),
              shell::formatNumber(last.volume / std::nearbyint(last.stocking), u"#0.000"));
    // Without thinnings the total production is the standing crop.
    EXPECT_EQ(cell(8, kColTotVolumePerHa), cell(8, kColVolumePerHa));
    // A thinned model's fields follow the last row, ready to thin or grow on.
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("50"));
    EXPECT_EQ(view.text(MainControl::txtFromB), cell(8, kColBasalArea));
    EXPECT_EQ(view.text(MainControl::txtFromD), cell(8, kColDbh));
    EXPECT_FALSE(view.isEnabled(MainControl::cmdClear));
    EXPECT_EQ(view.topRow(), 8);

    // The increments follow the rounded volumes.
    EXPECT_TRUE(cell(1, kColCai).isEmpty()) << "the first row has no increment";
    for (int r = 2; r < t.rowCount(); ++r) {
        const double v = std::nearbyint(t.row(r).record.volume);
        const double before = std::nearbyint(t.row(r - 1).record.volume);
        EXPECT_DOUBLE_EQ(t.row(r).numbers[kNumCai], (v - before) / 5.0) << r;
        EXPECT_DOUBLE_EQ(t.row(r).numbers[kNumMai],
                         double{t.row(r).record.volume} / t.row(r).record.age);
        EXPECT_EQ(cell(r, kColMai), shell::formatNumber(t.row(r).numbers[kNumMai], u"#"));
    }
}

TEST_F(MainWindowTest, ContinuingFromTheLastRowMatchesOneLongProjection) {
    typeStand(QStringLiteral("50"), QStringLiteral("5"));
    logic.cmdGrow_Click();
    std::vector<RowRecord> once;
    for (int r = 1; r < logic.table().rowCount(); ++r) {
        once.push_back(logic.table().row(r).record);
    }
    logic.cmdClear_Click();
    typeStand(QStringLiteral("30"), QStringLiteral("5"));
    logic.cmdGrow_Click();
    type(MainControl::txtToA, QStringLiteral("50"));
    logic.cmdGrow_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    ASSERT_EQ(logic.table().rowCount(), 9) << "age 30 is not repeated";
    for (int r = 1; r < logic.table().rowCount(); ++r) {
        const RowRecord &rec = logic.table().row(r).record;
        EXPECT_EQ(rec.age, once[static_cast<std::size_t>(r - 1)].age);
        EXPECT_NEAR(rec.basalArea, once[static_cast<std::size_t>(r - 1)].basalArea, 1e-4);
        EXPECT_NEAR(rec.stocking, once[static_cast<std::size_t>(r - 1)].stocking, 1e-2);
    }
}

TEST_F(MainWindowTest, OnlyAThinnedModelRefusesAChangedStart) {
    typeStand();
    logic.cmdGrow_Click();
    type(MainControl::txtFromA, QStringLiteral("20"));
    logic.cmdGrow_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, workflow::text::changesNotAllowed());
    EXPECT_EQ(interactive.messages[0].style, 64);
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("50")) << "restored from the row";
    EXPECT_EQ(logic.table().rowCount(), 9);

    // An un-thinned model may restart anywhere.
    logic.cmdClear_Click();
    logic.mnuModel_Click(1);
    typeStand();
    logic.cmdGrow_Click();
    typeStand(QStringLiteral("25"), QStringLiteral("5"));
    logic.cmdGrow_Click();
    EXPECT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(logic.table().rowCount(), 12);
    EXPECT_TRUE(view.isEnabled(MainControl::cmdFinalCut));
    EXPECT_FALSE(view.isEnabled(MainControl::cmdThin));
}

TEST_F(MainWindowTest, UseRowCopiesItsCellsIntoTheFields) {
    logic.UseFlxRow();
    ASSERT_EQ(interactive.messages.size(), 1) << "no row to use";
    EXPECT_EQ(interactive.messages[0].text, workflow::text::transferFailed());
    interactive.messages.clear();

    typeStand();
    logic.cmdGrow_Click();
    logic.select(3, 3);
    logic.UseFlxRow();
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("25"));
    EXPECT_EQ(view.text(MainControl::txtFromH), cell(3, kColTopHeight));
    EXPECT_EQ(view.text(MainControl::txtFromN), cell(3, kColStocking));
    EXPECT_EQ(view.text(MainControl::txtFromB), cell(3, kColBasalArea));
}

TEST_F(MainWindowTest, ClearAndClearAllShowTheirHeaderLayouts) {
    typeStand();
    logic.cmdGrow_Click();
    logic.ClearAll();
    EXPECT_TRUE(logic.table().empty());
    // Without a valued row the money column goes.
    QStringList header = logic.table().visibleGrid().front();
    EXPECT_EQ(header.size(), kColumnCount - 1);
    EXPECT_FALSE(header.contains(QStringLiteral(" € / ha")));
    EXPECT_TRUE(view.isEnabled(MainControl::cmdClear));

    logic.cmdClear_Click();
    header = logic.table().visibleGrid().front();
    ASSERT_EQ(header.size(), kColumnCount);
    EXPECT_EQ(header[13], QStringLiteral(" € / ha"));
}

TEST(YieldClassTest, CulminationAndEvenClasses) {
    using rotation::yieldClass;
    EXPECT_EQ(yieldClass({}), 0);
    EXPECT_EQ(yieldClass({5, 8, 11, 12.9}), 0) << "still rising";
    EXPECT_EQ(yieldClass({5, 13, 12}), 14);
    EXPECT_EQ(yieldClass({5, 14, 13.6}), 14);
    EXPECT_EQ(yieldClass({5, 12.6, 12.6}), 14) << "equal counts as culminated; 12.6 rounds to 13";
    EXPECT_EQ(yieldClass({9, 16.4, 15}), 16);
}

TEST_F(MainWindowTest, YieldClassShowsOnceTheMaiCulminates) {
    // 11 m at 15 years: site index 23, MAI peaks at 23.45 m³/ha/yr at 45.
    typeStand(QStringLiteral("40"), QStringLiteral("5"));
    type(MainControl::txtFromH, QStringLiteral("11"));
    logic.cmdGrow_Click();
    EXPECT_TRUE(view.text(MainControl::lblYC).isEmpty());
    EXPECT_EQ(view.hint(MainControl::lblYC), workflow::text::yieldClassInsufficient());
    type(MainControl::txtToA, QStringLiteral("60"));
    logic.cmdGrow_Click();
    EXPECT_EQ(work.yieldClass(), 24);
    EXPECT_EQ(view.text(MainControl::lblYC), QStringLiteral("24"));
}

} // namespace
} // namespace arbolex::testing
