// The history of the data files the exit writes over.
#include "shell/datahistory.hpp"
#include "testfiles.hpp"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using shell::DataHistory;

class DataHistoryTest : public ::testing::Test {
protected:
    QString data(const QString &name) const { return dataDir.filePath(name); }

    QTemporaryDir dataDir;
    QTemporaryDir userDir;
    DataHistory history{DataHistory::folderIn(userDir.path())};
};

TEST_F(DataHistoryTest, KeepsChangedVersionsOnlyAndTheLastTenOfEachFile) {
    const QString prices = data(QStringLiteral("CURPRIC.qdm"));
    EXPECT_TRUE(history.keep(prices)) << "a file not there yet has nothing to keep";
    EXPECT_TRUE(history.copies().isEmpty());

    writeBytes(prices, "1\r\n");
    ASSERT_TRUE(history.keep(prices));
    ASSERT_TRUE(history.keep(prices)) << "the same contents are not kept twice";
    ASSERT_EQ(history.copies().size(), 1);

    writeBytes(data(QStringLiteral("UD_Assort.qdm")), "\"Pulp\"\r\n");
    ASSERT_TRUE(history.keep(data(QStringLiteral("UD_Assort.qdm"))));
    for (int version = 2; version <= 12; ++version) {
        writeBytes(prices, QByteArray::number(version) + "\r\n");
        ASSERT_TRUE(history.keep(prices));
    }
    const QList<shell::KeptCopy> copies = history.copies();
    ASSERT_EQ(copies.size(), DataHistory::kCopiesKept + 1) << "ten of one file, one of the other";
    EXPECT_EQ(copies.front().fileName, QStringLiteral("CURPRIC.qdm"));
    EXPECT_EQ(readBytes(copies.front().path), "12\r\n") << "newest first";
    QList<QByteArray> kept;
    for (const shell::KeptCopy &copy : copies) {
        if (copy.fileName == QStringLiteral("CURPRIC.qdm")) {
            kept.append(readBytes(copy.path));
        }
    }
    EXPECT_EQ(kept.back(), "3\r\n") << "the two oldest versions went";
}

TEST_F(DataHistoryTest, RestoreKeepsThePresentFileSoItCanBeUndone) {
    const QString prices = data(QStringLiteral("USRPRIC.qdm"));
    writeBytes(prices, "good\r\n");
    ASSERT_TRUE(history.keep(prices));
    writeBytes(prices, "empty\r\n");

    QString error;
    ASSERT_TRUE(history.restore(history.copies().front(), dataDir.path(), error))
        << error.toStdString();
    EXPECT_EQ(readBytes(prices), "good\r\n");
    ASSERT_EQ(history.copies().size(), 2);
    EXPECT_EQ(readBytes(history.copies().front().path), "empty\r\n");

    // A data folder that is gone refuses the restore and says why.
    EXPECT_FALSE(
        history.restore(history.copies().back(), dataDir.filePath(QStringLiteral("gone")), error));
    EXPECT_FALSE(error.isEmpty());
}

} // namespace
} // namespace arbolex::testing
