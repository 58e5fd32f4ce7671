// The carbon account of a rotation: the living trees of every year from the
// standing volume, each harvest's carbon out of them and its stem wood by
// assortment class to the mill (docs/carbon.md).

#include "engine/modeldescription.hpp"
#include "rotation/rotation.hpp"

namespace arbolex::rotation {

namespace {

/// Stem carbon of a harvest in each assortment class, t CO₂e/ha.
std::array<double, carbon::kPoolCount> stemByClass(const AssortmentVolumes &classes, double gravity,
                                                   const carbon::Parameters &parameters) {
    std::array<double, carbon::kPoolCount> stem{};
    for (std::size_t k = 0; k < stem.size(); ++k) {
        stem[k] = carbon::stemWood(double{classes[k]}, gravity, parameters);
    }
    return stem;
}

} // namespace

carbon::Account rotationCarbon(const RotationHarvests &h, const carbon::Parameters &parameters) {
    const int present = h.presentAge;
    const int rotation = h.rotation;
    if (rotation < present ||
        h.standing.size() != static_cast<std::size_t>(rotation - present + 1)) {
        return {};
    }
    const double gravity = parameters.gravityOf(engine::speciesCode(h.model));
    const auto trees = [&](float volume) {
        return carbon::liveTrees(double{volume}, gravity, parameters);
    };
    std::vector<carbon::YearInput> inputs(static_cast<std::size_t>(rotation) + 1);
    const double atPresent = trees(h.standing.front());
    for (int a = 0; a <= rotation; ++a) {
        // Before the present the stand is not known: a straight line from planting.
        inputs[static_cast<std::size_t>(a)].trees =
            a >= present ? trees(h.standing[static_cast<std::size_t>(a - present)])
                         : atPresent * a / present;
    }
    for (const Harvest &t : h.thinnings) {
        if (t.age < present || t.age >= rotation) {
            continue;
        }
        carbon::YearInput &in = inputs[static_cast<std::size_t>(t.age)];
        in.harvested += in.trees - trees(t.residual.volume);
        const AssortmentVolumes classes =
            h.thinningsDivided ? t.assortments
                               : divideHarvest(t.volume, t.basalArea, t.stocking, h.volumeRatio);
        const auto stem = stemByClass(classes, gravity, parameters);
        for (std::size_t k = 0; k < stem.size(); ++k) {
            in.stem[k] += stem[k];
        }
    }
    carbon::YearInput &cut = inputs.back();
    cut.harvested = cut.trees;
    cut.stem = stemByClass(
        divideHarvest(h.finalCut.volume, h.finalCut.basalArea, h.finalCut.stocking, h.volumeRatio),
        gravity, parameters);
    return carbon::account(inputs, parameters);
}

} // namespace arbolex::rotation
