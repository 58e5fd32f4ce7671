#include "workflow/mainwindowfixture.hpp"

#include "document/documentcontroller.hpp"
#include "shell/iclipboard.hpp"
#include "shell/settings.hpp"
#include "shell/testfiles.hpp"

#include <QDir>
#include <QSettings>

namespace arbolex::testing {
namespace {

using shell::UnsavedChoice;

class DocumentControllerTest : public MainWindowTest {
protected:
    DocumentControllerTest() { documents.start(); }

    QString file(const QString &name) const { return QDir(dir.path()).filePath(name); }
    void grow() {
        typeStand(QStringLiteral("30"));
        logic.cmdGrow_Click();
    }

    QSettings settings{QDir(dir.path()).filePath(QStringLiteral("settings.ini")),
                       QSettings::IniFormat};
    document::DocumentController documents{work, logic, interactive, &settings};
};

TEST_F(DocumentControllerTest, CaptionCarriesTheNameAndTheUnsavedMark) {
    const QString modelCaption = view.caption().section(QStringLiteral("   ----  "), 0, 0);
    documents.refreshCaption();
    EXPECT_EQ(view.caption(), modelCaption + QStringLiteral("   ----  Untitled"));
    grow();
    documents.refreshCaption();
    EXPECT_EQ(view.caption(), modelCaption + QStringLiteral("   ----  Untitled *"));
    ASSERT_TRUE(documents.saveAs(file(QStringLiteral("Kilbrack 12b.arbolex"))));
    EXPECT_EQ(view.caption(), modelCaption + QStringLiteral("   ----  Kilbrack 12b.arbolex"));
    // Moving about the table is no change.
    logic.select(2, 2);
    EXPECT_FALSE(documents.isModified());
}

TEST_F(DocumentControllerTest, UnsavedWorkIsDiscardedOnlyWhenTheUserSaysSo) {
    grow();
    const int rows = logic.table().lastRow();
    interactive.unsavedAnswers = {UnsavedChoice::Cancel};
    documents.fileNew();
    EXPECT_EQ(logic.table().lastRow(), rows);
    ASSERT_EQ(interactive.questions.size(), 1);
    EXPECT_TRUE(interactive.questions.first().text.startsWith(
        QStringLiteral("PLEASE CONFIRM - The sub-compartment \"Untitled\"")));

    interactive.unsavedAnswers = {UnsavedChoice::Discard};
    documents.fileNew();
    EXPECT_TRUE(logic.table().empty());
    EXPECT_FALSE(documents.isModified());

    // Nothing unsaved: no question.
    documents.fileNew();
    EXPECT_EQ(interactive.questions.size(), 2);
}

TEST_F(DocumentControllerTest, TheTablesOwnCommandsAskNothing) {
    grow();
    logic.cmdClear_Click();
    logic.ClearAll();
    logic.mnuModel_Click(2);
    EXPECT_TRUE(interactive.questions.isEmpty());
}

TEST_F(DocumentControllerTest, OpenAsksAboutUnsavedWorkOnlyForAFileItCanTake) {
    grow();
    ASSERT_TRUE(documents.saveAs(file(QStringLiteral("a.arbolex"))));
    type(MainControl::txtNetArea, QStringLiteral("4"));
    ASSERT_TRUE(writeBytes(file(QStringLiteral("broken.arbolex")), "{"));
    EXPECT_FALSE(documents.open(file(QStringLiteral("broken.arbolex"))));
    EXPECT_TRUE(interactive.questions.isEmpty());
    EXPECT_TRUE(documents.isModified());

    interactive.unsavedAnswers = {UnsavedChoice::Save};
    EXPECT_TRUE(documents.open(file(QStringLiteral("a.arbolex"))));
    // Save wrote the net area into a.arbolex before it was opened again.
    EXPECT_EQ(view.text(MainControl::txtNetArea), QStringLiteral("4"));
    EXPECT_FALSE(documents.isModified());
}

TEST_F(DocumentControllerTest, AFailedSaveSaysSoAndIsLogged) {
    grow();
    EXPECT_FALSE(documents.saveAs(file(QStringLiteral("no-such-folder/a.arbolex"))));
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_TRUE(interactive.messages.first().text.startsWith(
        QStringLiteral("ERROR - The sub-compartment could not be saved as \"a.arbolex\"")));
    ASSERT_EQ(logLines().size(), 1);
    EXPECT_TRUE(logLines().first().contains(
        QStringLiteral(" in procedure SaveSubCompartment of Module Document")));
    EXPECT_TRUE(documents.isModified());
    EXPECT_TRUE(documents.path().isEmpty());
}

TEST_F(DocumentControllerTest, RecentFilesKeepTheLastEightNewestFirst) {
    for (int i = 1; i <= 9; ++i) {
        ASSERT_TRUE(documents.saveAs(file(QString::number(i) + QStringLiteral(".arbolex"))));
    }
    ASSERT_TRUE(documents.saveAs(file(QStringLiteral("5.arbolex"))));
    const QStringList recent = shell::readRecentFiles(settings);
    ASSERT_EQ(recent.size(), shell::kRecentFileCount);
    EXPECT_EQ(recent.first(), file(QStringLiteral("5.arbolex")));
    EXPECT_EQ(recent.at(1), file(QStringLiteral("9.arbolex")));
    EXPECT_EQ(recent.count(file(QStringLiteral("5.arbolex"))), 1);
    EXPECT_FALSE(recent.contains(file(QStringLiteral("1.arbolex"))));
    EXPECT_EQ(shell::readLastFolder(settings), dir.path());
}

TEST_F(DocumentControllerTest, TheIdentificationHeadsTheCopiedTable) {
    grow();
    documents.setIdentification({QStringLiteral("Kilbrack"), QStringLiteral("12"),
                                 QStringLiteral("b"), QStringLiteral("Sitka spruce\nPeaty gley")});
    EXPECT_TRUE(documents.isModified());
    logic.CopyTable(false);
    EXPECT_TRUE(clipboard.text().startsWith(
        QStringLiteral("Forest: Kilbrack\nCompartment: 12\nSub-compartment: b\nSitka spruce\n"
                       "Peaty gley\n\nRow\tAge")))
        << clipboard.text().left(120).toStdString();
}

} // namespace
} // namespace arbolex::testing
