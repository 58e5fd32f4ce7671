#pragma once

// Draws the data of a chart as a Qt chart: value axes with their units, the
// series, the marks and markers with their labels and a legend. The panel
// beside the table, the economics and estate windows, the exported files and
// the printed report all draw through it.

#include "charts/chartdata.hpp"

#include <QChart>

namespace arbolex::report {

/// How a chart is dressed.
enum class ChartLook {
    /// Type of fixed sizes and square corners, alike on screen, in files and
    /// on paper: the charts of a rotation, the report.
    Report,
    /// The desktop's own type, a little larger and bold for the title, and
    /// rounded corners: the economics and estate windows.
    Window,
};

/// Property of every drawn series (and bar set): the index of its ChartSeries in the data.
inline constexpr char kSeriesIndexProperty[] = "arbolexSeries";

/// A new chart of `data` (owned by the caller); only its title when it has
/// no series. Bars of a year axis are filled outlines on the same numeric
/// axis as the lines, bars by category stand (or lie) on an axis of their
/// categories; marks are points with their label beside them, markers dashed
/// lines across the plot named in the legend. Value axes whose range the data
/// leaves open share one zero and one set of grid lines.
QChart *buildChart(const charts::ChartData &data, ChartLook look = ChartLook::Report);

/// The point of `series` nearest to (x, y), the nearest x first (a drop holds
/// two points at one age); false when the series has none.
bool nearestPoint(const charts::ChartSeries &series, double x, double y, charts::ChartPoint &found);

/// The hover text of a point: the series, the x axis value and the value
/// with its unit.
QString hoverText(const charts::ChartData &data, const charts::ChartSeries &series,
                  const charts::ChartPoint &point);

} // namespace arbolex::report
