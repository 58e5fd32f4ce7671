// Discounting yearly cash flows: cents rounded half to even, annual compound
// factors, and the sum of rounded values that the net present value is.
#include "valuation/discounting.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <thread>
#include <vector>

namespace arbolex::valuation {
namespace {

TEST(DiscountingTest, CentsRoundHalfToEven) {
    EXPECT_EQ(roundToCents(613.9132535), 613.91);
    EXPECT_EQ(roundToCents(0.125), 0.12); // a half exactly: to the even cent
    EXPECT_EQ(roundToCents(0.375), 0.38);
    EXPECT_EQ(roundToCents(-0.125), -0.12);
    EXPECT_EQ(roundToCents(2.5), 2.5);
}

TEST(DiscountingTest, AnnualCompoundFactorFromTheFirstYear) {
    EXPECT_EQ(*discountedCashFlow(1000.0, 5.0, 10), 613.91);
    // The first year is not discounted, whatever the rate.
    EXPECT_EQ(*discountedCashFlow(1234.567, 12.0, 0), 1234.57);
    // Without interest every year keeps its cash flow, to the cent.
    EXPECT_EQ(*discountedCashFlow(-99.999, 0.0, 40), -100.0);
    EXPECT_DOUBLE_EQ(*discountFactor(5.0, 2), 1.1025);
}

TEST(DiscountingTest, NetPresentValueSumsTheRoundedValues) {
    // Each year rounds to 0.33; the unrounded sum would round to 1.00.
    const std::vector<double> flows(3, 1.0 / 3.0 + 0.001);
    EXPECT_DOUBLE_EQ(*netPresentValue(flows, 0.0), 0.99);
    EXPECT_DOUBLE_EQ(*netPresentValue({-1000.0, 0.0, 1102.5}, 5.0), 0.0);
    EXPECT_EQ(*netPresentValue({}, 5.0), 0.0);
}

TEST(DiscountingTest, FactorsThatCannotBeComputedAreRefused) {
    EXPECT_FALSE(discountFactor(1.0e9, 60).has_value()); // overflow
    EXPECT_FALSE(discountFactor(-100.0, 3).has_value());
    EXPECT_FALSE(discountedCashFlow(1.0, std::numeric_limits<double>::infinity(), 1));
    EXPECT_FALSE(netPresentValue({1.0, 1.0, 1.0}, 1.0e200).has_value());
}

/// The factor as computed without any table, or std::nullopt where refused.
std::optional<double> untabled(double ratePercent, int years) {
    const double f = std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
    return std::isfinite(f) && f > 0.0 ? std::optional<double>(f) : std::nullopt;
}

/// Every factor of `rates` over ages past either end of a table, asked in an
/// order that switches the rate often and comes back to earlier ones.
void expectSameAsUntabled(const std::vector<double> &rates) {
    for (const int years : {0, 1, 2, 37, 50, 1, 255, 256, 300, -1, -40, 50}) {
        for (const double r : rates) {
            SCOPED_TRACE(testing::Message() << r << " % over " << years << " years");
            EXPECT_EQ(discountFactor(r, years), untabled(r, years));
        }
    }
}

TEST(DiscountingTest, FactorsAreThePowersWhateverWasAskedBefore) {
    expectSameAsUntabled({3.0, 3.5, 3.0, -2.0, 0.0, -0.0, 1e-9, 250.0, 1.0e9, -100.0, -150.0,
                          std::numeric_limits<double>::quiet_NaN(), 3.0});
}

TEST(DiscountingTest, ThreadsAtDifferentRatesGetTheirOwnFactors) {
    std::vector<std::thread> threads;
    for (const double r : {2.0, 4.0}) {
        threads.emplace_back([r] {
            for (int pass = 0; pass < 200; ++pass) {
                expectSameAsUntabled({r, r + 0.5});
            }
        });
    }
    for (std::thread &t : threads) {
        t.join();
    }
}

} // namespace
} // namespace arbolex::valuation
