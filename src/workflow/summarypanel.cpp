#include "workflow/summarypanel.hpp"

#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::workflow {

bool SummaryPanel::fill() {
    bool filled = false;
    shell::guard(m_work.errorLog(), QStringLiteral(" in frmMain.FillSummary()"), [&] {
        const auto nothing = [this] {
            m_interactive.message(text::titleArbolex(), text::nothingToSummarize(),
                                  shell::kInformation);
        };
        if (m_work.table().rowCount() < 2) {
            nothing();
            return;
        }
        m_summary = {};
        show(true);
        const auto summary = m_work.summary();
        if (!summary) {
            nothing();
            return;
        }
        m_summary = *summary;
        filled = true;
    });
    m_view.tableChanged(1);
    return filled;
}

void SummaryPanel::toggle() {
    if (m_showing) {
        show(false);
    } else {
        fill();
    }
}

void SummaryPanel::show(bool summary) {
    m_showing = summary;
    m_view.showSummary(summary);
    m_view.setText(MainControl::lblTableTitle,
                   summary ? text::summary() : text::standProjections());
    m_view.setText(MainControl::cmdSummary,
                   summary ? text::gotoStandProjections() : text::gotoSummary());
}

} // namespace arbolex::workflow
