// Discounting yearly cash flows: cents rounded half to even, annual compound
// factors, and the sum of rounded values that the net present value is.
#include "valuation/discounting.hpp"

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <limits>
#include <random>
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
    // Whole cents past 2^52 stay as they are; a value that rounds to no cent
    // keeps its sign, as nearbyint leaves it.
    for (const double euro : {0x1p52 / 100.0, 0x1p53 / 100.0 + 0.5, -0x1p51 / 100.0 - 0.005, 1e300,
                              -0.004, 0.004, 12345.675, -12345.685}) {
        const double expected = std::nearbyint(euro * 100.0) / 100.0;
        EXPECT_EQ(std::bit_cast<std::uint64_t>(roundToCents(euro)),
                  std::bit_cast<std::uint64_t>(expected))
            << euro;
    }
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

/// The net present value as its definition reads: every year's cash flow over
/// std::pow's factor, rounded to cents, summed from the first year.
std::optional<double> byPowers(const std::vector<double> &cashFlows, double ratePercent) {
    double sum = 0.0;
    for (std::size_t i = 0; i < cashFlows.size(); ++i) {
        const auto factor = untabled(ratePercent, static_cast<int>(i));
        if (!factor) {
            return std::nullopt;
        }
        sum += roundToCents(cashFlows[i] / *factor);
    }
    return sum;
}

TEST(DiscountingTest, NetPresentValueIsTheSumOfPowersToTheBit) {
    std::mt19937_64 draw(20260101);
    std::uniform_real_distribution<double> rate(-20.0, 30.0);
    std::uniform_real_distribution<double> money(-5000.0, 50000.0);
    std::uniform_int_distribution<int> years(1, 120);
    std::uniform_int_distribution<int> cents(-500000, 5000000);
    for (int c = 0; c < 3000; ++c) {
        const double r = c % 7 == 0 ? std::nearbyint(rate(draw)) : rate(draw);
        std::vector<double> flows(static_cast<std::size_t>(years(draw)));
        for (std::size_t i = 0; i < flows.size(); ++i) {
            // One flow in three lands on half a cent once discounted: its
            // cents are decided by the last bits of the factor.
            const double q = 1.0 + r / 100.0;
            flows[i] =
                i % 3 == 1 ? (cents(draw) + 0.5) / 100.0 * std::pow(q, double(i)) : money(draw);
        }
        SCOPED_TRACE(testing::Message() << "rate " << r << ", " << flows.size() << " years");
        EXPECT_EQ(netPresentValue(flows, r), byPowers(flows, r));
    }
    for (const double r : {-100.0, -150.0, 1.0e9, 1.0e200, 0.0}) {
        EXPECT_EQ(netPresentValue({1.0, -2.5, 1e300, 0.125}, r),
                  byPowers({1.0, -2.5, 1e300, 0.125}, r))
            << r;
    }
}

} // namespace
} // namespace arbolex::valuation
