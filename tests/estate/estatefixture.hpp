#pragma once

// Estate rows for the tests: one table layout and a few plausible stands.

#include "estate/layout.hpp"
#include "estate/rowplan.hpp"

#include <gtest/gtest.h>

#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

namespace arbolex::estate::testing {

/// The test table's columns: the estate's own in an unusual order, with two
/// carried columns among them.
inline const std::vector<std::string> kHeader = {
    "area_ha",    "owner",       "model",      "id",         "age",
    "stocking",   "top_height",  "dbh",        "basal_area", "thin_from",
    "thin_every", "thin_volume", "thin_until", "note",       "rotation"};

inline Layout testLayout() {
    std::string problem;
    const auto layout = layoutOf(kHeader, problem);
    EXPECT_TRUE(layout.has_value()) << problem;
    return layout.value_or(Layout{});
}

/// A row of the test table: a young Sitka spruce stand (model 0) on 2.5 ha,
/// without a regime of its own.
inline RowValues sitkaRow() {
    return {"2.5", "Forestry Board", "0", "A-1", "15", "2500", "7", "", "20", "", "", "", "", "",
            ""};
}

/// `row` with the value of column `name` replaced.
inline RowValues with(RowValues row, const std::string &name, const std::string &value) {
    for (std::size_t i = 0; i < kHeader.size(); ++i) {
        if (kHeader[i] == name) {
            row[i] = value;
        }
    }
    return row;
}

/// `row` with each named column's value replaced.
inline RowValues with(RowValues row,
                      std::initializer_list<std::pair<std::string, std::string>> values) {
    for (const auto &[name, value] : values) {
        row = with(std::move(row), name, value);
    }
    return row;
}

/// Long-term prices of the shipped list, at 3 %.
inline EstateDefaults testDefaults() {
    EstateDefaults d;
    d.regime = {20, 5, 40.0f, std::nullopt};
    d.economics = {
        3.0,
        1500.0,
        20.0,
        {3.85, 7.9, 11.75, 15.3, 18.6, 22.95, 27.1, 30.4, 33.85, 37.2, 40.35, 43.5, 47.05}};
    d.year = 2026;
    return d;
}

} // namespace arbolex::estate::testing
