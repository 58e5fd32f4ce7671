#pragma once

// What the Help menu tells of the active model: the threshold basal area of
// its species (`TrhesholdInfo`) and the notes on its valid use (`Warn`).

#include <QString>

namespace arbolex::engine {
class Grow;
}

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

} // namespace arbolex::workflow
