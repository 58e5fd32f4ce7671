#include "workflow/summarypanel.hpp"

#include "carbon/account.hpp"
#include "economics/tableregime.hpp"
#include "engine/grow.hpp"
#include "engine/modeldescription.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "workflow/mainmessages.hpp"

#include <cmath>

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
        m_carbon = {};
        show(true);
        const auto summary = m_work.summary();
        if (!summary) {
            nothing();
            return;
        }
        m_summary = *summary;
        fillCarbon();
        filled = true;
    });
    m_view.tableChanged(1);
    return filled;
}

void SummaryPanel::fillCarbon() {
    // The rotation as the economics window values it, with the work's money.
    const rotation::Economics money = m_work.economics();
    std::optional<std::pair<int, double>> lastStand;
    if (const int last = m_work.lastStandRow(); last > 0) {
        const work::RowRecord &r = m_work.table().row(last).record;
        const carbon::Parameters &p = money.carbonParameters;
        lastStand = {static_cast<int>(std::lround(r.age)),
                     carbon::liveTrees(
                         r.volume, p.gravityOf(engine::speciesCode(m_work.grow().modelId())), p)};
    }
    m_carbon = carbonSummary(economics::valueTableRotation(m_work, money), money, lastStand);
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
