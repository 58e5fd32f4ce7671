#pragma once

#include <array>
#include <cstdint>

namespace arbolex::engine {

/// Number of entries in the model catalogue (identifiers 0 to 21).
inline constexpr int kModelCount = 22;

/// One growth model of the catalogue: its label and four coefficient sets.
struct CatalogueEntry {
    /// Label shown verbatim in captions and reports ("SS - (Thinned)" …).
    const char *label;
    /// State-model coefficients S1..S34 (index 0 holds S1), single precision.
    std::array<float, 34> s;
    /// Thinning-response coefficients a, c, d, e (T1..T4), double precision.
    std::array<double, 4> t;
    /// Volume coefficients V0..V9; Vi multiplies the i-th term of the volume function.
    std::array<double, 10> v;
    /// Assortment coefficients A1..A38 (index 0 holds A1), single precision.
    std::array<float, 38> a;
};

/// The 22 catalogue entries, indexed by model identifier.
const std::array<CatalogueEntry, kModelCount> &catalogue();

/// The text in which the un-thinned base models are looked up by identifier.
inline constexpr const char *kUnthinnedModels = "1+3+5+7+9";

/// True when the identifier, written as a number, is not found in "1+3+5+7+9".
/// This substring test is what decides whether thinning is offered, so 11, 13,
/// 15, 17 and 18 count as thinned although their labels say otherwise.
bool IsThinnedModel(int modelId);

} // namespace arbolex::engine
