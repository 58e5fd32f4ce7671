#pragma once

// Draws the data of a chart as a Qt chart: value axes with their units, the
// series, the marks with their labels and a legend. The panel beside the
// table, the exported files and the printed report all draw through it.

#include "charts/chartdata.hpp"

#include <QChart>

namespace arbolex::report {

/// Property of every drawn series: the index of its ChartSeries in the data.
inline constexpr char kSeriesIndexProperty[] = "arbolexSeries";

/// A new chart of `data` (owned by the caller). Bars are drawn as filled
/// outlines on the same numeric age axis as the lines; marks are points with
/// their label beside them.
QChart *buildChart(const charts::ChartData &data);

/// The point of `series` nearest to (x, y), the nearest x first (a drop holds
/// two points at one age); false when the series has none.
bool nearestPoint(const charts::ChartSeries &series, double x, double y, charts::ChartPoint &found);

/// The hover text of a point: the series, the x axis value and the value
/// with its unit.
QString hoverText(const charts::ChartData &data, const charts::ChartSeries &series,
                  const charts::ChartPoint &point);

} // namespace arbolex::report
