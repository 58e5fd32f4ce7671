#include "charts/standcharts.hpp"

#include "charts/chartmessages.hpp"
#include "rotation/yieldclass.hpp"
#include "shell/vbformat.hpp"
#include "work/incrementrows.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"

#include <algorithm>
#include <cmath>

namespace arbolex::charts {

using work::RowRecord;
using work::TableRow;

bool ChartData::empty() const {
    return std::all_of(series.begin(), series.end(),
                       [](const ChartSeries &s) { return s.points.empty(); });
}

namespace {

/// Appends a point unless it repeats the last one (a growth row at the age
/// of the thinning before it).
void add(ChartSeries &series, double x, double y) {
    std::vector<ChartPoint> &points = series.points;
    if (!points.empty() && points.back().x == x && points.back().y == y) {
        return;
    }
    points.push_back({x, y});
}

ChartSeries series(const QString &name, const QString &unit, int axis) {
    ChartSeries s;
    s.name = name;
    s.unit = unit;
    s.axis = axis;
    return s;
}

} // namespace

ChartData standDevelopment(const work::ProjectionTable &table) {
    ChartData chart;
    chart.title = text::titleStand();
    chart.x.title = text::axisAge();
    chart.note = text::noteStand();
    chart.axes = {{.title = text::axisVolume()},
                  {.title = text::axisHeightBasalArea()},
                  {.title = text::axisStocking(), .right = true}};
    ChartSeries height = series(text::seriesTopHeight(), QStringLiteral("m"), kAxisHeightBasalArea);
    ChartSeries stocking =
        series(text::seriesStocking(), QStringLiteral("stems/ha"), kAxisStocking);
    ChartSeries basalArea =
        series(text::seriesBasalArea(), QStringLiteral("m²/ha"), kAxisHeightBasalArea);
    ChartSeries volume = series(text::seriesVolume(), QStringLiteral("m³/ha"), kAxisVolume);
    ChartSeries total = series(text::seriesTotalProduction(), QStringLiteral("m³/ha"), kAxisVolume);

    // Volume thinned on the rows before the current one, m³/ha.
    double removedBefore = 0.0;
    const auto addStand = [&](double age, const RowRecord &r, double standFactor) {
        add(height, age, r.topHeight * standFactor);
        add(stocking, age, (r.stocking + r.removedStocking) * standFactor);
        add(basalArea, age, (r.basalArea + r.removedBasalArea) * standFactor);
        add(volume, age, (r.volume + r.removedVolume) * standFactor);
    };
    for (int i = 1; i <= table.lastRow(); ++i) {
        const TableRow &row = table.row(i);
        if (!row.isGrowth() && !row.isThinning()) {
            continue; // text rows and failed projections hold no stand
        }
        const RowRecord &r = row.record;
        const double age = r.age;
        // The stand before any removal on this row, then after it.
        addStand(age, r, 1.0);
        if (row.isThinning()) {
            add(height, age, r.topHeight);
            add(stocking, age, r.stocking);
            add(basalArea, age, r.basalArea);
            add(volume, age, r.volume);
        }
        add(total, age, double{r.volume} + r.removedVolume + removedBefore);
        removedBefore += r.removedVolume;
        if (row.finalCut) {
            addStand(age, RowRecord{}, 0.0);
        }
    }
    chart.series = {std::move(volume), std::move(total), std::move(height), std::move(basalArea),
                    std::move(stocking)};
    return chart;
}

ChartData increments(const work::ProjectionTable &table) {
    ChartData chart;
    chart.title = text::titleIncrements();
    chart.x.title = text::axisAge();
    chart.axes = {{.title = text::axisIncrement()}};
    ChartSeries cai = series(text::seriesCai(), QStringLiteral("m³/ha/yr"), 0);
    ChartSeries mai = series(text::seriesMai(), QStringLiteral("m³/ha/yr"), 0);
    std::vector<double> maiValues;
    for (const int i : work::incrementRows(table)) {
        const TableRow &row = table.row(i);
        const double age = row.numbers[work::kNumAge];
        if (!row.cells.value(work::kColCai).isEmpty()) {
            add(cai, age, row.numbers[work::kNumCai]);
        }
        maiValues.push_back(row.numbers[work::kNumMai]);
        if (age > 0.0) {
            add(mai, age, row.numbers[work::kNumMai]);
        }
    }
    const int yieldClass = rotation::yieldClass(maiValues);
    if (yieldClass > 0 && !mai.points.empty()) {
        // The first highest MAI: where the yield class is read.
        const auto peak =
            std::max_element(mai.points.begin(), mai.points.end(),
                             [](const ChartPoint &a, const ChartPoint &b) { return a.y < b.y; });
        chart.marks.push_back(
            {*peak, 0,
             text::markCulmination(static_cast<int>(std::nearbyint(peak->x)), yieldClass)});
        chart.note = text::noteYieldClass(yieldClass);
    } else if (!mai.points.empty()) {
        chart.note = text::noteNotCulminated();
    }
    chart.series = {std::move(cai), std::move(mai)};
    return chart;
}

ChartData cashFlowChart(const work::CashFlow &computed, int years) {
    ChartData chart;
    chart.title = text::titleCashFlow();
    chart.x.title = text::axisYear();
    // Two axes with their zeros level: the final cut's revenue would flatten
    // the discounted sums on a common axis.
    chart.axes = {{.title = text::axisCashFlow()},
                  {.title = text::axisCumulative(), .right = true}};
    ChartSeries bars = series(text::seriesCashFlow(), text::unitMoney(), 0);
    bars.style = ChartSeries::Style::Bars;
    ChartSeries cumulative = series(text::seriesCumulative(), text::unitMoney(), 1);
    years = std::min(years, computed.years());
    double sum = 0.0;
    int lastNegative = -1;
    for (int i = 0; i < years; ++i) {
        const double year = computed.matrix(work::kCfYear, i);
        const double flow = computed.matrix(work::kCfCashFlow, i);
        if (flow != 0.0) {
            bars.points.push_back({year, flow});
        }
        sum += computed.matrix(work::kCfDiscountedCashFlow, i);
        cumulative.points.push_back({year, sum});
        if (sum < 0.0) {
            lastNegative = i;
        }
    }
    if (lastNegative >= 0 && lastNegative + 1 < years) {
        // The line rises through 0 between these two years for the last time.
        const ChartPoint before = cumulative.points[static_cast<std::size_t>(lastNegative)];
        const ChartPoint after = cumulative.points[static_cast<std::size_t>(lastNegative) + 1];
        const double x = before.x + (0.0 - before.y) / (after.y - before.y) * (after.x - before.x);
        chart.marks.push_back(
            {{x, 0.0}, 1, text::markPayback(static_cast<int>(std::nearbyint(after.x)))});
    }
    if (years > 0) {
        chart.note = text::noteNpv(shell::formatNumber(computed.SumNPV(), u"#0"),
                                   shell::formatNumber(computed.interestRate(), u"0.00##"));
        chart.series = {std::move(bars), std::move(cumulative)};
    }
    return chart;
}

} // namespace arbolex::charts
