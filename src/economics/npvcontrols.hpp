#pragma once

#include <QString>

#include <optional>

namespace arbolex::economics {

/// The controls of the net present value window `frmNPV` that its logic reads
/// or sets, named as users and the documentation know them.
enum class NpvControl {
    txtInterestRate,
    txtNPV,
    cmdNPV, ///< "Compute"
    CmdCopyToClipboard,
    cmdClose,
};

inline constexpr int kNpvControlCount = static_cast<int>(NpvControl::cmdClose) + 1;

/// The control's name ("txtInterestRate").
QString npvControlName(NpvControl control);
/// The control named `name`, if the window has one.
std::optional<NpvControl> npvControlFromName(const QString &name);

} // namespace arbolex::economics
