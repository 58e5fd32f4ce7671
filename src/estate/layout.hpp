#pragma once

// The columns of an estate table: the ones the estate reads, found by name in
// any order, and every other column, carried through to the results untouched.

#include <array>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::estate {

/// The columns the estate reads.
enum class Column {
    kId,
    kModel,
    kAge,
    kStocking,
    kTopHeight,
    kBasalArea,
    kDbh,
    kAreaHa,
    kThinFrom,
    kThinEvery,
    kThinVolume,
    kThinUntil,
    kRotation,
};
inline constexpr std::size_t kColumnCount = 13;

/// Names of the columns, in the order of Column.
inline constexpr std::array<std::string_view, kColumnCount> kColumnNames = {
    "id",      "model",     "age",        "stocking",    "top_height", "basal_area", "dbh",
    "area_ha", "thin_from", "thin_every", "thin_volume", "thin_until", "rotation"};

/// Where each column is in a row of the table.
struct Layout {
    /// Index of each Column in a row, or -1 when the table has none.
    std::array<int, kColumnCount> index{};
    /// Indices of the carried columns, in table order.
    std::vector<int> carried;
    /// Names of the carried columns, in table order.
    std::vector<std::string> carriedNames;
    /// True when a comma may stand for the decimal point in the numbers the
    /// estate reads ("7,0"): a table whose fields are separated by
    /// semicolons, as a spreadsheet with European settings exports it.
    bool decimalComma = false;

    bool has(Column c) const { return index[static_cast<std::size_t>(c)] >= 0; }
    int at(Column c) const { return index[static_cast<std::size_t>(c)]; }
};

/// The layout of a table with the column `names` (a header row or the fields
/// of a layer). Names match without regard to case, and a name cut to ten
/// characters (as a Shapefile keeps it) matches too. Returns std::nullopt and
/// sets `problem` when a column the estate needs is missing or given twice.
std::optional<Layout> layoutOf(const std::vector<std::string> &names, std::string &problem);

} // namespace arbolex::estate
