#pragma once

#include "shell/runtimeerror.hpp"

#include <QSaveFile>
#include <QString>

#include <cstdint>

namespace arbolex::shell {

/// Reads a classic sequential data file: values one after another, each ending
/// at a comma or at the end of a line (CR LF, CR or LF), blanks around it
/// ignored. A value in double quotes loses its quotes and may hold commas;
/// anything between the closing quote and the next comma or line end is
/// skipped. Numbers are plain decimals with '.' ("0.5", ".5", "-3", "1e-4"),
/// whatever the locale. The file is taken as UTF-8, or as Latin-1 when it is
/// not valid UTF-8.
///
/// Every read returns the failure it met (number 0 when none):
/// - 52 "Bad file name or number" when the file could not be opened;
/// - 62 "Input past end of file" when no value is left;
/// - 13 "Type mismatch" when a number is expected and the value is not one:
///   the target is left unchanged and the next read goes on after that value;
/// - 6 "Overflow" when a whole number does not fit.
class SequentialReader {
public:
    /// Opens and reads the whole file. openError() is 53 "File not found" for
    /// a missing file, 75 "Path/File access error" for one that cannot be read.
    explicit SequentialReader(const QString &path);

    bool isOpen() const { return m_open; }
    const RuntimeError &openError() const { return m_openError; }
    /// True when no value is left to read.
    bool atEnd() const;

    /// An empty value reads as 0.
    [[nodiscard]] RuntimeError readNumber(double &value);
    /// Read at double precision, then stored at single precision.
    [[nodiscard]] RuntimeError readNumber(float &value);
    /// A number rounded half to even to a 16-bit whole number.
    [[nodiscard]] RuntimeError readInteger(std::int16_t &value);
    [[nodiscard]] RuntimeError readString(QString &value);

private:
    /// The next value; false when none is left.
    bool nextField(QString &field);

    QString m_text;
    qsizetype m_pos = 0;
    bool m_open = false;
    RuntimeError m_openError;
};

/// Writes a classic sequential data file, one value per line, lines ended by
/// CR LF: numbers in their shortest form with '.', whatever the locale, and
/// strings in double quotes. The file is replaced only by close(): until then,
/// and for good if close() is never called, the previous file stays as it was.
///
/// A write after a failed open returns 52 "Bad file name or number"; a failed
/// write or commit returns 57 "Device I/O error".
class SequentialWriter {
public:
    /// Opens `path` for output. openError() is 76 "Path not found" when its
    /// folder does not exist, 75 "Path/File access error" when it cannot be written.
    explicit SequentialWriter(const QString &path);

    bool isOpen() const { return m_open; }
    const RuntimeError &openError() const { return m_openError; }

    RuntimeError writeNumber(double value);
    /// A single-precision number in its shortest single-precision form (0.1f is "0.1").
    RuntimeError writeSingle(float value);
    RuntimeError writeInteger(int value);
    /// Written inside double quotes, as it stands.
    RuntimeError writeString(const QString &value);

    /// Replaces the file with what was written.
    [[nodiscard]] RuntimeError close();

private:
    RuntimeError writeLine(const QString &text);

    QSaveFile m_file;
    bool m_open = false;
    RuntimeError m_openError;
};

} // namespace arbolex::shell
