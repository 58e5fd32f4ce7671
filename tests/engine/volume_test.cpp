// Standing volume and the volume correction factor.
#include "recordingreport.hpp"

#include <cmath>

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

struct CorrectionClass {
    int model;
    float siteIndex;
    float factor;
};

class CorrectionFactorTest : public EngineTest,
                             public ::testing::WithParamInterface<CorrectionClass> {};

TEST_P(CorrectionFactorTest, EachClassIncludesItsUpperBound) {
    const CorrectionClass c = GetParam();
    // Model 16 at site index 0 leaves a factor other than 1 behind.
    ASSERT_TRUE(grow.GetModel(16));
    grow.GetVCF();
    ASSERT_TRUE(grow.GetModel(static_cast<std::int16_t>(c.model)));
    grow.setSiteIndex(c.siteIndex);
    EXPECT_TRUE(grow.GetVCF());
    EXPECT_EQ(grow.volumeCorrectionFactor(), c.factor);
}

INSTANTIATE_TEST_SUITE_P(
    Grow, CorrectionFactorTest,
    ::testing::Values(
        CorrectionClass{16, 0.0f, 0.994367307f}, CorrectionClass{16, 13.5f, 0.994367307f},
        CorrectionClass{16, 13.51f, 0.96947558f}, CorrectionClass{16, 16.5f, 0.96947558f},
        CorrectionClass{16, 16.51f, 0.952574f}, CorrectionClass{16, 19.5f, 0.952574f},
        CorrectionClass{16, 19.51f, 0.951985f}, CorrectionClass{16, 22.5f, 0.951985f},
        CorrectionClass{16, 22.51f, 0.944195f}, CorrectionClass{17, 13.5f, 0.95472905f},
        CorrectionClass{17, 13.51f, 0.95809963f}, CorrectionClass{17, 16.5f, 0.95809963f},
        CorrectionClass{17, 16.51f, 1.008985622f}, CorrectionClass{17, 19.5f, 1.008985622f},
        CorrectionClass{17, 19.51f, 0.9900969916f}, CorrectionClass{0, 25.0f, 1.0f},
        CorrectionClass{18, 12.0f, 1.0f}));

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
