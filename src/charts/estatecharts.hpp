#pragma once

// The estate's harvest forecast as a chart: the volume felled and thinned in
// every calendar year, in bars stacked by species.

#include "charts/chartdata.hpp"

#include <QStringList>

#include <vector>

namespace arbolex::charts {

/// The harvest forecast of an estate, year by year and species by species.
struct HarvestForecast {
    /// Every calendar year from the estate's year to the last harvest.
    std::vector<int> years;
    /// Species harvested, by name.
    QStringList species;
    /// Thinning and final-cut volume, m³ to 7 cm top, of `species[s]` in
    /// `years[y]`: volumes[s][y].
    std::vector<std::vector<double>> volumes;

    bool empty() const { return years.empty(); }
};

/// One bar a year, stacked by species in the order of their names, each
/// species in a colour of its own; the volume axis starts at 0.
ChartData harvestChart(const HarvestForecast &forecast);

} // namespace arbolex::charts
