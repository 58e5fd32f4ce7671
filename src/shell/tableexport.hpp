#pragma once

// A table as a spreadsheet receives it: the captions as the first row, then
// one line per row, each cell as it is shown, without its surrounding blanks.

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::shell {

/// Tab-separated lines ended by LF; tabs and line breaks inside a cell become blanks.
QString tabSeparated(const std::vector<QStringList> &rows);

/// An HTML table: the first row as header cells, the others as data cells,
/// every text escaped.
QString htmlTable(const std::vector<QStringList> &rows);

} // namespace arbolex::shell
