#pragma once

// One row of an estate table read into a stand, its regime and its area:
// every value is checked before the row is grown, and the first fault is the
// row's message, in the main window's words where the window has them.

#include "estate/layout.hpp"
#include "rotation/rotation.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace arbolex::estate {

/// What the command line gives every row that leaves a column empty.
struct EstateDefaults {
    rotation::Regime regime;
    /// Final-cut age, years; without it (and without a "rotation" value) the
    /// economic rotation.
    std::optional<int> rotation;
    rotation::Economics economics;
    /// Calendar year of the stands' present ages.
    int year = 0;
};

/// A row ready to grow.
struct RowPlan {
    rotation::Stand stand;
    rotation::Regime regime;
    std::optional<int> rotation;
    /// Area of the sub-compartment, ha.
    double areaHa = 0.0;
};

/// The row's values as text, in the table's column order (empty: no value).
using RowValues = std::vector<std::string>;

/// The row read and checked for form: a RowPlan, or the message of its first
/// fault. The stand's ranges are checked once its model is known (standFault).
std::variant<RowPlan, std::string> planRow(const Layout &layout, const RowValues &values,
                                           const EstateDefaults &defaults);

/// The row's model, 0 to 21, or std::nullopt when it has none of them.
std::optional<std::int16_t> modelOf(const Layout &layout, const RowValues &values);

/// A whole number from the text of a value (spaces around it allowed), or
/// std::nullopt. With `decimalComma`, a comma may stand for the decimal
/// point ("12,0"), but a value never holds both.
std::optional<long long> wholeNumber(const std::string &text, bool decimalComma = false);

/// A finite number from the text of a value, read the same whatever the
/// locale, or std::nullopt; `decimalComma` as for wholeNumber.
std::optional<double> decimalNumber(const std::string &text, bool decimalComma = false);

} // namespace arbolex::estate
