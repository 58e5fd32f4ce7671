// The main window's thin command: only the last row of the table may be
// thinned, and only one row at a time.
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "thinning/thinmessages.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <cmath>

namespace arbolex::workflow {

namespace {
QString wholeAge(float age) {
    return QString::number(static_cast<qint64>(std::nearbyint(age)));
}
} // namespace

void MainWindowLogic::cmdThin_Click() {
    namespace tt = thinning::text;
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdThin_Click()"), [&] {
        // After the final cut there is no crop left to thin.
        if (m_thinning == nullptr || !m_grow.isThinnedModel() || m_felled) {
            return;
        }
        const QString title = text::titleArbolexYeld();
        const int last = m_table.lastRow();
        if (last < 1) {
            m_interactive.message(title, tt::growthRowRequired(), shell::kExclamation);
            return;
        }
        const int current = m_table.currentRow();
        const int end = m_table.selectionEnd();
        if (end != last) {
            const float selectedAge = current >= 1 ? m_table.row(current).record.age : 0.0f;
            m_table.select(last, last);
            m_view.scrollToRow(last);
            m_interactive.message(title,
                                  tt::cannotThinLead() + wholeAge(m_table.row(last).record.age) +
                                      tt::cannotThinYears() + tt::cr() + tt::lf() +
                                      tt::cannotThinAt() + wholeAge(selectedAge),
                                  shell::kExclamation);
            return;
        }
        if (current != end) {
            m_interactive.message(title, tt::singleRowRequired(), shell::kExclamation);
            return;
        }
        const work::TableRow &row = m_table.row(last);
        // A thinning row stands for its thinned stand: opening it again lets
        // the user change that thinning.
        if (!row.isGrowth() && !row.isThinning()) {
            m_interactive.message(title, tt::growthRowRequired(), shell::kExclamation);
            return;
        }
        if (row.isGrowth() && row.record.isThinned()) {
            m_interactive.message(title, tt::growBeforeThinning(), shell::kExclamation);
            return;
        }
        thinning::ThinningFlags &flags = m_thinning->flags();
        m_thinning->frmThinLoad();
        if (flags.loopUnderWay) {
            // The loop drives the window itself.
            flags.thinnedSinceLastGrow = true;
            return;
        }
        // The loop repeats an earlier thinning, so it is offered only once a
        // thinning has been written.
        const bool loopMode =
            !flags.noThinningYet && m_interactive.askYesNo(title, tt::loopOffer());
        m_thinning->show(loopMode);
        flags.thinnedSinceLastGrow = true;
    });
}

} // namespace arbolex::workflow
