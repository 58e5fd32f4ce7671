// The default costs: the shipped file reads, anything but two costs from 0 up
// is refused whole with its reason and changes nothing, and a missing file is
// told apart from a damaged one.
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"

#include "prices/costfile.hpp"

#include <gtest/gtest.h>

#include <ostream>

namespace arbolex::testing {
namespace {

QString costsFile(const QTemporaryDir &dir) {
    return dir.filePath(QLatin1String(prices::kCostsFile));
}

struct BadCosts {
    const char *bytes;
    const char *fault; ///< part of the reason given
};

void PrintTo(const BadCosts &c, std::ostream *os) {
    *os << '"' << c.bytes << '"';
}

class CostFileTest : public ::testing::TestWithParam<BadCosts>, protected ProgramServices {};

TEST_P(CostFileTest, BadFileIsRefusedWholeAndSaysWhy) {
    const prices::CostDefaults before{1200.0, 15.0};
    prices.data().costs = before;
    writeBytes(costsFile(dir), GetParam().bytes);
    const prices::CostsReading read = prices::readCosts(costsFile(dir));
    EXPECT_FALSE(read.costs.has_value());
    EXPECT_FALSE(read.missing);
    EXPECT_TRUE(read.fault.startsWith(QStringLiteral("\"Costs.qdm\": ")));
    EXPECT_TRUE(read.fault.contains(QLatin1String(GetParam().fault))) << read.fault.toStdString();

    prices::GetCostsFromFile(dir.path(), prices.data(), log);
    EXPECT_EQ(prices.data().costs, before);
    const QStringList lines = logMessages(dir.path());
    ASSERT_EQ(lines.size(), 1);
    EXPECT_TRUE(lines[0].startsWith(QStringLiteral("FAULT - ") + read.fault));
}

INSTANTIATE_TEST_SUITE_P(
    Economics, CostFileTest,
    ::testing::Values(BadCosts{"3045\r\n", "the annual cost (value 2) is missing"},
                      BadCosts{"dear\r\n0\r\n", "the establishment cost (value 1) is not a number"},
                      BadCosts{"-5\r\n0\r\n", "(value 1) is not a cost from 0 to 99999.99 euro/ha"},
                      BadCosts{"3045\r\n100000\r\n", "(value 2) is not a cost from 0"},
                      BadCosts{"3045\r\n0\r\n7\r\n", "holds more than 2 costs"},
                      BadCosts{"", "is missing"}));

TEST(CostFile, ShippedMissingAndCommaSeparated) {
    const prices::CostsReading shipped = prices::readCosts(
        QDir(QStringLiteral(ARBOLEX_DATA_SOURCE)).filePath(QLatin1String(prices::kCostsFile)));
    ASSERT_TRUE(shipped.costs.has_value()) << shipped.fault.toStdString();
    // The establishment grant of a Sitka spruce plantation, and no yearly cost.
    EXPECT_EQ(shipped.costs->establishment, 3045.0);
    EXPECT_EQ(shipped.costs->annual, 0.0);

    QTemporaryDir dir;
    const prices::CostsReading missing = prices::readCosts(costsFile(dir));
    EXPECT_TRUE(missing.missing);
    EXPECT_EQ(missing.fault, QStringLiteral("\"Costs.qdm\": File not found"));
    writeBytes(costsFile(dir), "2500.5, 12\r\n\r\n");
    const prices::CostsReading read = prices::readCosts(costsFile(dir));
    ASSERT_TRUE(read.costs.has_value()) << read.fault.toStdString();
    EXPECT_EQ(*read.costs, (prices::CostDefaults{2500.5, 12.0}));
}

} // namespace
} // namespace arbolex::testing
