#pragma once

// The projection table flxMain as the command-line program prints it: the
// grid's cells as they are shown, except the marker of the rows the summary
// carries (a tab in the first separator cell, which the grid keeps), written
// as an empty cell; and in JSON, each row's figures by key with its label and
// whether the summary carries it.

#include "cli/output.hpp"
#include "work/projectiontable.hpp"

#include <QJsonArray>
#include <QStringList>

namespace arbolex::cli {

/// The grid: the captions, then a line per row. With `labels`, each line
/// starts with the row's label ("G yr", "T yr", "FC yr" …) under "Row", as a
/// copied table does.
Table gridTable(const work::ProjectionTable &table, bool labels);

/// The keys of the grid's columns in JSON, in the grid's order (the blank
/// separator columns have none).
QStringList gridKeys(const work::ProjectionTable &table);

/// One object per row: "label", "in_summary" and each column's figure by
/// key (null for an empty cell, the cell's text when it is no number).
QJsonArray gridJson(const work::ProjectionTable &table);

} // namespace arbolex::cli
