#include "shell/apperror.hpp"

#include "shell/runtimeerror.hpp"

#include <cstdint>
#include <limits>

namespace arbolex::shell {

void raiseAppFault(const RuntimeError &error, int line) {
    throw AppFault{error, line};
}

QString windowFaultLine(const AppFault &fault, const QString &label) {
    return handlerErrorText(fault.error, fault.line, label);
}

QString moduleFaultLine(const AppFault &fault, const QString &label) {
    return moduleErrorText(fault.error, fault.line, label);
}

std::int16_t addInt16(int a, int b, int line) {
    const int sum = a + b;
    if (sum < std::numeric_limits<std::int16_t>::min() ||
        sum > std::numeric_limits<std::int16_t>::max()) {
        raiseAppFault(RuntimeError::overflow(), line);
    }
    return static_cast<std::int16_t>(sum);
}

} // namespace arbolex::shell
