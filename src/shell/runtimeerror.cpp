#include "shell/runtimeerror.hpp"

namespace arbolex::shell {

namespace {
QString tail(const RuntimeError &error, int line, const QString &label) {
    return error.description + QLatin1String(" in line ") + QString::number(line) + label;
}
} // namespace

QString moduleErrorText(const RuntimeError &error, int line, const QString &label,
                        const QString &gap) {
    return QLatin1String("Error ") + QString::number(error.number) + gap + tail(error, line, label);
}

QString handlerErrorText(const RuntimeError &error, int line, const QString &label) {
    return QLatin1String("Error # :") + QString::number(error.number) + QLatin1String("  ") +
           tail(error, line, label);
}

} // namespace arbolex::shell
