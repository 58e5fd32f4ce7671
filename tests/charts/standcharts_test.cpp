// The series the charts are drawn from: removals as drops, the culmination
// of the MAI with its yield class, and the year a cash flow pays back.
#include "charts/chartmessages.hpp"
#include "charts/standcharts.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using charts::ChartData;
using charts::ChartPoint;
using charts::ChartSeries;
using work::RowKind;
using work::TableRow;

/// A stand row: age, standing stocking, basal area, volume, and what a
/// thinning on the row removed; increments as given (CAI < 0: none).
TableRow standRow(float age, float stocking, float basalArea, float volume,
                  RowKind kind = RowKind::Growth, float removedVolume = 0.0f, double cai = -1.0,
                  double mai = 0.0) {
    TableRow row;
    row.kind = kind;
    for (int c = 0; c < work::kColumnCount; ++c) {
        row.cells.append(QString());
    }
    row.record.age = age;
    row.record.topHeight = age / 2.0f;
    row.record.stocking = stocking;
    row.record.basalArea = basalArea;
    row.record.volume = volume;
    if (kind == RowKind::Thinning) {
        row.record.removedVolume = removedVolume;
        row.record.removedStocking = 400.0f;
        row.record.removedBasalArea = 8.0f;
    }
    row.numbers[work::kNumAge] = age;
    row.numbers[work::kNumMai] = mai;
    if (cai >= 0.0) {
        row.numbers[work::kNumCai] = cai;
        row.cells[work::kColCai] = QString::number(cai);
    }
    return row;
}

const ChartSeries &named(const ChartData &chart, const QString &name) {
    for (const ChartSeries &s : chart.series) {
        if (s.name == name) {
            return s;
        }
    }
    throw std::runtime_error("no such series");
}

std::vector<std::pair<double, double>> pairs(const ChartSeries &s) {
    std::vector<std::pair<double, double>> out;
    for (const ChartPoint &p : s.points) {
        out.emplace_back(p.x, p.y);
    }
    return out;
}

using Pairs = std::vector<std::pair<double, double>>;

TEST(StandChartTest, ThinningAndFinalCutDropTheStandingCropButNotTotalProduction) {
    work::ProjectionTable table;
    table.append(standRow(20, 2000, 30, 200));
    table.append(standRow(25, 1900, 36, 280));
    // Thinned at 25: 1500 stems, 28 m²/ha and 230 m³/ha left, 50 m³/ha removed.
    table.append(standRow(25, 1500, 28, 230, RowKind::Thinning, 50));
    table.append(standRow(25, 1500, 28, 230)); // growing on from the thinned stand
    table.append(standRow(30, 1480, 34, 320));
    TableRow text = standRow(30, 0, 0, 0, RowKind::Text);
    table.append(text);
    TableRow felled = standRow(30, 1480, 34, 320);
    felled.finalCut = true;
    table.append(felled);

    const ChartData chart = charts::standDevelopment(table);
    EXPECT_EQ(pairs(named(chart, charts::text::seriesVolume())),
              (Pairs{{20, 200}, {25, 280}, {25, 230}, {30, 320}, {30, 0}}));
    EXPECT_EQ(pairs(named(chart, charts::text::seriesStocking())),
              (Pairs{{20, 2000}, {25, 1900}, {25, 1500}, {30, 1480}, {30, 0}}));
    EXPECT_EQ(pairs(named(chart, charts::text::seriesBasalArea())),
              (Pairs{{20, 30}, {25, 36}, {25, 28}, {30, 34}, {30, 0}}));
    // Standing crop plus everything thinned before: never a drop.
    EXPECT_EQ(pairs(named(chart, charts::text::seriesTotalProduction())),
              (Pairs{{20, 200}, {25, 280}, {30, 370}}));
    // Every series is read on an axis of its own kind.
    EXPECT_EQ(named(chart, charts::text::seriesStocking()).axis, charts::kAxisStocking);
    EXPECT_EQ(named(chart, charts::text::seriesTopHeight()).axis, charts::kAxisHeightBasalArea);
    EXPECT_EQ(chart.axes.size(), 3U);
    EXPECT_TRUE(charts::standDevelopment(work::ProjectionTable()).empty());
    EXPECT_TRUE(charts::increments(work::ProjectionTable()).empty());
}

