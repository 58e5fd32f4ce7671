// The main window's load and unload: what a run leaves for the next one.
#include "mainwindowfixture.hpp"

#include "shell/datahistory.hpp"
#include "shell/testfiles.hpp"
#include "shell/vbtext.hpp"
#include "workflow/mainmessages.hpp"

#include <QDir>
#include <QSettings>

namespace arbolex::testing {
namespace {

using namespace workflow;
using namespace work;

const QRect kScreen(0, 0, 1920, 1080);

class MainStartupTest : public MainWindowTest {
protected:
    MainStartupTest() { copyShippedData(dir.path()); }

    QSettings settings{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
};

TEST_F(MainStartupTest, UnloadAndLoadRoundTrip) {
    logic.Form_Load(settings, kScreen);
    // Centred on the screen when no placement was ever saved.
    EXPECT_EQ(view.placement().center(), kScreen.center());
    logic.mnuModel_Click(4);
    typeStand(QStringLiteral("45"), QStringLiteral("2"));
    type(MainControl::txtNetArea, QStringLiteral("12.5"));
    view.setPlacement(QRect(40, 60, 1000, 700));
    prices.data().userDefined[3] = 17.25;
    work.cashFlow().setInterestRate(3.25);
    logic.Form_Unload(settings);

    SessionServices nextRun(dir.path());
    HeadlessMainView &nextView = nextRun.view;
    prices::Prices &nextPrices = nextRun.prices;
    nextRun.logic.Form_Load(settings, kScreen);
    EXPECT_EQ(nextRun.grow.modelId(), 4);
    for (MainControl c : {MainControl::txtFromA, MainControl::txtFromN, MainControl::txtFromH,
                          MainControl::txtFromB, MainControl::txtToA, MainControl::txtByA,
                          MainControl::txtNetArea}) {
        // The same values, written back in their display formats.
        EXPECT_EQ(shell::val(nextView.text(c)), shell::val(view.text(c)))
            << controlName(c).toStdString();
    }
    EXPECT_FALSE(nextView.text(MainControl::txtFromD).isEmpty()) << "DBH completed from BA";
    EXPECT_FALSE(nextView.text(MainControl::lblSI).isEmpty());
    EXPECT_EQ(nextView.activeModel(), 4);
    EXPECT_EQ(nextView.placement(), QRect(40, 60, 1000, 700));
    EXPECT_EQ(nextPrices.data().userDefined[3], 17.25);
    EXPECT_EQ(nextRun.work.cashFlow().interestRate(), 3.25);
    EXPECT_TRUE(logLines().isEmpty());
}

TEST_F(MainStartupTest, MissingFilesStillStartWithDefaults) {
    QFile::remove(dir.filePath(QStringLiteral("IFPRM1.dat")));
    QFile::remove(dir.filePath(QStringLiteral("CURPRIC.qdm")));
    logic.Form_Load(settings, kScreen);
    EXPECT_EQ(grow.modelId(), 0);
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("15"));
    EXPECT_TRUE(view.isEnabled(MainControl::cmdGrow));
    EXPECT_EQ(prices.pricesInUse()[0], 0.0) << "no price list could be read";
    EXPECT_EQ(logLines().size(), 2) << "one line per missing file";
    typeStand();
    logic.cmdGrow_Click();
    EXPECT_EQ(logic.table().rowCount(), 9) << "the program works without its files";
}

// A missing first price file stops the reading, and the exit then writes the
// empty lists over the good ones; the history brings them back.
TEST_F(MainStartupTest, ListsLostThroughAMissingFileComeBackFromTheHistory) {
    QTemporaryDir userDir;
    const shell::DataHistory history(shell::DataHistory::folderIn(userDir.path()));
    logic.attachDataHistory(&history);
    const QString userPrices = dir.filePath(QStringLiteral("USRPRIC.qdm"));
    const QByteArray goodList = readBytes(userPrices);
    QFile::remove(dir.filePath(QStringLiteral("CURPRIC.qdm")));
    logic.Form_Load(settings, kScreen);
    logic.Form_Unload(settings);
    ASSERT_NE(readBytes(userPrices), goodList) << "the exit wrote the empty list";

    QString error;
    for (const shell::KeptCopy &copy : history.copies()) {
        if (copy.fileName == QStringLiteral("USRPRIC.qdm")) {
            ASSERT_TRUE(history.restore(copy, dir.path(), error));
            break;
        }
    }
    EXPECT_EQ(readBytes(userPrices), goodList);
    logic.reloadDataFiles();
    EXPECT_GT(prices.data().userDefined[12], 0.0) << "the restored list is the one in memory";
}

TEST_F(MainStartupTest, ModelMenuKeepsRowsAndOffersThinningByModel) {
    logic.Form_Load(settings, kScreen);
    typeStand();
    logic.cmdGrow_Click();
    logic.mnuModel_Click(3);
    EXPECT_FALSE(view.isEnabled(MainControl::cmdThin));
    EXPECT_EQ(logic.table().rowCount(), 9);
    logic.mnuModel_Click(11); // labelled un-thinned, but not found in "1+3+5+7+9"
    EXPECT_TRUE(view.isEnabled(MainControl::cmdThin));
    logic.mnuModel_Click(22);
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, QStringLiteral("FAULT - Unknown model selection"));
    EXPECT_EQ(grow.modelId(), 11);
}

TEST_F(MainStartupTest, InformationBoxes) {
    logic.Form_Load(settings, kScreen);
    logic.TrhesholdInfo();
    logic.mnuModel_Click(1);
    logic.TrhesholdInfo();
    logic.Warn();
    ASSERT_EQ(interactive.messages.size(), 3);
    EXPECT_TRUE(
        interactive.messages[0].text.startsWith(QStringLiteral("The threshold BA for SS is :  ")));
    EXPECT_TRUE(interactive.messages[1].text.startsWith(
        QStringLiteral("The threshold BA for SS is not calculated but would be & vbCrLf & equal "
                       "or greater then :")));
    EXPECT_TRUE(interactive.messages[2].text.startsWith(text::warnLead()));
    EXPECT_TRUE(interactive.messages[2].text.contains(QStringLiteral("SS - (Un-thinned)")));
}

} // namespace
} // namespace arbolex::testing
