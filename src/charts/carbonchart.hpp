#pragma once

// The carbon chart beside the projection table: the carbon account of the
// table's rotation over age once it has a final cut; before one, the carbon
// in the living trees of the table's rows.

#include "carbon/account.hpp"
#include "charts/chartdata.hpp"

#include <cstdint>
#include <optional>

namespace arbolex::work {
class ProjectionTable;
class StandWork;
} // namespace arbolex::work

namespace arbolex::charts {

/// The account of a rotation over age, t CO₂e/ha: the stock in the living
/// trees (a harvest a vertical drop, the final cut to 0), in products in use,
/// the cumulative net removal, the units issued in steps at each
/// verification, and the long-term average stock as a dashed line.
ChartData carbonAccountChart(const carbon::Account &account);

/// The carbon in the living trees of the table's growth and thinning rows,
/// t CO₂e/ha, of model `model` (its species' specific gravity): a thinning
/// drops the stock at its age.
ChartData treeCarbonChart(const work::ProjectionTable &table, std::int16_t model,
                          const carbon::Parameters &parameters);

/// The carbon chart of the work now: the account of its rotation valued as
/// the economics window values it once the table has a final cut, else the
/// trees of its rows; empty without rows.
ChartData carbonChart(const work::StandWork &work);

} // namespace arbolex::charts
