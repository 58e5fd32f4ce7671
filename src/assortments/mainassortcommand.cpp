// The main window's assort command: the report of one growth row that carries
// no thinning (a thinning's assortments come from the thinning window).
#include "assortments/assortmessages.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

namespace arbolex::workflow {

void MainWindowLogic::cmdAssort_Click() {
    namespace at = assortments::text;
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdAssort_Click()"), [&] {
        if (m_assort == nullptr) {
            return;
        }
        const QString title = text::titleArbolex();
        const int current = m_table.currentRow();
        if (current != m_table.selectionEnd()) {
            m_interactive.message(title, at::singleGrowthRow(), shell::kExclamation);
            return;
        }
        const bool onRow = current >= 1 && current <= m_table.lastRow();
        if (!onRow || !(m_table.row(current).isGrowth() || m_table.row(current).isThinning())) {
            m_interactive.message(title, at::notGrowthRow(), shell::kExclamation);
            return;
        }
        // A growth row carries a thinning when a thinning row of its age follows it.
        const work::TableRow &row = m_table.row(current);
        bool thinned = row.isThinning() || row.record.isThinned();
        for (int r = current + 1; !thinned && r <= m_table.lastRow(); ++r) {
            thinned = m_table.row(r).isThinning() && m_table.row(r).record.age == row.record.age;
        }
        if (thinned) {
            m_interactive.message(title, at::useThinCommand(), shell::kExclamation);
            return;
        }
        m_assort->reportOnGrowthRow(current);
    });
}

} // namespace arbolex::workflow
