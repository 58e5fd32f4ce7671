#pragma once

// A regime written into the work as the main window writes it when the
// regime is typed into it, grown by one-year steps: the rotation library's
// growth path (the window's own procedure, with its checks), its years as
// growth rows, its thinnings as thinning rows, then the final cut. The
// economics window's "Apply" and the estate window's opening of a
// sub-compartment write their regimes so.

#include "rotation/rotation.hpp"

#include <QString>

#include <optional>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::work {

class StandWork;

/// Empties `work` and writes `regime` felled at `rotation` (years) for
/// `stand` into it, the cash flow of the felled rotation laid out. Returns
/// the message the window refuses the regime with, if it does; the work then
/// holds the rows up to where the window stopped. A price lookup that fails
/// says so through `interactive`.
std::optional<QString> replayRegime(StandWork &work, const rotation::Stand &stand,
                                    const rotation::Regime &regime, int rotation,
                                    shell::IInteractive &interactive);

} // namespace arbolex::work
