#include "cli/options.hpp"

#include <cmath>
#include <limits>

namespace arbolex::cli {

namespace {
QString dashed(const char *name) {
    return QStringLiteral("--") + QLatin1String(name);
}
} // namespace

Options::Options(const QStringList &arguments, const std::vector<const char *> &known) {
    QStringList names{QStringLiteral("--data-dir")};
    for (const char *name : known) {
        names.append(dashed(name));
    }
    for (qsizetype i = 0; i < arguments.size(); ++i) {
        const QString &word = arguments.at(i);
        if (!word.startsWith(QLatin1String("--"))) {
            throw UsageError{QStringLiteral("unexpected argument \"") + word + QLatin1Char('"')};
        }
        if (!names.contains(word)) {
            throw UsageError{QStringLiteral("unknown option ") + word};
        }
        // A value never starts with "--": that is the next option.
        if (i + 1 >= arguments.size() || arguments.at(i + 1).startsWith(QLatin1String("--"))) {
            throw UsageError{QStringLiteral("missing value for ") + word};
        }
        if (m_values.contains(word)) {
            throw UsageError{word + QStringLiteral(" is given twice")};
        }
        m_values.insert(word, arguments.at(++i));
    }
}

bool Options::has(const char *name) const {
    return m_values.contains(dashed(name));
}

QString Options::value(const char *name) const {
    const auto found = m_values.constFind(dashed(name));
    if (found == m_values.constEnd()) {
        throw UsageError{dashed(name) + QStringLiteral(" is required")};
    }
    return found.value();
}

double Options::number(const char *name) const {
    const QString text = value(name);
    bool ok = false;
    const double x = text.toDouble(&ok); // C locale: a point before the decimals
    if (!ok || !std::isfinite(x)) {
        throw UsageError{dashed(name) + QStringLiteral(": \"") + text +
                         QStringLiteral("\" is not a number")};
    }
    return x;
}

float Options::single(const char *name) const {
    const double x = number(name);
    if (std::fabs(x) > std::numeric_limits<float>::max()) {
        throw UsageError{dashed(name) + QStringLiteral(" is out of range")};
    }
    return static_cast<float>(x);
}

float Options::positive(const char *name) const {
    const float x = single(name);
    if (!(x > 0.0f)) {
        throw UsageError{dashed(name) + QStringLiteral(" must be above 0")};
    }
    return x;
}

int Options::wholeNumber(const char *name, int low, int high) const {
    const double x = number(name);
    if (x != std::trunc(x) || x < low || x > high) {
        throw UsageError{dashed(name) + QStringLiteral(" must be a whole number from ") +
                         QString::number(low) + QStringLiteral(" to ") + QString::number(high)};
    }
    return static_cast<int>(x);
}

int Options::oneOf(std::initializer_list<const char *> names) const {
    QStringList listed;
    int found = -1;
    int count = 0;
    for (const char *name : names) {
        listed.append(dashed(name));
        if (has(name)) {
            found = static_cast<int>(listed.size()) - 1;
            ++count;
        }
    }
    if (count != 1) {
        throw UsageError{
            (count == 0 ? QStringLiteral("give one of ") : QStringLiteral("give only one of ")) +
            listed.join(QStringLiteral(", "))};
    }
    return found;
}

} // namespace arbolex::cli
