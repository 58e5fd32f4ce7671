#pragma once

// The charts of the economics window, drawn from the rotation library's
// results: NPV, LEV and MAI by rotation age with the biological and economic
// rotations marked; the tornado of one factor moved at a time; the histogram
// of the Monte Carlo draws of NPV with its percentiles.

#include "rotation/rotation.hpp"
#include "rotation/uncertainty.hpp"

#include <QString>

#include <vector>

class QChart;

namespace arbolex::ui {

/// NPV and LEV (€/ha, left axis) and MAI (m³/ha/yr, right axis) by rotation age.
QChart *rotationChart(const rotation::RotationExplorer &explorer, const QString &title);

/// NPV (or LEV with `lev`) at the low and high end of each factor, as bars
/// from the value at today's figures, `base` (€/ha).
QChart *tornadoChart(const std::vector<rotation::TornadoBar> &bars, double base, bool lev,
                     const QString &title);

/// The draws of NPV in bars, with the 5th, 50th and 95th percentiles marked.
QChart *histogramChart(const rotation::MonteCarloResult &result, const QString &title);

} // namespace arbolex::ui
