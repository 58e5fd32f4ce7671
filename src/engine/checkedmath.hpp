#pragma once

// Arithmetic that detects the run-time failures the engine must report instead
// of letting NaN or infinity travel on: a power of a negative base, a division
// by zero, a logarithm of a non-positive number, an overflow. A failure throws
// RuntimeFault, which never leaves the engine: every public procedure of Grow
// catches it and reports it once.

#include <array>
#include <bit>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace arbolex::engine {

/// Run-time failure numbers, as the error log has always named them.
enum FaultNumber : int {
    kInvalidCall = 5,
    kOverflow = 6,
    kDivisionByZero = 11,
};

/// Description of a failure number for messages and the error log.
std::string_view faultDescription(int number);

/// A detected run-time failure: its number and the source line that failed.
struct RuntimeFault {
    int number = 0;
    unsigned line = 0;
};

[[noreturn, gnu::cold, gnu::noinline]] void raiseFault(int number, unsigned line);

namespace checked {

// Each function takes the line of its call, so a failure names the statement
// that failed.

/// Keeps a result only when it is a finite number.
inline double finite(double r, unsigned line = __builtin_LINE()) {
    if (!std::isfinite(r)) {
        raiseFault(std::isnan(r) ? kInvalidCall : kOverflow, line);
    }
    return r;
}

/// base^exponent in double precision.
inline double pow(double base, double exponent, unsigned line = __builtin_LINE()) {
    // x^0 is exactly 1 for every x (std::pow gives 1 even for a NaN base) and
    // can fail no check: many models' transforms have terms raised to 0,
    // which need no call.
    if (exponent == 0.0) {
        return 1.0;
    }
    if (base < 0.0 && exponent != std::trunc(exponent)) {
        raiseFault(kInvalidCall, line);
    }
    if (base == 0.0 && exponent < 0.0) {
        raiseFault(kDivisionByZero, line);
    }
    return finite(std::pow(base, exponent), line);
}

inline double div(double numerator, double denominator, unsigned line = __builtin_LINE()) {
    if (denominator == 0.0) {
        raiseFault(kDivisionByZero, line);
    }
    return finite(numerator / denominator, line);
}

inline double sqrt(double x, unsigned line = __builtin_LINE()) {
    if (!(x >= 0.0)) {
        raiseFault(kInvalidCall, line);
    }
    return std::sqrt(x);
}

inline double log(double x, unsigned line = __builtin_LINE()) {
    if (!(x > 0.0)) {
        raiseFault(kInvalidCall, line);
    }
    return std::log(x);
}

inline double exp(double x, unsigned line = __builtin_LINE()) {
    return finite(std::exp(x), line);
}

/// Stores a double into a single-precision variable; too large a value overflows.
inline float single(double x, unsigned line = __builtin_LINE()) {
    const auto f = static_cast<float>(x);
    if (!std::isfinite(f)) {
        raiseFault(std::isnan(x) ? kInvalidCall : kOverflow, line);
    }
    return f;
}

/// checked::pow with the last few powers kept: a solver that asks again for
/// the power of the same base and exponent (the fixed terms of the thinning
/// response at every Newton step, and the residual stocking its derivative
/// computes again) gets the very same double without computing it. Only a
/// power that succeeded is kept, so one that fails fails again, on its own
/// line.
class PowerMemo {
public:
    double operator()(double base, double exponent, unsigned line = __builtin_LINE()) {
        if (exponent == 0.0) {
            return 1.0; // as pow gives it, without taking a slot
        }
        const auto b = std::bit_cast<std::uint64_t>(base);
        const auto x = std::bit_cast<std::uint64_t>(exponent);
        std::size_t oldest = 0;
        for (std::size_t i = 0; i < kSlots; ++i) {
            if (m_used[i] != 0 && m_base[i] == b && m_exponent[i] == x) {
                m_used[i] = ++m_clock;
                return m_value[i];
            }
            if (m_used[i] < m_used[oldest]) {
                oldest = i;
            }
        }
        const double value = pow(base, exponent, line);
        m_base[oldest] = b;
        m_exponent[oldest] = x;
        m_value[oldest] = value;
        m_used[oldest] = ++m_clock;
        return value;
    }

private:
    /// Enough for the powers of one Newton step and the fixed ones.
    static constexpr std::size_t kSlots = 8;
    std::array<std::uint64_t, kSlots> m_base{};
    std::array<std::uint64_t, kSlots> m_exponent{};
    std::array<double, kSlots> m_value{};
    /// When each slot was last used; 0 for an empty slot.
    std::array<std::uint64_t, kSlots> m_used{};
    std::uint64_t m_clock = 0;
};

} // namespace checked
} // namespace arbolex::engine
