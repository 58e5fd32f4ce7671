#pragma once

#include "work/worksnapshot.hpp"

#include <QString>

#include <optional>

namespace arbolex::workflow {

/// The controls of the main window `frmMain` that its logic reads or sets,
/// named as users and the documentation know them.
enum class MainControl {
    // grow-from inputs
    txtFromA,
    txtFromN,
    txtFromH,
    txtFromB,
    txtFromD,
    txtToA,
    txtByA,
    txtNetArea,
    // read-only results
    lblSI,
    lblYC,
    // commands
    cmdGrow,
    cmdThin,
    cmdFinalCut,
    cmdAssort,
    cmdClear,
    cmdClearAll,
    cmdUseRow,
    cmdNPV,
    cmdSummary,
    cmdShowTimberPrice,
    cmdDeleteRows,
    /// Title above the table: "Stand Projections" or "Summary".
    lblTableTitle,
};

inline constexpr int kMainControlCount = static_cast<int>(MainControl::lblTableTitle) + 1;

/// The control's name ("txtFromA").
QString controlName(MainControl control);
/// The control named `name`, if the main window has one.
std::optional<MainControl> mainControlFromName(const QString &name);
/// True for the text fields whose keys go through the numeric key filter.
bool isNumericField(MainControl control);

/// The work field a numeric field shows (they are the same eight, in order).
inline work::WorkField workFieldOf(MainControl control) {
    return static_cast<work::WorkField>(control);
}
/// The field that shows a work field.
inline MainControl controlOf(work::WorkField field) {
    return static_cast<MainControl>(field);
}

} // namespace arbolex::workflow
