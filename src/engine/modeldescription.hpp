#pragma once
// What tells the 22 catalogue entries apart: the species behind the label's
// abbreviation, the regime, and for the alternative calibrations which
// coefficient sets differ from the base entry that has the same label. The
// differences are read from the coefficients themselves, so the description
// cannot drift from the catalogue.
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::engine {

/// The four coefficient sets of a catalogue entry.
enum class CoefficientSet { kStateModel, kThinningResponse, kVolume, kAssortment };

struct ModelDescription {
    /// Species in full, "Sitka spruce" for "SS".
    std::string_view species;
    /// True when the label names the thinned regime.
    bool thinnedRegime = false;
    /// Base entry (0 to 9) with the same label; the entry itself for a base entry.
    int baseModel = 0;
    /// Coefficient sets that differ from the base entry, in catalogue order.
    std::vector<CoefficientSet> differences;
    /// True when any thinning-response coefficient is not 0.
    bool thinningResponse = false;
    /// True when the standing volume carries a correction factor by site index.
    bool volumeCorrection = false;

    bool alternative(int modelId) const { return baseModel != modelId; }
};

/// Species abbreviation of entry `modelId` (0 to 21), as its label begins: "SS", "LPC".
std::string_view speciesCode(int modelId);

/// True for the entries whose standing volume `GetVCF` corrects by site index.
bool HasVolumeCorrection(int modelId);

/// Description of catalogue entry `modelId` (0 to 21).
ModelDescription describeModel(int modelId);

/// One line beside the label: "Sitka spruce, thinned" for a base entry,
/// "Sitka spruce, thinned; as 0 with its own volume and assortments" for an
/// alternative calibration.
std::string modelSummary(int modelId);

/// The same, brief enough for a menu: "Sitka spruce, thinned; as 0, own
/// state, thinning, volume, assortment sets; volume by site".
std::string modelMenuNote(int modelId);

/// A few sentences for a tooltip or a description pane: species, regime,
/// thinning response, and what the alternative calibration changes.
std::string modelDetails(int modelId);

} // namespace arbolex::engine
