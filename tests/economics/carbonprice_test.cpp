// The carbon settings of the program: the data folder's carbon file is read
// whole or not at all and is written back only when the user changed it; the
// carbon price window edits the price and its payment between Allow and
// Accept Changes; the work's money carries what the window accepted.
#include "mocks/programservices.hpp"
#include "mocks/sessionservices.hpp"
#include "shell/testfiles.hpp"

#include "economics/carbonformat.hpp"
#include "economics/carbonpricemessages.hpp"
#include "economics/carbonpricewindowlogic.hpp"
#include "economics/headlesscarbonpriceview.hpp"
#include "prices/carbonsettingsfile.hpp"
#include "prices/pricefiles.hpp"
#include "shell/datahistory.hpp"

#include <QSettings>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using economics::CarbonPriceControl;

QString carbonFile(const QString &folder) {
    return QDir(folder).filePath(QLatin1String(prices::kCarbonFile));
}

// ---- The file -------------------------------------------------------------------------------

TEST(CarbonSettingsFile, ShippedFileIsTheDefaultsAsTheProgramWritesThem) {
    const QString shipped = carbonFile(QStringLiteral(ARBOLEX_DATA_SOURCE));
    const prices::CarbonSettingsReading read = prices::readCarbonSettings(shipped);
    ASSERT_TRUE(read.settings) << read.fault.toStdString();
    EXPECT_EQ(*read.settings, carbon::defaultSettings());
    // Byte for byte: the exit of a changed setting writes the same sources.
    EXPECT_EQ(readBytes(shipped).toStdString(), carbon::carbonText(carbon::defaultSettings()));
}

class CarbonSettingsFileTest : public ::testing::Test, protected ProgramServices {
protected:
    void writeAtExit() {
        prices::writePriceFilesAtExit(dir.path(), prices, nullptr, QStringLiteral(" at exit"), log);
    }
};

TEST_F(CarbonSettingsFileTest, BadFileLeavesTheDefaultsLogsOnceAndIsNotWrittenOver) {
    const QByteArray bad = "price = 80\npayment = flow\nhalf_life.panels = -3\n";
    writeBytes(carbonFile(dir.path()), bad);
    prices::GetCarbonSettingsFromFile(dir.path(), prices.data(), log);
    EXPECT_EQ(prices.data().carbon, carbon::defaultSettings()) << "nothing half-read";
    const QStringList lines = logMessages(dir.path());
    ASSERT_EQ(lines.size(), 1);
    EXPECT_TRUE(lines[0].startsWith(
        QStringLiteral("FAULT - \"Carbon.qdm\": the half-life of panels must be above 0 years; "
                       "the carbon settings were not read")))
        << lines[0].toStdString();

    writeAtExit();
    EXPECT_EQ(readBytes(carbonFile(dir.path())), bad) << "left for the user to mend";

    // A line that is not right names its line.
    writeBytes(carbonFile(dir.path()), "price = 80\n\npayment = weekly\n");
    const prices::CarbonSettingsReading read = prices::readCarbonSettings(carbonFile(dir.path()));
    EXPECT_FALSE(read.settings);
    EXPECT_EQ(read.fault,
              QStringLiteral("\"Carbon.qdm\": line 3: \"weekly\" is not a value of payment"));
}

TEST_F(CarbonSettingsFileTest, MissingFileIsLoggedAndNotMadeUnlessChanged) {
    prices::GetCarbonSettingsFromFile(dir.path(), prices.data(), log);
    EXPECT_EQ(logMessages(dir.path()).size(), 1);
    writeAtExit();
    EXPECT_FALSE(QFile::exists(carbonFile(dir.path())));

    prices.data().carbon.pricing = {40.0, carbon::Payment::kUnits};
    writeAtExit();
    const prices::CarbonSettingsReading read = prices::readCarbonSettings(carbonFile(dir.path()));
    ASSERT_TRUE(read.settings) << read.fault.toStdString();
    EXPECT_EQ(*read.settings, prices.data().carbon);
}

TEST_F(CarbonSettingsFileTest, ChangedFileIsKeptInTheHistoryBeforeItIsWritten) {
    copyShippedData(dir.path());
    const QByteArray before = readBytes(carbonFile(dir.path()));
    prices::readPriceFiles(dir.path(), prices, log);
    prices.data().carbon.pricing.payment = carbon::Payment::kFlow;
    const shell::DataHistory history(dir.filePath(QStringLiteral("history")));
    prices::writePriceFilesAtExit(dir.path(), prices, &history, QStringLiteral(" at exit"), log);
    QStringList keptCarbon;
    for (const shell::KeptCopy &copy : history.copies()) {
        if (copy.fileName == QLatin1String(prices::kCarbonFile)) {
            keptCarbon << copy.path;
        }
    }
    ASSERT_EQ(keptCarbon.size(), 1);
    EXPECT_EQ(readBytes(keptCarbon.front()), before);
    EXPECT_NE(readBytes(carbonFile(dir.path())), before);
    EXPECT_TRUE(logMessages(dir.path()).isEmpty());
}

