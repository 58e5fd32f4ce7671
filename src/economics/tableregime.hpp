#pragma once

// The user's own rotation read back from the projection table: the stand of
// its first row, the regime of its thinning rows and the age of its final cut,
// in the terms of the rotation library.

#include "rotation/rotation.hpp"

#include <QString>

#include <optional>
#include <vector>

namespace arbolex::work {
class ProjectionTable;
class StandWork;
} // namespace arbolex::work

namespace arbolex::economics {

/// The regime the thinning rows describe.
struct TableRegime {
    rotation::Regime regime;
    /// Ages of the thinning rows, years, oldest first.
    std::vector<int> ages;
    /// Volume each removed, m³/ha.
    std::vector<float> volumes;
    /// True when the intervals or the volumes differ: `regime` then takes
    /// their mean interval (rounded) and mean volume.
    bool irregular = false;
    /// Age of the final cut of the table, when it has one.
    std::optional<int> finalCut;
};

/// The stand of the table's first growth row, of model `model`; std::nullopt
/// for a table without one.
std::optional<rotation::Stand> standFromTable(const work::ProjectionTable &table,
                                              std::int16_t model);

/// The regime of the table's thinning rows before its final cut.
TableRegime regimeFromTable(const work::ProjectionTable &table);

/// The rotation as the table holds it: every thinning row (one in the year of
/// the final cut too) and the final-cut row, from the table's first year, for
/// the rotation library to value; `volumeRatio` divides them into
/// assortments. The standing volume of every year (the carbon in the trees)
/// is the table's where it has a row, and a straight line between its rows.
/// std::nullopt for a table without a final cut.
std::optional<rotation::RotationHarvests>
harvestsFromTable(const work::ProjectionTable &table, std::int16_t model,
                  const engine::VolumeRatioCoefficients &volumeRatio);

/// The rotation the work's table holds (harvestsFromTable, for the model in
/// use), valued with `economics` as the economics window values it, without
/// the searches of the rates (IRR, break-even); std::nullopt for a table
/// without a final cut. Its carbon account and carbon money are the window's.
std::optional<rotation::RotationValue> valueTableRotation(const work::StandWork &work,
                                                          const rotation::Economics &economics);

/// "Thinnings of 30 to 50 m³/ha at 20, 25 and 32 years; final cut at 45 years."
QString describeTableRotation(const rotation::RotationHarvests &harvests);

/// "40 m³/ha at 20, 25 and 30 years", or "no thinning".
QString describeRegime(const rotation::Regime &regime, int rotation);

/// What was assumed for irregular thinnings, empty for a regular regime:
/// every figure when `everyFigure`, else the rotation explorer's and the
/// optimiser's (the table's own thinnings valued as they are).
QString irregularNote(const TableRegime &regime, bool everyFigure = true);

} // namespace arbolex::economics
