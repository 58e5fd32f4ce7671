// The carbon chart of an account: a harvest drops the trees at its age (the
// stock before it, then after), the final cut to 0; units rise in steps at
// the years they are issued; the long-term average runs across the rotation.
#include "charts/carbonchart.hpp"

#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace arbolex::testing {
namespace {

std::vector<std::pair<double, double>> points(const charts::ChartSeries &s) {
    std::vector<std::pair<double, double>> all;
    for (const charts::ChartPoint &p : s.points) {
        all.emplace_back(p.x, p.y);
    }
    return all;
}

TEST(CarbonChart, HarvestsDropTheTreesAndUnitsRiseInSteps) {
    carbon::Account account;
    const auto year = [](int age, double trees, double harvested, double products, double units) {
        carbon::AccountYear y;
        y.age = age;
        y.trees = trees;
        y.harvested = harvested;
        y.products = products;
        y.units = units;
        y.cumulativeNetRemoval = trees + products;
        return y;
    };
    account.years = {year(0, 0.0, 0.0, 0.0, 0.0), year(1, 10.0, 0.0, 0.0, 0.0),
                     year(2, 12.0, 6.0, 3.0, 4.0), year(3, 0.0, 20.0, 11.0, 3.0)};
    account.longTermAverage = 9.0;
    account.unitsTotal = 7.0;
    const charts::ChartData chart = charts::carbonAccountChart(account);
    ASSERT_EQ(chart.series.size(), 5u);
    using P = std::vector<std::pair<double, double>>;
    EXPECT_EQ(points(chart.series[0]), (P{{0, 0}, {1, 10}, {2, 18}, {2, 12}, {3, 20}, {3, 0}}));
    EXPECT_EQ(points(chart.series[1]), (P{{0, 0}, {1, 0}, {2, 3}, {3, 11}}));
    EXPECT_EQ(points(chart.series[3]), (P{{0, 0}, {1, 0}, {2, 0}, {2, 4}, {3, 4}, {3, 7}}));
    EXPECT_EQ(points(chart.series[4]), (P{{0, 9}, {3, 9}}));
    EXPECT_TRUE(charts::carbonAccountChart({}).empty());
}

} // namespace
} // namespace arbolex::testing
