#pragma once

// What the Help menu tells of the active model: the threshold basal area of
// its species (`TrhesholdInfo`) and the notes on its valid use (`Warn`).

#include <QString>

namespace arbolex::engine {
class Grow;
}

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::workflow {

/// Species code of a model label ("SS", "NS", "DF", "LP", "SP"), "" when the
/// label names no known species.
QString speciesCode(const QString &label);

/// The basal area (m²/ha) a reference stand of the active model of `grow`
/// reaches when its top height first reaches the first-thinning height. Works
/// on a copy of the engine, so the site index of the user's stand stays.
float thresholdBasalArea(const engine::Grow &grow);

/// The message `TrhesholdInfo` shows for the active model of `grow`, or ""
/// when the model's species is unknown.
QString thresholdText(const engine::Grow &grow);

/// The notes `Warn` shows on the valid use of the active model of `grow`.
QString warnText(const engine::Grow &grow);

/// `TrhesholdInfo`: tells the threshold of the active model, or that its
/// species is not known; a failure is logged.
void tellThreshold(const engine::Grow &grow, shell::IInteractive &interactive,
                   shell::ErrorLog &log);
/// `Warn`: tells the notes on the valid use of the active model.
void tellNotes(const engine::Grow &grow, shell::IInteractive &interactive, shell::ErrorLog &log);

} // namespace arbolex::workflow
