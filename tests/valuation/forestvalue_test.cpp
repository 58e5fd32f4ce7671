// The bare-land and stand valuations against cases worked by hand.
#include "valuation/forestvalue.hpp"

#include <gtest/gtest.h>

#include <vector>

namespace arbolex::valuation {
namespace {

struct LevCase {
    const char *what;
    std::vector<double> cashFlowByAge;
    double ratePercent;
    double lev;
};

class LandExpectationValueTest : public testing::TestWithParam<LevCase> {};

TEST_P(LandExpectationValueTest, HandWorked) {
    const LevCase &c = GetParam();
    ASSERT_TRUE(landExpectationValue(c.cashFlowByAge, c.ratePercent).has_value()) << c.what;
    EXPECT_NEAR(*landExpectationValue(c.cashFlowByAge, c.ratePercent), c.lev, 1e-9 * c.lev)
        << c.what;
}

INSTANTIATE_TEST_SUITE_P(
    Faustmann, LandExpectationValueTest,
    testing::Values(
        // A single final cut of 1000 every year at 10 %: 1000 / 0.1.
        LevCase{"yearly final cut", {0.0, 1000.0}, 10.0, 10000.0},
        // 1000 every 2 years: 1000 / (1.1² − 1) = 1000 / 0.21.
        LevCase{"final cut at 2", {0.0, 0.0, 1000.0}, 10.0, 1000.0 / 0.21},
        // Planting cost carried to the final cut: (1000 − 100 · 1.21) / 0.21.
        LevCase{"planting cost", {-100.0, 0.0, 1000.0}, 10.0, 879.0 / 0.21},
        // A thinning at 1 earns one year's interest: (1000 + 50 · 1.05) / 0.1025.
        LevCase{"thinning", {0.0, 50.0, 1000.0}, 5.0, 1052.5 / 0.1025}));

TEST(ForestValueTest, AnnuityAndStandValueFollowFromTheLev) {
    const double lev = *landExpectationValue({-100.0, 0.0, 1000.0}, 10.0);
    EXPECT_NEAR(equivalentAnnualAnnuity(lev, 10.0), 87.9 / 0.21, 1e-9);
    // Two years to the final cut of 1000: 826.45 (to the cent) + LEV / 1.21.
    EXPECT_NEAR(*forestValue({0.0, 0.0, 1000.0}, lev, 10.0), 826.45 + lev / 1.21, 1e-9);
    // Felled today: the final cut and the bare land.
    EXPECT_NEAR(*forestValue({1000.0}, lev, 10.0), 1000.0 + lev, 1e-9);
}

TEST(ForestValueTest, ValuesThatDoNotExistAreRefused) {
    EXPECT_FALSE(landExpectationValue({0.0, 1000.0}, 0.0)) << "no interest: an endless sum";
    EXPECT_FALSE(landExpectationValue({0.0, 1000.0}, -2.0));
    EXPECT_FALSE(landExpectationValue({1000.0}, 5.0)) << "a rotation of 0 years";
    EXPECT_FALSE(landExpectationValue({0.0, 0.0, 1.0}, 1.0e200)) << "overflow";
    EXPECT_FALSE(breakEvenPriceFactor({0.0, 0.0}, {100.0, 0.0}, 5.0)) << "no timber revenue";
}

TEST(BreakEvenTest, PriceFactorBringsTheLevToZero) {
    const std::vector<double> revenue = {0.0, 200.0, 1000.0};
    const std::vector<double> cost = {300.0, 20.0, 20.0};
    // (300 · 1.21 + 20 · 1.1 + 20) / (200 · 1.1 + 1000) = 405 / 1220.
    const double k = *breakEvenPriceFactor(revenue, cost, 10.0);
    EXPECT_NEAR(k, 405.0 / 1220.0, 1e-12);
    std::vector<double> flow;
    for (std::size_t a = 0; a < revenue.size(); ++a) {
        flow.push_back(k * revenue[a] - cost[a]);
    }
    EXPECT_NEAR(*landExpectationValue(flow, 10.0), 0.0, 1e-9);
}

struct IrrCase {
    const char *what;
    std::vector<double> cashFlowByAge;
    IrrOutcome outcome;
    double ratePercent;
};

class InternalRateTest : public testing::TestWithParam<IrrCase> {};

TEST_P(InternalRateTest, HandWorked) {
    const IrrCase &c = GetParam();
    const InternalRate irr = internalRateOfReturn(c.cashFlowByAge);
    EXPECT_EQ(irr.outcome, c.outcome) << c.what;
    EXPECT_NEAR(irr.ratePercent, c.ratePercent, 1e-8) << c.what;
}

INSTANTIATE_TEST_SUITE_P(
    Bracketing, InternalRateTest,
    testing::Values(
        // Two payments: 121 / 100 = 1.1² gives 10 %; 1500 / 1000 gives 50 %.
        IrrCase{"two payments, 2 years", {-100.0, 0.0, 121.0}, IrrOutcome::kRoot, 10.0},
        IrrCase{"two payments, 1 year", {-1000.0, 1500.0}, IrrOutcome::kRoot, 50.0},
        IrrCase{"a loss", {-1000.0, 0.0, 0.0, 512.0}, IrrOutcome::kRoot, -20.0},
        IrrCase{"long rotation",
                {-1000.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 1024000.0},
                IrrOutcome::kRoot,
                100.0},
        IrrCase{"revenue only", {0.0, 100.0, 200.0}, IrrOutcome::kNoSignChange, 0.0},
        IrrCase{"cost only", {-100.0, -5.0}, IrrOutcome::kNoSignChange, 0.0},
        IrrCase{"nothing", {0.0, 0.0}, IrrOutcome::kNoSignChange, 0.0},
        // 132x² − 230x + 100 = 0 with x = 1/(1+r): x = 10/11 and 5/6, 10 % and 20 %.
        IrrCase{"two roots", {-100.0, 230.0, -132.0}, IrrOutcome::kMoreThanOneRoot, 0.0},
        // −100 + 150x − 100x² has no real root.
        IrrCase{"sign changes, no root", {-100.0, 150.0, -100.0}, IrrOutcome::kNoRoot, 0.0}));

} // namespace
} // namespace arbolex::valuation
