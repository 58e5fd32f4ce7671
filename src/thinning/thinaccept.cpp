// Accepting a thinning: the thinning record, the thinning row the work writes
// from it, and the thinned stand as the new grow-from.
#include "assortments/assortwindowlogic.hpp"
#include "rotation/standmath.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinmessages.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "work/standwork.hpp"
#include "work/worktexts.hpp"
#include "workflow/mainmessages.hpp"

#include <cmath>

namespace arbolex::thinning {

using shell::formatNumber;
using work::WorkField;

void ThinWindowLogic::cmdAccept_Click() {
    try {
        const work::ProjectionTable &table = m_standWork.table();
        const int row = table.currentRow();
        if (row < 1) {
            return;
        }
        const work::TableRow &current = table.row(row);
        const ThinningWork &w = m_work;
        const bool nothingRemoved = !w.previewed || w.preBasalArea == w.postBasalArea;
        if (current.isGrowth() && !m_flags.editingExisting && nothingRemoved) {
            // Nothing removed: no thinning is stored.
            m_standWork.SetGrowFrom(0.0f, w.preBasalArea, w.preStocking, w.topHeight, 0.0f, -1.0f);
            if (!m_flags.loopUnderWay) {
                m_view.close();
            }
            return;
        }
        m_standWork.SetGrowFrom(0.0f, w.postBasalArea, w.postStocking, w.topHeight, 0.0f, -1.0f);

        work::RowRecord record;
        record.age = current.record.age;
        record.topHeight = w.topHeight;
        record.basalArea = w.postBasalArea;
        record.stocking = w.postStocking;
        record.volume = w.postVolume;
        // The loop takes the diameter the window shows; both are the same
        // truncated value.
        float postB = w.postBasalArea;
        float postN = w.postStocking;
        record.dbh = m_flags.loopUnderWay && shell::isNumeric(m_view.text(ThinControl::lblPostD))
                         ? static_cast<float>(shell::val(m_view.text(ThinControl::lblPostD)))
                         : rotation::truncateToTenth(rotation::dbhFromBasalArea(postB, postN));
        record.removedBasalArea = w.preBasalArea - w.postBasalArea;
        record.removedStocking = w.preStocking - w.postStocking;
        record.removedVolume = std::fabs(w.preVolume - w.postVolume);
        record.postDbh = record.dbh;

        const int thinRow = m_standWork.WriteThinLine(record, work::text::rowLabelThinning(),
                                                      m_flags.editingExisting, m_interactive);
        if (m_assort != nullptr) {
            m_assort->appendPendingRows(w, record.age);
        }
        m_standWork.select(thinRow, thinRow);
        SetGrowFromAfterThin();
        if (!m_flags.loopUnderWay) {
            m_view.close();
        }
    } catch (const shell::AppFault &fault) {
        m_interactive.message(workflow::text::titleArbolex(), text::acceptFailed(),
                              shell::kExclamation);
        m_standWork.errorLog().append(
            shell::windowFaultLine(fault, QStringLiteral(" in frmThin.cmdAccept_Click()")));
    }
}

void ThinWindowLogic::SetGrowFromAfterThin() {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in Misc.SetGrowFromAfterThin()"), [&] {
        const work::ProjectionTable &table = m_standWork.table();
        const int row = table.currentRow();
        if (row < 1) {
            return;
        }
        m_standWork.copyRowToFields(row);
        if (m_flags.loopUnderWay) {
            // The next grow of the loop reaches the next thinning age.
            const double frequency =
                std::nearbyint(shell::val(m_view.text(ThinControl::txtThinFreq)));
            const double age = shell::val(table.row(row).cells.value(work::kColAge));
            m_standWork.setField(WorkField::ToAge, formatNumber(age + frequency, u"##0"));
            m_standWork.setField(WorkField::ByStep, formatNumber(frequency, u"##0"));
        }
    });
}

} // namespace arbolex::thinning
