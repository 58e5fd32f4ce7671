#include "prices/costfile.hpp"

#include "shell/errorlog.hpp"
#include "shell/runtimeerror.hpp"
#include "shell/seqfile.hpp"

#include <QDir>
#include <QFileInfo>

#include <cmath>

namespace arbolex::prices {

namespace {

constexpr QLatin1String kGetLabel(" in procedure GetCostsFromFile of Module Misc");

constexpr const char *kCostNames[] = {"the establishment cost", "the annual cost"};

} // namespace

CostsReading readCosts(const QString &path) {
    const QString name = QLatin1Char('"') + QFileInfo(path).fileName() + QLatin1Char('"');
    shell::SequentialReader in(path);
    if (in.openError()) {
        return {std::nullopt, in.openError().number == shell::kErrFileNotFound,
                name + QStringLiteral(": ") + in.openError().description};
    }
    CostDefaults costs;
    double *const values[] = {&costs.establishment, &costs.annual};
    for (std::size_t i = 0; i < std::size(values); ++i) {
        const QString which = QStringLiteral(": ") + QLatin1String(kCostNames[i]) +
                              QStringLiteral(" (value ") + QString::number(i + 1) +
                              QLatin1Char(')');
        double &value = *values[i];
        const shell::RuntimeError error = in.readNumber(value);
        if (error.number == shell::kErrInputPastEndOfFile) {
            return {std::nullopt, false, name + which + QStringLiteral(" is missing")};
        }
        if (error) {
            return {std::nullopt, false, name + which + QStringLiteral(" is not a number")};
        }
        if (!std::isfinite(value) || value < 0.0 || value > kMaxCost) {
            return {std::nullopt, false,
                    name + which + QStringLiteral(" is not a cost from 0 to ") +
                        QString::number(kMaxCost, 'f', 2) + QStringLiteral(" euro/ha")};
        }
    }
    if (!in.atEnd()) {
        return {std::nullopt, false,
                name + QStringLiteral(": holds more than ") + QString::number(std::size(values)) +
                    QStringLiteral(" costs")};
    }
    return {costs, false, {}};
}

void GetCostsFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log) {
    const CostsReading read = readCosts(QDir(dataFolder).filePath(QLatin1String(kCostsFile)));
    if (!read.costs) {
        log.append(QStringLiteral("FAULT - ") + read.fault +
                   QStringLiteral("; the default costs were not read") + kGetLabel);
        return;
    }
    data.costs = *read.costs;
}

} // namespace arbolex::prices
