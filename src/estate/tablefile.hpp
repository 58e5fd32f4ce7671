#pragma once

// The estate's result tables in each format of the command-line program,
// written as a stream so that a million rows never sit in memory:
// - CSV: RFC 4180 (csvfile.hpp), the default;
// - TSV: one line per row, a value's tabs and line breaks written as blanks,
//   so that every line has as many fields as the header;
// - JSON: one document, {"run": …, "units": …, "columns": […], "rows": [
//   one object per line ]}; the caller renders the members before
//   "columns", the rows are written here as they come. A figure is written
//   as the number the CSV prints, an empty figure as null.

#include "estate/csvfile.hpp"
#include "estate/resulttable.hpp"

#include <string>
#include <string_view>
#include <vector>

namespace arbolex::estate {

enum class TableFormat { kCsv, kTsv, kJson };

/// The file name ending of a format, without its dot: "csv", "tsv" or "json".
const char *fileExtension(TableFormat format);

/// Appends `value` to `line` as one TSV field: tabs, CRs and LFs become blanks.
void appendTsvField(std::string &line, std::string_view value);

/// Appends `value` as a JSON string: quotes, backslashes and control
/// characters escaped (RFC 8259), other bytes as they are (UTF-8).
void appendJsonString(std::string &out, std::string_view value);

/// True when `text` is a number as JSON writes one ("-12.5", "1e-05").
bool isJsonNumber(std::string_view text);

/// How the rows of one table are written in one format.
class RowFormat {
public:
    RowFormat(TableFormat format, std::vector<ResultColumn> columns);

    TableFormat format() const { return m_format; }
    /// What the file starts with. CSV and TSV: the header line. JSON: "{",
    /// `jsonMembers` (the members before "columns", such as `"run":{…}`,
    /// rendered by the caller; may be empty), the columns and the opening
    /// of "rows".
    std::string head(std::string_view jsonMembers) const;
    /// The line of one row, its values in the order of the columns. A JSON
    /// row is an object of the columns: text as a string, a figure as the
    /// number it is printed as, an empty figure as null.
    std::string line(const std::vector<std::string> &values) const;

private:
    TableFormat m_format;
    std::vector<ResultColumn> m_columns;
    /// For JSON, each column's `"name":`, escaped once.
    std::vector<std::string> m_keys;
};

/// One result table written to a file in one format.
class ResultFile {
public:
    /// Creates `path` and writes its head (RowFormat::head). Throws CsvFileError.
    ResultFile(std::string path, TableFormat format, std::vector<ResultColumn> columns,
               std::string_view jsonMembers = {});

    /// The line of one row (RowFormat::line). Safe to call on several
    /// threads at once.
    std::string line(const std::vector<std::string> &values) const { return m_rows.line(values); }
    /// Writes a line made by line(). Throws CsvFileError.
    void writeLine(std::string_view line);
    void write(const std::vector<std::string> &values) { writeLine(line(values)); }
    /// Ends the document and closes the file. Throws CsvFileError.
    void close();

private:
    RowFormat m_rows;
    CsvFile m_file;
    bool m_firstRow = true;
    bool m_closed = false;
};

} // namespace arbolex::estate
