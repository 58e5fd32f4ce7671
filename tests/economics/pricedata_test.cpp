// Price and category files: the reading order and where a failure stops it,
// which lists each writer selector writes, and the file text.
#include "shell/testfiles.hpp"

#include "prices/pricedata.hpp"
#include "shell/errorlog.hpp"

#include <QLocale>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::economics {
namespace {

using testing::logMessages;
using testing::readBytes;
using testing::writeBytes;

/// Thirteen prices first, first + 1, ... one per line.
QByteArray priceLines(int first) {
    QByteArray text;
    for (int i = 0; i < prices::kPriceClassCount; ++i) {
        text += QByteArray::number(first + i) + "\r\n";
    }
    return text;
}

class PriceFilesTest : public ::testing::Test {
protected:
    QString path(const char *name) const { return m_dir.filePath(QLatin1String(name)); }

    /// Writes current prices 100.., private 200.., user 300.., long-term 400.. and
    /// the categories, gives `file` the text `replacement` (none: no file) and reads.
    prices::PriceData readWith(const char *file, const char *replacement) {
        QFile::remove(m_log.path());
        writeBytes(path(prices::kCurrentPricesFile), priceLines(100));
        writeBytes(path(prices::kPrivatePricesFile),
                   priceLines(200) + "\"Jan 2025\"\r\n\"Dec 2025\"\r\n");
        writeBytes(path(prices::kUserPricesFile), priceLines(300));
        writeBytes(path(prices::kAveragePricesFile), priceLines(400));
        writeBytes(path(prices::kUserAssortmentsFile),
                   QByteArray("\"Pulpwood\"\r\n7\r\n14\r\n").repeated(4) +
                       "\"Stakes\",.5,12.5\r\n");
        QFile::remove(path(file));
        if (replacement != nullptr) {
            writeBytes(path(file), replacement);
        }
        prices::PriceData data;
        data.current[3] = -1;
        prices::GetPricesFromFiles(m_dir.path(), data, m_log);
        return data;
    }
    /// The one log line expected, from its "number description in line N".
    QStringList logged(const char *failure) const {
        return {QLatin1String("Error ") + QLatin1String(failure) +
                QLatin1String(" in procedure GetPricesFromFiles of Module Misc")};
    }

