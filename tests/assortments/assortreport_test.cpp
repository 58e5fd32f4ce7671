// Assortment reports from the main window and the thinning window, and the
// assortment rows written when a thinning is accepted.
#include "assortfixture.hpp"

#include "assortments/assortmessages.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

using namespace workflow;
using namespace work;
namespace at = assortments::text;

double shown(const assortments::HeadlessAssortView &v, AssortControl c) {
    return shell::val(v.text(c));
}

/// The volumes of the three classes the report shows, added up.
double shownVolume(const assortments::HeadlessAssortView &v) {
    return shown(v, AssortControl::lblVol714) + shown(v, AssortControl::lblVol1420) +
           shown(v, AssortControl::lblVol20);
}

TEST_F(AssortTest, GrowthRowReportDividesItsVolume) {
    growTo(QStringLiteral("50"));
    logic.select(5, 5);
    logic.cmdAssort_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    ASSERT_TRUE(assortView.isShown());
    EXPECT_EQ(assortView.caption(), QStringLiteral("Assortment at age 35"));
    EXPECT_EQ(assort.session().pending, QStringLiteral("0"));
    EXPECT_NEAR(shownVolume(assortView), logic.table().row(5).record.volume, 0.02);
    EXPECT_NEAR(shown(assortView, AssortControl::lblPct714) +
                    shown(assortView, AssortControl::lblPct1420) +
                    shown(assortView, AssortControl::lblPct20),
                100.0, 0.15);

    // A growth row's report is not kept as a row.
    const int rows = logic.table().rowCount();
    assort.press(AssortControl::cmdAccept);
    EXPECT_FALSE(assortView.isShown());
    EXPECT_EQ(logic.table().rowCount(), rows);
}

struct MainFault {
    const char *name;
    int row, endRow;
    bool thinFirst;
    QString (*text)();
};

class MainAssortFaultTest : public AssortTest, public ::testing::WithParamInterface<MainFault> {};

TEST_P(MainAssortFaultTest, RefusesInOrder) {
    const MainFault &f = GetParam();
    if (f.thinFirst) {
        previewThinning();
        thin.cmdAccept_Click();
    } else {
        growTo(QStringLiteral("30"));
    }
    logic.select(f.row, f.endRow);
    logic.cmdAssort_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, f.text());
    EXPECT_FALSE(assortView.isShown());
}

INSTANTIATE_TEST_SUITE_P(
    Faults, MainAssortFaultTest,
    ::testing::Values(MainFault{"TwoRows", 2, 3, false, &at::singleGrowthRow},
                      MainFault{"NoRow", 0, 0, false, &at::notGrowthRow},
                      // Rows 1-4 are growth rows at 15-30; row 5 the thinning at 30.
                      MainFault{"ThinningRow", 5, 5, true, &at::useThinCommand},
                      MainFault{"GrowthRowOfTheThinning", 4, 4, true, &at::useThinCommand}),
    [](const auto &test) { return std::string(test.param.name); });

struct TitleCase {
    const char *name;
    int kind;
    const char *removeBasalArea;
    const char *removeStocking;
    const char *title;
};

class ThinAssortTitleTest : public AssortTest, public ::testing::WithParamInterface<TitleCase> {};

TEST_P(ThinAssortTitleTest, FollowsKindAndRack) {
    const TitleCase &c = GetParam();
    openThinning();
    // The stand at 30 has 54.8 m²/ha and 2074 stems: a fifth of each is a rack thinning.
    const float g = number(ThinControl::lblPreB);
    const float n = number(ThinControl::lblPreN);
    const bool rack = QLatin1String(c.removeBasalArea) == QLatin1String("rack");
    typeThin(ThinControl::txtRemB,
             rack ? QString::number(g / 5.0f, 'f', 4) : QLatin1String(c.removeBasalArea));
    typeThin(ThinControl::txtRemN,
             rack ? QString::number(n / 5.0f, 'f', 4) : QLatin1String(c.removeStocking));
    thin.cmdThin_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    thin.cmdAssort_Click(c.kind);
    ASSERT_TRUE(interactive.messages.isEmpty()) << interactive.messages[0].text.toStdString();
    EXPECT_EQ(assortView.text(AssortControl::lblDesc), QLatin1String(c.title));
    EXPECT_EQ(assort.session().reportKind, c.kind);
}

INSTANTIATE_TEST_SUITE_P(
    Titles, ThinAssortTitleTest,
    ::testing::Values(TitleCase{"PreThin", 0, "10", "600", "Pre-[Actual]-Thin Crop assortment"},
                      TitleCase{"Selective", 1, "10", "600", "Thinning assortment"},
                      TitleCase{"Rack", 1, "rack", "rack", "Rack-thin assortment"},
                      TitleCase{"PostSelective", 2, "10", "600", "Post-thin crop assortment"},
                      TitleCase{"PostRack", 2, "rack", "rack", "Post-rack thin crop assortment"}),
    [](const auto &test) { return std::string(test.param.name); });

