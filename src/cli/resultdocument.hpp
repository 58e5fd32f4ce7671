#pragma once

// The JSON document of every command: one object holding the result's own
// members, "run" (what produced it) and "units" (the unit of every figure,
// from cli/units.hpp). docs/schemas/ describes each command's document.
//
// "run" holds the program, its version and the command; "inputs", every
// input after the defaults were applied, each an option of the command
// ("thin_volume": 40 is --thin-volume 40; a list gives the option its values
// in turn); the prices a valuation used; the files read with their SHA-256;
// and "started", the time the run began (UTC, ISO 8601). Running the command
// again with those inputs and files gives the same document, "started" aside.

#include "cli/output.hpp"
#include "cli/units.hpp"

#include <QByteArray>
#include <QJsonArray>
#include <QJsonObject>
#include <QString>

#include <map>

namespace arbolex::cli {

/// The key of an option among the inputs: its name with underscores for
/// dashes ("thin-volume" is "thin_volume").
QString inputKey(const char *option);

class RunRecord {
public:
    /// The record of `command` ("rotation"), started now.
    explicit RunRecord(const QString &command);

    /// An effective input, the value of the option --KEY (underscores as dashes).
    void input(const QString &key, const Value &value);
    /// An input of several values (--rate-range LO HI).
    void input(const QString &key, const QJsonArray &values);
    void inputs(const Fields &fields);
    /// The --format of the run.
    void setFormat(Format format);
    /// A member of the record besides the inputs ("prices_used").
    void insert(const QString &key, const QJsonValue &value);
    /// A file the run read, by the name the output gives it, and its SHA-256
    /// (null when it could not be read).
    void fileRead(const QString &name, const QString &path);

    QJsonObject json() const;

private:
    QJsonObject m_record;
    QJsonObject m_inputs;
    QJsonArray m_files;
};

/// The JSON output of a command.
class ResultDocument {
public:
    explicit ResultDocument(const RunRecord &run, units::Table table = units::Table::kStand);

    void insert(const QString &key, const QJsonValue &value);
    void insert(const Fields &fields);
    /// The unit of `key` in this document, where it differs from the
    /// table's (the gain of a search for the largest volume).
    void setUnit(const QString &key, const char *unit);
    /// Keys of figures written after the document's members, row by row (the
    /// estate's tables): "units" names theirs too.
    void addStreamedFigures(const QStringList &keys);

    /// The document: its members, "run" and "units". Throws std::logic_error
    /// when a key holding a figure has no unit.
    QJsonObject json() const;
    /// The document as the program prints it (indented, UTF-8).
    QByteArray bytes() const;

private:
    QJsonObject m_members;
    QJsonObject m_run;
    units::Table m_table;
    std::map<QString, const char *> m_ownUnits;
    QStringList m_streamedFigures;
};

/// The output of a command that prints a few fields and one table: in TSV
/// and CSV the fields as "#" lines above the table; in JSON the fields as
/// members and the rows under `name` (the one row as an object when
/// `oneRow`).
QByteArray fieldsAndTable(Format format, const RunRecord &run, const Fields &fields,
                          const QString &name, const Table &table, bool oneRow = false);

/// The SHA-256 of a file, in hex, or null when it cannot be read.
QJsonValue fileSha256(const QString &path);

} // namespace arbolex::cli
