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
    if (!(format::shownValue(pre.volume, kThinningVolumeShown) - removal > 0.0)) {
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
