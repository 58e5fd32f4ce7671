// The grow-from checks of a path take a figure as it is where the rounding of
// its cell cannot decide a range check: they must refuse exactly the stands
// that the checks of the cells themselves refuse, most of all at the bounds.
#include "rotation/growcommand.hpp"

#include "format/displayformat.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

namespace arbolex::rotation {
namespace {

/// The check the window makes: every cell formatted and read back.
std::optional<GrowFromFault> cellsFault(const engine::StandState &s, float targetAge,
                                        float maxTopHeight, int maxTargetAge) {
    return growFromFault(shownGrowFrom(s, targetAge), maxTopHeight, maxTargetAge);
}

/// Figures around `bound`: on it, a few units in the last place either side,
/// and across the half-tenth where a cell of one decimal rounds.
std::vector<float> around(float bound) {
    std::vector<float> out;
    for (const float d : {0.0f, 0.04f, 0.0499f, 0.05f, 0.0501f, 0.06f, 0.0999f, 0.1f, 0.1001f,
                          0.11f, 0.15f, 1.0f}) {
        out.push_back(bound - d);
        out.push_back(bound + d);
    }
    for (int ulps = 1; ulps <= 3; ++ulps) {
        float down = bound;
        float up = bound;
        for (int i = 0; i < ulps; ++i) {
            down = std::nextafter(down, 0.0f);
            up = std::nextafter(up, 1e9f);
        }
        out.push_back(down);
        out.push_back(up);
        out.push_back(bound - 0.05f + (up - bound));
        out.push_back(bound + 0.05f - (up - bound));
    }
    out.push_back(std::nanf(""));
    return out;
}

void expectSameFault(const engine::StandState &s, float maxTopHeight) {
    for (const float target : {30.0f, 60.0f, 61.0f}) {
        const auto expected = cellsFault(s, target, maxTopHeight, 60);
        const auto actual = shownGrowFromFault(s, target, maxTopHeight, 60);
        ASSERT_EQ(expected.has_value(), actual.has_value())
            << "age " << s.age << " height " << s.topHeight << " basal area " << s.basalArea;
        if (expected) {
            EXPECT_EQ(expected->field, actual->field);
            EXPECT_EQ(expected->text, actual->text);
        }
    }
}

TEST(ShownGrowFromFaultTest, RefusesWhatTheCellsRefuseAtEveryBound) {
    const float maxTopHeight = 41.37f;
    const engine::StandState typical{30.0f, 35.0f, 1200.0f, 18.0f, 250.0f};
    for (const float height : [&] {
             std::vector<float> h = around(kMinHeight);
             const std::vector<float> top = around(maxTopHeight);
             h.insert(h.end(), top.begin(), top.end());
             return h;
         }()) {
        engine::StandState s = typical;
        s.topHeight = height;
        expectSameFault(s, maxTopHeight);
    }
    for (const float bound : {kMinBasalArea, kMaxBasalArea}) {
        for (const float basalArea : around(bound)) {
            engine::StandState s = typical;
            s.basalArea = basalArea;
            expectSameFault(s, maxTopHeight);
        }
    }
    for (const float bound : {kMinAge, kMaxAge}) {
        for (const float age : around(bound)) {
            engine::StandState s = typical;
            s.age = age;
            expectSameFault(s, maxTopHeight);
        }
    }
    for (const float stocking : {99.4f, 99.5f, 100.5f, 4999.5f, 5000.4f, 5000.5f}) {
        engine::StandState s = typical;
        s.stocking = stocking;
        expectSameFault(s, maxTopHeight);
    }
}

TEST(ThinByVolumeTest, RefusesTheRemovalsOfTheShownVolumeToTheHundredth) {
    engine::Grow grow;
    grow.GetModel(0);
    grow.GetVCF();
    // The window refuses a removal that leaves nothing of the volume its
    // cell shows; removals and volumes across the cell's rounding.
    for (const float volume : {249.98f, 249.994f, 249.995f, 249.996f, 250.0f, 250.004f, 250.005f,
                               250.006f, 250.01f, 250.02f}) {
        for (const double removal : {249.98, 249.99, 249.995, 250.0, 250.005, 250.01, 250.02}) {
            const engine::StandState pre{30.0f, 35.0f, 1200.0f, 18.0f, volume};
            const bool shownLeavesNothing =
                !(format::shownValue(volume, kThinningVolumeShown) - removal > 0.0);
            const VolumeThinningStep step = thinByVolume(grow, pre, removal);
            EXPECT_EQ(shownLeavesNothing,
                      step.refusal == std::string(engine::thinningtext::kRemovalLeavesNoVolume))
                << volume << " less " << removal;
        }
    }
}

} // namespace
} // namespace arbolex::rotation
