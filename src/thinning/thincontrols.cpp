#include "thinning/thincontrols.hpp"

#include "shell/controlnames.hpp"

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
    return shell::controlNameIn(kNames, control);
}

std::optional<ThinControl> thinControlFromName(const QString &name) {
    return shell::controlNamedIn<ThinControl>(kNames, name);
}

bool isThinField(ThinControl control) {
    return control <= ThinControl::txtThinUntil;
}

} // namespace arbolex::thinning
