#pragma once

// Discounting of yearly cash flows: the arithmetic every valuation of a
// rotation shares. Standard C++ only, so the command-line valuations and the
// windows compute the same numbers.

#include <optional>
#include <span>
#include <vector>

namespace arbolex::valuation {

/// Money rounded to whole cents, halves to even (613.915 → 613.92, 0.125 → 0.12).
double roundToCents(double euro);

/// Annual compound discount factor (1 + ratePercent / 100)^years; years may be
/// negative. std::nullopt when the factor is not a finite positive number
/// (an overflow, or a rate of −100 % or less).
std::optional<double> discountFactor(double ratePercent, int years);

/// `cashFlow` received `years` after the present, discounted to the present and
/// rounded to cents; std::nullopt when the discount factor overflows.
std::optional<double> discountedCashFlow(double cashFlow, double ratePercent, int years);

/// Net present value of yearly cash flows, entry i received i years after the
/// present: the sum of the discounted cash flows, each rounded to cents first.
/// std::nullopt when a discount factor overflows.
std::optional<double> netPresentValue(const std::vector<double> &cashFlows, double ratePercent);

/// The same over a part of a longer cash flow (from the present age on), without copying it.
std::optional<double> netPresentValueOf(std::span<const double> cashFlows, double ratePercent);

} // namespace arbolex::valuation
