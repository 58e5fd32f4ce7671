#include "economics/npvcontrols.hpp"

#include "shell/controlnames.hpp"

#include <array>

namespace arbolex::economics {

namespace {
constexpr std::array<const char *, kNpvControlCount> kNames = {
    "txtInterestRate", "txtNPV", "cmdNPV", "CmdCopyToClipboard", "cmdClose"};
} // namespace

QString npvControlName(NpvControl control) {
    return shell::controlNameIn(kNames, control);
}

std::optional<NpvControl> npvControlFromName(const QString &name) {
    return shell::controlNamedIn<NpvControl>(kNames, name);
}

} // namespace arbolex::economics
