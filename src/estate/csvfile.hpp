#pragma once

// The estate's CSV tables, written straight to a buffered file: GDAL's CSV
// writer costs two thirds of a row's growth and runs on one thread, so the
// results table is written here (GDAL still reads every input, CSV included,
// and writes the GeoPackage). Fields are quoted only when they must be
// (RFC 4180): a comma, a quote, a line break or a space at either end.

#include <cstdio>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::estate {

/// Appends `value` to `line` as one CSV field (without a separator).
void appendCsvField(std::string &line, std::string_view value);

/// The fields as one CSV line, ending in "\n".
std::string csvLine(const std::vector<std::string> &fields);

/// A file that cannot be created or written; the text says which and why.
struct CsvFileError : std::runtime_error {
    using std::runtime_error::runtime_error;
};

class CsvFile {
public:
    /// Creates (or empties) `path` and writes the header. Throws CsvFileError.
    CsvFile(std::string path, const std::vector<std::string> &header);
    /// Creates (or empties) `path`; the caller writes its first line. Throws CsvFileError.
    explicit CsvFile(std::string path);
    ~CsvFile();
    CsvFile(const CsvFile &) = delete;
    CsvFile &operator=(const CsvFile &) = delete;

    /// Writes a line made by csvLine. Throws CsvFileError.
    void writeLine(std::string_view line);
    void write(const std::vector<std::string> &fields) { writeLine(csvLine(fields)); }
    /// Writes what is buffered and closes the file. Throws CsvFileError.
    void close();

private:
    [[noreturn]] void fail();

    std::string m_path;
    std::FILE *m_file = nullptr;
};

} // namespace arbolex::estate
