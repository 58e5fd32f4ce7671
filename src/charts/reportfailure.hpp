#pragma once

#include <QString>

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::charts {

/// A report, chart or print job that failed: the user is told `text` under
/// `title`, and the failure goes to the error log as the one line of the
/// handler `label` (" in frmMain.mnuExportReport_Click()").
void reportOutputFailure(shell::IInteractive &interactive, shell::ErrorLog &log,
                         const QString &title, const QString &text, const QString &label);

} // namespace arbolex::charts
