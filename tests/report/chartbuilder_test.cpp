// The one chart builder: bars by category stand or lie on an axis of their
// categories, markers span the whole plot once the axes are rounded, and the
// value axes the data leaves open share their zero while the others keep the
// range the data gives them.
#include "charts/economicscharts.hpp"
#include "charts/estatecharts.hpp"
#include "report/chartbuilder.hpp"

#include <QBarCategoryAxis>
#include <QBarSet>
#include <QCategoryAxis>
#include <QHorizontalStackedBarSeries>
#include <QLegend>
#include <QLegendMarker>
#include <QLineSeries>
#include <QStackedBarSeries>
#include <QValueAxis>

#include <gtest/gtest.h>

#include <memory>

namespace arbolex::testing {
namespace {

using charts::ChartData;
using charts::ChartSeries;
using report::ChartLook;

template <class Axis> Axis *axisAt(QChart &chart, Qt::Alignment side) {
    for (QAbstractAxis *axis : chart.axes()) {
        if (axis->alignment() == side) {
            return qobject_cast<Axis *>(axis);
        }
    }
    return nullptr;
}

TEST(ChartBuilderTest, StackedBarsStandOnTheirCategoriesAndTornadoBarsLie) {
    charts::HarvestForecast forecast;
    forecast.years = {2026, 2027};
    forecast.species = {QStringLiteral("DF"), QStringLiteral("SS")};
    forecast.volumes = {{100.0, 0.0}, {50.0, 750.0}};
    const ChartData harvest = charts::harvestChart(forecast);
    const std::unique_ptr<QChart> standing(report::buildChart(harvest, ChartLook::Window));
    auto *stacked = qobject_cast<QStackedBarSeries *>(standing->series().value(0));
    ASSERT_NE(stacked, nullptr);
    ASSERT_EQ(stacked->count(), 2);
    QBarSet *ss = stacked->barSets().at(1);
    EXPECT_EQ(ss->label(), QStringLiteral("SS"));
    EXPECT_EQ(ss->at(1), 750.0);
    EXPECT_EQ(ss->color().rgb() & 0xffffff, *harvest.series[1].colour);
    EXPECT_EQ(ss->property(report::kSeriesIndexProperty).toInt(), 1);
    auto *years = axisAt<QBarCategoryAxis>(*standing, Qt::AlignBottom);
    ASSERT_NE(years, nullptr);
    EXPECT_EQ(years->categories(), harvest.categories);
    auto *volume = axisAt<QValueAxis>(*standing, Qt::AlignLeft);
    ASSERT_NE(volume, nullptr);
    EXPECT_EQ(volume->min(), 0.0);
    EXPECT_GE(volume->max(), 800.0) << "the tallest stack fits";

    const std::vector<rotation::TornadoBar> bars = {{"costs ±20 %", 100.0, 90.0, 60.0, 40.0}};
    const ChartData tornado = charts::tornadoChart(bars, 95.0, false, QString());
    const std::unique_ptr<QChart> lying(report::buildChart(tornado, ChartLook::Window));
    EXPECT_NE(qobject_cast<QHorizontalStackedBarSeries *>(lying->series().value(0)), nullptr);
    EXPECT_NE(axisAt<QBarCategoryAxis>(*lying, Qt::AlignLeft), nullptr);
    // The change in money along the bottom, labelled at the data's ticks.
    auto *change = axisAt<QCategoryAxis>(*lying, Qt::AlignBottom);
    ASSERT_NE(change, nullptr);
    EXPECT_EQ(change->categoriesLabels().size(), static_cast<int>(tornado.axes[0].ticks.size()));
}

TEST(ChartBuilderTest, MarkersSpanTheRoundedAxisAndNameThemselvesInTheLegend) {
    rotation::MonteCarloResult draws;
    draws.histogram = {13, 40, 27};
    draws.npvLowest = 1000.0;
    draws.npvHighest = 4000.0;
    draws.npv = {1500.0, 2500.0, 3500.0};
    for (const ChartLook look : {ChartLook::Window, ChartLook::Report}) {
        const std::unique_ptr<QChart> chart(
            report::buildChart(charts::histogramChart(draws, QStringLiteral("NPV")), look));
        auto *count = axisAt<QValueAxis>(*chart, Qt::AlignLeft);
        ASSERT_NE(count, nullptr);
        int markers = 0;
        for (QAbstractSeries *series : chart->series()) {
            auto *line = qobject_cast<QLineSeries *>(series);
            if (line == nullptr || !line->name().startsWith(u'P')) {
                continue;
            }
            ++markers;
            ASSERT_EQ(line->count(), 2);
            EXPECT_EQ(line->at(0).y(), count->min());
            EXPECT_EQ(line->at(1).y(), count->max()) << "after the axis was rounded";
            EXPECT_GE(count->max(), 44.0);
            EXPECT_EQ(chart->legend()->markers(line).value(0)->label(), line->name());
        }
        EXPECT_EQ(markers, 3);
    }
}

TEST(ChartBuilderTest, OpenAxesShareTheirZeroGivenAxesKeepTheirRange) {
    ChartData data;
    data.axes = {{.title = QStringLiteral("€")},
                 {.title = QStringLiteral("€ summed"), .right = true},
                 {.title = QStringLiteral("fixed"), .right = true, .min = 0.0, .max = 7.0}};
    ChartSeries spent;
    spent.points = {{0.0, -2000.0}, {10.0, 500.0}};
    ChartSeries summed;
    summed.axis = 1;
    summed.points = {{0.0, -2000.0}, {10.0, 60000.0}};
    ChartSeries fixed;
    fixed.axis = 2;
    fixed.points = {{0.0, 1.0}, {10.0, 30.0}};
    data.series = {spent, summed, fixed};
    const std::unique_ptr<QChart> chart(report::buildChart(data));
    std::vector<QValueAxis *> axes;
    for (QAbstractAxis *axis : chart->axes(Qt::Vertical)) {
        axes.push_back(qobject_cast<QValueAxis *>(axis));
    }
    ASSERT_EQ(axes.size(), 3U);
    const auto zeroAt = [](const QValueAxis *a) {
        return -a->min() / (a->max() - a->min());
    };
    EXPECT_LT(axes[0]->min(), 0.0);
    EXPECT_DOUBLE_EQ(zeroAt(axes[0]), zeroAt(axes[1]));
    EXPECT_EQ(axes[0]->tickCount(), axes[1]->tickCount());
    EXPECT_EQ(axes[2]->min(), 0.0);
    EXPECT_EQ(axes[2]->max(), 7.0) << "the data's range, though a value lies beyond it";
}

} // namespace
} // namespace arbolex::testing
