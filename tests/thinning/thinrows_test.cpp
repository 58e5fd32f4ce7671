// Accepting thinnings into the projection table, growing on from them,
// re-opening one, and the thinning loop.
#include "thinningfixture.hpp"

#include "prices/pricelookup.hpp"
#include "thinning/thinmessages.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

using namespace workflow;
using namespace work;

TEST_F(ThinningTest, AcceptWithNothingRemovedStoresNothing) {
    openThinning();
    const int rows = logic.table().rowCount();
    typeThin(ThinControl::txtRemB, QStringLiteral("0"));
    typeThin(ThinControl::txtRemN, QStringLiteral("0"));
    thin.cmdThin_Click();
    thin.cmdAccept_Click();
    EXPECT_EQ(logic.table().rowCount(), rows);
    EXPECT_FALSE(thinView.isShown());
    EXPECT_FALSE(work.thinned());
}

TEST_F(ThinningTest, AcceptedThinningRowShowsTheThinnedStandAndItsValue) {
    previewThinning();
    const thinning::ThinningWork w = thin.work();
    thin.cmdAccept_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());

    const TableRow &row = lastRow();
    EXPECT_TRUE(row.isThinning());
    EXPECT_EQ(row.label, QStringLiteral("T yr"));
    EXPECT_EQ(row.cells[kColAge], QStringLiteral("30"));
    EXPECT_EQ(row.record.basalArea, w.postBasalArea);
    EXPECT_EQ(row.record.removedBasalArea, w.preBasalArea - w.postBasalArea);
    EXPECT_EQ(row.record.removedVolume, std::fabs(w.preVolume - w.postVolume));
    EXPECT_EQ(row.cells[kColBasalArea], shell::formatNumber(w.postBasalArea, u"##0.0"));
    EXPECT_EQ(row.cells[kColThinVolumePerHa], QStringLiteral("60"));
    const double meanTree = row.record.removedVolume / std::nearbyint(row.record.removedStocking);
    const double price = prices::TrouveIndicePrix(meanTree, prices.data().current, interactive);
    EXPECT_EQ(row.cells[kColValuePerHa],
              shell::formatNumber(row.record.removedVolume * price, u"####0"));
    EXPECT_GT(work.timberRevenue().at(30), 0.0);
    // Total production is the stand before the thinning.
    EXPECT_EQ(row.cells[kColTotBasalArea], shell::formatNumber(w.preBasalArea, u"##0.0"));
    // The thinned stand is the new grow-from stand.
    EXPECT_EQ(view.text(MainControl::txtFromB), row.cells[kColBasalArea]);
    EXPECT_EQ(view.text(MainControl::txtFromN), row.cells[kColStocking]);
    EXPECT_TRUE(work.thinned());
    EXPECT_FALSE(thinView.isShown());
}

TEST_F(ThinningTest, GrowingOnContinuesFromTheThinnedStand) {
    previewThinning();
    thin.cmdAccept_Click();
    const int thinRow = logic.table().lastRow();
    const RowRecord thinned = lastRow().record;
    type(MainControl::txtToA, QStringLiteral("40"));
    logic.cmdGrow_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    ASSERT_EQ(logic.table().lastRow(), thinRow + 2) << "35 and 40 follow the thinning row";
    const TableRow &next = logic.table().row(thinRow + 1);
    EXPECT_EQ(next.record.age, 35.0f);
    // The increment counts the growth since the thinning, not the removal.
    EXPECT_DOUBLE_EQ(next.numbers[kNumCai],
                     (std::nearbyint(next.record.volume) - std::nearbyint(thinned.volume)) / 5.0);
    // The mean increment and total production count the removal.
    EXPECT_DOUBLE_EQ(next.numbers[kNumMai],
                     (next.record.volume + double{thinned.removedVolume}) / 35.0);
    // Projected from the exact thinned state.
    engine::Grow check = grow;
    std::vector<engine::StandState> states;
    check.PROJ(30, thinned.basalArea, thinned.stocking, thinned.topHeight, 35, 5, states);
    EXPECT_EQ(next.record.basalArea, states.back().basalArea);
}

