// Price lookup by mean tree volume: class bounds read from the captions, the
// gaps between them, a caption that does not convert, and the prices in use.
#include "mocks/fakeinteractive.hpp"

#include "prices/pricelookup.hpp"
#include "prices/prices.hpp"
#include "rotation/priceclasses.hpp"

#include <gtest/gtest.h>

namespace arbolex::economics {
using prices::priceClassOf;
namespace {

/// Current price of class i is 100 + i, so a price names its class.
prices::PriceList classPrices() {
    prices::PriceList prices{};
    for (std::size_t i = 0; i < prices.size(); ++i) {
        prices[i] = 100.0 + double(i);
    }
    return prices;
}

TEST(PriceLookupTest, ClassOfMeanTreeVolume) {
    const struct {
        double volume;
        int priceClass;
    } cases[] = {{0.074, 0},
                 {0.0, 0},
                 {-1.0, 0},
                 {0.075, 1},
                 {0.124, 1},
                 {0.125, 2},
                 {0.424, 5},
                 {0.425, 6},
                 {0.65, 8},
                 {0.999, 11},
                 {1.0, 12},
                 {5.0, 12},
                 // the 0.001 gaps between classes fall through to the top class
                 {0.0745, 12},
                 {0.4245, 12},
                 {0.9995, 12}};
    testing::FakeInteractive ui;
    const QLocale english(QLocale::English, QLocale::UnitedStates);
    for (const auto &c : cases) {
        EXPECT_EQ(prices::TrouveIndicePrix(c.volume, classPrices(), ui, english),
                  100.0 + c.priceClass)
            << c.volume;
        EXPECT_EQ(priceClassOf(c.volume, ui, english), c.priceClass) << c.volume;
        EXPECT_EQ(rotation::priceClassOf(c.volume), c.priceClass) << c.volume;
    }
    EXPECT_TRUE(ui.messages.isEmpty());

    // captions do not convert under a decimal comma: message, nothing found
    const QLocale german(QLocale::German, QLocale::Germany);
    EXPECT_EQ(prices::TrouveIndicePrix(0.5, classPrices(), ui, german), 0.0);
    EXPECT_EQ(priceClassOf(0.5, ui, german), 0);
    ASSERT_EQ(ui.messages.size(), 2);
    EXPECT_EQ(ui.messages[0].text, QStringLiteral("Error 13  Type mismatch in line 10 in "
                                                  "procedure TrouveIndicePrix of Feuille frmMain"));
}

TEST(PriceLookupTest, RotationsClassEveryVolumeAsTheWindowsDo) {
    // Every volume to the half litre, bounds, gaps and beyond, under a locale
    // that reads the captions and under one that does not: a rotation reads
    // the captions without a locale.
    testing::FakeInteractive ui;
    const QLocale english(QLocale::English, QLocale::UnitedStates);
    const QLocale german(QLocale::German, QLocale::Germany);
    for (int halfLitres = -2; halfLitres <= 2400; ++halfLitres) {
        const double volume = halfLitres * 0.0005;
        EXPECT_EQ(rotation::priceClassOf(volume), priceClassOf(volume, ui, english)) << volume;
    }
    EXPECT_EQ(rotation::priceClassOf(0.5), 7);
    EXPECT_EQ(priceClassOf(0.5, ui, german), 0);
}

TEST(PriceLookupTest, PricesInUseAreAbsoluteButTheLookupKeepsTheSign) {
    prices::Prices prices;
    prices.data().current = classPrices();
    prices.data().current[3] = -7.5;
    prices.data().privateSector.fill(-20.0);
    prices.selectPriceSet(prices::kCurrentPrices);
    EXPECT_EQ(prices.pricesInUse()[3], 7.5);

    prices.selectPriceSet(prices::kPrivatePrices);
    prices.selectPriceSet(4); // not a set: nothing changes
    EXPECT_EQ(prices.priceSetInUse(), prices::kPrivatePrices);
    EXPECT_EQ(prices.pricesInUse()[3], 20.0);
    testing::FakeInteractive ui;
    EXPECT_EQ(prices::TrouveIndicePrix(0.2, prices.data().current, ui, QLocale::c()), -7.5);
}

} // namespace
} // namespace arbolex::economics
