#include "estate/csvfile.hpp"

#include <cerrno>
#include <cstring>

namespace arbolex::estate {

namespace {

/// Bytes buffered before a write: a few hundred results lines.
constexpr std::size_t kBufferBytes = 1 << 16;

bool needsQuotes(std::string_view value) {
    // One pass over the value: find_first_of would look each byte up in the
    // set with a call of its own.
    for (const char c : value) {
        if (c == ',' || c == '"' || c == '\r' || c == '\n') {
            return true;
        }
    }
    return !value.empty() && (value.front() == ' ' || value.back() == ' ');
}

} // namespace

void appendCsvField(std::string &line, std::string_view value) {
    if (!needsQuotes(value)) {
        line.append(value);
        return;
    }
    line.push_back('"');
    for (const char c : value) {
        if (c == '"') {
            line.push_back('"');
        }
        line.push_back(c);
    }
    line.push_back('"');
}

std::string csvLine(const std::vector<std::string> &fields) {
    std::size_t length = fields.size() + 1;
    for (const std::string &field : fields) {
        length += field.size();
    }
    std::string line;
    line.reserve(length + 8); // room for a quoted field or two without a new block
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (i > 0) {
            line.push_back(',');
        }
        appendCsvField(line, fields[i]);
    }
    line.push_back('\n');
    return line;
}

CsvFile::CsvFile(std::string path, const std::vector<std::string> &header)
    : CsvFile(std::move(path)) {
    write(header);
}

CsvFile::CsvFile(std::string path) : m_path(std::move(path)) {
    m_file = std::fopen(m_path.c_str(), "wb");
    if (m_file == nullptr) {
        fail();
    }
    std::setvbuf(m_file, nullptr, _IOFBF, kBufferBytes);
}

CsvFile::~CsvFile() {
    if (m_file != nullptr) {
        std::fclose(m_file);
    }
}

void CsvFile::writeLine(std::string_view line) {
    if (std::fwrite(line.data(), 1, line.size(), m_file) != line.size()) {
        fail();
    }
}

void CsvFile::close() {
    if (m_file == nullptr) {
        return;
    }
    std::FILE *file = m_file;
    m_file = nullptr;
    if (std::fclose(file) != 0) {
        fail();
    }
}

void CsvFile::fail() {
    throw CsvFileError("cannot write \"" + m_path + "\": " + std::strerror(errno));
}

} // namespace arbolex::estate
