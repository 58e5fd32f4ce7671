#pragma once

// The main window's summary `flxSummary`: filled from the work on demand,
// shown in place of the projection table, and toggled with it.

#include "work/standwork.hpp"
#include "workflow/carbonsummary.hpp"
#include "workflow/imainview.hpp"

#include <QStringList>

#include <vector>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::workflow {

class SummaryPanel {
public:
    SummaryPanel(work::StandWork &work, IMainView &view, shell::IInteractive &interactive)
        : m_work(work), m_view(view), m_interactive(interactive) {}

    /// Fills the summary and shows it; false when there was nothing to summarise.
    bool fill();
    /// Toggles between "Stand Projections" and "Summary".
    void toggle();
    /// Shows the summary (true) or the projection table, with their captions.
    void show(bool summary);
    bool showing() const { return m_showing; }

    /// The summary as last filled: its rows, in the projection table's shape.
    const std::vector<work::TableRow> &rows() const { return m_summary.rows; }
    /// Index in rows() of the first row of the rotation's totals.
    int totalsFrom() const { return m_summary.totalsFrom; }
    /// The summary as shown: captions first, then its rows.
    std::vector<QStringList> grid() const { return m_work.summaryGrid(m_summary); }
    /// The group above each column of the summary ("Thinning" …).
    QStringList groups() const { return m_work.summaryGroups(); }
    /// The carbon block under the summary, as last filled.
    const CarbonSummary &carbon() const { return m_carbon; }

private:
    void fillCarbon();

    work::StandWork &m_work;
    IMainView &m_view;
    shell::IInteractive &m_interactive;
    work::Summary m_summary;
    CarbonSummary m_carbon;
    bool m_showing = false;
};

} // namespace arbolex::workflow
