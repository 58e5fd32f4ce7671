#include "engine/modeldescription.hpp"

#include "engine/catalogue.hpp"

#include <algorithm>
#include <array>
#include <cstddef>
#include <utility>

namespace arbolex::engine {

namespace {

constexpr std::array<std::pair<std::string_view, std::string_view>, 5> kSpecies{{
    {"SS", "Sitka spruce"},
    {"NS", "Norway spruce"},
    {"DF", "Douglas fir"},
    {"LPC", "Lodgepole pine (coastal)"},
    {"SP", "Scots pine"},
}};

constexpr int kBaseEntries = 10;

const CatalogueEntry &entry(int modelId) {
    return catalogue()[static_cast<std::size_t>(modelId)];
}

std::string_view speciesName(int modelId) {
    const std::string_view code = speciesCode(modelId);
    for (const auto &[abbreviation, name] : kSpecies) {
        if (abbreviation == code) {
            return name;
        }
    }
    return code;
}

int baseOf(int modelId) {
    const std::string_view label = entry(modelId).label;
    for (int base = 0; base < kBaseEntries; ++base) {
        if (label == entry(base).label) {
            return base;
        }
    }
    return modelId;
}

std::string_view setName(CoefficientSet set, bool brief) {
    switch (set) {
    case CoefficientSet::kStateModel:
        return brief ? "state" : "state model";
    case CoefficientSet::kThinningResponse:
        return brief ? "thinning" : "thinning response";
    case CoefficientSet::kVolume:
        return "volume";
    case CoefficientSet::kAssortment:
        return brief ? "assortment" : "assortments";
    }
    return {};
}

/// True when the alternative differs from its base by having no thinning response at all.
bool losesThinningResponse(const ModelDescription &model) {
    return !model.thinningResponse &&
           std::find(model.differences.begin(), model.differences.end(),
                     CoefficientSet::kThinningResponse) != model.differences.end();
}

/// "its own a, b and c" ("own a, b, c sets" when brief), "; no thinning
/// response" added when that set is gone rather than changed.
std::string differencesText(const ModelDescription &model, bool brief = false) {
    std::vector<std::string_view> own;
    for (const CoefficientSet set : model.differences) {
        if (set != CoefficientSet::kThinningResponse || model.thinningResponse) {
            own.push_back(setName(set, brief));
        }
    }
    std::string text;
    for (std::size_t i = 0; i < own.size(); ++i) {
        if (brief) {
            text += i == 0 ? "own " : ", ";
        } else {
            text += i == 0 ? "its own " : i + 1 == own.size() ? " and " : ", ";
        }
        text += own[i];
    }
    if (brief && !own.empty()) {
        text += own.size() == 1 ? " set" : " sets";
    }
    if (losesThinningResponse(model)) {
        text += text.empty() ? "no thinning response" : "; no thinning response";
    }
    if (model.volumeCorrection) {
        text += brief ? "; volume by site" : "; volume corrected by site index";
    }
    return text;
}

std::string regimeText(bool thinned) {
    return thinned ? "thinned" : "un-thinned";
}

} // namespace

std::string_view speciesCode(int modelId) {
    const std::string_view label = entry(modelId).label;
    return label.substr(0, label.find(' '));
}

bool HasVolumeCorrection(int modelId) {
    return modelId == 16 || modelId == 17;
}

ModelDescription describeModel(int modelId) {
    const CatalogueEntry &own = entry(modelId);
    ModelDescription model;
    model.species = speciesName(modelId);
    model.thinnedRegime = std::string_view(own.label).find("(Thinned)") != std::string_view::npos;
    model.baseModel = baseOf(modelId);
    model.thinningResponse =
        std::any_of(own.t.begin(), own.t.end(), [](double c) { return c != 0.0; });
    model.volumeCorrection = HasVolumeCorrection(modelId);
    const CatalogueEntry &base = entry(model.baseModel);
    if (own.s != base.s) {
        model.differences.push_back(CoefficientSet::kStateModel);
    }
    if (own.t != base.t) {
        model.differences.push_back(CoefficientSet::kThinningResponse);
    }
    if (own.v != base.v) {
        model.differences.push_back(CoefficientSet::kVolume);
    }
    if (own.a != base.a) {
        model.differences.push_back(CoefficientSet::kAssortment);
    }
    return model;
}

std::string modelSummary(int modelId) {
    const ModelDescription model = describeModel(modelId);
    std::string text = std::string(model.species) + ", " + regimeText(model.thinnedRegime);
    if (!model.alternative(modelId)) {
        return text;
    }
    text += "; as " + std::to_string(model.baseModel);
    if (model.differences.empty()) {
        return text + ", value for value";
    }
    return text + " with " + differencesText(model);
}

std::string modelMenuNote(int modelId) {
    const ModelDescription model = describeModel(modelId);
    std::string text = std::string(model.species) + ", " + regimeText(model.thinnedRegime);
    if (!model.alternative(modelId)) {
        return text;
    }
    text += "; as " + std::to_string(model.baseModel);
    return text +
           (model.differences.empty() ? ", value for value" : ", " + differencesText(model, true));
}

std::string modelDetails(int modelId) {
    const ModelDescription model = describeModel(modelId);
    std::string text =
        std::string(model.species) + ", " + regimeText(model.thinnedRegime) + " regime. ";
    if (model.thinnedRegime) {
        text += model.thinningResponse ? "Thinnings change the stand's development."
                                       : "No thinning response: thinnings remove trees without "
                                         "changing how the rest grows.";
    }
    if (!model.alternative(modelId)) {
        return text + (model.thinnedRegime ? " " : "") + "Base calibration of its label.";
    }
    text += (model.thinnedRegime ? " " : "") + std::string("Alternative calibration of ") +
            std::to_string(model.baseModel) + " (same label): ";
    if (model.differences.empty()) {
        return text + "the same coefficients, value for value.";
    }
    return text + differencesText(model) + ".";
}

} // namespace arbolex::engine
