// The main window's Show Timber Prices command.
#include "economics/timberpriceswindowlogic.hpp"
#include "shell/apperror.hpp"
#include "workflow/mainwindowlogic.hpp"

namespace arbolex::workflow {

void MainWindowLogic::cmdShowTimberPrice_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdShowTimberPrice_Click()"), [&] {
        if (m_timberPrices != nullptr) {
            m_timberPrices->show();
        }
    });
}

} // namespace arbolex::workflow
