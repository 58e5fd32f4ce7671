// The estate's result tables in CSV, TSV and JSON: every line keeps the
// header's fields, a JSON string survives any input byte, and a figure is
// written as the number the CSV prints.
#include "estate/tablefile.hpp"

#include <gtest/gtest.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <sstream>

#include <unistd.h>

namespace arbolex::estate {
namespace {

std::string json(std::string_view value) {
    std::string out;
    appendJsonString(out, value);
    return out;
}

TEST(EstateJsonTest, StringsEscapeWhatJsonForbidsAndKeepUtf8) {
    EXPECT_EQ(json("plain"), "\"plain\"");
    EXPECT_EQ(json("say \"deer\"\\"), R"("say \"deer\"\\")");
    EXPECT_EQ(json("a\tb\r\nc"), R"("a\u0009b\u000d\u000ac")");
    EXPECT_EQ(json(std::string_view("\0", 1)), R"("\u0000")");
    EXPECT_EQ(json("Müller € 🌲"), "\"Müller € 🌲\"");
    // A Latin-1 ü, a lone continuation byte, an overlong slash, a surrogate
    // and a character cut short: each byte that starts no UTF-8 character
    // becomes U+FFFD, so a strict reader takes the document.
    EXPECT_EQ(json("M\xFCller"), "\"M\xEF\xBF\xBDller\"");
    EXPECT_EQ(json("\x80"), "\"\xEF\xBF\xBD\"");
    EXPECT_EQ(json("\xC0\xAF"), "\"\xEF\xBF\xBD\xEF\xBF\xBD\"");
    EXPECT_EQ(json("\xED\xA0\x80"), "\"\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD\"");
    EXPECT_EQ(json("\xE2\x82"), "\"\xEF\xBF\xBD\xEF\xBF\xBD\"");
}

TEST(EstateJsonTest, OnlyJsonNumbersAreNumbers) {
    for (const char *number : {"0", "-0", "12", "12.345", "-0.5", "1e-05", "6.02E+23", "2056"}) {
        EXPECT_TRUE(isJsonNumber(number)) << number;
    }
    for (const char *text :
         {"", "-", "+1", "01", ".5", "5.", "1e", "1e+", "inf", "nan", "0x10", "1,5", " 1"}) {
        EXPECT_FALSE(isJsonNumber(text)) << text;
    }
}

class ResultFileTest : public ::testing::Test {
protected:
    std::string write(TableFormat format, std::string_view members) {
        const std::string path = (m_folder / "table").string();
        ResultFile file(path, format, m_columns, members);
        for (const auto &row : m_rows) {
            file.writeLine(file.line(row));
        }
        file.close();
        std::ifstream in(path, std::ios::binary);
        std::stringstream text;
        text << in.rdbuf();
        return text.str();
    }

    void TearDown() override { std::filesystem::remove_all(m_folder); }

    std::filesystem::path m_folder = [] {
        auto folder = std::filesystem::temp_directory_path() /
                      ("arbolex-tablefile-" + std::to_string(getpid()));
        std::filesystem::create_directories(folder);
        return folder;
    }();
    std::vector<ResultColumn> m_columns = {
        {"line", ColumnType::kInteger}, {"note", ColumnType::kText}, {"npv", ColumnType::kReal}};
    std::vector<std::vector<std::string>> m_rows = {{"2", "fenced,\t\"deer\"\nline two", "12.50"},
                                                    {"3", "", ""}};
};

TEST_F(ResultFileTest, EachFormatKeepsEveryLineAsWideAsTheHeader) {
    EXPECT_EQ(write(TableFormat::kCsv, {}),
              "line,note,npv\n2,\"fenced,\t\"\"deer\"\"\nline two\",12.50\n3,,\n");
    EXPECT_EQ(write(TableFormat::kTsv, {}),
              "line\tnote\tnpv\n2\tfenced, \"deer\" line two\t12.50\n3\t\t\n");
    // The caller's members open the document; a figure is the CSV's text, an
    // empty figure null, an empty text "".
    EXPECT_EQ(write(TableFormat::kJson, R"("run":{"command":"estate"})"),
              "{\"run\":{\"command\":\"estate\"},\"columns\":[\"line\",\"note\",\"npv\"],"
              "\"rows\":[\n"
              "{\"line\":2,\"note\":\"fenced,\\u0009\\\"deer\\\"\\u000aline two\",\"npv\":12.50},\n"
              "{\"line\":3,\"note\":\"\",\"npv\":null}\n]}\n");
    m_rows.clear();
    EXPECT_EQ(write(TableFormat::kJson, {}),
              "{\"columns\":[\"line\",\"note\",\"npv\"],\"rows\":[\n\n]}\n");
}

} // namespace
} // namespace arbolex::estate
