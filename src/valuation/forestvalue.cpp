#include "valuation/forestvalue.hpp"

#include "valuation/discounting.hpp"

#include "engine/vectorstate.hpp"

#include <cmath>

namespace arbolex::valuation {

namespace {

/// Value at age 0 of a cash flow by age at the growth factor q = 1 + r:
/// Σ cf_a q^(−a), by Horner's rule from the last age.
double valueAtPlanting(const std::vector<double> &cashFlowByAge, double q) {
    double value = 0.0;
    for (auto a = cashFlowByAge.size(); a-- > 0;) {
        value = value / q + cashFlowByAge[a];
    }
    return value;
}

/// Points of the scan for the internal rate of return, evenly spaced in
/// ln(1 + r): fine enough that two roots closer than about 0.2 % of (1 + r)
/// are the only ones it can miss.
constexpr int kIrrScanPoints = 4000;
constexpr double kIrrTolerancePercent = 1e-10;

} // namespace

std::optional<double> landExpectationValue(const std::vector<double> &cashFlowByAge,
                                           double ratePercent) {
    engine::clearUpperVectorState();
    if (cashFlowByAge.size() < 2 || !(ratePercent > 0.0)) {
        return std::nullopt;
    }
    const auto rotation = static_cast<int>(cashFlowByAge.size()) - 1;
    const std::optional<double> growth = discountFactor(ratePercent, rotation);
    if (!growth) {
        return std::nullopt;
    }
    // Σ cf_a q^(R−a) is the value at planting carried to the final cut.
    const double atFinalCut = valueAtPlanting(cashFlowByAge, 1.0 + ratePercent / 100.0) * *growth;
    const double lev = atFinalCut / (*growth - 1.0);
    if (!std::isfinite(lev)) {
        return std::nullopt;
    }
    return lev;
}

double equivalentAnnualAnnuity(double landExpectationValue, double ratePercent) {
    return landExpectationValue * ratePercent / 100.0;
}

std::optional<double> forestValue(const std::vector<double> &cashFlowFromPresent,
                                  double landExpectationValue, double ratePercent) {
    const int yearsToFinalCut =
        cashFlowFromPresent.empty() ? 0 : static_cast<int>(cashFlowFromPresent.size()) - 1;
    return forestValue(netPresentValue(cashFlowFromPresent, ratePercent), yearsToFinalCut,
                       landExpectationValue, ratePercent);
}

std::optional<double> forestValue(std::optional<double> netPresentValue, int yearsToFinalCut,
                                  double landExpectationValue, double ratePercent) {
    const std::optional<double> factor = discountFactor(ratePercent, yearsToFinalCut);
    if (!netPresentValue || !factor) {
        return std::nullopt;
    }
    return *netPresentValue + landExpectationValue / *factor;
}

InternalRate internalRateOfReturn(const std::vector<double> &cashFlowByAge) {
    engine::clearUpperVectorState();
    bool positive = false;
    bool negative = false;
    for (const double cf : cashFlowByAge) {
        positive = positive || cf > 0.0;
        negative = negative || cf < 0.0;
    }
    if (!positive || !negative) {
        return {IrrOutcome::kNoSignChange, 0.0};
    }
    const double lowest = std::log1p(kIrrLowestRate / 100.0);
    const double highest = std::log1p(kIrrHighestRate / 100.0);
    auto rateAt = [&](int i) {
        const double g = lowest + (highest - lowest) * i / kIrrScanPoints;
        return std::expm1(g) * 100.0;
    };
    auto value = [&](double ratePercent) {
        return valueAtPlanting(cashFlowByAge, 1.0 + ratePercent / 100.0);
    };
    int roots = 0;
    double low = 0.0;
    double high = 0.0;
    double previous = value(rateAt(0));
    if (previous == 0.0) {
        ++roots;
        low = high = rateAt(0);
    }
    for (int i = 1; i <= kIrrScanPoints; ++i) {
        const double current = value(rateAt(i));
        if (current == 0.0 || (previous != 0.0 && (current < 0.0) != (previous < 0.0))) {
            ++roots;
            low = rateAt(i - 1);
            high = rateAt(i);
        }
        previous = current;
    }
    if (roots == 0) {
        return {IrrOutcome::kNoRoot, 0.0};
    }
    if (roots > 1) {
        return {IrrOutcome::kMoreThanOneRoot, 0.0};
    }
    // Bisection keeps the bracket: it halves until the rate is known to
    // kIrrTolerancePercent, whatever the shape of the value curve.
    double atLow = value(low);
    while (high - low > kIrrTolerancePercent && value(high) != 0.0) {
        const double middle = 0.5 * (low + high);
        const double atMiddle = value(middle);
        if (atMiddle == 0.0) {
            low = high = middle;
            break;
        }
        if ((atMiddle < 0.0) == (atLow < 0.0)) {
            low = middle;
            atLow = atMiddle;
        } else {
            high = middle;
        }
    }
    return {IrrOutcome::kRoot, value(high) == 0.0 ? high : 0.5 * (low + high)};
}

std::optional<double> breakEvenPriceFactor(const std::vector<double> &revenueByAge,
                                           const std::vector<double> &costByAge,
                                           double ratePercent) {
    const std::optional<double> revenue = landExpectationValue(revenueByAge, ratePercent);
    const std::optional<double> cost = landExpectationValue(costByAge, ratePercent);
    if (!revenue || !cost || !(*revenue > 0.0)) {
        return std::nullopt;
    }
    return *cost / *revenue;
}

} // namespace arbolex::valuation
