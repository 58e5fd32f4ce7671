#pragma once

// A regime written into the projection table by the commands a user would
// press: clear, type the stand, grow to each thinning age, thin by the volume
// method and accept, grow to the rotation, final cut. The economics window's
// "Apply" and the estate window's opening of a sub-compartment both use it.

#include "rotation/rotation.hpp"

#include <QString>

#include <optional>

namespace arbolex::thinning {
class ThinWindowLogic;
}

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::economics {

/// Writes `regime` felled at `rotation` (years) for `stand` into `work` by the
/// commands of `main` and `thin`, grown by the step of its step field (5
/// years when it holds none).
/// Returns the reason when a step could not be made; the table then holds
/// what was made up to that step.
std::optional<QString> replayRegime(work::StandWork &work, workflow::IMainCommands &main,
                                    thinning::ThinWindowLogic &thin, const rotation::Stand &stand,
                                    const rotation::Regime &regime, int rotation);

} // namespace arbolex::economics
