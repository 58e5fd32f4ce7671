// Sequential data files: how values are split and converted, the classic
// failures, and that a file is replaced only when the new one is complete.
#include "shell/testfiles.hpp"

#include "shell/seqfile.hpp"

#include <QLocale>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::shell {
namespace {

using testing::readBytes;
using testing::writeBytes;

TEST(SeqFileTest, ValuesEndAtCommaOrLineEnd) {
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("mixed.qdm"));
    writeBytes(path, "1.5, .5 ,-3\r\n  \"Pallet, small\" , 7\nabc\r8,,2e1\r\n");
    SequentialReader in(path);
    double n[7] = {0, 0, 0, 0, 9, 9, 0};
    QString name;
    for (int i = 0; i < 3; ++i) {
        EXPECT_FALSE(in.readNumber(n[i]));
    }
    EXPECT_FALSE(in.readString(name));
    EXPECT_FALSE(in.readNumber(n[3]));
    // not a number: the target keeps its value and reading goes on
    EXPECT_EQ(in.readNumber(n[4]).number, kErrTypeMismatch);
    for (int i = 4; i < 7; ++i) { // an empty value reads as 0
        EXPECT_FALSE(in.readNumber(n[i]));
    }
    EXPECT_EQ(name, QStringLiteral("Pallet, small"));
    const double expected[7] = {1.5, 0.5, -3, 7, 8, 0, 20};
    for (int i = 0; i < 7; ++i) {
        EXPECT_EQ(n[i], expected[i]) << i;
    }
    EXPECT_EQ(in.readString(name).number, kErrInputPastEndOfFile);

    SequentialReader missing(dir.filePath(QStringLiteral("absent.qdm")));
    EXPECT_EQ(missing.openError().number, kErrFileNotFound);
    EXPECT_EQ(missing.readNumber(n[0]).number, kErrBadFileNameOrNumber);
}

TEST(SeqFileTest, WriterUsesPointAndReplacesTheFileOnlyOnClose) {
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("out.qdm"));
    writeBytes(path, "old\r\n");
    {
        SequentialWriter abandoned(path);
        EXPECT_FALSE(abandoned.writeNumber(1));
    } // never closed
    EXPECT_EQ(readBytes(path), "old\r\n");

    const QLocale previous;
    QLocale::setDefault(QLocale(QLocale::French, QLocale::France));
    SequentialWriter out(path);
    EXPECT_FALSE(out.writeNumber(12.75));
    EXPECT_FALSE(out.writeSingle(0.1f));
    EXPECT_FALSE(out.writeString(QStringLiteral("Pallet, small")));
    QLocale::setDefault(previous);
    EXPECT_FALSE(out.close());
    EXPECT_EQ(readBytes(path), "12.75\r\n0.1\r\n\"Pallet, small\"\r\n");
}

} // namespace
} // namespace arbolex::shell
