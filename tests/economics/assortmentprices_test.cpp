// The assortment prices: the file's reader refuses anything but three prices
// and changes nothing then, the exit writes what the window accepted, and the
// window edits the prices between Allow and Accept Changes.
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"

#include "economics/assortpricesmessages.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/headlessassortpricesview.hpp"
#include "prices/assortmentpricefile.hpp"

#include <gtest/gtest.h>

#include <ostream>

namespace arbolex::testing {
namespace {

using economics::AssortPricesControl;
using economics::AssortPricesItem;

QString pricesFile(const QTemporaryDir &dir) {
    return dir.filePath(QLatin1String(prices::kAssortmentPricesFile));
}

// ---- Reader ---------------------------------------------------------------------------------

struct BadFile {
    const char *bytes;
    const char *fault; ///< part of the reason given
};

void PrintTo(const BadFile &c, std::ostream *os) {
    *os << '"' << c.bytes << '"';
}

class AssortmentPriceFileTest : public ::testing::TestWithParam<BadFile>,
                                protected ProgramServices {};

TEST_P(AssortmentPriceFileTest, BadFileIsRefusedWholeAndSaysWhy) {
    prices.data().assortmentPrices = {1.0, 2.0, 3.0};
    writeBytes(pricesFile(dir), GetParam().bytes);
    const prices::AssortmentPricesReading read = prices::readAssortmentPrices(pricesFile(dir));
    EXPECT_FALSE(read.prices.has_value());
    EXPECT_TRUE(read.fault.contains(QLatin1String(GetParam().fault))) << read.fault.toStdString();
    EXPECT_TRUE(read.fault.startsWith(QStringLiteral("\"AssortPrices.qdm\"")));

    prices::GetAssortmentPricesFromFile(dir.path(), prices.data(), log);
    EXPECT_EQ(prices.data().assortmentPrices, (rotation::AssortmentPriceList{1.0, 2.0, 3.0}));
    const QStringList lines = logMessages(dir.path());
    ASSERT_EQ(lines.size(), 1);
    EXPECT_TRUE(lines[0].startsWith(QStringLiteral("FAULT - ") + read.fault));
}

INSTANTIATE_TEST_SUITE_P(
    Economics, AssortmentPriceFileTest,
    ::testing::Values(BadFile{"10\r\n28\r\n", "the price of >20 cm (value 3) is missing"},
                      BadFile{"10\r\ncheap\r\n48\r\n", "the price of 14-20 cm (value 2) is not a"},
                      BadFile{"-10\r\n28\r\n48\r\n", "7-14 cm (value 1) is not a price from 0"},
                      BadFile{"10\r\n28\r\n10000\r\n", "from 0 to 9999.99 euro/m3"},
                      BadFile{"10\r\n28\r\n48\r\n60\r\n", "holds more than 3 prices"},
                      BadFile{"", "is missing"}));

TEST(AssortmentPriceFile, MissingFileAndTheShippedFormats) {
    QTemporaryDir dir;
    const prices::AssortmentPricesReading missing = prices::readAssortmentPrices(pricesFile(dir));
    EXPECT_EQ(missing.fault, QStringLiteral("\"AssortPrices.qdm\": File not found"));
    // Comma-separated values, a missing leading zero and blank lines at the end.
    writeBytes(pricesFile(dir), "10.5, .75,48\r\n\r\n");
    const prices::AssortmentPricesReading read = prices::readAssortmentPrices(pricesFile(dir));
    ASSERT_TRUE(read.prices.has_value()) << read.fault.toStdString();
    EXPECT_EQ(*read.prices, (rotation::AssortmentPriceList{10.5, 0.75, 48.0}));
}

// ---- Window -----------------------------------------------------------------------------------

class AssortPricesWindowTest : public ::testing::Test, protected ProgramServices {
protected:
    AssortPricesWindowTest() {
        prices.data().assortmentPrices = {12.0, 30.5, 50.0};
        window.show();
    }

    QString field(int k) const { return view.text({AssortPricesControl::txtAsmtVal, k}); }
    QString command() const { return view.text({AssortPricesControl::cmdChangeAsmtPrices, 0}); }

    economics::HeadlessAssortPricesView view;
    economics::AssortPricesWindowLogic window{prices.data(), log, view, interactive};
};

TEST_F(AssortPricesWindowTest, TypingOnlyBetweenAllowAndAcceptChanges) {
    window.typeText(0, QStringLiteral("99"));
    EXPECT_EQ(field(0), QStringLiteral("12.00")) << "refused before Allow Changes";
    window.cmdChangeAsmtPrices_Click();
    EXPECT_EQ(command(), QStringLiteral("Accept Changes"));
    EXPECT_TRUE(view.pricesEditable());
    window.typeText(0, QStringLiteral("1a4.5.2"));
    EXPECT_EQ(field(0), QStringLiteral("14.52")) << "letters and a second point refused";
    window.typeText(1, QString());
    window.cmdChangeAsmtPrices_Click();
    EXPECT_EQ(prices.data().assortmentPrices, (rotation::AssortmentPriceList{14.52, 0.0, 50.0}));
    EXPECT_EQ(field(1), QStringLiteral("0.00"));
    EXPECT_EQ(command(), QStringLiteral("Allow Changes"));
    window.typeText(2, QStringLiteral("1"));
    EXPECT_EQ(prices.data().assortmentPrices[2], 50.0);
}

TEST_F(AssortPricesWindowTest, PriceAboveTheHighestIsRefusedAndNothingChanges) {
    window.cmdChangeAsmtPrices_Click();
    window.typeText(0, QStringLiteral("11"));
    window.typeText(2, QStringLiteral("123456"));
    window.cmdChangeAsmtPrices_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(
        interactive.messages[0].text,
        economics::text::priceOutOfRange(QStringLiteral(">20 cm"), QStringLiteral("9999.99")));
    EXPECT_EQ(prices.data().assortmentPrices, (rotation::AssortmentPriceList{12.0, 30.5, 50.0}));
    EXPECT_TRUE(window.changesAllowed()) << "the user can put it right";
    EXPECT_EQ(field(2), QStringLiteral("123456"));
}

TEST_F(AssortPricesWindowTest, AcceptedPricesAreWrittenAndReadBack) {
    window.cmdChangeAsmtPrices_Click();
    window.typeText(1, QStringLiteral("31.25"));
    window.cmdChangeAsmtPrices_Click();
    prices::WriteAssortmentPricesInFile(dir.path(), prices.data(), log);
    EXPECT_EQ(readBytes(pricesFile(dir)), QByteArray("12\r\n31.25\r\n50\r\n"));
    prices::PriceData next;
    prices::GetAssortmentPricesFromFile(dir.path(), next, log);
    EXPECT_EQ(next.assortmentPrices, prices.data().assortmentPrices);
    EXPECT_TRUE(logMessages(dir.path()).isEmpty());
}

} // namespace
} // namespace arbolex::testing