// ---- The window -------------------------------------------------------------------------------

class CarbonPriceWindowTest : public ::testing::Test, protected ProgramServices {
protected:
    CarbonPriceWindowTest() { window.show(); }

    QString price() const { return view.text(CarbonPriceControl::txtCarbonPrice); }
    bool checked(CarbonPriceControl c) const { return view.isChecked(c); }

    economics::HeadlessCarbonPriceView view;
    economics::CarbonPriceWindowLogic window{prices.data(), log, view, interactive};
};

TEST_F(CarbonPriceWindowTest, PriceAndPaymentChangeOnlyBetweenAllowAndAccept) {
    EXPECT_EQ(price(), QStringLiteral("56.00"));
    EXPECT_TRUE(checked(CarbonPriceControl::OptPaymentNone));
    window.typeText(QStringLiteral("99"));
    window.press(CarbonPriceControl::OptPaymentFlow);
    EXPECT_EQ(price(), QStringLiteral("56.00")) << "refused before Allow Changes";
    EXPECT_TRUE(checked(CarbonPriceControl::OptPaymentNone));

    int changes = 0;
    window.onChanged([&changes] { ++changes; });
    window.cmdChangeCarbonPrice_Click();
    EXPECT_TRUE(view.editable());
    window.typeText(QStringLiteral("7a2.5.1"));
    EXPECT_EQ(price(), QStringLiteral("72.51")) << "letters and a second point refused";
    window.press(CarbonPriceControl::OptPaymentUnits);
    EXPECT_TRUE(checked(CarbonPriceControl::OptPaymentUnits));
    EXPECT_FALSE(checked(CarbonPriceControl::OptPaymentNone));
    window.cmdChangeCarbonPrice_Click();
    EXPECT_EQ(prices.data().carbon.pricing.price, 72.51);
    EXPECT_EQ(prices.data().carbon.pricing.payment, carbon::Payment::kUnits);
    EXPECT_FALSE(view.editable());
    EXPECT_EQ(changes, 1);
    // Accepting the same again changes nothing.
    window.cmdChangeCarbonPrice_Click();
    window.cmdChangeCarbonPrice_Click();
    EXPECT_EQ(changes, 1);
}

TEST_F(CarbonPriceWindowTest, PriceAboveTheHighestIsRefusedAndNothingChanges) {
    window.cmdChangeCarbonPrice_Click();
    window.typeText(QStringLiteral("10000.01"));
    window.press(CarbonPriceControl::OptPaymentFlow);
    window.cmdChangeCarbonPrice_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text,
              economics::carbontext::priceOutOfRange(QStringLiteral("10000.00")));
    EXPECT_EQ(prices.data().carbon, carbon::defaultSettings());
    EXPECT_TRUE(window.changesAllowed()) << "the user can put it right";
    window.typeText(QString());
    window.cmdChangeCarbonPrice_Click();
    EXPECT_EQ(prices.data().carbon.pricing.price, 0.0) << "an empty field counts 0";
    EXPECT_EQ(prices.data().carbon.pricing.payment, carbon::Payment::kFlow);
}

// ---- A run to the next ------------------------------------------------------------------------

TEST(CarbonSettingsRun, AcceptedSettingsAreTheWorksMoneyAndTheNextRunsSettings) {
    SessionServices run;
    copyShippedData(run.dataFolder);
    QSettings settings(run.dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    run.logic.Form_Load(settings, QRect(0, 0, 1280, 800));
    run.session.timberPrices().press(economics::TimberPricesControl::cmdCarbonPrice);
    ASSERT_TRUE(run.carbonPriceView.isShown());
    economics::CarbonPriceWindowLogic &window = run.session.carbonPrice();
    window.cmdChangeCarbonPrice_Click();
    window.typeText(QStringLiteral("31.5"));
    window.press(CarbonPriceControl::OptPaymentFlow);
    window.cmdChangeCarbonPrice_Click();
    const rotation::Economics money = run.work.economics();
    EXPECT_EQ(money.carbon.price, 31.5);
    EXPECT_EQ(money.carbon.payment, carbon::Payment::kFlow);
    run.logic.Form_Unload(settings);

    SessionServices next(run.dataFolder);
    next.logic.Form_Load(settings, QRect(0, 0, 1280, 800));
    EXPECT_EQ(next.prices.data().carbon, run.prices.data().carbon);
    EXPECT_EQ(next.work.economics().carbon.payment, carbon::Payment::kFlow);
    EXPECT_TRUE(logMessages(run.dataFolder).isEmpty());
}

} // namespace
} // namespace arbolex::testing
