#pragma once

// Arithmetic that detects the run-time failures the engine must report instead
// of letting NaN or infinity travel on: a power of a negative base, a division
// by zero, a logarithm of a non-positive number, an overflow. A failure throws
// RuntimeFault, which never leaves the engine: every public procedure of Grow
// catches it and reports it once.

#include <cmath>
#include <source_location>
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

[[noreturn, gnu::cold, gnu::noinline]] void raiseFault(int number, std::source_location where);

namespace checked {

using Here = std::source_location;

/// Keeps a result only when it is a finite number.
inline double finite(double r, Here where) {
    if (!std::isfinite(r)) {
        raiseFault(std::isnan(r) ? kInvalidCall : kOverflow, where);
    }
    return r;
}

/// base^exponent in double precision.
inline double pow(double base, double exponent, Here where = Here::current()) {
    if (base < 0.0 && exponent != std::trunc(exponent)) {
        raiseFault(kInvalidCall, where);
    }
    if (base == 0.0 && exponent < 0.0) {
        raiseFault(kDivisionByZero, where);
    }
    return finite(std::pow(base, exponent), where);
}

inline double div(double numerator, double denominator, Here where = Here::current()) {
    if (denominator == 0.0) {
        raiseFault(kDivisionByZero, where);
    }
    return finite(numerator / denominator, where);
}

inline double sqrt(double x, Here where = Here::current()) {
    if (!(x >= 0.0)) {
        raiseFault(kInvalidCall, where);
    }
    return std::sqrt(x);
}

inline double log(double x, Here where = Here::current()) {
    if (!(x > 0.0)) {
        raiseFault(kInvalidCall, where);
    }
    return std::log(x);
}

inline double exp(double x, Here where = Here::current()) {
    return finite(std::exp(x), where);
}

/// Stores a double into a single-precision variable; too large a value overflows.
inline float single(double x, Here where = Here::current()) {
    const auto f = static_cast<float>(x);
    if (!std::isfinite(f)) {
        raiseFault(std::isnan(x) ? kInvalidCall : kOverflow, where);
    }
    return f;
}

} // namespace checked
} // namespace arbolex::engine
