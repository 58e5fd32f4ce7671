#include "workflow/maincontrols.hpp"

#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::workflow {

namespace {
constexpr std::array<const char *, kMainControlCount> kNames = {
    "txtFromA",    "txtFromN",           "txtFromH",      "txtFromB",     "txtFromD",  "txtToA",
    "txtByA",      "txtNetArea",         "lblSI",         "lblYC",        "cmdGrow",   "cmdThin",
    "cmdFinalCut", "cmdAssort",          "cmdClear",      "cmdClearAll",  "cmdUseRow", "cmdNPV",
    "cmdSummary",  "cmdShowTimberPrice", "cmdDeleteRows", "lblTableTitle"};
} // namespace

QString controlName(MainControl control) {
    return shell::controlNameIn(kNames, control);
}

std::optional<MainControl> mainControlFromName(const QString &name) {
    return shell::controlNamedIn<MainControl>(kNames, name);
}

bool isNumericField(MainControl control) {
    return control <= MainControl::txtNetArea;
}

} // namespace arbolex::workflow
