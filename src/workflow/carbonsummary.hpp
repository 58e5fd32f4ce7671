#pragma once

// The carbon block under the summary: what the table's rotation does with
// carbon, from its account as the economics window values it.

#include "rotation/rotation.hpp"

#include <QString>

#include <optional>
#include <utility>
#include <vector>

namespace arbolex::workflow {

/// The block: a heading that names the unit and the carbon money, then each
/// figure's caption and value.
struct CarbonSummary {
    QString heading;
    std::vector<std::pair<QString, QString>> figures;

    bool empty() const { return figures.empty(); }
};

/// The block of a rotation valued with `economics`: the stock in the trees
/// at the final cut (before felling), the long-term average stock, the total
/// net removal and the units issued, t CO₂e/ha, and the NPV of the carbon
/// money (only when carbon counts, else "not counted"). Without a rotation
/// (no final cut yet) the stock in the trees of the last stand, `lastStand`
/// (t CO₂e/ha at `lastAge`), when there is one.
CarbonSummary carbonSummary(const std::optional<rotation::RotationValue> &value,
                            const rotation::Economics &economics,
                            std::optional<std::pair<int, double>> lastStand = std::nullopt);

} // namespace arbolex::workflow
