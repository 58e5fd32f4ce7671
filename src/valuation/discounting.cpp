#include "valuation/discounting.hpp"

#include "engine/vectorstate.hpp"

#include <cmath>
#include <cstring>
#include <limits>

namespace arbolex::valuation {

namespace {

/// Ages a factor table keeps: beyond any rotation a model can grow.
constexpr int kTabledYears = 256;

/// The discount factors of the last rate asked for on this thread, each
/// computed by the same std::pow as an untabled factor and only when first
/// asked for: a table changes no figure, it only saves the powers that a
/// thousand rotations valued at one rate (an estate, the optimiser's search)
/// would compute again and again.
class FactorTable {
public:
    double factor(double ratePercent, int years) {
        if (!sameRate(ratePercent)) {
            m_rate = ratePercent;
            for (double &f : m_factor) {
                f = kUnknown;
            }
        }
        double &f = m_factor[static_cast<std::size_t>(years)];
        if (std::isnan(f)) {
            f = std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
        }
        return f;
    }

private:
    static constexpr double kUnknown = std::numeric_limits<double>::quiet_NaN();

    /// The same rate, to the bit (−0 is not 0 for a table).
    bool sameRate(double ratePercent) const {
        return std::memcmp(&ratePercent, &m_rate, sizeof ratePercent) == 0;
    }

    double m_rate = kUnknown;
    double m_factor[kTabledYears]{};
};

/// (1 + ratePercent / 100)^years, tabled where it can be: a finite rate and
/// 0 to kTabledYears − 1 years (a power of a finite base to a whole exponent
/// is never NaN, so NaN marks a factor not yet computed).
double power(double ratePercent, int years) {
    if (years < 0 || years >= kTabledYears || !std::isfinite(ratePercent)) {
        return std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
    }
    thread_local FactorTable table;
    return table.factor(ratePercent, years);
}

std::optional<double> checkedFactor(double factor) {
    if (!std::isfinite(factor) || factor <= 0.0) {
        return std::nullopt;
    }
    return factor;
}

} // namespace

double roundToCents(double euro) {
    // nearbyint rounds halves to even in the default rounding mode.
    return std::nearbyint(euro * 100.0) / 100.0;
}

std::optional<double> discountFactor(double ratePercent, int years) {
    return checkedFactor(power(ratePercent, years));
}

std::optional<double> discountedCashFlow(double cashFlow, double ratePercent, int years) {
    engine::clearUpperVectorState();
    const std::optional<double> factor = discountFactor(ratePercent, years);
    if (!factor) {
        return std::nullopt;
    }
    return roundToCents(cashFlow / *factor);
}

std::optional<double> netPresentValue(const std::vector<double> &cashFlows, double ratePercent) {
    engine::clearUpperVectorState();
    double sum = 0.0;
    for (std::size_t i = 0; i < cashFlows.size(); ++i) {
        const std::optional<double> factor = discountFactor(ratePercent, static_cast<int>(i));
        if (!factor) {
            return std::nullopt;
        }
        sum += roundToCents(cashFlows[i] / *factor);
    }
    return sum;
}

} // namespace arbolex::valuation
