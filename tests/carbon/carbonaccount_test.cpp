// The carbon account of a rotation: the trees' carbon per m³ of stem within
// the published bounds of its constants, a balance that closes in every year
// of every model's rotation, harvests that move carbon without making or
// losing any, units within their cap, and carbon money that scales with its
// price and lengthens the economic rotation.
#include "carbon/account.hpp"
#include "engine/catalogue.hpp"
#include "engine/modeldescription.hpp"
#include "engine/recordingreport.hpp"
#include "rotation/rotation.hpp"

#include <gtest/gtest.h>

#include <cmath>

namespace arbolex::rotation {
namespace {

using engine::testing::EngineTest;
using engine::testing::nearRel;

TEST(CarbonOfTrees, RootsAndWholeTreeWithinPublishedBounds) {
    const carbon::Parameters p;
    // Root over above-ground biomass stays within the ratios the IPCC tabulates
    // for temperate conifer forest (0.20 above 150 t/ha to 0.40 below 50 t/ha).
    for (double aboveGround = 10.0; aboveGround <= 400.0; aboveGround += 10.0) {
        const double roots = std::exp(p.rootIntercept + p.rootSlope * std::log(aboveGround));
        EXPECT_GE(roots / aboveGround, 0.20) << aboveGround;
        EXPECT_LE(roots / aboveGround, 0.40) << aboveGround;
    }
    // So a m³ of stem holds stem carbon times the branch expansion times 1.2
    // to 1.4, whatever the species and the standing volume.
    for (const carbon::SpeciesGravity &g : p.gravity) {
        const double stem = carbon::stemWood(1.0, g.gravity, p);
        for (double volume = 20.0; volume <= 900.0; volume += 40.0) {
            const double perM3 = carbon::liveTrees(volume, g.gravity, p) / volume;
            EXPECT_GE(perM3, stem * p.branchExpansion * 1.2) << g.species << " " << volume;
            EXPECT_LE(perM3, stem * p.branchExpansion * 1.4) << g.species << " " << volume;
        }
    }
    EXPECT_NEAR(carbon::stemWood(1.0, p.gravityOf("SS"), p), 0.33 * 0.5 * 44.0 / 12.0, 1e-12);
    EXPECT_EQ(carbon::liveTrees(0.0, 0.33, p), 0.0);
}

/// Economics with flat prices and carbon as given.
Economics valued(double rate, carbon::Payment payment = carbon::Payment::kNone,
                 double price = 0.0) {
    Economics e;
    e.ratePercent = rate;
    e.establishmentCost = 1500.0;
    e.annualCost = 10.0;
    e.prices.fill(30.0);
    e.carbon = {price, payment};
    return e;
}

class CarbonAccountTest : public EngineTest {
protected:
    /// Every model's rotation from two plausible stands, thinned where the
    /// model responds to thinning; `visit` gets each path and final cut.
    template <class Visit> int forEveryModel(Visit visit) {
        int visited = 0;
        for (std::int16_t model = 0; model < engine::kModelCount; ++model) {
            for (const float age : {14.0f, 22.0f}) {
                const Stand stand{model, age, 2400.0f - 40.0f * age, 0.42f * age + 2.0f,
                                  1.2f * age};
                grow.GetModel(model);
                Regime regime;
                if (grow.isThinnedModel() && (model % 2 == 0 || model > 9)) {
                    regime = {static_cast<int>(age) + 6, 5, 35.0f, std::nullopt};
                }
                GrowthFailure failure;
                std::optional<GrowthPath> path = growPath(grow, stand, regime, failure);
                if (!path) {
                    regime = {};
                    path = growPath(grow, stand, regime, failure);
                }
                EXPECT_TRUE(path) << model << ": " << failure.text;
                if (!path) {
                    continue;
                }
                const int rotation = std::min(path->lastAge(), 50);
                if (rotationProblem(*path, regime, rotation)) {
                    continue;
                }
                visit(*path, regime, rotation);
                ++visited;
            }
        }
        return visited;
    }
};

TEST_F(CarbonAccountTest, BalanceClosesEveryYearAndHarvestsMoveCarbonWithoutLosingAny) {
    const carbon::Parameters p;
    const int visited = forEveryModel([&](const GrowthPath &path, const Regime &, int rotation) {
        const RotationHarvests h = rotationHarvests(path, rotation);
        const carbon::Account a = rotationCarbon(h, p);
        ASSERT_EQ(a.years.size(), static_cast<std::size_t>(rotation) + 1);
        double sequestered = 0.0;
        double emitted = 0.0;
        double treesBefore = 0.0;
        for (const carbon::AccountYear &y : a.years) {
            sequestered += y.sequestration;
            emitted += y.emissions;
            const double scale = std::max(1.0, sequestered);
            // What the trees took up stands in them, in products, or was emitted.
            EXPECT_NEAR(sequestered, y.trees + y.products + emitted, 1e-9 * scale)
                << path.model << " age " << y.age;
            EXPECT_NEAR(y.cumulativeNetRemoval, y.trees + y.products, 1e-9 * scale);
            // A harvest takes from the trees exactly what it sends on.
            EXPECT_NEAR(treesBefore + y.sequestration - y.harvested, y.trees, 1e-9 * scale);
            EXPECT_GE(y.harvested, 0.0);
            treesBefore = y.trees;
        }
        EXPECT_EQ(a.years.back().trees, 0.0) << "the final cut takes the whole crop";
        // Each thinning takes the carbon of the volume it removes.
        for (const Harvest &t : h.thinnings) {
            const carbon::AccountYear &y = a.years[static_cast<std::size_t>(t.age)];
            const double gravity = p.gravityOf(engine::speciesCode(path.model));
            EXPECT_NEAR(y.harvested,
                        carbon::liveTrees(path.at(t.age).volume, gravity, p) -
                            carbon::liveTrees(t.residual.volume, gravity, p),
                        1e-9 * y.harvested);
            EXPECT_GT(y.products, a.years[static_cast<std::size_t>(t.age) - 1].products);
        }
        // Units never pass the long-term average less the buffer.
        EXPECT_LE(a.unitsTotal, (1.0 - p.bufferShare) * a.longTermAverage + 1e-9);
        EXPECT_GT(a.unitsTotal, 0.0);
    });
    EXPECT_GE(visited, 30);
}

TEST_F(CarbonAccountTest, CarbonMoneyScalesWithItsPriceAndLeavesTimberAlone) {
    forEveryModel([&](const GrowthPath &path, const Regime &, int rotation) {
        const RotationValue none = valueRotation(path, rotation, valued(3.0));
        for (const carbon::Payment pay : {carbon::Payment::kFlow, carbon::Payment::kUnits}) {
            const RotationValue low = valueRotation(path, rotation, valued(3.0, pay, 10.0));
            const RotationValue high = valueRotation(path, rotation, valued(3.0, pay, 40.0));
            // Each year's discounted flow is rounded to the cent, as the
            // cash-flow window rounds it.
            const double cents = 0.01 * (rotation + 1);
            EXPECT_NEAR(4.0 * *low.npvCarbon, *high.npvCarbon, 2.5 * cents);
            EXPECT_NEAR(4.0 * *low.levCarbon, *high.levCarbon, 0.001 * std::fabs(*high.levCarbon));
            EXPECT_GT(std::fabs(*high.npvCarbon), 100.0 * cents);
            EXPECT_EQ(*high.npvTimber, *none.npv) << "timber money as without carbon";
            EXPECT_NEAR(*high.npvTimber + *high.npvCarbon, *high.npv, cents);
        }
        // A payment without a price is no carbon money: every figure as before.
        const RotationValue free =
            valueRotation(path, rotation, valued(3.0, carbon::Payment::kFlow));
        EXPECT_EQ(*free.npv, *none.npv);
        EXPECT_EQ(free.breakEvenPriceFactor, none.breakEvenPriceFactor);
        EXPECT_EQ(*none.npvCarbon, 0.0);
    });
}

TEST_F(CarbonAccountTest, PaymentsForNetRemovalNeverShortenTheEconomicRotation) {
    int longer = 0;
    forEveryModel([&](const GrowthPath &path, const Regime &regime, int) {
        const int timber = exploreRotations(path, regime, valued(3.0)).economicRotation;
        const int withCarbon =
            exploreRotations(path, regime, valued(3.0, carbon::Payment::kFlow, 100.0))
                .economicRotation;
        EXPECT_GE(withCarbon, timber) << "model " << path.model << " from " << path.presentAge;
        longer += withCarbon > timber ? 1 : 0;
    });
    EXPECT_GT(longer, 0);
}

} // namespace
} // namespace arbolex::rotation
