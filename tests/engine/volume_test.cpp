// Standing volume and the volume correction factor.
#include "recordingreport.hpp"

#include <cmath>
#include <vector>

namespace arbolex::engine::testing {
namespace {

using VolumeTest = EngineTest;

struct Stand {
    float g, n, h;
};

TEST_F(VolumeTest, SitkaSpruceVolumeIsTheClosedFormula) {
    ASSERT_TRUE(grow.GetModel(0));
    ASSERT_TRUE(grow.GetVCF());
    grow.setSiteIndex(16.0f);
    const auto &v = catalogue()[0].v;
    ASSERT_EQ(v[2], -0.53576); // H/√N enters for model 0
    for (const Stand s :
         {Stand{20.0f, 2500.0f, 7.0f}, Stand{45.5f, 1200.0f, 18.2f}, Stand{70.0f, 600.0f, 29.0f}}) {
        const double g = s.g, n = s.n, h = s.h, si = 16.0;
        const double expected =
            g * (v[0] + v[1] * h + v[2] * h / std::sqrt(n) + v[4] / h + v[5] * h / n +
                 v[7] * 100.0 / (g * h) + v[8] * si / g + v[9] * si * si / g);
        EXPECT_TRUE(nearRel(expected, grow.GetV7(s.g, s.n, s.h), 2e-6)) << s.g;
    }
}

TEST_F(VolumeTest, ZeroBasalAreaIsHarmlessWhereItsTermsAreUnused) {
    // Scots pine has no term in N·H/G, 100/(G·H), SI/G or SI²/G.
    ASSERT_TRUE(grow.GetModel(8));
    grow.setSiteIndex(12.0f);
    EXPECT_EQ(grow.GetV7(0.0f, 1500.0f, 12.0f), 0.0f);

    ASSERT_TRUE(grow.GetModel(0));
    EXPECT_EQ(grow.GetV7(0.0f, 1500.0f, 12.0f), 0.0f);
    ASSERT_EQ(report.messages.size(), 1u);
    EXPECT_EQ(report.messages[0].title, titles::kArbolex);
    EXPECT_EQ(report.messages[0].text,
              "Unable to complete volume calculation. Reason: Division by zero");
    ASSERT_EQ(report.logLines.size(), 1u);
    EXPECT_TRUE(report.logLines[0].starts_with("Error # :11  Division by zero in line "));
    EXPECT_TRUE(report.logLines[0].ends_with(" in Grow.GetV7()"));
    report.clear();
}

// The factors themselves are the model's table; what can go wrong is the
// class a site index on a bound falls into, or a factor left from the model
// chosen before.
TEST_F(VolumeTest, CorrectionClassesIncludeTheirUpperBound) {
    const auto factor = [this](int model, float siteIndex) {
        grow.GetModel(16); // leaves a factor other than 1 behind
        grow.GetVCF();
        EXPECT_TRUE(grow.GetModel(static_cast<std::int16_t>(model)));
        grow.setSiteIndex(siteIndex);
        EXPECT_TRUE(grow.GetVCF());
        return grow.volumeCorrectionFactor();
    };
    for (const auto &[model, bounds] :
         {std::pair{16, std::vector<float>{13.5f, 16.5f, 19.5f, 22.5f}},
          std::pair{17, std::vector<float>{13.5f, 16.5f, 19.5f}}}) {
        for (const float bound : bounds) {
            EXPECT_EQ(factor(model, bound), factor(model, bound - 1.0f)) << model << " " << bound;
            EXPECT_NE(factor(model, bound + 0.01f), factor(model, bound)) << model << " " << bound;
        }
    }
    EXPECT_EQ(factor(0, 25.0f), 1.0f);
    EXPECT_EQ(factor(18, 12.0f), 1.0f);
}

TEST_F(VolumeTest, FactorIsFixedAtSelectionAndScalesTheVolumeLast) {
    ASSERT_TRUE(grow.GetModel(16));
    grow.setSiteIndex(20.0f);
    const float uncorrected = grow.GetV7(40.0f, 1500.0f, 15.0f);
    // The site index of 20 m takes effect only when the factor is set again.
    grow.GetVCF();
    EXPECT_EQ(grow.GetV7(40.0f, 1500.0f, 15.0f),
              static_cast<float>(double{0.951985f} * uncorrected));
}

} // namespace
} // namespace arbolex::engine::testing
