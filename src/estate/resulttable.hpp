#pragma once

// The results table of an estate (subcompartments.csv, and the attributes of
// subcompartments.gpkg): the input's line, id and carried columns, then the
// figures of the row, and the error table (errors.csv).

#include "estate/layout.hpp"
#include "estate/rowplan.hpp"
#include "estate/rowresult.hpp"

#include <string>
#include <vector>

namespace arbolex::estate {

enum class ColumnType { kText, kInteger, kReal };

struct ResultColumn {
    std::string name;
    ColumnType type = ColumnType::kText;
};

/// The figures' columns, after the input's line, id and carried columns.
const std::vector<ResultColumn> &figureColumns();

/// The values of the figures' columns (empty where a figure does not exist
/// or the row was not grown).
void figureValues(const RowResult &row, std::vector<std::string> &values);

/// All columns of the results table with the carried columns of `layout`
/// (typed as text).
std::vector<ResultColumn> resultColumns(const Layout &layout);

/// One row of the results table: line, id, carried values, figures.
void resultValues(const Layout &layout, long long line, const RowValues &input,
                  const RowResult &row, std::vector<std::string> &values);

/// Columns of the error table.
std::vector<ResultColumn> errorColumns();

/// The id of a row as written in the input.
const std::string &rowId(const Layout &layout, const RowValues &input);

} // namespace arbolex::estate
