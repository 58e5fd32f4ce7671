#pragma once

// The three charts of a rotation, read from the projection table and the cash
// flow: the stand's development, its increments, and the money it earns.

#include "charts/chartdata.hpp"

namespace arbolex::work {
class CashFlow;
}
namespace arbolex::work {
class ProjectionTable;
}

namespace arbolex::charts {

/// Axes of the stand development chart.
enum StandAxis : int { kAxisVolume = 0, kAxisHeightBasalArea = 1, kAxisStocking = 2 };

/// Top height, stocking, basal area, standing volume and total production
/// over age. A thinning row adds the stand before the thinning (standing plus
/// removed) and after it at the same age, and the final cut drops the
/// standing crop to 0, so every removal shows as a vertical drop.
ChartData standDevelopment(const work::ProjectionTable &table);

/// CAI and MAI over age, from the rows the yield class reads; once the MAI has
/// culminated its maximum is marked and labelled with the yield class.
ChartData increments(const work::ProjectionTable &table);

/// Bars of the yearly cash flow and the line of the cumulative discounted cash
/// flow of the first `years` years of a computed cash flow; where the line
/// last rises through 0 the rotation pays back, and that crossing is marked.
/// Empty when there is no cash flow.
ChartData cashFlowChart(const work::CashFlow &computed, int years);

} // namespace arbolex::charts
