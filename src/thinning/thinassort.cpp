// The thinning window's three Assort buttons: reports on the stand before the
// thinning, the removal and the stand after, from the working state.
#include "assortments/assortwindowlogic.hpp"
#include "shell/apperror.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "work/standwork.hpp"

namespace arbolex::thinning {

void ThinWindowLogic::cmdAssort_Click(int index) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmThin.cmdAssort_Click()"), [&] {
        const int row = m_standWork.table().currentRow();
        if (m_assort == nullptr || row < 1 || index < 0 || index > 2) {
            return;
        }
        m_assort->reportOnThinning(index, m_work, m_standWork.table().row(row).record.age,
                                   m_flags.editingExisting);
    });
}

} // namespace arbolex::thinning
