// The carbon file: what it writes it reads back; a fault names its line and
// leaves nothing half-read; names left out keep their defaults.
#include "carbon/carbonfile.hpp"

#include <gtest/gtest.h>

namespace arbolex::carbon {
namespace {

TEST(CarbonFile, WrittenSettingsReadBackTheSame) {
    Settings s = defaultSettings();
    s.pricing = {31.25, Payment::kUnits};
    s.parameters.gravity[2].gravity = 0.45;
    s.parameters.halfLife[2] = 50.0;
    s.parameters.productsInClaims = true;
    s.parameters.firstVintage = 3;
    const CarbonReading r = readCarbonText(carbonText(s));
    ASSERT_TRUE(r.settings) << r.fault;
    EXPECT_EQ(*r.settings, s);
    EXPECT_EQ(r.settings->pricing.payment, Payment::kUnits);
    EXPECT_EQ(r.settings->parameters.gravityOf("DF"), 0.45);
}

TEST(CarbonFile, NamesLeftOutKeepTheirDefaults) {
    const CarbonReading r = readCarbonText("# only a price\r\nprice = 80\r\npayment = flow\r\n");
    ASSERT_TRUE(r.settings) << r.fault;
    EXPECT_EQ(r.settings->pricing.price, 80.0);
    EXPECT_EQ(r.settings->pricing.payment, Payment::kFlow);
    EXPECT_EQ(r.settings->parameters.halfLife, defaultSettings().parameters.halfLife);
    EXPECT_FALSE(defaultSettings().pricing.counts()) << "shipped: shown, not counted";
}

TEST(CarbonFile, EveryFaultIsRefusedWithItsLine) {
    const struct {
        const char *text;
        const char *fault;
    } cases[] = {
        {"price = 10\nprize = 3\n", "line 2: unknown name \"prize\""},
        {"price = 10\nprice = 12\n", "line 2: \"price\" given twice"},
        {"\n\npayment = monthly\n", "line 3: \"monthly\" is not a value of payment"},
        {"price 10\n", "line 1: not a line of the form name = value"},
        {"price = 10 EUR\n", "line 1: \"10 EUR\" is not a value of price"},
        {"price = nan\n", "line 1: \"nan\" is not a value of price"},
        {"price = -1\n", "the carbon price must be from 0 to 10000 EUR per t CO2e"},
        {"half_life.paper = 0\n", "the half-life of paper must be above 0 years"},
        {"buffer_share = 1\n", "the buffer share must be from 0 to below 1"},
        {"vintage_years = 0\n",
         "the first vintage and the years between vintages must be 1 or more"},
        {"cap_at_long_term_average = true\n",
         "line 1: \"true\" is not a value of cap_at_long_term_average"},
        {"first_vintage = 2.5\n", "line 1: \"2.5\" is not a value of first_vintage"},
    };
    for (const auto &c : cases) {
        const CarbonReading r = readCarbonText(c.text);
        EXPECT_FALSE(r.settings) << c.text;
        EXPECT_EQ(r.fault, c.fault) << c.text;
    }
}

} // namespace
} // namespace arbolex::carbon
