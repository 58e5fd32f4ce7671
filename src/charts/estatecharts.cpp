#include "charts/estatecharts.hpp"

#include "charts/chartmessages.hpp"

#include <array>

namespace arbolex::charts {

namespace {

/// Colours of the species, in the order of their names.
constexpr std::array<std::uint32_t, 8> kSpeciesColours = {0x2e7d32, 0x1b6ca8, 0xb8860b, 0x8b3a3a,
                                                          0x6a4c93, 0x00838f, 0xd2691e, 0x555555};

} // namespace

ChartData harvestChart(const HarvestForecast &forecast) {
    ChartData chart;
    chart.title = text::titleHarvest();
    chart.x.title = text::axisHarvestYear();
    chart.x.grid = false;
    for (const int year : forecast.years) {
        chart.categories << QString::number(year);
    }
    ChartAxis volume;
    volume.title = text::axisHarvestVolume();
    volume.min = 0.0;
    volume.rounded = true;
    volume.decimals = 0;
    chart.axes = {volume};
    for (qsizetype s = 0; s < forecast.species.size(); ++s) {
        const auto at = static_cast<std::size_t>(s);
        ChartSeries bars;
        bars.name = forecast.species[s];
        bars.unit = QStringLiteral("m³");
        bars.style = ChartSeries::Style::StackedBars;
        bars.colour = kSpeciesColours.at(at % kSpeciesColours.size());
        const std::vector<double> &volumes = forecast.volumes.at(at);
        for (std::size_t y = 0; y < volumes.size(); ++y) {
            bars.points.push_back({static_cast<double>(y), volumes[y]});
        }
        chart.series.push_back(std::move(bars));
    }
    return chart;
}

} // namespace arbolex::charts
