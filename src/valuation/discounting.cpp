#include "valuation/discounting.hpp"

#include "engine/vectorstate.hpp"

#include <cmath>

namespace arbolex::valuation {

double roundToCents(double euro) {
    // nearbyint rounds halves to even in the default rounding mode.
    return std::nearbyint(euro * 100.0) / 100.0;
}

std::optional<double> discountFactor(double ratePercent, int years) {
    const double factor = std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
    if (!std::isfinite(factor) || factor <= 0.0) {
        return std::nullopt;
    }
    return factor;
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
        const std::optional<double> discounted =
            discountedCashFlow(cashFlows[i], ratePercent, static_cast<int>(i));
        if (!discounted) {
            return std::nullopt;
        }
        sum += *discounted;
    }
    return sum;
}

} // namespace arbolex::valuation