TEST_F(AssortTest, RowsFollowTheRequestsInKindOrderEachOnce) {
    previewThinning();
    thin.cmdAssort_Click(2);
    assort.cmdOK_Click();
    thin.cmdAssort_Click(2);
    assort.cmdOK_Click();
    thin.cmdAssort_Click(0);
    assort.cmdAccept_Click();
    thin.cmdAssort_Click(1);
    assort.cmdCancel_Click(); // withdrawn
    thin.cmdAccept_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_EQ(labelsAfterThinning(),
              (QStringList{QStringLiteral("AC yr"), QStringLiteral("AP yr")}));
    const TableRow &crop = logic.table().row(logic.table().lastRow() - 1);
    EXPECT_TRUE(crop.isText());
    EXPECT_EQ(crop.cells[kColAge], QStringLiteral("30"));
    EXPECT_TRUE(crop.cells[kColTopHeight].startsWith(QStringLiteral("7-14(%) ")));
    EXPECT_TRUE(crop.cells[kColStocking].startsWith(QStringLiteral("7-14(m3/ha) ")));
    EXPECT_TRUE(crop.cells[kColVolumePerHa].startsWith(QStringLiteral(">20(m3/ha) ")));
    // The next grow continues from the thinned stand, and the report rows
    // take no part in increments or the yield class.
    const double maiBefore = logic.table().row(logic.table().lastRow() - 2).numbers[kNumMai];
    type(MainControl::txtToA, QStringLiteral("35"));
    logic.cmdGrow_Click();
    const TableRow &next = logic.table().row(logic.table().lastRow());
    EXPECT_TRUE(next.isGrowth());
    EXPECT_FALSE(next.cells[kColCai].isEmpty());
    EXPECT_GT(next.numbers[kNumMai], maiBefore);
    // The thinning window starts with no requests.
    logic.cmdThin_Click();
    EXPECT_TRUE(assort.session().pending.isEmpty());
}

TEST_F(AssortTest, ReopenedThinningReportsTheActualCropAfter) {
    previewThinning();
    thin.cmdAccept_Click();
    logic.cmdThin_Click(); // the thinning row is the last row: it opens again
    interactive.questions.clear();
    ASSERT_TRUE(thin.flags().editingExisting);
    thin.cmdAssort_Click(2);
    EXPECT_EQ(assortView.text(AssortControl::lblDesc),
              QStringLiteral("Post-[Actual]-Thin Crop assortment"));
    assort.cmdAccept_Click();
    thin.cmdAccept_Click();
    EXPECT_EQ(labelsAfterThinning(), QStringList{QStringLiteral("AP yr")});
}

TEST_F(AssortTest, RemovalRowAddsUpToTheRemovedVolume) {
    previewThinning(QStringLiteral("60"));
    thin.cmdAssort_Click(1);
    EXPECT_NEAR(shownVolume(assortView), 60.0, 0.02);
}

TEST_F(AssortTest, BackwardOrMissingThinningIsRefused) {
    openThinning();
    thin.cmdAssort_Click(1);
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, at::previewFirst());
    interactive.messages.clear();

    // A working state whose stand after holds more stems than before runs backwards.
    thinning::ThinningWork backward = thin.work();
    backward.previewed = true;
    backward.postBasalArea = backward.preBasalArea - 5.0f;
    backward.postStocking = backward.preStocking + 100.0f;
    backward.postVolume = backward.preVolume - 30.0f;
    for (const int kind : {1, 2}) {
        EXPECT_FALSE(assort.reportOnThinning(kind, backward, 30.0f, false));
    }
    ASSERT_EQ(interactive.messages.size(), 2);
    EXPECT_EQ(interactive.messages[1].text,
              QStringLiteral("BACKWARD THINNING has been detected.\r\nPlease transmit the "
                             "details of your operation to the support team."));
    EXPECT_FALSE(assortView.isShown());
    EXPECT_TRUE(assort.session().pending.isEmpty());
}

TEST_F(AssortTest, UserCategoriesReportAndDevelopment) {
    // Shipped categories: Pulpwood 7-14, Pallet 14-20, Sawlog 20+, Stakes 8-12, Large sawlog 30+.
    user.mnuAssortUser_Click();
    user.press(AssortUserControl::chkUse, 1);
    user.press(AssortUserControl::chkUse, 4);
    user.press(AssortUserControl::chkUserCategories, 0);
    user.cmdOK_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_TRUE(assort.session().userCategories);

    previewThinning();
    thin.cmdAssort_Click(1);
    ASSERT_TRUE(assortView.userReport().has_value());
    const assortments::UserReport r = *assortView.userReport();
    ASSERT_EQ(r.rows.size(), 2u);
    EXPECT_EQ(r.rows[0][0], QStringLiteral("Pulpwood"));
    EXPECT_EQ(r.rows[1][0], QStringLiteral("Stakes"));
    EXPECT_EQ(r.rows[1][1], QStringLiteral("8 - 12"));
    ASSERT_EQ(r.header.size(), 7);
    // Each stand is divided on its own, so removed + post comes close to pre
    // without matching it; the removal column is the report itself.
    for (const QStringList &row : r.rows) {
        EXPECT_NEAR(shell::val(row[4]), shell::val(row[5]) + shell::val(row[6]),
                    0.05 * shell::val(row[4]));
        EXPECT_EQ(row[2], row[5]);
    }
    assort.cmdAccept_Click();
    thin.cmdAccept_Click();
    const TableRow &row = logic.table().row(logic.table().lastRow());
    EXPECT_EQ(row.label, QStringLiteral("AT yr"));
    EXPECT_TRUE(row.cells[kColTopHeight].startsWith(QStringLiteral("Pulpwood(%) ")));
    EXPECT_TRUE(row.cells[kColDbh].startsWith(QStringLiteral("Stakes(%) ")));
}

TEST(AssortRowLabel, TestsRunInOrder) {
    for (const auto &[title, label] : {std::pair{"Crop assortment", "AC yr"},
                                       {"Pre-[Actual]-Thin Thinning", "AC yr"},
                                       {"Rack-thin assortment", "AT yr"},
                                       {"Thinning assortment", "AT yr"},
                                       {"Post-[Actual]-Thin Crop assortment", "AP yr"}}) {
        EXPECT_EQ(assortments::AssortWindowLogic::rowLabel(QLatin1String(title)),
                  QLatin1String(label))
            << title;
    }
}

} // namespace
} // namespace arbolex::testing
