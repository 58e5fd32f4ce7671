#pragma once

// A chart drawn onto any painter (a PDF page, an SVG file, an image) at a
// given size, and saved as PNG or SVG.

#include "charts/chartdata.hpp"

#include <QRectF>
#include <QSize>
#include <QString>

class QPainter;

namespace arbolex::report {

/// Draws `data` as a chart into `target` of `painter`: lines and text stay
/// vectors on a PDF or SVG painter.
void paintChart(const charts::ChartData &data, QPainter &painter, const QRectF &target);

/// Saves the chart as a PNG image of `size` logical pixels at twice that
/// resolution; false when the file cannot be written.
bool saveChartPng(const charts::ChartData &data, const QString &path, QSize size);
/// Saves the chart as an SVG drawing of `size`; false when the file cannot be written.
bool saveChartSvg(const charts::ChartData &data, const QString &path, QSize size);

} // namespace arbolex::report
