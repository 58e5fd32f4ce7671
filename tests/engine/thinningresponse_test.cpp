// The thinning response: residual stocking, residual basal area and the Newton
// solve for a residual volume.
#include "recordingreport.hpp"

#include <bit>
#include <cmath>
#include <cstdint>
#include <limits>
#include <utility>
#include <vector>

namespace arbolex::engine::testing {
namespace {

/// A stand ready for thinning: age 30, 2000 stems/ha, top height 13 m, 40 m²/ha.
constexpr float kStocking = 2000.0f;
constexpr float kHeight = 13.0f;
constexpr float kBasalArea = 40.0f;

class ThinningResponseTest : public EngineTest, public ::testing::WithParamInterface<int> {
protected:
    void SetUp() override {
        ASSERT_TRUE(grow.GetModel(static_cast<std::int16_t>(GetParam())));
        grow.GetVCF();
        ASSERT_TRUE(grow.SiteIndex(30.0f, kHeight));
    }
};

TEST_P(ThinningResponseTest, ResidualStockingAndBasalAreaAreInverse) {
    EXPECT_EQ(grow.NRES(kHeight, kStocking, kBasalArea, kBasalArea), kStocking);
    EXPECT_TRUE(nearRel(kBasalArea, grow.BRES(kHeight, kStocking, kBasalArea, kStocking), 1e-12));
    float previous = kStocking;
    for (float gr : {35.0f, 30.0f, 22.5f, 15.0f}) {
        const float nr = grow.NRES(kHeight, kStocking, kBasalArea, gr);
        EXPECT_LT(nr, previous) << gr; // less basal area left, fewer stems left
        previous = nr;
        EXPECT_TRUE(nearRel(gr, grow.BRES(kHeight, kStocking, kBasalArea, nr), 1e-6)) << gr;
    }
}

TEST_P(ThinningResponseTest, NewtonKeepsAStandAtItsOwnVolume) {
    const float v = grow.GetV7(kBasalArea, kStocking, kHeight);
    float nr = 0.0f, gr = 0.0f;
    ASSERT_TRUE(grow.NEWTON(kStocking, kBasalArea, kHeight, v, nr, gr));
    EXPECT_NEAR(gr, kBasalArea, 1e-3);
    EXPECT_TRUE(nearRel(kStocking, nr, 1e-6));
}

TEST_P(ThinningResponseTest, NewtonRemovesAQuarterOfTheVolume) {
    const float vt = 0.75f * grow.GetV7(kBasalArea, kStocking, kHeight);
    float nr = 0.0f, gr = 0.0f;
    ASSERT_TRUE(grow.NEWTON(kStocking, kBasalArea, kHeight, vt, nr, gr));
    EXPECT_LT(gr, kBasalArea);
    EXPECT_LT(nr, kStocking);
    // Nr belongs to the basal area one Newton step before Gr; the volume of
    // the returned basal area on the response curve is on target.
    EXPECT_NEAR(grow.GetV7(gr, grow.NRES(kHeight, kStocking, kBasalArea, gr), kHeight), vt, 0.01);
}

/// The catalogue entries with a thinning response.
INSTANTIATE_TEST_SUITE_P(Grow, ThinningResponseTest,
                         ::testing::Values(0, 2, 4, 6, 8, 10, 12, 14, 16, 19, 21));

using ThinningFailureTest = EngineTest;

TEST_F(ThinningFailureTest, ModelWithoutResponseDividesByZero) {
    ASSERT_TRUE(grow.GetModel(1)); // a = 0
    EXPECT_EQ(grow.NRES(kHeight, kStocking, kBasalArea, 30.0f), 0.0f);
    EXPECT_EQ(grow.BRES(kHeight, kStocking, kBasalArea, 1500.0f), 0.0);
    ASSERT_EQ(report.messages.size(), 2u);
    ASSERT_EQ(report.logLines.size(), 2u);
    EXPECT_EQ(report.messages[0].title, titles::kArbolex);
    EXPECT_EQ(report.messages[0].text,
              "ERROR - in residual stocking calculation. Reason: Division by zero");
    EXPECT_EQ(report.messages[1].text,
              "ERROR - in residual Basal Area calculation. Reason: Division by zero");
    for (const std::string &line : report.logLines) {
        EXPECT_TRUE(line.starts_with("Error # :11  Division by zero in line ")) << line;
    }
    // The residual stocking's mark has never carried parentheses.
    EXPECT_TRUE(report.logLines[0].ends_with(" in Grow.NRES")) << report.logLines[0];
    EXPECT_TRUE(report.logLines[1].ends_with(" in Grow.BRES()")) << report.logLines[1];
    report.clear();
}

TEST_F(ThinningFailureTest, UnreachableVolumeTripsTheIterationLimit) {
    // Along the response curve of this lodgepole pine stand the volume peaks
    // just under its present volume, so asking for 1% more makes Newton's
    // method oscillate around the peak.
    ASSERT_TRUE(grow.GetModel(6));
    ASSERT_TRUE(grow.SiteIndex(30.0f, 15.0f));
    const float vt = 1.01f * grow.GetV7(20.0f, 2500.0f, 15.0f);
    float nr = -1.0f, gr = -1.0f;
    EXPECT_FALSE(grow.NEWTON(2500.0f, 20.0f, 15.0f, vt, nr, gr));
    EXPECT_EQ(gr, 0.0f);
    EXPECT_EQ(nr, 0.0f);
    EXPECT_TRUE(report.logLines.empty());
    report.take(titles::kOstran, "ERROR - Exceed iteration limit in Newton's Algorithm.", 48);
}

TEST_F(ThinningFailureTest, NonPositiveVolumeFailsInAPowerAndIsReportedOnce) {
    ASSERT_TRUE(grow.GetModel(0));
    ASSERT_TRUE(grow.SiteIndex(30.0f, kHeight));
    // Vt = 0 starts Newton at Gr = 0 (0^−a divides by zero); Vt < 0 at a
    // negative Gr (a negative base to a fractional power).
    for (const float vt : {0.0f, -50.0f}) {
        float nr = -1.0f, gr = -1.0f;
        EXPECT_FALSE(grow.NEWTON(kStocking, kBasalArea, kHeight, vt, nr, gr));
        EXPECT_EQ(gr, 0.0f);
        EXPECT_EQ(nr, 0.0f);
        ASSERT_EQ(report.messages.size(), 1u) << vt;
        ASSERT_EQ(report.logLines.size(), 1u) << vt;
        EXPECT_TRUE(report.messages[0].text.starts_with(
            "ERROR - in residual stocking calculation. Reason: "));
        EXPECT_TRUE(report.logLines[0].ends_with(" in Grow.NRES"));
        report.clear();
    }
}

// The thinning response keeps its last powers: a kept power must be the
// power to the bit, an empty slot must match nothing, and a power that fails
// must fail every time, on the line that asked for it.
TEST(PowerMemoTest, KeepsOnlyPowersThatSucceeded) {
    checked::PowerMemo pow;
    EXPECT_EQ(pow(0.0, 0.0), 1.0); // not the zeros of an empty slot
    std::vector<std::pair<double, double>> arguments;
    for (int i = 1; i <= 12; ++i) {
        arguments.emplace_back(1.0 + i / 7.0, -0.4 - i / 11.0);
    }
    for (int pass = 0; pass < 3; ++pass) {
        for (const auto &[base, exponent] : arguments) {
            EXPECT_EQ(pow(base, exponent), std::pow(base, exponent)) << base << "^" << exponent;
            EXPECT_EQ(pow(base, exponent), std::pow(base, exponent)) << base << "^" << exponent;
        }
    }
    for (int attempt = 0; attempt < 2; ++attempt) {
        unsigned line = 0;
        try {
            line = __LINE__ + 1;
            pow(-2.0, 0.5);
            ADD_FAILURE() << "a negative base with a fractional exponent";
        } catch (const RuntimeFault &fault) {
            EXPECT_EQ(fault.number, kInvalidCall);
            EXPECT_EQ(fault.line, line);
        }
    }
    EXPECT_THROW(pow(0.0, -1.0), RuntimeFault);
    EXPECT_EQ(pow(-0.0, 3.0), std::pow(-0.0, 3.0));
    EXPECT_TRUE(std::signbit(pow(-0.0, 3.0)));
    EXPECT_FALSE(std::signbit(pow(0.0, 3.0)));
}

// A power to 0 is answered without the library: it must be the library's
// answer for every base, and fail no check where the library call would not.
TEST(PowerMemoTest, ZeroExponentIsTheLibrarysOneForEveryBase) {
    checked::PowerMemo memo;
    const double inf = std::numeric_limits<double>::infinity();
    for (const double base :
         {0.0, -0.0, -2.5, 1e-310, 3.0, inf, -inf, std::numeric_limits<double>::quiet_NaN()}) {
        for (const double zero : {0.0, -0.0}) {
            EXPECT_EQ(std::bit_cast<std::uint64_t>(checked::pow(base, zero)),
                      std::bit_cast<std::uint64_t>(std::pow(base, zero)))
                << base;
            EXPECT_EQ(memo(base, zero), std::pow(base, zero)) << base;
        }
    }
}

} // namespace
} // namespace arbolex::engine::testing
