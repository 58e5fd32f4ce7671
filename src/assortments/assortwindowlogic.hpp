#pragma once

// The logic of the assortment report window `frmAssort`: the report of a
// growth row (asked for from the main window) or of a thinning's crop before,
// removal and crop after (from the thinning window's three Assort buttons), in
// the fixed classes or over the user categories, and the assortment rows that
// kept reports become.

#include "assortments/assortmentsession.hpp"
#include "assortments/iassortview.hpp"
#include "engine/assortment.hpp"
#include "thinning/thinningstate.hpp"

#include <QString>
#include <QStringList>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::work {
class StandWork;
}

namespace arbolex::assortments {

/// A stand of a report: basal area (m²/ha) and stocking (stems/ha); for a
/// removal, the volume the thinning removed (m³/ha), which its classes add up to.
struct ReportStand {
    float basalArea = 0.0f;
    float stocking = 0.0f;
    float removedVolume = 0.0f;
};

class AssortWindowLogic {
public:
    AssortWindowLogic(work::StandWork &work, IAssortView &view, shell::IInteractive &interactive);

    AssortmentSession &session() { return m_session; }
    IAssortView &view() { return m_view; }

    /// The main window's report on growth row `row` ("Crop assortment").
    void reportOnGrowthRow(int row);
    /// The thinning window's report of `kind` on its working state at `age`;
    /// `actualThinning` when the window edits a thinning already accepted.
    /// True when the report was shown.
    bool reportOnThinning(int kind, const thinning::ThinningWork &work, float age,
                          bool actualThinning);

    /// Fills the window for the current report kind in the fixed classes;
    /// false (nothing shown) when the report cannot be built.
    bool frmAssortLoad(float preBasalArea, float preStocking, float topHeight, float postBasalArea,
                       float postStocking);
    /// The same over the user categories in use, with the thinning
    /// development (pre, removed, post) for a report from the thinning window.
    bool frmAssortLoadMod(float preBasalArea, float preStocking, float topHeight,
                          float postBasalArea, float postStocking);

    /// Closes the report.
    void cmdOK_Click();
    /// Keeps the report: a thinning's report becomes an assortment row when
    /// the thinning is accepted (asked for again if it had been withdrawn); a
    /// growth row's report just closes.
    void cmdAccept_Click();
    /// Closes the report and withdraws a thinning's request.
    void cmdCancel_Click();
    /// Presses cmdOK, cmdAccept or cmdCancel; false for any other control.
    bool press(AssortControl control);

    /// Appends one assortment row per pending request, in the order 0, 1, 2,
    /// each at most once, for the accepted thinning `work` at `age`.
    void appendPendingRows(const thinning::ThinningWork &work, float age);

    /// The stand a report of `kind` describes: the crop before, the removal
    /// or the crop after.
    static ReportStand standOf(int kind, const thinning::ThinningWork &work);
    /// Row label of a kept report from its description: "AC yr", "AT yr" or "AP yr".
    static QString rowLabel(const QString &description);

private:
    /// The report's title for the current kind, or empty when refused.
    QString chooseTitle(float preBasalArea, float preStocking, float postBasalArea,
                        float postStocking) const;
    /// False (with its message) when the report of a thinning cannot be built.
    bool thinningUsable(float preBasalArea, float preStocking, float postBasalArea,
                        float postStocking);
    /// The title, the checks and the calculation that both reports share;
    /// writes the caption and the title. False (nothing shown) when refused.
    bool prepareReport(const thinning::ThinningWork &work, float topHeight, bool user,
                       engine::Assortment &result);
    /// The user categories in use and their names; false when none is.
    bool categoriesInUse(std::vector<engine::AssortmentCategory> &bounds, QStringList &names);
    bool calculate(const ReportStand &stand, float topHeight, bool user,
                   engine::Assortment &result);
    void appendRow(const QString &description, float age, const engine::Assortment &result,
                   const QStringList &names);
    void message(const QString &text);

    work::StandWork &m_standWork;
    IAssortView &m_view;
    shell::IInteractive &m_interactive;
    AssortmentSession m_session;

    /// The report on show: from the main window or the thinning window.
    bool m_fromMain = false;
    bool m_actualThinning = false;
    float m_age = 0.0f;
    /// The volumes before and after the thinning of a report from the thinning window.
    thinning::ThinningWork m_volumes;
};

} // namespace arbolex::assortments
