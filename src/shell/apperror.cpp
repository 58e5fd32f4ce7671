#include "shell/apperror.hpp"

#include "shell/runtimeerror.hpp"

#include <cstdint>
#include <limits>

namespace arbolex::shell {

QString appFaultDescription(int number) {
    switch (number) {
    case kAppInvalidCall:
        return QStringLiteral("Invalid procedure call or argument");
    case kAppOverflow:
        return QStringLiteral("Overflow");
    case kAppOutOfMemory:
        return QStringLiteral("Out of memory");
    case kAppDivisionByZero:
        return QStringLiteral("Division by zero");
    case kAppTypeMismatch:
        return QStringLiteral("Type mismatch");
    default:
        return QStringLiteral("Internal error");
    }
}

void raiseAppFault(int number, int line) {
    throw AppFault{number, appFaultDescription(number), line};
}

QString windowFaultLine(const AppFault &fault, const QString &label) {
    return handlerErrorText({fault.number, fault.description}, fault.line, label);
}

QString moduleFaultLine(const AppFault &fault, const QString &label) {
    return moduleErrorText({fault.number, fault.description}, fault.line, label);
}

std::int16_t addInt16(int a, int b, int line) {
    const int sum = a + b;
    if (sum < std::numeric_limits<std::int16_t>::min() ||
        sum > std::numeric_limits<std::int16_t>::max()) {
        raiseAppFault(kAppOverflow, line);
    }
    return static_cast<std::int16_t>(sum);
}

} // namespace arbolex::shell
