#pragma once

// Valuation of a rotation of bare land and of the stand today: land
// expectation value (Faustmann), equivalent annual annuity, forest value,
// internal rate of return and break-even price factor (docs/economics.md).
// Cash flows are per hectare, euro, indexed by stand age: entry a is received
// at age a, from age 0 (planting) to the rotation age R (the final cut).
// Rates are in percent (5 means 5 %).

#include <optional>
#include <vector>

namespace arbolex::valuation {

/// Land expectation value, euro/ha: the rotation from bare land repeated for
/// ever, LEV = Σ cf_a (1+r)^(R−a) / ((1+r)^R − 1), a = 0..R. std::nullopt
/// without a positive rate, with fewer than two entries (R < 1) or when a
/// power overflows.
std::optional<double> landExpectationValue(const std::vector<double> &cashFlowByAge,
                                           double ratePercent);

/// Equivalent annual annuity, euro/ha/year: the level yearly rent that the
/// land expectation value pays for ever, LEV · r.
double equivalentAnnualAnnuity(double landExpectationValue, double ratePercent);

/// Forest value of the stand today, euro/ha: the net present value of the
/// cash flows from the present age to the final cut (entry i received i years
/// after the present, each discounted and rounded to cents as netPresentValue
/// does), plus the land expectation value discounted from the final cut, the
/// last entry. std::nullopt when a discount factor overflows.
std::optional<double> forestValue(const std::vector<double> &cashFlowFromPresent,
                                  double landExpectationValue, double ratePercent);

/// The same from the net present value of those cash flows, already computed
/// (std::nullopt when it overflowed), the final cut `yearsToFinalCut` after
/// the present.
std::optional<double> forestValue(std::optional<double> netPresentValue, int yearsToFinalCut,
                                  double landExpectationValue, double ratePercent);

/// What the search for the internal rate of return found.
enum class IrrOutcome {
    /// One rate makes the value 0: `ratePercent`.
    kRoot,
    /// Every cash flow has the same sign (or is 0): no rate makes the value 0.
    kNoSignChange,
    /// The cash flow changes sign but no rate from −99 % to 1000 % makes it 0.
    kNoRoot,
    /// More than one rate makes the value 0: none of them is "the" return.
    kMoreThanOneRoot,
};

struct InternalRate {
    IrrOutcome outcome = IrrOutcome::kNoSignChange;
    /// The rate, percent, when `outcome` is kRoot; 0 otherwise.
    double ratePercent = 0.0;
};

/// Lowest and highest rates the internal rate of return is looked for in, percent.
inline constexpr double kIrrLowestRate = -99.0;
inline constexpr double kIrrHighestRate = 1000.0;

/// Internal rate of return of a cash flow by age: the rate r at which
/// Σ cf_a (1+r)^(−a) = 0, so that the rotation's value (and its LEV) is 0.
/// Found by bracketing: the value is scanned over a fine grid of rates from
/// kIrrLowestRate to kIrrHighestRate, every sign change is counted, and a
/// single one is narrowed by bisection to 1e-10 %. Never diverges.
InternalRate internalRateOfReturn(const std::vector<double> &cashFlowByAge);

/// Break-even price factor: the factor k on every timber price that brings the
/// land expectation value to 0, LEV(k · revenue − cost) = 0, that is
/// k = LEV(cost) / LEV(revenue). Revenue and cost by age, both positive
/// amounts. std::nullopt when the timber revenue's LEV is not positive or the
/// LEV cannot be computed.
std::optional<double> breakEvenPriceFactor(const std::vector<double> &revenueByAge,
                                           const std::vector<double> &costByAge,
                                           double ratePercent);

} // namespace arbolex::valuation
