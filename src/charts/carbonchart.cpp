#include "charts/carbonchart.hpp"

#include "charts/chartmessages.hpp"
#include "economics/carbonformat.hpp"
#include "economics/tableregime.hpp"
#include "engine/grow.hpp"
#include "engine/modeldescription.hpp"
#include "work/projectiontable.hpp"
#include "work/standwork.hpp"

namespace arbolex::charts {

namespace {

constexpr std::uint32_t kTrees = 0x2e8b57;
constexpr std::uint32_t kProducts = 0xb8860b;
constexpr std::uint32_t kRemoval = 0x1b6ca8;
constexpr std::uint32_t kUnits = 0x6a4c93;
constexpr std::uint32_t kAverage = 0x6e6e6e;

ChartSeries series(const QString &name, std::uint32_t colour) {
    ChartSeries s;
    s.name = name;
    s.unit = text::unitCarbon();
    s.colour = colour;
    return s;
}

/// Appends a point unless it repeats the last one.
void add(ChartSeries &s, double x, double y) {
    if (!s.points.empty() && s.points.back().x == x && s.points.back().y == y) {
        return;
    }
    s.points.push_back({x, y});
}

ChartData carbonFrame() {
    ChartData chart;
    chart.title = text::titleCarbon();
    chart.x.title = text::axisAge();
    chart.axes = {{.title = text::axisCarbon()}};
    return chart;
}

} // namespace

ChartData carbonAccountChart(const carbon::Account &account) {
    ChartData chart = carbonFrame();
    if (account.years.empty()) {
        return chart;
    }
    ChartSeries trees = series(text::seriesCarbonTrees(), kTrees);
    ChartSeries products = series(text::seriesCarbonProducts(), kProducts);
    // The account closes: the net removal to date is the trees and products,
    // so it runs dashed over the trees until a harvest sends carbon away.
    ChartSeries removal = series(text::seriesNetRemoval(), kRemoval);
    removal.pattern = ChartSeries::Pattern::Dashed;
    trees.width = 3.0;
    ChartSeries units = series(text::seriesUnits(), kUnits);
    ChartSeries average = series(text::seriesLongTermAverage(), kAverage);
    average.pattern = ChartSeries::Pattern::Dashed;
    average.width = 1.4;
    double issued = 0.0;
    for (const carbon::AccountYear &y : account.years) {
        const double age = y.age;
        // The stock before the harvest of the year, then after it.
        add(trees, age, y.trees + y.harvested);
        add(trees, age, y.trees);
        add(products, age, y.products);
        add(removal, age, y.cumulativeNetRemoval);
        add(units, age, issued);
        issued += y.units;
        add(units, age, issued);
    }
    const double first = account.years.front().age;
    const double last = account.years.back().age;
    average.points = {{first, account.longTermAverage}, {last, account.longTermAverage}};
    chart.note = text::noteCarbon(economics::tonnesText(account.longTermAverage),
                                  economics::tonnesText(account.unitsTotal));
    chart.series = {std::move(trees), std::move(products), std::move(removal), std::move(units),
                    std::move(average)};
    return chart;
}

ChartData treeCarbonChart(const work::ProjectionTable &table, std::int16_t model,
                          const carbon::Parameters &parameters) {
    ChartData chart = carbonFrame();
    const double gravity = parameters.gravityOf(engine::speciesCode(model));
    ChartSeries trees = series(text::seriesCarbonTrees(), kTrees);
    for (int i = 1; i <= table.lastRow(); ++i) {
        const work::TableRow &row = table.row(i);
        if (!row.isGrowth() && !row.isThinning()) {
            continue; // text rows and failed projections hold no stand
        }
        const work::RowRecord &r = row.record;
        add(trees, r.age,
            carbon::liveTrees(double{r.volume} + r.removedVolume, gravity, parameters));
        add(trees, r.age, carbon::liveTrees(r.volume, gravity, parameters));
    }
    if (!trees.points.empty()) {
        chart.note = text::noteCarbonBeforeFinalCut();
        chart.series = {std::move(trees)};
    }
    return chart;
}

ChartData carbonChart(const work::StandWork &work) {
    const rotation::Economics money = work.economics();
    if (const auto value = economics::valueTableRotation(work, money)) {
        if (!value->carbon.years.empty()) {
            return carbonAccountChart(value->carbon);
        }
    }
    return treeCarbonChart(work.table(), work.grow().modelId(), money.carbonParameters);
}

} // namespace arbolex::charts
