// A rotation grown by the engine and valued: the path keeps the crop before
// each thinning, harvests are priced by their mean tree's class, and the
// explorer, the single rotation and the valuation functions agree.
#include "rotation/rotation.hpp"

#include "engine/recordingreport.hpp"
#include "valuation/forestvalue.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace arbolex::rotation {
namespace {

using engine::testing::EngineTest;
using engine::testing::nearRel;

/// A young Sitka spruce stand (a thinned model).
constexpr Stand kSitka{0, 15.0f, 2500.0f, 7.0f, 20.0f};

/// Prices that tell the classes apart: class k sells at 10 + k euro/m³.
PriceList stepPrices() {
    PriceList p{};
    for (std::size_t k = 0; k < p.size(); ++k) {
        p[k] = 10.0 + static_cast<double>(k);
    }
    return p;
}

/// Makes the stand's model active as growPath does, with its transition.
bool prepare(engine::Grow &grow, const Stand &stand) {
    grow.GetModel(stand.model);
    grow.GetVCF();
    if (!grow.SiteIndex(stand.age, stand.height)) {
        return false;
    }
    grow.TM(grow.siteIndex());
    return true;
}

class RotationTest : public EngineTest {
protected:
    GrowthPath grown(const Stand &stand, const Regime &regime) {
        GrowthFailure failure;
        std::optional<GrowthPath> path = growPath(grow, stand, regime, failure);
        EXPECT_TRUE(path.has_value()) << failure.text;
        return path.value_or(GrowthPath{});
    }

    GrowthFailure refused(const Stand &stand, const Regime &regime) {
        GrowthFailure failure;
        EXPECT_FALSE(growPath(grow, stand, regime, failure).has_value());
        return failure;
    }

    Economics economics(double rate) const { return {rate, 0.0, 0.0, stepPrices()}; }

