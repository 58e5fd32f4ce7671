#include "estate/tablefile.hpp"

#include <cstdio>

namespace arbolex::estate {

namespace {

/// U+FFFD, written for a byte that does not begin a UTF-8 character (a
/// Latin-1 input): a strict JSON reader refuses the document otherwise.
constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

/// Length of the UTF-8 character at the start of `s`, 0 when it is not one.
std::size_t utf8Length(std::string_view s) {
    const auto lead = static_cast<unsigned char>(s.front());
    std::size_t length = 0;
    unsigned char low = 0x80;
    unsigned char high = 0xBF;
    if (lead >= 0xC2 && lead <= 0xDF) {
        length = 2;
    } else if (lead >= 0xE0 && lead <= 0xEF) {
        length = 3;
        low = lead == 0xE0 ? 0xA0 : 0x80;  // no overlong forms
        high = lead == 0xED ? 0x9F : 0xBF; // no surrogates
    } else if (lead >= 0xF0 && lead <= 0xF4) {
        length = 4;
        low = lead == 0xF0 ? 0x90 : 0x80;
        high = lead == 0xF4 ? 0x8F : 0xBF; // nothing past U+10FFFF
    } else {
        return 0;
    }
    if (s.size() < length) {
        return 0;
    }
    for (std::size_t i = 1; i < length; ++i) {
        const auto c = static_cast<unsigned char>(s[i]);
        if (c < (i == 1 ? low : 0x80) || c > (i == 1 ? high : 0xBF)) {
            return 0;
        }
    }
    return length;
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

} // namespace

const char *fileExtension(TableFormat format) {
    switch (format) {
    case TableFormat::kTsv:
        return "tsv";
    case TableFormat::kJson:
        return "json";
    case TableFormat::kCsv:
        break;
    }
    return "csv";
}

void appendTsvField(std::string &line, std::string_view value) {
    for (const char c : value) {
        line.push_back(c == '\t' || c == '\r' || c == '\n' ? ' ' : c);
    }
}

void appendJsonString(std::string &out, std::string_view value) {
    out.push_back('"');
    while (!value.empty()) {
        const char c = value.front();
        const auto byte = static_cast<unsigned char>(c);
        std::size_t taken = 1;
        if (c == '"' || c == '\\') {
            out.push_back('\\');
            out.push_back(c);
        } else if (byte < 0x20) {
            char escaped[8];
            std::snprintf(escaped, sizeof escaped, "\\u%04x", static_cast<unsigned>(byte));
            out.append(escaped);
        } else if (byte < 0x80) {
            out.push_back(c);
        } else if ((taken = utf8Length(value)) > 0) {
            out.append(value.substr(0, taken));
        } else {
            taken = 1;
            out.append(kReplacement);
        }
        value.remove_prefix(taken);
    }
    out.push_back('"');
}

bool isJsonNumber(std::string_view text) {
    std::size_t i = 0;
    auto digits = [&] {
        const std::size_t start = i;
        while (i < text.size() && isDigit(text[i])) {
            ++i;
        }
        return i > start;
    };
    if (i < text.size() && text[i] == '-') {
        ++i;
    }
    if (i < text.size() && text[i] == '0') {
        ++i;
    } else if (!digits()) {
        return false;
    }
    if (i < text.size() && text[i] == '.') {
        ++i;
        if (!digits()) {
            return false;
        }
    }
    if (i < text.size() && (text[i] == 'e' || text[i] == 'E')) {
        ++i;
        if (i < text.size() && (text[i] == '+' || text[i] == '-')) {
            ++i;
        }
        if (!digits()) {
            return false;
        }
    }
    return i == text.size();
}

RowFormat::RowFormat(TableFormat format, std::vector<ResultColumn> columns)
    : m_format(format), m_columns(std::move(columns)) {
    if (m_format != TableFormat::kJson) {
        return;
    }
    for (const ResultColumn &c : m_columns) {
        std::string key;
        appendJsonString(key, c.name);
        m_keys.push_back(key + ':');
    }
}

std::string RowFormat::head(std::string_view jsonMembers) const {
    if (m_format != TableFormat::kJson) {
        std::vector<std::string> names;
        names.reserve(m_columns.size());
        for (const ResultColumn &c : m_columns) {
            names.push_back(c.name);
        }
        return line(names);
    }
    std::string head = "{";
    head.append(jsonMembers);
    head.append(jsonMembers.empty() ? "\"columns\":[" : ",\"columns\":[");
    for (std::size_t i = 0; i < m_keys.size(); ++i) {
        // The key without its colon.
        head.append(i == 0 ? "" : ",").append(m_keys[i], 0, m_keys[i].size() - 1);
    }
    head.append("],\"rows\":[\n");
    return head;
}

std::string RowFormat::line(const std::vector<std::string> &values) const {
    if (m_format == TableFormat::kCsv) {
        return csvLine(values);
    }
    std::string out;
    if (m_format == TableFormat::kTsv) {
        for (std::size_t i = 0; i < values.size(); ++i) {
            if (i > 0) {
                out.push_back('\t');
            }
            appendTsvField(out, values[i]);
        }
        out.push_back('\n');
        return out;
    }
    out.push_back('{');
    for (std::size_t i = 0; i < values.size() && i < m_keys.size(); ++i) {
        if (i > 0) {
            out.push_back(',');
        }
        out.append(m_keys[i]);
        const std::string &value = values[i];
        const bool figure = m_columns[i].type != ColumnType::kText;
        if (figure && value.empty()) {
            out.append("null");
        } else if (figure && isJsonNumber(value)) {
            out.append(value);
        } else {
            // Text, or (never from the estate's own figures) a figure that is
            // no JSON number, kept as text rather than lost.
            appendJsonString(out, value);
        }
    }
    out.push_back('}');
    return out;
}

ResultFile::ResultFile(std::string path, TableFormat format, std::vector<ResultColumn> columns,
                       std::string_view jsonMembers)
    : m_rows(format, std::move(columns)), m_file(std::move(path)) {
    m_file.writeLine(m_rows.head(jsonMembers));
}

void ResultFile::writeLine(std::string_view line) {
    // JSON rows are the elements of one array: a comma between two of them.
    if (m_rows.format() == TableFormat::kJson && !m_firstRow) {
        m_file.writeLine(",\n");
    }
    m_firstRow = false;
    m_file.writeLine(line);
}

void ResultFile::close() {
    if (m_closed) {
        return;
    }
    m_closed = true;
    if (m_rows.format() == TableFormat::kJson) {
        m_file.writeLine("\n]}\n");
    }
    m_file.close();
}

} // namespace arbolex::estate
