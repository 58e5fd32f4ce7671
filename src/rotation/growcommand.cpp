#include "rotation/growcommand.hpp"

#include "format/displayformat.hpp"

#include <cmath>

namespace arbolex::rotation {

GrowFromValues shownGrowFrom(const engine::StandState &s, float targetAge) {
    GrowFromValues v;
    v.age = static_cast<float>(format::val(format::singleText(s.age)));
    v.stocking = static_cast<float>(std::nearbyint(double{s.stocking}));
    v.height = static_cast<float>(format::shownValue(s.topHeight, kTopHeightCell));
    v.basalArea = static_cast<float>(format::shownValue(s.basalArea, kBasalAreaCell));
    v.targetAge = targetAge;
    return v;
}

namespace {

/// How far a figure must lie from a bound of its range for its cell to be
/// on the same side: the cells round to at most a tenth (a cell of one
/// decimal moves a figure by at most 0.05, the age's plain text by a unit in
/// its last place), and the figures checked are below a few thousand, where
/// single precision keeps the difference well under the rest of the margin.
constexpr float kCellMargin = 0.1f;

/// `value`, when every comparison with `low` and `high` gives for it what it
/// gives for `shown()`, the figure its cell holds; else `shown()` itself.
template <typename Shown> float checkedFigure(float value, float low, float high, Shown &&shown) {
    const bool inside = value >= low + kCellMargin && value <= high - kCellMargin;
    const bool outside = value <= low - kCellMargin || value >= high + kCellMargin;
    return inside || outside ? value : shown();
}

/// Margin of the thinning window's volume check: its volume cell ("###0.00")
/// is within 0.005 of the volume.
constexpr double kVolumeCellMargin = 0.01;
/// Volumes below which the 15 digits a cell is rounded from are far finer
/// than that margin, m³/ha.
constexpr double kVolumeCellRange = 1e9;

} // namespace

std::optional<GrowFromFault> shownGrowFromFault(const engine::StandState &s, float targetAge,
                                                float maxTopHeight, int maxTargetAge) {
    GrowFromValues v;
    v.age = checkedFigure(s.age, kMinAge, kMaxAge, [&] {
        return static_cast<float>(format::val(format::singleText(s.age)));
    });
    v.stocking = static_cast<float>(std::nearbyint(double{s.stocking}));
    v.height = checkedFigure(s.topHeight, kMinHeight, maxTopHeight, [&] {
        return static_cast<float>(format::shownValue(s.topHeight, kTopHeightCell));
    });
    v.basalArea = checkedFigure(s.basalArea, kMinBasalArea, kMaxBasalArea, [&] {
        return static_cast<float>(format::shownValue(s.basalArea, kBasalAreaCell));
    });
    v.targetAge = targetAge;
    return growFromFault(v, maxTopHeight, maxTargetAge);
}

Growth growStand(engine::Grow &grow, float age, float basalArea, float stocking, float topHeight,
                 float targetAge, float step) {
    std::vector<engine::StandState> states;
    Growth g = growStand(grow, age, basalArea, stocking, topHeight, targetAge, step, states);
    g.states = std::move(states);
    return g;
}

Growth growStand(engine::Grow &grow, float age, float basalArea, float stocking, float topHeight,
                 float targetAge, float step, std::vector<engine::StandState> &states) {
    Growth g;
    g.siteIndexKnown = grow.SiteIndex(age, topHeight);
    // A site index that could not be computed leaves 0 in the engine, and the
    // projection goes on with it as it always has.
    g.siteIndex = grow.siteIndex();
    grow.TM(g.siteIndex);
    float siteIndex = g.siteIndex;
    grow.STATEYR(age, basalArea, stocking, topHeight, targetAge, siteIndex);
    g.age = age;
    g.basalArea = basalArea;
    g.stocking = stocking;
    g.topHeight = topHeight;
    g.targetAge = targetAge;
    g.projected = grow.PROJ(age, basalArea, stocking, topHeight, targetAge, step, states);
    return g;
}

VolumeThinningStep thinByVolume(engine::Grow &grow, const engine::StandState &pre, double removal) {
    VolumeThinningStep step;
    // The window checks the removal against the volume it shows.
    const double volume = pre.volume;
    const bool decided =
        std::fabs(volume - removal) > kVolumeCellMargin && std::fabs(volume) < kVolumeCellRange;
    const double shown = decided ? volume : format::shownValue(volume, kThinningVolumeShown);
    if (!(shown - removal > 0.0)) {
        step.refusal = std::string(engine::thinningtext::kRemovalLeavesNoVolume);
        step.thinned.outcome = engine::VolumeThinningOutcome::kNothingLeft;
        return step;
    }
    step.thinned = grow.thinToVolume(pre.stocking, pre.basalArea, pre.topHeight,
                                     engine::residualVolume(pre.volume, removal));
    switch (step.thinned.outcome) {
    case engine::VolumeThinningOutcome::kNoThinningResponse:
        step.refusal = std::string(engine::thinningtext::kNoThinningResponse);
        break;
    case engine::VolumeThinningOutcome::kNothingLeft:
        step.refusal = std::string(engine::thinningtext::kNothingLeft);
        break;
    case engine::VolumeThinningOutcome::kSolverFailed:
    case engine::VolumeThinningOutcome::kDone:
        break;
    }
    return step;
}

} // namespace arbolex::rotation
