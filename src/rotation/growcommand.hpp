#pragma once

// The grow command without its window: from a grow-from stand, the site index
// of its age and top height, the transition of that site index, the start
// moved to the nearest whole year and the states projected from it. The main
// window and a rotation grow through it alike, and both read a table row back
// into the grow-from fields in the same way.

#include "engine/grow.hpp"
#include "engine/standstate.hpp"
#include "rotation/standchecks.hpp"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::rotation {

/// Pattern of the volumes the thinning window shows (before, removed, after), m³/ha.
inline constexpr std::string_view kThinningVolumeShown = "###0.00";

/// Patterns of the cells that the grow-from fields take a row's top height
/// and basal area from (its age is shown as its plain text and its stocking
/// rounded to a whole number).
inline constexpr std::string_view kTopHeightCell = "#0.0";
inline constexpr std::string_view kBasalAreaCell = "##0.0";

/// The grow-from values the fields hold when growing goes on from a table row
/// of stand `s`: its cells read back (format, then read), and `targetAge`.
/// The grow command checks these; it grows from the row's exact state.
GrowFromValues shownGrowFrom(const engine::StandState &s, float targetAge);

/// growFromFault(shownGrowFrom(s, targetAge), maxTopHeight, maxTargetAge), the
/// same fault or none, with a cell formatted and read back only where its
/// rounding could decide a check: a figure well inside or well outside its
/// range shows a figure on the same side of each bound. A path grown past
/// several thinnings checks every thinned stand this way.
std::optional<GrowFromFault> shownGrowFromFault(const engine::StandState &s, float targetAge,
                                                float maxTopHeight, int maxTargetAge);

/// What one press of the grow command computed.
struct Growth {
    /// Site index of the grow-from age and top height, m (0 when it could not
    /// be computed, and then siteIndexKnown is false).
    float siteIndex = 0.0f;
    bool siteIndexKnown = false;
    /// The grow-from stand moved to the nearest whole year, and the age grown
    /// to rounded to a whole year.
    float age = 0.0f;
    float basalArea = 0.0f;
    float stocking = 0.0f;
    float topHeight = 0.0f;
    float targetAge = 0.0f;
    /// False when the projection failed; the states before the failure stay.
    bool projected = false;
    /// The start state, then one state per step.
    std::vector<engine::StandState> states;
};

/// The thinning window's volume method on its last growth row `pre`: the
/// removal (m³/ha) checked against the volume the window shows before the
/// thinning, then the engine's thinning to the residual volume. `refusal` is
/// the window's message when it refuses; it is empty when the engine's solver
/// failed, which has shown its own message.
struct VolumeThinningStep {
    engine::VolumeThinning thinned;
    std::optional<std::string> refusal;

    bool done() const { return !refusal && thinned.done(); }
};
VolumeThinningStep thinByVolume(engine::Grow &grow, const engine::StandState &pre, double removal);

/// Grows the stand (age, years; basal area, m²/ha; stocking, stems/ha; top
/// height, m) to `targetAge` by `step` years with the active model of `grow`,
/// as the grow command does.
Growth growStand(engine::Grow &grow, float age, float basalArea, float stocking, float topHeight,
                 float targetAge, float step);

/// The same, with the start state and the projected states appended to
/// `states` (Growth::states stays empty): a path grown in several presses
/// keeps one vector of states instead of one for every press.
Growth growStand(engine::Grow &grow, float age, float basalArea, float stocking, float topHeight,
                 float targetAge, float step, std::vector<engine::StandState> &states);

} // namespace arbolex::rotation
