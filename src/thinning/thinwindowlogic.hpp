#pragma once

// The logic of the thinning window `frmThin`: loading the stand before the
// thinning, checking and previewing a prescription by any of four methods,
// accepting it into the projection table, and the thinning loop that repeats
// accept, grow, thin and preview at a set frequency.

#include "thinning/ithinview.hpp"
#include "thinning/thinningstate.hpp"

#include <QString>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::assortments {
class AssortWindowLogic;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::work {
class StandWork;
struct RowRecord;
} // namespace arbolex::work

namespace arbolex::thinning {

/// Prescription methods, as ThinMethod() numbers them.
enum ThinningMethod : int {
    kBasalAreaAndStocking = 1,
    kBasalArea = 2,
    kStocking = 3,
    kVolume = 4,
    kNoMethod = -99,
};

class ThinWindowLogic {
public:
    /// The thinning window on `work`; the loop presses the grow and thin
    /// commands of `main`.
    ThinWindowLogic(work::StandWork &work, workflow::IMainCommands &main, IThinView &view,
                    shell::IInteractive &interactive);

    // ---- Loading and showing ---------------------------------------------------

    /// Loads the window for the current row of `flxMain`: the stand before
    /// the thinning, and the old thinning when the row already carries one.
    void frmThinLoad();
    /// Shows the window, with the loop frame on when `loopMode`.
    void show(bool loopMode);
    /// The main window's Thin: loads the window on the last row and shows it,
    /// offering the loop once a thinning has been written (the loop itself
    /// drives the window without showing it).
    void openFromMain();

    // ---- Preview ------------------------------------------------------------------

    /// Checks, solves and previews the prescribed thinning.
    void cmdThin_Click();
    bool chkThinFlds();
    /// The method the filled fields prescribe, or kNoMethod (with its message).
    int ThinMethod();
    /// Fills the removal and post-thinning columns from the two states.
    void ShowThin(float preBasalArea, float preStocking, float topHeight, float preVolume,
                  float postBasalArea, float postStocking, float postVolume);
    /// Empties the removal and post-thinning columns.
    void cmdClear_Click();
    /// Closes the window without changing the table.
    void cmdCancel_Click();

    // ---- Acceptance ------------------------------------------------------------------

    /// Writes the previewed thinning into the projection table and makes the
    /// thinned stand the new grow-from stand.
    void cmdAccept_Click();
    /// Writes the thinned row's stand into the grow-from fields.
    void SetGrowFromAfterThin();

    // ---- Assortments -------------------------------------------------------------------

    /// Assort button `index` (0 pre-thin, 1 thinning, 2 post-thin): the
    /// report of that stand of the working state, asked for as a row.
    void cmdAssort_Click(int index);
    void attachAssortments(assortments::AssortWindowLogic *assort) { m_assort = assort; }

    // ---- The loop -----------------------------------------------------------------------

    void chkActivLoop_Click();
    bool loopFieldCheck();
    void cmdLoop_Click();
    /// Empties the six removal and post-thinning fields.
    void resetFields();

    // ---- Fields ----------------------------------------------------------------------------

    /// Types `text` into a field as a user would (digits and one '.' pass).
    void typeText(ThinControl control, const QString &text);
    /// Presses the command `control` (cmdThin, cmdAccept, chkActivLoop …);
    /// false when the window has no such command.
    bool press(ThinControl control);

    const ThinningWork &work() const { return m_work; }
    ThinningFlags &flags() { return m_flags; }
    IThinView &view() { return m_view; }

private:
    QString field(ThinControl c) const;
    void message(const QString &title, const QString &text);
    bool refuse(const QString &text, ThinControl focus);
    /// Post value of a quantity: pre − removal when a removal is typed (the
    /// removal wins), else the post field.
    float postValue(ThinControl removal, ThinControl post, float pre) const;
    void emptyResultColumns();
    void fillFromRecord(const work::RowRecord &record);

    work::StandWork &m_standWork;
    workflow::IMainCommands &m_main;
    IThinView &m_view;
    shell::IInteractive &m_interactive;
    ThinningWork m_work;
    assortments::AssortWindowLogic *m_assort = nullptr;
    ThinningFlags m_flags;
    /// Ratios post / pre of the last method-1 preview.
    float m_ratioBasalArea = 1.0f;
    float m_ratioStocking = 1.0f;
};

} // namespace arbolex::thinning
