#pragma once

// How the windows of the work open, close and press one another without
// knowing one another's logic: the session that builds them answers.

#include "workflow/maincontrols.hpp"

#include <QString>

namespace arbolex::work {
struct WorkSnapshot;
}

namespace arbolex::workflow {

/// The windows the main window opens and closes.
class IWorkWindows {
public:
    virtual ~IWorkWindows() = default;
    /// The thinning window on the last row of the table.
    virtual void openThinning() = 0;
    virtual void closeThinning() = 0;
    /// The assortment report of growth row `row`.
    virtual void openAssortment(int row) = 0;
    /// The net present value window on the laid-out cash flow.
    virtual void openNpv() = 0;
    virtual void closeNpv() = 0;
    virtual void openTimberPrices() = 0;
};

/// The main window's commands that the other windows press: the thinning loop
/// grows and thins, a regime replayed ends with the final cut, the economics
/// window checks the grow-from fields, and an opened document puts back a
/// whole work.
class IMainCommands {
public:
    virtual ~IMainCommands() = default;
    virtual void mnuModel_Click(int index) = 0;
    /// Types `text` into a field as a user would, then leaves it.
    virtual void typeText(MainControl control, const QString &text) = 0;
    virtual void cmdGrow_Click() = 0;
    virtual void cmdThin_Click() = 0;
    virtual void cmdFinalCut_Click() = 0;
    virtual void cmdClear_Click() = 0;
    /// The grow-from fields checked as the grow command checks them (their
    /// messages shown, the focus on the field at fault).
    virtual bool checkGrowFrom() = 0;
    /// Puts back `work` with its model chosen, as it was taken.
    virtual void restore(const work::WorkSnapshot &work) = 0;
};

} // namespace arbolex::workflow