TEST(IncrementChartTest, MarksTheFirstHighestMaiWithTheYieldClass) {
    work::ProjectionTable table;
    table.append(standRow(20, 2000, 30, 200, RowKind::Growth, 0, -1, 10.0));
    table.append(standRow(25, 1900, 36, 300, RowKind::Growth, 0, 20, 12.6));
    // A thinning row repeats the MAI of its age and takes no part.
    table.append(standRow(25, 1500, 28, 250, RowKind::Thinning, 50, 20, 99.0));
    table.append(standRow(30, 1480, 34, 380, RowKind::Growth, 0, 16, 12.6));
    table.append(standRow(35, 1460, 38, 420, RowKind::Growth, 0, 8, 11.0));

    const ChartData chart = charts::increments(table);
    EXPECT_EQ(pairs(named(chart, charts::text::seriesCai())), (Pairs{{25, 20}, {30, 16}, {35, 8}}))
        << "the first row has no increment of its own";
    EXPECT_EQ(pairs(named(chart, charts::text::seriesMai())),
              (Pairs{{20, 10}, {25, 12.6}, {30, 12.6}, {35, 11}}));
    ASSERT_EQ(chart.marks.size(), 1U);
    EXPECT_EQ(chart.marks[0].at.x, 25.0);
    EXPECT_EQ(chart.marks[0].at.y, 12.6);
    // 12.6 rounds to 13, an odd class, raised to 14.
    EXPECT_EQ(chart.marks[0].label, charts::text::markCulmination(25, 14));
    EXPECT_EQ(chart.note, charts::text::noteYieldClass(14));
}

TEST(IncrementChartTest, NoMarkWhileTheMaiStillRises) {
    work::ProjectionTable table;
    table.append(standRow(20, 2000, 30, 200, RowKind::Growth, 0, -1, 10.0));
    table.append(standRow(25, 1900, 36, 300, RowKind::Growth, 0, 20, 12.0));
    const ChartData chart = charts::increments(table);
    EXPECT_TRUE(chart.marks.empty());
    EXPECT_EQ(chart.note, charts::text::noteNotCulminated());
}

class CashFlowChartTest : public ::testing::Test {
protected:
    /// Years 20 to 25 with these discounted cash flows; the cash flows
    /// themselves twice as large.
    ChartData chartOf(const std::vector<double> &discounted) {
        flow.SetRotationLength(20, 20 + static_cast<int>(discounted.size()) - 1);
        flow.DimNPVArrays();
        for (std::size_t i = 0; i < discounted.size(); ++i) {
            const int year = static_cast<int>(i);
            flow.setMatrix(work::kCfCashFlow, year, 2.0 * discounted[i]);
            flow.setMatrix(work::kCfDiscountedCashFlow, year, discounted[i]);
        }
        return charts::cashFlowChart(flow, flow.years());
    }

    work::CashFlow flow;
};

TEST_F(CashFlowChartTest, BarsForYearsWithMoneyAndTheCumulativeDiscountedLine) {
    const ChartData chart = chartOf({-1000, 0, 0, 0, 0, 1500});
    EXPECT_EQ(pairs(named(chart, charts::text::seriesCashFlow())),
              (Pairs{{20, -2000}, {25, 3000}}));
    EXPECT_EQ(named(chart, charts::text::seriesCashFlow()).style, ChartSeries::Style::Bars);
    EXPECT_EQ(pairs(named(chart, charts::text::seriesCumulative())),
              (Pairs{{20, -1000}, {21, -1000}, {22, -1000}, {23, -1000}, {24, -1000}, {25, 500}}));
    ASSERT_EQ(chart.marks.size(), 1U);
    EXPECT_DOUBLE_EQ(chart.marks[0].at.x, 24.0 + 1000.0 / 1500.0);
    EXPECT_EQ(chart.marks[0].at.y, 0.0);
    EXPECT_EQ(chart.marks[0].label, charts::text::markPayback(25));
    EXPECT_EQ(chart.note, charts::text::noteNpv(QStringLiteral("500"), QStringLiteral("5.00")));
}

TEST_F(CashFlowChartTest, PaysBackWhereTheLineLastRisesThroughZero) {
    // Cumulative: -100, 200, -300, -300, 100, 100.
    const ChartData chart = chartOf({-100, 300, -500, 0, 400, 0});
    ASSERT_EQ(chart.marks.size(), 1U);
    EXPECT_DOUBLE_EQ(chart.marks[0].at.x, 23.75);
    EXPECT_EQ(chart.marks[0].label, charts::text::markPayback(24));
}

TEST_F(CashFlowChartTest, NoPaybackMarkWithoutALossOrARecoveryAndNoChartWithoutARotation) {
    EXPECT_TRUE(chartOf({0, 100, 0, 300}).marks.empty()) << "never below zero";
    EXPECT_TRUE(chartOf({-500, 100, 0, 300}).marks.empty()) << "never back above zero";
    EXPECT_TRUE(charts::cashFlowChart(flow, 0).empty());
}

} // namespace
} // namespace arbolex::testing
