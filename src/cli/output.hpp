#pragma once

// What every command prints, and how: a command builds its figures, words and
// tables from the values below; the writers here make them TSV, CSV or
// (resultdocument.hpp) JSON. No command joins separators by hand, so every
// format keeps its rules:
// - TSV and CSV: lines between blank lines and "#" lines form a block, and
//   every line of a block has the same number of fields. A TSV field never
//   holds a tab or a line break (they become blanks); a CSV field is quoted
//   as RFC 4180 says (the estate's writer, estate/csvfile.hpp).
// - A figure is printed once, by Value, and JSON reads back the figure the
//   tables print.

#include "cli/options.hpp"

#include <QByteArray>
#include <QJsonArray>
#include <QJsonObject>
#include <QJsonValue>
#include <QString>
#include <QStringList>

#include <optional>
#include <string>
#include <vector>

namespace arbolex::cli {

enum class Format { kTsv, kCsv, kJson };

/// The option names every command that prints a result knows: "format".
inline constexpr const char *kFormatOption = "format";

/// --format: tsv, csv or json, `fallback` without it. Throws UsageError.
Format readFormat(const Options &options, Format fallback = Format::kTsv);
/// --format as typed: "tsv", "csv" or "json".
QString formatWord(Format format);
/// Help line of --format.
QString formatOptionHelp();

/// A number as the tables print it ("%.9g": every single-precision value
/// comes back exactly).
QString formatNumber(double x);

/// One cell of a table, or the value of a field: nothing, a word or a figure.
class Value {
public:
    /// Nothing: an empty cell, null in JSON.
    Value() = default;
    /// A word: the same text in every format (a string in JSON).
    static Value word(const QString &text);
    /// A word standing where a figure has none ("no root"): its text in a
    /// table, null in JSON.
    static Value note(const QString &text);
    static Value whole(qint64 n);
    /// A quantity as the tables print it ("%.9g": every single-precision
    /// value comes back exactly).
    static Value number(double x);
    /// A number in double precision as typed: the shortest text that reads
    /// back to the same number (an input of a run record).
    static Value exact(double x);
    /// Money rounded to cents, printed as a quantity; nothing when absent.
    static Value money(const std::optional<double> &euro);
    /// A figure already printed (a cell of the grid): a number in JSON, or
    /// its text when it is no number (an out-of-range mark).
    static Value printed(const QString &text);

    /// The text a table prints.
    const QString &text() const { return m_text; }
    /// The value in JSON: the number the text reads, its text, or null.
    QJsonValue json() const;

private:
    enum class Kind { kNothing, kWord, kNote, kFigure };
    Value(Kind kind, QString text) : m_kind(kind), m_text(std::move(text)) {}

    Kind m_kind = Kind::kNothing;
    QString m_text;
};

/// A named value: a line "key<TAB>value" of a table's figures, a member of
/// the JSON document.
struct Field {
    QString key;
    Value value;
};
using Fields = std::vector<Field>;

/// The fields as the members of a JSON object.
QJsonObject toJson(const Fields &fields);

/// Columns and rows of cells: a block of a TSV or CSV output, an array of
/// objects in JSON.
class Table {
public:
    explicit Table(QStringList columns) : m_columns(std::move(columns)) {}

    /// Appends a row; it must have one cell per column (throws
    /// std::logic_error otherwise: a table is never ragged).
    void add(std::vector<Value> row);

    const QStringList &columns() const { return m_columns; }
    const std::vector<std::vector<Value>> &rows() const { return m_rows; }

    /// Row `i` as an object of its columns.
    QJsonObject jsonRow(std::size_t i) const;
    /// Every row as an object.
    QJsonArray json() const;

private:
    QStringList m_columns;
    std::vector<std::vector<Value>> m_rows;
};

/// A TSV or CSV output, built line by line and written in one piece.
class TextOutput {
public:
    /// `format` is kTsv or kCsv.
    explicit TextOutput(Format format) : m_format(format) {}

    /// "# key<SEP>value": what the lines below are about (a site index, a
    /// model).
    void comment(const QString &key, const Value &value);
    /// A comment line per field.
    void comments(const Fields &fields);
    /// An empty line, which ends a block.
    void blank();
    /// A blank line and "# name": the title of the next block.
    void title(const QString &name);
    /// One "key<SEP>value" line per field.
    void fields(const Fields &fields);
    /// The header and the rows.
    void table(const Table &table);
    /// One line of cells.
    void line(const QStringList &cells);

    /// The whole output, UTF-8.
    QByteArray bytes() const { return QByteArray::fromStdString(m_text); }

private:
    Format m_format;
    std::string m_text;
};

} // namespace arbolex::cli
