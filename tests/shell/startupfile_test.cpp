// The start-up file: round trip, and a missing or damaged file that must give
// the defaults and one log line instead of stopping the program.
#include "shell/testfiles.hpp"

#include "shell/errorlog.hpp"
#include "shell/startupfile.hpp"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::shell {
namespace {

const StartupValues kSome = {3, 22.5f, 31.2f, 1800, 14.3f, 60, 10, 12.5};

TEST(StartupFileTest, RoundTripAndShippedFile) {
    QTemporaryDir dir;
    ErrorLog log(dir.path());
    ASSERT_TRUE(writeStartupFile(dir.path(), kSome, log));
    EXPECT_EQ(testing::readBytes(dir.filePath(QLatin1String(kStartupFile))),
              "3\r\n22.5\r\n31.2\r\n1800\r\n14.3\r\n60\r\n10\r\n12.5\r\n");
    StartupValues read;
    ASSERT_TRUE(readStartupFile(dir.path(), read, log));
    EXPECT_TRUE(read == kSome);
    ASSERT_TRUE(readStartupFile(QStringLiteral(ARBOLEX_DATA_SOURCE), read, log));
    EXPECT_TRUE(read == StartupValues{.netArea = 10});
}

TEST(StartupFileTest, MissingOrDamagedFileGivesDefaultsAndOneLogLine) {
    const struct {
        const char *text; // nullptr: no file
        const char *message;
    } cases[] = {
        {nullptr, "53  File not found in line 10"},
        {"", "62  Input past end of file in line 20"},
        {"3,15,20\r\n", "62  Input past end of file in line 50"},
        {"3\r\n15\r\nxx\r\n2500\r\n7\r\n50\r\n5\r\n10\r\n", "13  Type mismatch in line 40"},
        {"22\r\n15\r\n20\r\n2500\r\n7\r\n50\r\n5\r\n10\r\n",
         "340  Control array element '22' doesn't exist in line 20"},
    };
    for (const auto &c : cases) {
        SCOPED_TRACE(c.message);
        QTemporaryDir dir;
        ErrorLog log(dir.path());
        if (c.text != nullptr) {
            testing::writeBytes(dir.filePath(QLatin1String(kStartupFile)), c.text);
        }
        StartupValues read = kSome;
        EXPECT_FALSE(readStartupFile(dir.path(), read, log));
        EXPECT_TRUE(read == StartupValues{});
        EXPECT_EQ(testing::logMessages(dir.path()),
                  QStringList{QLatin1String("Error # :") + QLatin1String(c.message) +
                              QLatin1String(" in frmMain.Load()")});
    }
}

} // namespace
} // namespace arbolex::shell
