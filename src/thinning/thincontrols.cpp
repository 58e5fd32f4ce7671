#include "thinning/thincontrols.hpp"

#include <array>

namespace arbolex::thinning {

namespace {
constexpr std::array<const char *, kThinControlCount> kNames = {
    "txtRemN",     "txtRemB",      "txtRemV",  "txtPostN", "txtPostB",  "txtPostV",
    "txtThinFreq", "txtThinUntil", "lblPreN",  "lblPreB",  "lblPreV",   "lblPreD",
    "lblPreMV",    "lblRemD",      "lblRemMV", "lblPostD", "lblPostMV", "chkActivLoop",
    "fraLoop",     "cmdLoop",      "cmdThin",  "cmdClear", "cmdCancel", "cmdAccept"};
} // namespace

QString controlName(ThinControl control) {
    return QLatin1String(kNames.at(static_cast<std::size_t>(control)));
}

std::optional<ThinControl> thinControlFromName(const QString &name) {
    for (std::size_t i = 0; i < kNames.size(); ++i) {
        if (name == QLatin1String(kNames[i])) {
            return static_cast<ThinControl>(i);
        }
    }
    return std::nullopt;
}

bool isThinField(ThinControl control) {
    return control <= ThinControl::txtThinUntil;
}

} // namespace arbolex::thinning