    const Regime m_thinning{20, 5, 40.0f, 35};
};

TEST_F(RotationTest, UnthinnedPathIsTheEngineProjection) {
    const GrowthPath path = grown(kSitka, {});
    ASSERT_EQ(path.presentAge, 15);
    ASSERT_EQ(path.ageLimit, 60);
    ASSERT_EQ(path.years.size(), 46u);
    EXPECT_TRUE(path.thinnings.empty());

    engine::Grow other;
    ASSERT_TRUE(prepare(other, kSitka));
    std::vector<engine::StandState> states;
    ASSERT_TRUE(
        other.PROJ(15.0f, kSitka.basalArea, kSitka.stocking, kSitka.height, 60.0f, 1.0f, states));
    ASSERT_EQ(states.size(), path.years.size());
    for (std::size_t i = 0; i < states.size(); ++i) {
        EXPECT_EQ(path.years[i].age, states[i].age);
        EXPECT_EQ(path.years[i].volume, states[i].volume) << "age " << states[i].age;
    }
}

TEST_F(RotationTest, ThinningsRemoveTheirVolumeAndTheStandGrowsOnFromWhatIsLeft) {
    const GrowthPath path = grown(kSitka, m_thinning);
    ASSERT_EQ(path.thinnings.size(), 4u);
    for (std::size_t i = 0; i < path.thinnings.size(); ++i) {
        const Harvest &t = path.thinnings[i];
        EXPECT_EQ(t.age, 20 + 5 * static_cast<int>(i));
        EXPECT_TRUE(nearRel(40.0, t.volume, 1e-4)) << "age " << t.age;
        EXPECT_GT(t.stocking, 0.0f);
        EXPECT_DOUBLE_EQ(t.meanTreeVolume, t.volume / std::nearbyint(double{t.stocking}));
        EXPECT_EQ(t.priceClass, priceClassOf(t.meanTreeVolume));
    }
    // The record of a thinning age is the crop before it; the next year grows
    // from the residual state the thinning response gives.
    const engine::StandState &before = path.at(20);
    float nr = 0.0f;
    float gr = 0.0f;
    engine::Grow other;
    ASSERT_TRUE(prepare(other, kSitka));
    ASSERT_TRUE(other.NEWTON(before.stocking, before.basalArea, before.topHeight,
                             before.volume - 40.0f, nr, gr));
    EXPECT_EQ(path.thinnings[0].stocking, before.stocking - nr);
    std::vector<engine::StandState> states;
    ASSERT_TRUE(other.PROJ(20.0f, gr, nr, before.topHeight, 21.0f, 1.0f, states));
    EXPECT_EQ(path.at(21).volume, states.back().volume);
    EXPECT_LT(path.at(21).volume, grown(kSitka, {}).at(21).volume);
}

TEST_F(RotationTest, ThinningsRunToTheLastNamedAgeOrUpToTheAgeLimit) {
    Regime open = m_thinning;
    open.thinUntil.reset();
    const GrowthPath path = grown(kSitka, open);
    ASSERT_FALSE(path.thinnings.empty());
    EXPECT_EQ(path.thinnings.back().age, 55);
    // A rotation takes only the thinnings before its final cut.
    EXPECT_EQ(valueRotation(path, 42, economics(2.0)).thinnings.size(), 5u);
    EXPECT_EQ(firstRotation(path, open), 21);
    EXPECT_EQ(firstRotation(grown(kSitka, m_thinning), m_thinning), 36);
    EXPECT_EQ(firstRotation(grown(kSitka, {}), {}), 15);
}

struct ProblemCase {
    const char *what;
    Regime regime;
    int rotation;
    bool problem;
};

class RotationProblemTest : public RotationTest, public testing::WithParamInterface<ProblemCase> {};

TEST_P(RotationProblemTest, RotationsAfterTheThinningsWithinTheAgeLimit) {
    const ProblemCase &c = GetParam();
    GrowthPath path;
    path.presentAge = 15;
    path.ageLimit = 60;
    EXPECT_EQ(rotationProblem(path, c.regime, c.rotation).has_value(), c.problem) << c.what;
}

INSTANTIATE_TEST_SUITE_P(
    Ages, RotationProblemTest,
    testing::Values(ProblemCase{"after the last thinning", {20, 5, 40.0f, 35}, 36, false},
                    ProblemCase{"at the last thinning", {20, 5, 40.0f, 35}, 35, true},
                    // 20, 25, 30, 35: a last age of 38 names 35 as the last thinning.
                    ProblemCase{"last age between thinnings", {20, 5, 40.0f, 38}, 36, false},
                    ProblemCase{"open regime", {20, 5, 40.0f, std::nullopt}, 21, false},
                    ProblemCase{
                        "before the first thinning", {20, 5, 40.0f, std::nullopt}, 20, true},
                    ProblemCase{"at the age limit", {}, 60, false},
                    ProblemCase{"past the age limit", {}, 61, true},
                    ProblemCase{"felled today", {}, 15, false},
                    ProblemCase{"before today", {}, 14, true}));

TEST_F(RotationTest, RegimesTheStandCannotCarryAreRefused) {
    // The thinning window refuses to remove more than stands: the path ends
    // at the first thinning, and a rotation past it gets the window's message.
    Regime heavy = m_thinning;
    heavy.thinVolume = 5000.0f;
    const GrowthPath stopped = grown(kSitka, heavy);
    ASSERT_TRUE(stopped.stop.has_value());
    EXPECT_EQ(stopped.lastAge(), 20);
    EXPECT_EQ(rotationProblem(stopped, heavy, 40),
              "FAULT - Proposed thinning leads to negative or zero Volume.");
    Regime early = m_thinning;
    early.thinFrom = 12;
    EXPECT_TRUE(refused(kSitka, early).badInput);
    Regime reversed = m_thinning;
    reversed.thinUntil = 18;
    EXPECT_TRUE(refused(kSitka, reversed).badInput);
    // Model 1 is un-thinned: it has no thinning response.
    Stand unthinned = kSitka;
    unthinned.model = 1;
    EXPECT_TRUE(refused(unthinned, m_thinning).badInput);
    EXPECT_EQ(grown(unthinned, {}).ageLimit, 60);
    Stand old = kSitka;
    old.age = 65.0f;
    EXPECT_TRUE(refused(old, {}).badInput);
}

TEST_F(RotationTest, HarvestsArePricedByTheirMeanTreeAndCostsAreCharged) {
    const GrowthPath path = grown(kSitka, m_thinning);
    Economics e = economics(3.0);
    e.establishmentCost = 1500.0;
    e.annualCost = 20.0;
    const RotationValue v = valueRotation(path, 45, e);
    const engine::StandState &crop = path.at(45);
    EXPECT_EQ(v.finalCut.volume, crop.volume);
    const double shownMeanTree =
        std::round(crop.volume / std::nearbyint(double{crop.stocking}) * 1000.0) / 1000.0;
    EXPECT_EQ(v.finalCut.meanTreeVolume, shownMeanTree);
    EXPECT_DOUBLE_EQ(v.finalCut.revenue, crop.volume * (10.0 + priceClassOf(shownMeanTree)));
    ASSERT_EQ(v.thinnings.size(), 4u);
    for (const Harvest &t : v.thinnings) {
        EXPECT_DOUBLE_EQ(t.revenue, t.volume * (10.0 + t.priceClass));
    }
    ASSERT_EQ(v.cashflow.size(), 46u);
    EXPECT_EQ(v.cashflow[0].cost, 1500.0);
    EXPECT_EQ(v.cashflow[1].cost, 20.0);
    EXPECT_EQ(v.cashflow[25].revenue, v.thinnings[1].revenue);
    EXPECT_EQ(v.cashflow[45].revenue, v.finalCut.revenue);
    EXPECT_EQ(v.cashflow[44].revenue, 0.0);

    // The establishment cost lies before today: it lowers the LEV by
    // C·q^R/(q^R − 1) and leaves the net present value alone.
    e.establishmentCost = 0.0;
    const RotationValue free = valueRotation(path, 45, e);
    const double qR = std::pow(1.03, 45);
    EXPECT_TRUE(nearRel(*free.lev - 1500.0 * qR / (qR - 1.0), *v.lev, 1e-12));
    EXPECT_EQ(*free.npv, *v.npv);
    EXPECT_TRUE(nearRel(*v.lev * 0.03, *v.eaa, 1e-12));
    // A rotation that pays has a return above its rate and a break-even
    // factor below 1; that the factor brings the LEV to 0 is checked with the
    // cash flow's entries below.
    ASSERT_GT(*v.lev, 0.0);
    ASSERT_EQ(v.irr.outcome, valuation::IrrOutcome::kRoot);
    EXPECT_GT(v.irr.ratePercent, 3.0);
    EXPECT_LT(*v.breakEvenPriceFactor, 1.0);
}

TEST_F(RotationTest, CashFlowEntriesCountInEveryRotationThatReachesThem) {
    const GrowthPath path = grown(kSitka, m_thinning);
    Economics e = economics(3.0);
    e.annualCost = 5.0;
    const RotationValue plain = valueRotation(path, 45, e);
    e.entries = {{16, 1200.0, 0.0}, {28, 0.0, 300.5}, {45, 450.0, 0.0}, {55, 999.0, 0.0}};
    const RotationValue v = valueRotation(path, 45, e);
    EXPECT_EQ(v.cashflow[16].cost, 1205.0);
    EXPECT_EQ(v.cashflow[28].otherRevenue, 300.5);
    EXPECT_EQ(v.cashflow[28].revenue, plain.cashflow[28].revenue) << "not timber";
    EXPECT_EQ(v.cashflow[45].cost, 455.0);
    // From the present age each year's cash flow is discounted and rounded
    // to cents: the entries move the NPV by their own discounted cents.
    const auto cents = [](double euro, int years) {
        return std::nearbyint(euro / std::pow(1.03, years) * 100.0) / 100.0;
    };
    EXPECT_NEAR(*v.npv - *plain.npv, -cents(1200.0, 1) + cents(300.5, 13) - cents(450.0, 30), 0.03);
    // The entry at 55 comes after the final cut at 45: it is not counted.
    e.entries.pop_back();
    EXPECT_EQ(valueRotation(path, 45, e).lev, v.lev);
    // Other revenues do not follow timber prices: the break-even factor on the
    // prices alone brings the LEV to 0.
    ASSERT_TRUE(v.breakEvenPriceFactor.has_value());
    for (double &p : e.prices) {
        p *= *v.breakEvenPriceFactor;
    }
    EXPECT_NEAR(*valueRotation(path, 45, e).lev, 0.0, 1e-6);
    // The explorer's rotations that reach 55 count its entry.
    e.prices = stepPrices();
    e.entries = {{55, 999.0, 0.0}};
    const RotationExplorer explorer = exploreRotations(path, m_thinning, e);
    Economics none = e;
    none.entries.clear();
    const RotationExplorer without = exploreRotations(path, m_thinning, none);
    ASSERT_EQ(explorer.rows.size(), without.rows.size());
    for (std::size_t i = 0; i < explorer.rows.size(); ++i) {
        const RotationRow &row = explorer.rows[i];
        EXPECT_EQ(row.npv, valueRotation(path, row.age, e).npv) << row.age;
        EXPECT_EQ(row.age < 55, row.lev == without.rows[i].lev) << row.age;
    }
}

TEST_F(RotationTest, ExplorerAgreesWithEachRotationAndNamesBothOptima) {
    const GrowthPath path = grown(kSitka, m_thinning);
    const Economics e = economics(2.5);
    const RotationExplorer explorer = exploreRotations(path, m_thinning, e);
    ASSERT_EQ(explorer.rows.front().age, 36);
    ASSERT_EQ(explorer.rows.back().age, 60);
    for (const RotationRow &row : explorer.rows) {
        const RotationValue v = valueRotation(path, row.age, e);
        EXPECT_EQ(row.lev, v.lev) << row.age;
        EXPECT_EQ(row.npv, v.npv) << row.age;
        EXPECT_EQ(row.forestValue, v.forestValue) << row.age;
        EXPECT_EQ(row.mai, v.mai) << row.age;
    }
    auto largest = [&](auto field) {
        return std::max_element(
                   explorer.rows.begin(), explorer.rows.end(),
                   [&](const RotationRow &a, const RotationRow &b) { return field(a) < field(b); })
            ->age;
    };
    EXPECT_EQ(explorer.biologicalRotation, largest([](const RotationRow &r) { return r.mai; }));
    EXPECT_EQ(explorer.economicRotation, largest([](const RotationRow &r) { return *r.lev; }));
}

TEST_F(RotationTest, DearerMoneyFellsNoLater) {
    const GrowthPath path = grown(kSitka, {});
    int previous = path.ageLimit;
    for (const double rate : {1.0, 2.0, 4.0, 8.0}) {
        const int economic = exploreRotations(path, {}, economics(rate)).economicRotation;
        EXPECT_LE(economic, previous) << rate << " %";
        previous = economic;
    }
    EXPECT_EQ(exploreRotations(path, {}, economics(0.0)).economicRotation, 0)
        << "without interest the LEV does not exist";
}

} // namespace
} // namespace arbolex::rotation
