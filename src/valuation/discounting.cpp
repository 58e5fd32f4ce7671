#include "valuation/discounting.hpp"

#include "engine/vectorstate.hpp"

#include <bit>
#include <bitset>
#include <cmath>
#include <cstdint>
#include <limits>

namespace arbolex::valuation {

namespace {

/// Ages a factor table keeps: beyond any rotation a model can grow.
constexpr int kTabledYears = 256;

/// Factors whose product is taken without checking it against the power:
/// far from an overflow or an underflow.
constexpr double kSureFactorLow = 1e-300;
constexpr double kSureFactorHigh = 1e300;
/// One unit in the last place of a double in [1, 2), 2^−52.
constexpr double kUnitLastPlace = 0x1p-52;

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
            m_known.reset();
        }
        const auto i = static_cast<std::size_t>(years);
        if (!m_known.test(i)) {
            m_factor[i] = std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
            m_known.set(i);
        }
        return m_factor[i];
    }

private:
    /// The same rate, to the bit (−0 is not 0 for a table).
    bool sameRate(double ratePercent) const {
        return std::bit_cast<std::uint64_t>(ratePercent) == std::bit_cast<std::uint64_t>(m_rate);
    }

    double m_rate = std::numeric_limits<double>::quiet_NaN();
    std::bitset<kTabledYears> m_known;
    double m_factor[kTabledYears]{};
};

/// (1 + ratePercent / 100)^years, tabled where it can be: a finite rate and
/// 0 to kTabledYears − 1 years.
double power(double ratePercent, int years) {
    if (years < 0 || years >= kTabledYears || !std::isfinite(ratePercent)) {
        return std::pow(1.0 + ratePercent / 100.0, static_cast<double>(years));
    }
    thread_local FactorTable table;
    return table.factor(ratePercent, years);
}

/// std::nearbyint in the default rounding mode (to the nearest, halves to
/// even), without a call into the library for every year of every NPV: below
/// 2^52, adding 2^52 and taking it away again leaves the whole number that
/// mode rounds to; from 2^52 on a double is whole already (and NaN and the
/// infinities stay what they are, as with nearbyint).
double nearestWhole(double x) {
    constexpr double kWholeFrom = 0x1p52;
    const double magnitude = std::fabs(x);
    if (!(magnitude < kWholeFrom)) {
        return x;
    }
    const double rounded = (magnitude + kWholeFrom) - kWholeFrom;
    return std::copysign(rounded, x);
}

std::optional<double> checkedFactor(double factor) {
    if (!std::isfinite(factor) || factor <= 0.0) {
        return std::nullopt;
    }
    return factor;
}

} // namespace

double roundToCents(double euro) {
    // Halves to even, as nearbyint in the default rounding mode.
    return nearestWhole(euro * 100.0) / 100.0;
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
    return netPresentValueOf(cashFlows, ratePercent);
}

std::optional<double> netPresentValueOf(std::span<const double> cashFlows, double ratePercent) {
    engine::clearUpperVectorState();
    // The factors by repeated multiplication, q^i = q^(i−1) · q, which
    // differ from std::pow's by at most (i + 1) units in the last place;
    // a value is taken from them only when no such difference can move its
    // cents, else from the power itself. The sum is the same to the bit as
    // with a power for every year, for a tenth of the cost: a rate drawn
    // anew for each of 10,000 Monte Carlo draws has no table to use.
    const double q = 1.0 + ratePercent / 100.0;
    double product = 1.0;
    double sum = 0.0;
    for (std::size_t i = 0; i < cashFlows.size(); ++i) {
        if (i > 0) {
            product *= q;
        }
        if (product > kSureFactorLow && product < kSureFactorHigh) {
            const double cents = cashFlows[i] / product * 100.0;
            const double whole = nearestWhole(cents);
            const double margin = 0.5 - std::fabs(cents - whole);
            const double drift = std::fabs(cents) * static_cast<double>(i + 8) * kUnitLastPlace;
            if (margin > drift) {
                sum += whole / 100.0;
                continue;
            }
        }
        const std::optional<double> factor = discountFactor(ratePercent, static_cast<int>(i));
        if (!factor) {
            return std::nullopt;
        }
        sum += roundToCents(cashFlows[i] / *factor);
    }
    return sum;
}

} // namespace arbolex::valuation