    QTemporaryDir m_dir;
    shell::ErrorLog m_log{m_dir.path()};
};

TEST_F(PriceFilesTest, ReadingStopsOnlyAtAMissingOrShortFile) {
    prices::PriceData data = readWith("none", nullptr);
    EXPECT_EQ(data.current[3], 103.0);
    EXPECT_EQ(data.privatePeriod[1], QStringLiteral("Dec 2025"));
    EXPECT_EQ(data.longTermAverage[12], 412.0);
    EXPECT_EQ(data.categories[4].name, QStringLiteral("Stakes"));
    EXPECT_EQ(data.categories[4].smallEnd, 0.5f);
    EXPECT_TRUE(logMessages(m_dir.path()).isEmpty());

    data = readWith(prices::kCurrentPricesFile, nullptr); // nothing read at all
    EXPECT_EQ(data.current[3], -1.0);
    EXPECT_EQ(data.privateSector, prices::PriceList{});
    EXPECT_EQ(logMessages(m_dir.path()), logged("53 File not found in line 10"));

    data = readWith(prices::kUserPricesFile, nullptr);
    EXPECT_EQ(data.current[3], 103.0);
    EXPECT_EQ(data.privatePeriod[1], QStringLiteral("Dec 2025"));
    EXPECT_EQ(data.userDefined, prices::PriceList{});
    EXPECT_TRUE(data.categories[0].name.isEmpty());
    EXPECT_EQ(logMessages(m_dir.path()), logged("53 File not found in line 70"));

    data = readWith(prices::kCurrentPricesFile, "1\r\n2\r\n3\r\n4\r\n5\r\n");
    EXPECT_EQ(data.current[4], 5.0);
    EXPECT_EQ(data.current[5], 0.0);
    EXPECT_EQ(data.privateSector, prices::PriceList{});
    EXPECT_EQ(logMessages(m_dir.path()), logged("62 Input past end of file in line 20"));

    // a value that is no number keeps its entry; the reading goes on
    data = readWith(prices::kCurrentPricesFile, priceLines(100).replace("103", "1O3").constData());
    EXPECT_EQ(data.current[3], -1.0);
    EXPECT_EQ(data.current[4], 104.0);
    EXPECT_EQ(data.categories[4].name, QStringLiteral("Stakes"));
    EXPECT_EQ(logMessages(m_dir.path()), logged("13 Type mismatch in line 20"));
}

TEST_F(PriceFilesTest, SelectorChoosesTheListsAndPrivatePricesAreNeverWritten) {
    const struct {
        std::int16_t selector;
        bool current, user, average;
    } cases[] = {{0, true, false, false}, {1, false, true, false},  {2, false, false, true},
                 {3, true, true, true},   {4, false, false, false}, {-1, false, false, false}};
    const QByteArray privateText = priceLines(200) + "\"a\"\r\n\"b\"\r\n";
    for (const auto &c : cases) {
        SCOPED_TRACE(c.selector);
        QTemporaryDir dir;
        auto exists = [&dir](const char *name) {
            return QFile::exists(dir.filePath(QLatin1String(name)));
        };
        writeBytes(dir.filePath(QLatin1String(prices::kPrivatePricesFile)), privateText);
        prices::WritePricesInFiles(c.selector, dir.path(), prices::PriceData{}, m_log);
        EXPECT_EQ(exists(prices::kCurrentPricesFile), c.current);
        EXPECT_EQ(exists(prices::kUserPricesFile), c.user);
        EXPECT_EQ(exists(prices::kAveragePricesFile), c.average);
        EXPECT_EQ(readBytes(dir.filePath(QLatin1String(prices::kPrivatePricesFile))), privateText);
    }
    prices::WritePricesInFiles(prices::kWriteCurrent, m_dir.filePath(QStringLiteral("gone")), {},
                               m_log);
    EXPECT_EQ(logMessages(m_dir.path()).value(0),
              QStringLiteral("Error 76 Path not found in line 10  in procedure "
                             "WritePricesInFiles of Module Misc"));
}

TEST_F(PriceFilesTest, WrittenFilesReadBackUnderDecimalCommaLocale) {
    prices::PriceData written;
    written.current.fill(12.75);
    written.current[0] = -3.5;
    written.categories[0] = {QStringLiteral("Pallet, small"), 14, 20.5f, true};
    writeBytes(path(prices::kPrivatePricesFile), priceLines(200) + "\"a\"\r\n\"b\"\r\n");

    const QLocale previous;
    QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
    prices::WritePricesInFiles(prices::kWriteAllPrices, m_dir.path(), written, m_log);
    prices::WriteUserDefinedAssortmentsInFile(m_dir.path(), written, m_log);
    QLocale::setDefault(previous);

    EXPECT_TRUE(readBytes(path(prices::kCurrentPricesFile)).startsWith("-3.5\r\n12.75\r\n"));
    const QByteArray categories = readBytes(path(prices::kUserAssortmentsFile));
    EXPECT_TRUE(categories.startsWith("\"Pallet, small\"\r\n14\r\n20.5\r\n\"\"\r\n0\r\n0\r\n"));
    EXPECT_EQ(categories.count("\r\n"), 15);
    prices::PriceData data;
    prices::GetPricesFromFiles(m_dir.path(), data, m_log);
    EXPECT_EQ(data.current, written.current);
    EXPECT_EQ(data.categories[0].name, QStringLiteral("Pallet, small"));
    EXPECT_TRUE(logMessages(m_dir.path()).isEmpty());

    prices::GetPricesFromFiles(QStringLiteral(ARBOLEX_DATA_SOURCE), data, m_log); // as shipped
    EXPECT_TRUE(logMessages(m_dir.path()).isEmpty());
}

} // namespace
} // namespace arbolex::economics
