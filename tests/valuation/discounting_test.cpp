// Discounting yearly cash flows: cents rounded half to even, annual compound
// factors, and the sum of rounded values that the net present value is.
#include "valuation/discounting.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

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

} // namespace
} // namespace arbolex::valuation
