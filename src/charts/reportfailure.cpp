#include "charts/reportfailure.hpp"

#include "shell/apperror.hpp"
#include "shell/interactive.hpp"

namespace arbolex::charts {

void reportOutputFailure(shell::IInteractive &interactive, shell::ErrorLog &log,
                         const QString &title, const QString &text, const QString &label) {
    interactive.message(title, text, shell::kCritical);
    log.append(shell::windowFaultLine({shell::RuntimeError::pathFileAccessError(), 0}, label));
}

} // namespace arbolex::charts