TEST_F(ThinningTest, ReopeningAThinningShowsTheStandBeforeItAndOverwrites) {
    openThinning();
    const thinning::ThinningWork before = thin.work();
    typeThin(ThinControl::txtRemB, QStringLiteral("8"));
    thin.cmdThin_Click();
    thin.cmdAccept_Click();
    const int rows = logic.table().rowCount();

    logic.cmdThin_Click(); // on the thinning row, the last row
    ASSERT_EQ(interactive.questions.size(), 1) << "the loop is offered after a first thinning";
    EXPECT_EQ(interactive.questions[0].text, thinning::text::loopOffer());
    EXPECT_TRUE(thin.flags().editingExisting);
    EXPECT_FLOAT_EQ(thin.work().preBasalArea, before.preBasalArea);
    EXPECT_FLOAT_EQ(thin.work().preStocking, before.preStocking);
    EXPECT_EQ(thinView.text(ThinControl::txtRemB), QStringLiteral("8.00"));

    thin.resetFields();
    typeThin(ThinControl::txtRemB, QStringLiteral("12"));
    thin.cmdThin_Click();
    thin.cmdAccept_Click();
    EXPECT_EQ(logic.table().rowCount(), rows) << "overwritten, not added";
    EXPECT_FLOAT_EQ(lastRow().record.removedBasalArea, 12.0f);
    EXPECT_EQ(lastRow().cells[kColThinBasalArea], QStringLiteral("12.0"));
}

TEST_F(ThinningTest, LoopThinsTheSameVolumeAtTheFrequency) {
    openThinning(QStringLiteral("20"));
    typeThin(ThinControl::txtRemV, QStringLiteral("30"));
    thin.cmdThin_Click();
    thinView.setChecked(ThinControl::chkActivLoop, true);
    thin.chkActivLoop_Click();
    typeThin(ThinControl::txtThinFreq, QStringLiteral("5"));
    typeThin(ThinControl::txtThinUntil, QStringLiteral("50"));
    thin.cmdLoop_Click();
    ASSERT_TRUE(interactive.messages.isEmpty()) << interactive.messages[0].text.toStdString();

    // (50 − 20) / 5 = 6: seven passes accept thinnings at 20, 25, …, 50 and
    // leave the thinning at 55 previewed in the window.
    std::vector<float> thinnedAt;
    for (int r = 1; r < logic.table().rowCount(); ++r) {
        const TableRow &row = logic.table().row(r);
        if (row.isThinning()) {
            thinnedAt.push_back(row.record.age);
            EXPECT_EQ(row.cells[kColThinVolumePerHa], QStringLiteral("30")) << row.record.age;
        }
    }
    EXPECT_EQ(thinnedAt, (std::vector<float>{20, 25, 30, 35, 40, 45, 50}));
    EXPECT_EQ(lastRow().record.age, 55.0f);
    EXPECT_TRUE(lastRow().isGrowth());
    EXPECT_TRUE(thinView.isShown());
    EXPECT_TRUE(thin.work().previewed);
    EXPECT_EQ(thinView.text(ThinControl::txtRemV), QStringLiteral("30.00"));
    EXPECT_FALSE(thin.flags().loopUnderWay);
}

TEST_F(ThinningTest, LoopPassesRoundHalvesToEven) {
    for (const auto &[until, thinnings] : {std::pair{"30", 3}, std::pair{"34", 5}}) {
        logic.cmdClear_Click();
        openThinning(QStringLiteral("20"));
        typeThin(ThinControl::txtRemV, QStringLiteral("20"));
        thin.cmdThin_Click();
        typeThin(ThinControl::txtThinFreq, QStringLiteral("4"));
        typeThin(ThinControl::txtThinUntil, QLatin1String(until));
        thin.cmdLoop_Click();
        int count = 0;
        for (int r = 1; r < logic.table().rowCount(); ++r) {
            count += logic.table().row(r).isThinning() ? 1 : 0;
        }
        EXPECT_EQ(count, thinnings) << "thin until " << until; // 2.5 → 2, 3.5 → 4
    }
}

TEST_F(ThinningTest, LoopFromAnAgeBeyondEveryModelMakesNoPass) {
    openThinning(QStringLiteral("20"));
    typeThin(ThinControl::txtRemV, QStringLiteral("30"));
    thin.cmdThin_Click();
    typeThin(ThinControl::txtThinFreq, QStringLiteral("3"));
    typeThin(ThinControl::txtThinUntil, QStringLiteral("50"));
    const int rows = logic.table().rowCount();
    type(MainControl::txtFromA, QString(70, QLatin1Char('2'))); // beyond a long
    thin.cmdLoop_Click();
    EXPECT_EQ(logic.table().rowCount(), rows);
}

TEST_F(ThinningTest, LoopFieldsAreChecked) {
    openThinning();
    thin.cmdLoop_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, thinning::text::enterFrequency());
    EXPECT_EQ(thinView.focused(), ThinControl::txtThinFreq);
    typeThin(ThinControl::txtThinFreq, QStringLiteral("5"));
    thin.cmdLoop_Click();
    EXPECT_EQ(interactive.messages[1].text, thinning::text::enterThinUntil());
}

} // namespace
} // namespace arbolex::testing
