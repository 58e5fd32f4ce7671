// The economics window's charts and the estate's harvest forecast as chart
// data, without a widget: the series drawn, where the rotations and
// percentiles are marked, the ranges of the axes.
#include "charts/economicscharts.hpp"
#include "charts/estatecharts.hpp"
#include "economics/economicsmessages.hpp"

#include <gtest/gtest.h>

#include <set>

namespace arbolex::testing {
namespace {

using charts::ChartAxis;
using charts::ChartData;
using charts::ChartSeries;
namespace et = economics::economicstext;

std::vector<double> tickValues(const ChartAxis &axis) {
    std::vector<double> values;
    for (const charts::AxisTick &tick : axis.ticks) {
        values.push_back(tick.value);
    }
    return values;
}

// ---- The money axis -------------------------------------------------------------------

struct MoneyCase {
    const char *name;
    double low;
    double high;
    std::vector<double> ticks;
    std::vector<const char *> labels;
};

class MoneyAxisTest : public ::testing::TestWithParam<MoneyCase> {};

TEST_P(MoneyAxisTest, RoundEndsAndLabelsWithThousandsSeparators) {
    const MoneyCase &c = GetParam();
    const ChartAxis axis = charts::moneyAxis(c.low, c.high, et::axisMoney());
    EXPECT_EQ(tickValues(axis), c.ticks);
    EXPECT_EQ(axis.min, c.ticks.front());
    EXPECT_EQ(axis.max, c.ticks.back());
    ASSERT_EQ(axis.ticks.size(), c.labels.size());
    for (std::size_t i = 0; i < c.labels.size(); ++i) {
        EXPECT_EQ(axis.ticks[i].label, QString::fromUtf8(c.labels[i]));
    }
}

INSTANTIATE_TEST_SUITE_P(Ranges, MoneyAxisTest,
                         ::testing::Values(
                             // NPV and LEV of a rotation: 0 to 15,551 €/ha in steps of 5,000.
                             MoneyCase{"Values",
                                       0.0,
                                       15551.0,
                                       {0.0, 5000.0, 10000.0, 15000.0, 20000.0},
                                       {"0", "5,000", "10,000", "15,000", "20,000"}},
                             // A tornado 8,000 €/ha either side: money lost carries a minus sign.
                             MoneyCase{"Changes",
                                       -8400.0,
                                       8400.0,
                                       {-10000.0, -5000.0, 0.0, 5000.0, 10000.0},
                                       {"−10,000", "−5,000", "0", "5,000", "10,000"}},
                             // Draws of NPV from 1,234 to 41,700 €/ha: the axis shows 0.
                             MoneyCase{"Draws",
                                       0.0,
                                       41700.0,
                                       {0.0, 10000.0, 20000.0, 30000.0, 40000.0, 50000.0},
                                       {"0", "10,000", "20,000", "30,000", "40,000", "50,000"}}),
                         [](const ::testing::TestParamInfo<MoneyCase> &range) {
                             return std::string(range.param.name);
                         });

// ---- NPV, LEV and MAI by rotation age -----------------------------------------------------

rotation::RotationExplorer explorer() {
    rotation::RotationExplorer e;
    e.rows = {{30, 300.0f, 14.0, -500.0, std::nullopt, std::nullopt},
              {35, 400.0f, 16.0, 2000.0, 1200.0, std::nullopt},
              {40, 500.0f, 17.5, 4000.0, 2500.0, std::nullopt},
              {45, 560.0f, 17.0, 3800.0, 2200.0, std::nullopt}};
    e.biologicalRotation = 40;
    e.economicRotation = 40;
    return e;
}

TEST(RotationChartTest, MoneyOnTheLeftIncrementOnTheRightRotationsMarked) {
    const ChartData chart = charts::rotationChart(explorer(), QStringLiteral("At 3 %"));
    ASSERT_EQ(chart.series.size(), 3U);
    const ChartSeries &npv = chart.series[0];
    const ChartSeries &lev = chart.series[1];
    const ChartSeries &mai = chart.series[2];
    EXPECT_EQ(npv.points.size(), 4U);
    // An age without a LEV is left out, not drawn at 0.
    ASSERT_EQ(lev.points.size(), 3U);
    EXPECT_EQ(lev.points.front().x, 35.0);
    EXPECT_EQ(mai.axis, charts::kAxisMai);

    // The ages from the first to the last row; money from the lowest NPV to
    // the highest; the MAI from 0 with room above the highest.
    EXPECT_EQ(chart.x.min, 30.0);
    EXPECT_EQ(chart.x.max, 45.0);
    const ChartAxis &money = chart.axes.at(charts::kAxisMoney);
    EXPECT_LE(*money.min, -500.0);
    EXPECT_GE(*money.max, 4000.0);
    const ChartAxis &increment = chart.axes.at(charts::kAxisMai);
    EXPECT_EQ(increment.min, 0.0);
    EXPECT_EQ(increment.max, 21.0); // 17.5 × 1.15 = 20.1, up to a whole number

    ASSERT_EQ(chart.markers.size(), 2U);
    EXPECT_EQ(chart.markers[0].x, 40.0);
    EXPECT_EQ(chart.markers[0].label, QStringLiteral("Biological: 40 yr"));
    EXPECT_EQ(chart.markers[1].label, QStringLiteral("Economic: 40 yr"));
}

TEST(RotationChartTest, NoRowsNoSeriesAndNoEconomicRotationWithoutLev) {
    EXPECT_TRUE(charts::rotationChart({}, QStringLiteral("t")).empty());
    EXPECT_TRUE(charts::rotationChart({}, QStringLiteral("t")).axes.empty());
    rotation::RotationExplorer noRate = explorer();
    noRate.economicRotation = 0; // no positive rate: no LEV, no economic rotation
    const ChartData chart = charts::rotationChart(noRate, QStringLiteral("t"));
    ASSERT_EQ(chart.markers.size(), 1U);
    EXPECT_TRUE(chart.markers[0].label.startsWith(et::markBiological()));
}

// ---- Tornado --------------------------------------------------------------------------

TEST(TornadoChartTest, BarsFromTodaysValueWidestSwingOnTopFactorsWithoutFiguresLeftOut) {
    const std::vector<rotation::TornadoBar> bars = {
        {"timber prices ±20 %", 11000.0, 17000.0, 6500.0, 11200.0},
        {"interest rate ±1 point", 22500.0, 9400.0, 21000.0, 3600.0},
        {"costs ±20 %", 14600.0, 14500.0, 9400.0, 8300.0},
        {"volume ±10 %", std::nullopt, 16000.0, std::nullopt, 10000.0},
    };
    const ChartData npv = charts::tornadoChart(bars, 14500.0, false, QStringLiteral("NPV"));
    ASSERT_EQ(npv.categories.size(), 3);
    // Categories run from the bottom up: the widest swing last.
    EXPECT_TRUE(npv.categories.back().startsWith(QStringLiteral("Interest rate ±1 point")));
    EXPECT_TRUE(npv.categories.front().startsWith(QStringLiteral("Costs")));
    EXPECT_TRUE(npv.categories.back().endsWith(QStringLiteral("22,500 to 9,400 €/ha")));
    ASSERT_EQ(npv.series.size(), 2U);
    for (const ChartSeries &end : npv.series) {
        EXPECT_EQ(end.style, ChartSeries::Style::LyingBars);
        EXPECT_EQ(end.points.size(), 3U);
    }
    // Low and high end as changes from today's NPV.
    EXPECT_EQ(npv.series[0].points.back().y, 22500.0 - 14500.0);
    EXPECT_EQ(npv.series[1].points.back().y, 9400.0 - 14500.0);
    EXPECT_EQ(npv.axes.at(0).title, QStringLiteral("Change from 14,500 €/ha (NPV)"));
    // The axis is as wide either side of 0.
    EXPECT_EQ(*npv.axes.at(0).min, -*npv.axes.at(0).max);
    EXPECT_GE(*npv.axes.at(0).max, 8000.0);

    const ChartData lev = charts::tornadoChart(bars, 8800.0, true, QStringLiteral("LEV"));
    EXPECT_EQ(lev.series[0].points.back().y, 21000.0 - 8800.0);
    EXPECT_TRUE(lev.axes.at(0).title.endsWith(QStringLiteral("(LEV)")));
}

// ---- Monte Carlo ---------------------------------------------------------------------

TEST(HistogramChartTest, BinsSideBySideFromZeroPercentilesMarked) {
    rotation::MonteCarloResult draws;
    draws.histogram = {10, 40, 25, 5};
    draws.npvLowest = 2000.0;
    draws.npvHighest = 10000.0;
    draws.npv = {3000.0, 5500.0, 9000.0};
    const ChartData chart = charts::histogramChart(draws, QStringLiteral("draws"));
    ASSERT_EQ(chart.series.size(), 1U);
    const ChartSeries &bins = chart.series[0];
    EXPECT_EQ(bins.barWidth, 2000.0);
    ASSERT_EQ(bins.points.size(), 4U);
    EXPECT_EQ(bins.points[1].x, 4000.0);
    EXPECT_EQ(bins.points[1].y, 40.0);
    // The NPV axis shows 0 even when every draw earns.
    EXPECT_EQ(chart.x.min, 0.0);
    EXPECT_GE(*chart.x.max, 10000.0);
    EXPECT_EQ(chart.axes.at(0).min, 0.0);
    EXPECT_DOUBLE_EQ(*chart.axes.at(0).max, 44.0);
    ASSERT_EQ(chart.markers.size(), 3U);
    EXPECT_EQ(chart.markers[1].x, 5500.0);
    EXPECT_EQ(chart.markers[1].label, QStringLiteral("P50 5,500"));
    EXPECT_EQ(chart.markers[2].label, QStringLiteral("P95 9,000"));

    EXPECT_TRUE(charts::histogramChart({}, QStringLiteral("none")).empty());
}

// ---- Harvest forecast -------------------------------------------------------------------

// The bars' sets, values and categories as drawn: chartbuilder_test.cpp.
TEST(HarvestChartTest, EightSpeciesInEightColoursThenRoundAgain) {
    charts::HarvestForecast forecast;
    forecast.years = {2026, 2027, 2028};
    for (int s = 0; s < 9; ++s) {
        forecast.species << QStringLiteral("S%1").arg(s);
        forecast.volumes.push_back({1.0 * s, 0.0, 10.0});
    }
    const ChartData chart = charts::harvestChart(forecast);
    ASSERT_EQ(chart.series.size(), 9U);
    std::set<std::uint32_t> colours;
    for (std::size_t s = 0; s < 8; ++s) {
        colours.insert(*chart.series[s].colour);
    }
    EXPECT_EQ(colours.size(), 8U);
    EXPECT_EQ(chart.series[8].colour, chart.series[0].colour);
    EXPECT_TRUE(charts::harvestChart({}).empty());
}

} // namespace
} // namespace arbolex::testing
