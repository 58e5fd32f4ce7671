// Where the program keeps its data: a folder named on the command line or in
// the environment wins; a program in a folder of its own keeps its data
// beside itself; an installed one works in the user's data location, filled
// from its installed defaults without ever overwriting a user's file.
#include "shell/testfiles.hpp"

#include "shell/datafolder.hpp"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace arbolex::shell {
namespace {

class DataFolderTest : public ::testing::Test {
protected:
    void SetUp() override {
        m_savedVariable = qgetenv(kDataFolderVariable);
        qunsetenv(kDataFolderVariable);
        m_places = {m_root.filePath(QStringLiteral("bin")),
                    m_root.filePath(QStringLiteral("share/arbolex/data")),
                    m_root.filePath(QStringLiteral("home/ARBOLEX"))};
        QDir().mkpath(m_places.executableFolder);
    }
    void TearDown() override {
        if (!m_savedVariable.isNull()) {
            qputenv(kDataFolderVariable, m_savedVariable);
        }
        QFile::setPermissions(m_places.executableFolder,
                              QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }

    /// Installs two read-only default files, as a package may.
    void installDefaults() {
        QDir().mkpath(m_places.installedDefaults);
        for (const auto &[name, bytes] : kDefaults) {
            const QString path = QDir(m_places.installedDefaults).filePath(QLatin1String(name));
            testing::writeBytes(path, bytes);
            QFile::setPermissions(path, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther);
        }
    }
    QString userFile(const char *name) const {
        return QDir(m_places.userFolder).filePath(QLatin1String(name));
    }

    static constexpr std::pair<const char *, const char *> kDefaults[] = {
        {"CURPRIC.qdm", "4.1\r\n8.35\r\n"}, {"IFPRM1.dat", "0\r\n15\r\n"}};

    QTemporaryDir m_root;
    DataPlaces m_places;
    QByteArray m_savedVariable;
};

TEST_F(DataFolderTest, CommandLineThenEnvironmentWinOverEveryPlace) {
    installDefaults();
    const QString named = m_root.filePath(QStringLiteral("named"));
    const QString other = m_root.filePath(QStringLiteral("other"));
    qputenv(kDataFolderVariable, other.toUtf8());
    EXPECT_EQ(dataFolder({QStringLiteral("--data-dir"), named}, m_places), named);
    EXPECT_EQ(dataFolder({QStringLiteral("run")}, m_places), other);
    EXPECT_FALSE(QFileInfo::exists(m_places.userFolder)) << "nothing is copied for a named folder";
}

TEST_F(DataFolderTest, ProgramOfABuildKeepsItsDataBesideItself) {
    EXPECT_EQ(dataFolder({}, m_places), m_places.executableFolder);
    EXPECT_FALSE(QFileInfo::exists(m_places.userFolder));
}

TEST_F(DataFolderTest, InstalledProgramFillsTheUserLocationFromItsDefaults) {
    installDefaults();
    // Its own folder is writable here (an installation in ~/.local, or root),
    // and still it never writes there.
    ASSERT_EQ(dataFolder({}, m_places), m_places.userFolder);
    for (const auto &[name, bytes] : kDefaults) {
        EXPECT_EQ(testing::readBytes(userFile(name)), bytes) << name;
        EXPECT_TRUE(QFileInfo(userFile(name)).isWritable()) << name << ": the exit writes it";
    }
    EXPECT_TRUE(QDir(m_places.executableFolder).isEmpty());
}

TEST_F(DataFolderTest, UserFilesAreNeverOverwrittenAndLostOnesComeBack) {
    installDefaults();
    QDir().mkpath(m_places.userFolder);
    testing::writeBytes(userFile("CURPRIC.qdm"), "5\r\n9\r\n");
    ASSERT_EQ(dataFolder({}, m_places), m_places.userFolder);
    EXPECT_EQ(testing::readBytes(userFile("CURPRIC.qdm")), "5\r\n9\r\n");
    EXPECT_EQ(testing::readBytes(userFile("IFPRM1.dat")), "0\r\n15\r\n");
}

TEST_F(DataFolderTest, ReadOnlyProgramFolderFallsBackToTheUserLocation) {
    QFile::setPermissions(m_places.executableFolder, QFile::ReadOwner | QFile::ExeOwner);
    if (QFileInfo(m_places.executableFolder).isWritable()) {
        GTEST_SKIP() << "this user may write into a read-only folder (root)";
    }
    EXPECT_EQ(dataFolder({}, m_places), m_places.userFolder);
    EXPECT_TRUE(QFileInfo(m_places.userFolder).isDir()) << "created, if without defaults";
}

} // namespace
} // namespace arbolex::shell
