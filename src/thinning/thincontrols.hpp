#pragma once

#include <QString>

#include <optional>

namespace arbolex::thinning {

/// The controls of the thinning window `frmThin` that its logic reads or sets.
enum class ThinControl {
    // removals and post-thinning values typed by the user
    txtRemN,
    txtRemB,
    txtRemV,
    txtPostN,
    txtPostB,
    txtPostV,
    // the loop
    txtThinFreq,
    txtThinUntil,
    // read-only columns
    lblPreN,
    lblPreB,
    lblPreV,
    lblPreD,
    lblPreMV,
    lblRemD,
    lblRemMV,
    lblPostD,
    lblPostMV,
    // commands and switches
    chkActivLoop,
    fraLoop,
    cmdLoop,
    cmdThin,
    cmdClear,
    cmdCancel,
    cmdAccept,
};

inline constexpr int kThinControlCount = static_cast<int>(ThinControl::cmdAccept) + 1;

QString controlName(ThinControl control);
std::optional<ThinControl> thinControlFromName(const QString &name);
/// True for the fields the user types into.
bool isThinField(ThinControl control);

} // namespace arbolex::thinning
