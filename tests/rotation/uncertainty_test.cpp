// Tornado and Monte Carlo of a rotation: moved factors act on the right
// figures, draws repeat with their seed, and the distributions are the ones
// named (a log-normal price level has its median at the rotation's value).
#include "rotation/uncertainty.hpp"

#include "engine/recordingreport.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <numeric>

namespace arbolex::rotation {
namespace {

using engine::testing::EngineTest;
using engine::testing::nearRel;

constexpr Stand kSitka{0, 15.0f, 2500.0f, 7.0f, 20.0f};
constexpr int kRotation = 45;

class UncertaintyTest : public EngineTest {
protected:
    UncertaintyTest() {
        GrowthFailure failure;
        path = *growPath(grow, kSitka, {20, 5, 40.0f, 35}, failure);
        for (std::size_t k = 0; k < economics.prices.size(); ++k) {
            economics.prices[k] = 4.0 + 3.5 * static_cast<double>(k);
        }
    }

    MonteCarloSettings fixed() const {
        MonteCarloSettings s;
        s.draws = 2000;
        s.priceSpread = 0.0;
        s.rateLow = s.rateHigh = economics.ratePercent;
        return s;
    }

    GrowthPath path;
    Economics economics{3.0, 0.0, 0.0, {}};
};

TEST_F(UncertaintyTest, WithoutSpreadEveryDrawIsTheRotation) {
    economics.establishmentCost = 900.0;
    const RotationValue v = valueRotation(path, kRotation, economics);
    const MonteCarloResult r = monteCarlo(path, kRotation, economics, fixed());
    for (const double x : {r.npv.p5, r.npv.p50, r.npv.p95}) {
        EXPECT_EQ(x, *v.npv);
    }
    EXPECT_EQ(r.lev.p50, *v.lev);
    EXPECT_EQ(r.probabilityNpvBelowZero, 0.0);
    EXPECT_EQ(std::accumulate(r.histogram.begin(), r.histogram.end(), 0), 2000);
}

TEST_F(UncertaintyTest, SeedRepeatsTheDrawsAndThePriceLevelIsLogNormal) {
    MonteCarloSettings s = fixed();
    s.draws = 10000;
    s.priceSpread = 0.25;
    const MonteCarloResult a = monteCarlo(path, kRotation, economics, s);
    const MonteCarloResult b = monteCarlo(path, kRotation, economics, s);
    EXPECT_EQ(a.npv.p5, b.npv.p5);
    EXPECT_EQ(a.lev.p95, b.lev.p95);
    EXPECT_EQ(a.histogram, b.histogram);
    s.seed = 2;
    EXPECT_NE(monteCarlo(path, kRotation, economics, s).npv.p50, a.npv.p50);
    // Revenue only: NPV is the price level times the rotation's, so its
    // percentiles are those of exp(0.25 · z): 5 % at z = −1.645.
    const double npv = *valueRotation(path, kRotation, economics).npv;
    EXPECT_TRUE(nearRel(npv, a.npv.p50, 0.01));
    EXPECT_TRUE(nearRel(npv * std::exp(-0.25 * 1.645), a.npv.p5, 0.02));
    EXPECT_TRUE(nearRel(npv * std::exp(0.25 * 1.645), a.npv.p95, 0.02));
}

TEST_F(UncertaintyTest, CostlyRotationsLoseMoneyInSomeDraws) {
    economics.establishmentCost = 1500.0;
    economics.annualCost = 250.0;
    MonteCarloSettings s = fixed();
    s.priceSpread = 0.4;
    s.rateLow = 2.0;
    s.rateHigh = 6.0;
    s.costSpread = 0.2;
    const MonteCarloResult r = monteCarlo(path, kRotation, economics, s);
    EXPECT_GT(r.probabilityNpvBelowZero, 0.0);
    EXPECT_LT(r.probabilityNpvBelowZero, 1.0);
    EXPECT_LT(r.npv.p5, r.npv.p50);
    EXPECT_LT(r.npv.p50, r.npv.p95);
    EXPECT_LE(r.npvLowest, r.npv.p5);
}

TEST_F(UncertaintyTest, TornadoMovesOneFactorAtATime) {
    const RotationValue v = valueRotation(path, kRotation, economics);
    const std::vector<TornadoBar> bars = tornado(path, kRotation, economics);
    ASSERT_EQ(bars.size(), 4u);
    // Revenue only: prices and volume scale NPV and LEV; costs change nothing.
    EXPECT_TRUE(nearRel(0.8 * *v.npv, *bars[0].npvLow, 1e-4));
    EXPECT_TRUE(nearRel(1.2 * *v.lev, *bars[0].levHigh, 1e-9));
    // Volume moves each mean tree too: the final cut's 0.876 m³ (class 10)
    // becomes 0.964 m³ (class 11) at +10 % and 0.788 m³ (class 9) at −10 %,
    // so the bar reaches past a plain ±10 % of the revenue.
    ASSERT_EQ(v.finalCut.priceClass, 10);
    EXPECT_GT(*bars[3].levHigh, 1.1 * *v.lev);
    EXPECT_LT(*bars[3].levLow, 0.9 * *v.lev);
    EXPECT_EQ(*bars[2].npvLow, *bars[2].npvHigh);
    // Dearer money, smaller values.
    EXPECT_GT(*bars[1].levLow, *v.lev);
    EXPECT_LT(*bars[1].levHigh, *v.lev);
    EXPECT_GT(*bars[1].npvLow, *bars[1].npvHigh);
}

} // namespace
} // namespace arbolex::rotation
