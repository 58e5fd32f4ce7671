#pragma once

// The charts of the economics window, from the rotation library's results:
// NPV, LEV and MAI by rotation age with the biological and economic
// rotations marked; the tornado of one factor moved at a time; the histogram
// of the Monte Carlo draws of NPV with its percentiles.

#include "charts/chartdata.hpp"
#include "rotation/rotation.hpp"
#include "rotation/uncertainty.hpp"

#include <vector>

namespace arbolex::economics {
class EconomicsWindowLogic;
}

namespace arbolex::charts {

/// Axes of the rotation chart.
enum RotationAxis : int { kAxisMoney = 0, kAxisMai = 1 };

/// A money axis from `low` to `high` (€/ha) whose ends and labels are round
/// values, about six steps apart, written with thousands separators.
ChartAxis moneyAxis(double low, double high, const QString &title);

/// NPV and LEV (€/ha, left axis) and MAI (m³/ha/yr, right axis) by rotation
/// age, the biological and economic rotations marked, and the economic
/// rotation without carbon money (`economicWithoutCarbon`, years) where
/// paying carbon moves it; only the title when the explorer has no rows.
ChartData rotationChart(const rotation::RotationExplorer &explorer, const QString &title,
                        int economicWithoutCarbon = 0);

/// NPV (or LEV with `lev`) at the low and high end of each factor, as lying
/// bars from the value at today's figures `base` (€/ha), the widest swing on top.
ChartData tornadoChart(const std::vector<rotation::TornadoBar> &bars, double base, bool lev,
                       const QString &title);

/// The draws of NPV in bins, with the 5th, 50th and 95th percentiles marked;
/// only the title when there are no draws.
ChartData histogramChart(const rotation::MonteCarloResult &result, const QString &title);

/// The economics window's charts, titled with the rate of their figures;
/// empty charts (no title either) where the logic has no figures.
struct EconomicsCharts {
    ChartData rotations;
    ChartData tornadoNpv;
    ChartData tornadoLev;
    ChartData draws;
};
EconomicsCharts economicsCharts(economics::EconomicsWindowLogic &logic);

} // namespace arbolex::charts
