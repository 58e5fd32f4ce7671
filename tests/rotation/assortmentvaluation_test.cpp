// A rotation valued by assortments: each harvest divided into the classes of
// the assortment report and sold class by class, and every figure built on
// the valuation (explorer, optimiser score, break-even, tornado) following it.
#include "rotation/optimiser.hpp"
#include "rotation/rotation.hpp"
#include "rotation/uncertainty.hpp"

#include "engine/recordingreport.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <numeric>

namespace arbolex::rotation {
namespace {

using engine::testing::EngineTest;
using engine::testing::nearRel;

/// A young Sitka spruce stand, and an old one of big trees (Dq about 40 cm).
constexpr Stand kYoung{0, 15.0f, 2500.0f, 7.0f, 20.0f};
constexpr Stand kBigTrees{0, 40.0f, 400.0f, 22.0f, 50.0f};

/// Pulpwood, pallet wood and sawlog, euro/m³ standing.
constexpr AssortmentPriceList kAssortmentPrices{10.0, 28.0, 48.0};

class AssortmentValuationTest : public EngineTest {
protected:
    GrowthPath grown(const Stand &stand, const Regime &regime = {}) {
        GrowthFailure failure;
        std::optional<GrowthPath> path = growPath(grow, stand, regime, failure);
        EXPECT_TRUE(path.has_value()) << failure.text;
        return path.value_or(GrowthPath{});
    }

    static Economics byAssortments(double rate) {
        Economics e{rate, 0.0, 0.0, {}};
        e.prices.fill(30.0);
        e.valuation = Valuation::kAssortments;
        e.assortmentPrices = kAssortmentPrices;
        return e;
    }

    static double total(const AssortmentVolumes &v) {
        return std::accumulate(v.begin(), v.end(), 0.0);
    }
};

TEST_F(AssortmentValuationTest, FinalCutIsTheReportsClassesTimesTheirPrices) {
    const GrowthPath path = grown(kYoung);
    const RotationValue v = valueRotation(path, 50, byAssortments(3.0));
    // The assortment report of the felled crop, as the main window shows it.
    const engine::StandState &crop = path.at(50);
    engine::Assortment classes;
    ASSERT_TRUE(grow.AsmtB(crop.basalArea, crop.stocking, crop.topHeight, {}, classes));
    double revenue = 0.0;
    for (std::size_t i = 0; i < 3; ++i) {
        EXPECT_TRUE(nearRel(classes.classVolume[i], v.finalCut.assortments[i], 1e-6)) << i;
        revenue += double{classes.classVolume[i]} * kAssortmentPrices[i];
    }
    EXPECT_TRUE(nearRel(revenue, v.finalCut.revenue, 1e-6));
    EXPECT_EQ(v.cashflow[50].revenue, v.finalCut.revenue);
    // One revenue 35 years from today and nothing else.
    EXPECT_NEAR(*v.npv, revenue / std::pow(1.03, 35), 0.01);
}

TEST_F(AssortmentValuationTest, ThinningsAreDividedIntoTheirRemovedVolume) {
    const GrowthPath path = grown(kYoung, {20, 5, 40.0f, 35});
    const RotationValue v = valueRotation(path, 45, byAssortments(3.0));
    ASSERT_EQ(v.thinnings.size(), 4u);
    for (const Harvest &t : v.thinnings) {
        EXPECT_TRUE(nearRel(t.volume, total(t.assortments), 1e-5)) << t.age;
        EXPECT_DOUBLE_EQ(t.revenue, t.assortments[0] * 10.0 + t.assortments[1] * 28.0 +
                                        t.assortments[2] * 48.0);
    }
    EXPECT_TRUE(nearRel(v.finalCut.volume, total(v.finalCut.assortments), 1e-5));
}

TEST_F(AssortmentValuationTest, BigTreesSellAsSawlogSmallTreesAsPulpwood) {
    const Economics e = byAssortments(3.0);
    const RotationValue small = valueRotation(grown(kYoung), 20, e);
    const RotationValue big = valueRotation(grown(kBigTrees), 60, e);
    const double smallPerM3 = small.finalCut.revenue / small.finalCut.volume;
    const double bigPerM3 = big.finalCut.revenue / big.finalCut.volume;
    EXPECT_LT(smallPerM3, 15.0) << "mostly pulpwood";
    EXPECT_GT(bigPerM3, 44.0) << "mostly sawlog";
    EXPECT_GT(big.finalCut.assortments[2], 0.8f * big.finalCut.volume);
    // By the mean tree, the same crop sells at one price for its whole volume.
    Economics standing = e;
    standing.valuation = Valuation::kStandingPrice;
    EXPECT_DOUBLE_EQ(valueRotation(grown(kBigTrees), 60, standing).finalCut.revenue,
                     big.finalCut.volume * 30.0);
}

TEST_F(AssortmentValuationTest, EveryFigureFollowsTheValuation) {
    const Regime regime{20, 5, 40.0f, 35};
    const GrowthPath path = grown(kYoung, regime);
    Economics e = byAssortments(3.0);
    e.establishmentCost = 1200.0;
    const RotationValue v = valueRotation(path, 45, e);

    const RotationExplorer explorer = exploreRotations(path, regime, e);
    const RotationRow &row = explorer.rows[static_cast<std::size_t>(45 - explorer.rows[0].age)];
    EXPECT_EQ(row.npv, v.npv);
    EXPECT_EQ(row.lev, v.lev);
    EXPECT_EQ(scoreRotation(path, regime, 45, e, Objective::kLev).lev, *v.lev);
    // Thinnings divided once, as the optimiser does, value the same.
    GrowthPath divided = path;
    divideThinnings(divided);
    EXPECT_EQ(valueRotation(divided, 45, e).lev, v.lev);

    ASSERT_TRUE(v.breakEvenPriceFactor.has_value());
    Economics atBreakEven = e;
    for (double &p : atBreakEven.assortmentPrices) {
        p *= *v.breakEvenPriceFactor;
    }
    EXPECT_NEAR(*valueRotation(path, 45, atBreakEven).lev, 0.0, 1e-6);

    // Volume ±10 % moves every class with it, whatever the mean tree.
    e.establishmentCost = 0.0;
    const RotationValue free = valueRotation(path, 45, e);
    const std::vector<TornadoBar> bars = tornado(path, 45, e);
    ASSERT_EQ(bars.size(), 4u);
    EXPECT_TRUE(nearRel(*free.lev * 0.9, *bars[3].levLow, 1e-9));
    EXPECT_TRUE(nearRel(*free.lev * 1.1, *bars[3].levHigh, 1e-9));
}

} // namespace
} // namespace arbolex::rotation
