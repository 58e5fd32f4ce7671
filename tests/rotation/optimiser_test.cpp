// The regime optimiser against an exhaustive search of the same small grid,
// grown regime by regime and rotation by rotation through the public calls.
#include "rotation/optimiser.hpp"

#include "engine/recordingreport.hpp"

#include <gtest/gtest.h>

namespace arbolex::rotation {
namespace {

using engine::testing::EngineTest;

constexpr Stand kSitka{0, 15.0f, 2500.0f, 7.0f, 20.0f};

Economics money(double rate) {
    Economics e{rate, 1200.0, 10.0, {}};
    for (std::size_t k = 0; k < e.prices.size(); ++k) {
        e.prices[k] = 4.0 + 3.5 * static_cast<double>(k);
    }
    return e;
}

class OptimiserTest : public EngineTest {
protected:
    OptimiserResult run(const OptimiserSettings &settings, const Stand &stand = kSitka) {
        GrowthFailure failure;
        std::optional<OptimiserResult> r = optimise(grow, stand, money(3.0), settings, failure);
        EXPECT_TRUE(r.has_value()) << failure.text;
        return r.value_or(OptimiserResult{});
    }

    OptimiserSettings smallGrid() const {
        OptimiserSettings s;
        s.thinFrom = {18, 22};
        s.thinEvery = {4, 7};
        s.thinVolume = {30.0f, 50.0f};
        s.maxRemovalShare = 0.3;
        s.minStocking = 500.0f;
        s.top = 4;
        s.refine = false;
        return s;
    }

    /// The largest LEV of the grid, each regime grown with its last thinning
    /// named and felled at every age its constraints allow.
    double exhaustiveBest(const OptimiserSettings &s) {
        double best = -1e300;
        auto consider = [&](const Regime &regime, int rotation) {
            GrowthFailure failure;
            const std::optional<GrowthPath> path = growPath(grow, kSitka, regime, failure);
            if (!path || rotationProblem(*path, regime, rotation)) {
                return;
            }
            for (const Harvest &t : path->thinnings) {
                const engine::StandState &before = path->at(t.age);
                if (t.volume > s.maxRemovalShare * before.volume ||
                    before.stocking - t.stocking < s.minStocking) {
                    return;
                }
            }
            best = std::max(best, *valueRotation(*path, rotation, money(3.0)).lev);
        };
        for (int r = 15; r <= 60; ++r) {
            consider({}, r);
        }
        for (const int from : s.thinFrom) {
            for (const int every : s.thinEvery) {
                for (const float volume : s.thinVolume) {
                    for (int until = from; until < 60; until += every) {
                        for (int r = until + 1; r <= std::min(until + every, 60); ++r) {
                            consider({from, every, volume, until}, r);
                        }
                    }
                }
            }
        }
        return best;
    }
};

TEST_F(OptimiserTest, GridSearchFindsTheExhaustiveBest) {
    const OptimiserSettings s = smallGrid();
    const OptimiserResult r = run(s);
    ASSERT_EQ(r.best.size(), 4u);
    EXPECT_EQ(r.regimesGrown, 8);
    EXPECT_DOUBLE_EQ(r.best.front().lev, exhaustiveBest(s));
    for (std::size_t i = 1; i < r.best.size(); ++i) {
        EXPECT_GE(r.best[i - 1].score, r.best[i].score);
    }
    // Each regime reported gives the same figures when grown and felled as written.
    for (const Candidate &c : r.best) {
        GrowthFailure failure;
        const std::optional<GrowthPath> path = growPath(grow, kSitka, c.regime, failure);
        ASSERT_TRUE(path.has_value()) << failure.text;
        ASSERT_FALSE(rotationProblem(*path, c.regime, c.rotation));
        const RotationValue v = valueRotation(*path, c.rotation, money(3.0));
        EXPECT_EQ(*v.lev, c.lev);
        EXPECT_EQ(*v.npv, c.npv);
    }
}

TEST_F(OptimiserTest, RefinementOnlyImprovesAndRepeatsItself) {
    OptimiserSettings s = smallGrid();
    const double coarse = run(s).best.front().score;
    s.refine = true;
    const OptimiserResult refined = run(s);
    EXPECT_GE(refined.best.front().score, coarse);
    EXPECT_GT(refined.regimesGrown, 8);
    const OptimiserResult again = run(s);
    ASSERT_EQ(again.best.size(), refined.best.size());
    for (std::size_t i = 0; i < again.best.size(); ++i) {
        EXPECT_EQ(again.best[i].score, refined.best[i].score);
        EXPECT_EQ(again.best[i].rotation, refined.best[i].rotation);
        EXPECT_EQ(again.best[i].regime.thinFrom, refined.best[i].regime.thinFrom);
    }
}

TEST_F(OptimiserTest, ConstraintsAndUnthinnedModelsLeaveTheRotationAlone) {
    OptimiserSettings s = smallGrid();
    s.maxRemovalShare = 0.01; // no thinning of the grid is light enough
    for (const Candidate &c : run(s).best) {
        EXPECT_FALSE(c.regime.thins());
    }
    Stand unthinned = kSitka;
    unthinned.model = 1;
    const OptimiserResult r = run(OptimiserSettings{}, unthinned);
    ASSERT_FALSE(r.best.empty());
    EXPECT_EQ(r.regimesGrown, 0);
    GrowthFailure failure;
    const GrowthPath path = *growPath(grow, unthinned, {}, failure);
    EXPECT_EQ(r.best.front().rotation, exploreRotations(path, {}, money(3.0)).economicRotation);
    s.objective = Objective::kVolume;
    s.maxRemovalShare = 0.35;
    EXPECT_EQ(run(s).best.front().rotation, 60) << "production grows to the age limit";
}

TEST_F(OptimiserTest, ProgressCanStopTheSearch) {
    OptimiserSettings s = smallGrid();
    GrowthFailure failure;
    int calls = 0;
    const std::optional<OptimiserResult> r =
        optimise(grow, kSitka, money(3.0), s, failure, [&](double fraction) {
            EXPECT_GT(fraction, 0.0);
            EXPECT_LE(fraction, 1.0);
            return ++calls < 3;
        });
    ASSERT_TRUE(r.has_value());
    EXPECT_FALSE(r->completed);
    EXPECT_EQ(r->regimesGrown, 3);
}

} // namespace
} // namespace arbolex::rotation
