#include "rotation/assortmentprices.hpp"

#include <optional>

namespace arbolex::rotation {

AssortmentVolumes divideHarvest(float volume, float basalArea, float stocking,
                                engine::VolumeRatioCoefficients ratio) {
    // The report's own classes: the fixed ones, never the user categories.
    static const engine::AssortmentBounds bounds = *engine::ClassBounds({});
    AssortmentVolumes volumes{};
    const std::optional<engine::AssortmentRatios> ratios =
        engine::StandRatios(basalArea, stocking, bounds, ratio);
    if (!ratios) {
        return volumes;
    }
    const engine::Assortment divided = engine::DivideVolume(volume, bounds, *ratios);
    for (std::size_t i = 0; i < volumes.size(); ++i) {
        volumes[i] = divided.classVolume[i];
    }
    return volumes;
}

double assortmentRevenue(const AssortmentVolumes &volumes, const AssortmentPriceList &prices) {
    double revenue = 0.0;
    for (std::size_t i = 0; i < volumes.size(); ++i) {
        revenue += double{volumes[i]} * prices[i];
    }
    return revenue;
}

} // namespace arbolex::rotation
