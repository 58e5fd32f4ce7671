// Deleting the last rows of the projection table, and copying the table or
// the summary to the clipboard.
#include "economics/npvwindowlogic.hpp"
#include "shell/apperror.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "shell/tableexport.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

namespace arbolex::workflow {

void MainWindowLogic::cmdDeleteRows_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdDeleteRows_Click()"), [&] {
        const int first = std::min(m_table.currentRow(), m_table.selectionEnd());
        if (m_table.empty() || first < 1) {
            message(text::titleArbolex(), text::selectRowToDelete(), shell::kExclamation);
            return;
        }
        if (!m_interactive.askYesNo(text::titleArbolex(),
                                    text::confirmDelete(first, m_table.lastRow()))) {
            return;
        }
        AjustArraysAfterDelete(first);
    });
}

void MainWindowLogic::AjustArraysAfterDelete(int firstDeleted) {
    if (firstDeleted <= 1) {
        afterClear(work::HeaderLayout::WithMoney);
        return;
    }
    m_table.removeFrom(firstDeleted);
    m_table.setHeaderLayout(work::HeaderLayout::WithMoney);
    m_states.clear();
    m_firstNew = 0;
    timberRevenueChanged();
    // The rotation is open again unless its final cut survived; no cash flow.
    m_felled = false;
    bool thinnings = false;
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        m_felled = m_felled || m_table.row(r).finalCut;
        thinnings = thinnings || m_table.row(r).isThinning();
    }
    m_cashFlow.reset();
    if (m_npv != nullptr) {
        m_npv->view().close();
    }
    if (m_thinning != nullptr) {
        m_thinning->flags().noThinningYet = !thinnings;
        m_thinning->view().close();
    }
    const int stand = lastStandRow();
    m_standingVolume = stand > 0 ? m_table.row(stand).record.volume : 0.0;
    if (m_showingSummary) {
        showSummary(false);
    }
    updateYieldClassLabel();

    // Growing goes on from the new last row.
    const int last = m_table.lastRow();
    m_table.select(last, last);
    if (stand == last) {
        copyRowToFields(last);
    }
    m_view.setEnabled(MainControl::cmdGrow, !m_felled);
    m_view.setEnabled(MainControl::cmdThin, !m_felled && m_grow.isThinnedModel());
    m_view.setEnabled(MainControl::cmdFinalCut, !m_felled);
    m_view.setEnabled(MainControl::cmdNPV, false);
    m_view.tableChanged(1);
    m_view.scrollToRow(last);
}

void MainWindowLogic::CopyTable(bool summary) {
    bool copied = false;
    shell::guard(m_log, QStringLiteral(" in frmMain.CopyTable()"), [&] {
        if (m_clipboard == nullptr) {
            return;
        }
        std::vector<QStringList> grid = summary ? summaryGrid() : m_table.exportGrid();
        // The sub-compartment's identification heads the copy, a blank line below it.
        const QStringList heading = m_identification.heading();
        if (!heading.isEmpty()) {
            std::vector<QStringList> top;
            for (const QString &line : heading) {
                top.push_back({line});
            }
            top.push_back({QString()});
            grid.insert(grid.begin(), top.begin(), top.end());
        }
        copied = m_clipboard->setTable(shell::tabSeparated(grid), shell::htmlTable(grid));
    });
    if (!copied) {
        message(text::titleArbolex(), text::transferFailed(), shell::kExclamation);
    }
}

} // namespace arbolex::workflow
