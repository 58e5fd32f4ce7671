// Model selection: the active model's label and coefficient sets.
#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/vectorstate.hpp"

#include <cmath>
#include <string>
#include <string_view>

namespace arbolex::engine {

bool IsThinnedModel(int modelId) {
    return std::string_view(kUnthinnedModels).find(std::to_string(modelId)) ==
           std::string_view::npos;
}

bool Grow::GetModel(std::int16_t modelId, std::int16_t part) {
    m_errorFlag = 0;
    if (modelId < 0 || modelId >= kModelCount) {
        showMessage(titles::kModelSelection, "FAULT - Unknown model selection", kStyleExclamation);
        return false;
    }
    const CatalogueEntry &entry = catalogue()[static_cast<std::size_t>(modelId)];
    m_label = entry.label;
    m_modelId = modelId;
    ++m_modelGeneration;
    // Every coefficient of a loaded set is written, zeros included, so nothing
    // of the previous model survives in it.
    if (part == kPartAll || part == kPartStateModel) {
        m_s = entry.s;
        m_s[7] = 0.0f; // S8 is the work slot that TM fills
    }
    if (part == kPartAll || part == kPartThinningResponse) {
        m_t = entry.t;
    }
    if (part == kPartAll || part == kPartVolume) {
        m_v = entry.v;
    }
    if (part == kPartAll || part == kPartAssortment) {
        m_a = entry.a;
    }
    return true;
}

float Grow::maxTopHeight() const {
    clearUpperVectorState();
    return static_cast<float>(std::pow(static_cast<double>(S(6)), 1.0 / S(1)));
}

void Grow::showMessage(std::string_view title, std::string_view text, int style) {
    if (m_report != nullptr) {
        m_report->showMessage(title, text, style);
    }
}

void Grow::reportFault(const RuntimeFault &fault, std::string_view title, std::string_view lead,
                       std::string_view mark) {
    ++m_faultCount;
    m_errorFlag = -1;
    const std::string_view description = faultDescription(fault.number);
    if (!lead.empty()) {
        std::string text(lead);
        text += description;
        showMessage(title, text, kStyleCritical);
    }
    if (m_report != nullptr) {
        std::string line = "Error # :" + std::to_string(fault.number) + "  ";
        line += description;
        line += " in line " + std::to_string(fault.line);
        line += mark;
        m_report->logError(line);
    }
}

} // namespace arbolex::engine
