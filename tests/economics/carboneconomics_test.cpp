// Carbon money in the windows: the economics window shows timber and carbon
// side by side and what paying carbon does to the economic rotation; the
// summary's carbon block, the carbon chart and the report's carbon page give
// the economics window's figures; without a payment every figure is the
// timber's alone.
#include "thinning/thinningfixture.hpp"

#include "charts/carbonchart.hpp"
#include "charts/chartmessages.hpp"
#include "charts/economicscharts.hpp"
#include "charts/reportcontent.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/economicsformat.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/tableregime.hpp"
#include "workflow/mainmessages.hpp"

#include <algorithm>

namespace arbolex::testing {
namespace {

using economics::EconomicsControl;
using workflow::MainControl;

class CarbonEconomicsTest : public ThinningTest {
protected:
    /// The young stand thinned by 40 m³/ha at 25, felled at 50, by one-year steps.
    void typeRotation() { ThinningTest::typeRotation({25}, {QStringLiteral("40")}, 50); }

    void valueAt3Percent() {
        work.cashFlow().setInterestRate(3.0);
        economics.cmdEconomics_Click();
        economics.typeText(EconomicsControl::txtEstablishmentCost, QStringLiteral("1800"));
        economics.cmdCompute_Click();
        ASSERT_TRUE(economics.valued()) << view.text(EconomicsControl::lblRegime).toStdString();
    }

    QString shown(EconomicsControl c) const { return view.text(c); }

    economics::HeadlessEconomicsView &view = economicsView;
    economics::EconomicsWindowLogic &economics = session.economics();
};

TEST_F(CarbonEconomicsTest, PaidCarbonStandsBesideTimberAndMovesTheEconomicRotation) {
    prices.data().carbon.pricing = {56.0, carbon::Payment::kFlow};
    typeRotation();
    valueAt3Percent();
    const rotation::RotationValue &v = *economics.value();
    ASSERT_TRUE(v.npvCarbon && v.npvTimber && v.levCarbon);
    EXPECT_NE(*v.npvCarbon, 0.0);
    EXPECT_EQ(shown(EconomicsControl::lblNpvCarbon), economics::euroPerHaText(v.npvCarbon));
    EXPECT_EQ(shown(EconomicsControl::lblNpvTimber), economics::euroPerHaText(v.npvTimber));
    EXPECT_EQ(shown(EconomicsControl::lblNpvTotal), shown(EconomicsControl::lblNPV));
    EXPECT_EQ(shown(EconomicsControl::lblLevTotal), shown(EconomicsControl::lblLEV));

    // The timber's economic rotation: the same explorer with no carbon money.
    rotation::Economics timber = economics.economics();
    timber.carbon.payment = carbon::Payment::kNone;
    engine::Grow own;
    rotation::GrowthFailure failure;
    const auto path = rotation::growPath(own, economics.stand(), economics.regime(), failure);
    ASSERT_TRUE(path);
    const int without =
        rotation::exploreRotations(*path, economics.regime(), timber).economicRotation;
    const int with = economics.explorer().economicRotation;
    ASSERT_GT(without, 0);
    EXPECT_EQ(economics.economicRotationWithoutCarbon(), without);
    const QString named = QStringLiteral("Carbon at 56 €/t CO₂e (flow)");
    EXPECT_EQ(shown(EconomicsControl::lblCarbonRotation),
              with == without
                  ? economics::economicstext::carbonKeepsRotation(named, with)
                  : economics::economicstext::carbonMovesRotation(named, without, with));
    const charts::ChartData chart = charts::economicsCharts(economics).rotations;
    const bool marked =
        std::any_of(chart.markers.begin(), chart.markers.end(),
                    [without](const charts::ChartMarker &m) { return m.x == without; });
    EXPECT_EQ(marked, true) << "the timber's economic rotation is marked";

    // The summary's block, the chart and the report give the window's account.
    ASSERT_TRUE(logic.FillSummary());
    const workflow::CarbonSummary &block = logic.summaryCarbon();
    ASSERT_EQ(block.figures.size(), 5u);
    EXPECT_EQ(block.figures[3].second, economics::quantityText(v.carbon.unitsTotal, 1));
    EXPECT_EQ(block.figures[4].second, shown(EconomicsControl::lblNpvCarbon));
    const charts::ChartData carbonChart = charts::carbonChart(work);
    ASSERT_EQ(carbonChart.series.size(), 5u);
    EXPECT_EQ(carbonChart.series[3].points.back().y, v.carbon.unitsTotal) << "units issued";
    EXPECT_EQ(carbonChart.series[0].points.back().x, 50.0);
    EXPECT_EQ(carbonChart.series[0].points.back().y, 0.0) << "the final cut takes the trees";
    const charts::ReportContent report = charts::reportContent(work, economics);
    ASSERT_TRUE(report.carbon);
    EXPECT_EQ(report.carbon->yearly.rows.size(), v.carbon.years.size());
    EXPECT_EQ(report.carbon->totals.back().second, shown(EconomicsControl::lblNpvCarbon));
}

TEST_F(CarbonEconomicsTest, UnpaidCarbonLeavesEveryFigureTheTimbers) {
    prices.data().carbon.pricing = {56.0, carbon::Payment::kNone};
    typeRotation();
    valueAt3Percent();
    const rotation::RotationValue &v = *economics.value();
    rotation::Economics timber = economics.economics();
    timber.carbon = {};
    const auto own = economics::valueTableRotation(work, timber);
    ASSERT_TRUE(own);
    EXPECT_EQ(v.npv, own->npv);
    EXPECT_EQ(v.lev, own->lev);
    EXPECT_EQ(economics.economicRotationWithoutCarbon(), 0);
    EXPECT_EQ(shown(EconomicsControl::lblNpvCarbon), economics::carbontext::notCounted());
    EXPECT_EQ(shown(EconomicsControl::lblCarbonRotation),
              economics::economicstext::carbonNotCounted());
    ASSERT_TRUE(logic.FillSummary());
    EXPECT_EQ(logic.summaryCarbon().figures.back().second, economics::carbontext::notCounted());
    // The account is shown all the same.
    EXPECT_GT(v.carbon.longTermAverage, 0.0);
}

TEST_F(CarbonEconomicsTest, BeforeTheFinalCutTheTreesOfTheRowsOnly) {
    typeStand(QStringLiteral("40"), QStringLiteral("5"));
    logic.cmdGrow_Click();
    const charts::ChartData chart = charts::carbonChart(work);
    ASSERT_EQ(chart.series.size(), 1u);
    EXPECT_EQ(chart.series[0].points.size(), 6u) << "ages 15 to 40 by 5";
    EXPECT_EQ(chart.note, charts::text::noteCarbonBeforeFinalCut());
    ASSERT_TRUE(logic.FillSummary());
    ASSERT_EQ(logic.summaryCarbon().figures.size(), 1u);
    EXPECT_EQ(logic.summaryCarbon().figures[0].first, workflow::text::summaryCarbonInTrees(40));
    EXPECT_EQ(logic.summaryCarbon().figures[0].second,
              economics::quantityText(chart.series[0].points.back().y, 1));
    EXPECT_FALSE(charts::reportContent(work).carbon) << "no account before the final cut";
}

} // namespace
} // namespace arbolex::testing
