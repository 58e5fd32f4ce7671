#include "workflow/maincontrols.hpp"

#include <array>

namespace arbolex::workflow {

namespace {
constexpr std::array<const char *, kMainControlCount> kNames = {
    "txtFromA",    "txtFromN",  "txtFromH",    "txtFromB",   "txtFromD",
    "txtToA",      "txtByA",    "txtNetArea",  "lblSI",      "lblYC",
    "cmdGrow",     "cmdThin",   "cmdFinalCut", "cmdAssort",  "cmdClear",
    "cmdClearAll", "cmdUseRow", "cmdNPV",      "cmdSummary", "cmdShowTimberPrice"};
} // namespace

QString controlName(MainControl control) {
    return QLatin1String(kNames.at(static_cast<std::size_t>(control)));
}

std::optional<MainControl> mainControlFromName(const QString &name) {
    for (std::size_t i = 0; i < kNames.size(); ++i) {
        if (name == QLatin1String(kNames[i])) {
            return static_cast<MainControl>(i);
        }
    }
    return std::nullopt;
}

bool isNumericField(MainControl control) {
    return control <= MainControl::txtNetArea;
}

} // namespace arbolex::workflow
