// The timber prices window's logic: the key filter of the price fields,
// accepting the user's prices, the option buttons, the red of negative prices,
// and what reaches the files at exit. Opening and closing the window are
// checked through its widgets (tests/ui/timberpriceswindow_test.cpp).
#include "mocks/programservices.hpp"
#include "shell/testfiles.hpp"
#include "workflow/mainwindowfixture.hpp"

#include "economics/assortpriceswindowlogic.hpp"
#include "economics/headlesstimberpricesview.hpp"
#include "economics/timberpricesmessages.hpp"
#include "economics/timberpriceswindowlogic.hpp"

#include <QSettings>

#include <cmath>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using economics::TimberPricesControl;
using economics::TimberPricesItem;

constexpr int kFirstUserField = 13;

TimberPricesItem priceField(int index) {
    return {TimberPricesControl::txtTimbVal, index};
}

/// The four lists with distinct prices; a few negative, as a file may hold them.
prices::PriceData samplePrices() {
    prices::PriceData data;
    for (int k = 0; k < prices::kPriceClassCount; ++k) {
        const auto i = static_cast<std::size_t>(k);
        data.current[i] = 10.0 + k;
        data.userDefined[i] = 20.0 + k;
        data.longTermAverage[i] = 30.0 + k;
        data.privateSector[i] = 40.0 + k;
    }
    data.current[3] = -3.5;
    data.privateSector[12] = -0.25;
    data.privatePeriod = {QStringLiteral("January 2025"), QStringLiteral("December 2025")};
    return data;
}

class TimberPricesLogicTest : public ::testing::Test, protected ProgramServices {
protected:
    TimberPricesLogicTest() {
        prices.data() = samplePrices();
        window.Form_Load();
    }

    QString field(int index) const { return view.text(priceField(index)); }
    QString commandCaption() const { return view.text({TimberPricesControl::cmdChangePrices, 0}); }

    economics::HeadlessTimberPricesView view;
    economics::TimberPricesWindowLogic window{prices, log, view};
};

// ---- Key filter ---------------------------------------------------------------------------

struct KeyCase {
    const char *name;
    bool changesAllowed;
    int field;
    const char *fieldText;
    char16_t key;
    bool accepted;
};

class TimberPricesKeyTest : public TimberPricesLogicTest,
                            public ::testing::WithParamInterface<KeyCase> {};

TEST_P(TimberPricesKeyTest, KeyFilter) {
    const KeyCase &c = GetParam();
    prices.setPriceChanges(c.changesAllowed);
    view.setText(priceField(c.field), QString::fromLatin1(c.fieldText));
    EXPECT_EQ(window.txtTimbVal_KeyPress(c.field, QChar(c.key)), c.accepted);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, TimberPricesKeyTest,
    ::testing::Values(
        // Without "Allow Changes" no field takes a key, not even the user's.
        KeyCase{"UserFieldWithoutChanges", false, 13, "4.00", u'5', false},
        KeyCase{"BackspaceWithoutChanges", false, 25, "4.00", u'\b', false},
        // The other lists never take a key.
        KeyCase{"LastCurrentField", true, 12, "", u'5', false},
        KeyCase{"FirstLongTermField", true, 26, "", u'5', false},
        KeyCase{"PrivateField", true, 39, "", u'\b', false},
        KeyCase{"LastPrivateField", true, 51, "", u'.', false},
        // The user's fields, with "Allow Changes".
        KeyCase{"Digit", true, 13, "", u'7', true},
        KeyCase{"DigitLastUserField", true, 25, "12", u'0', true},
        KeyCase{"Backspace", true, 20, "12.5", u'\b', true},
        KeyCase{"FirstPoint", true, 13, "12", u'.', true},
        KeyCase{"SecondPoint", true, 13, "1.2", u'.', false},
        KeyCase{"Minus", true, 13, "", u'-', false}, KeyCase{"Letter", true, 13, "", u'e', false},
        KeyCase{"Comma", true, 13, "1", u',', false}, KeyCase{"Blank", true, 13, "1", u' ', false}),
    [](const ::testing::TestParamInfo<KeyCase> &param) { return param.param.name; });

// ---- Allow and accept -----------------------------------------------------------------------

TEST_F(TimberPricesLogicTest, AcceptStoresTheUserFieldsAndAnEmptiedFieldAsZero) {
    EXPECT_EQ(commandCaption(), economics::text::allowChanges());
    EXPECT_FALSE(view.userPricesEditable());

    window.cmdChangePrices_Click();
    EXPECT_TRUE(prices.priceChanges());
    EXPECT_EQ(commandCaption(), economics::text::acceptChanges());
    EXPECT_TRUE(view.userPricesEditable());
    window.typeText(kFirstUserField, QStringLiteral("12.5"));
    window.typeText(kFirstUserField + 1, QString());
    window.typeText(kFirstUserField + 12, QStringLiteral(".75"));

    window.cmdChangePrices_Click();
    EXPECT_FALSE(prices.priceChanges());
    EXPECT_EQ(commandCaption(), economics::text::allowChanges());
    EXPECT_FALSE(view.userPricesEditable());
    EXPECT_EQ(field(kFirstUserField + 1), QStringLiteral("0"));
    EXPECT_EQ(field(kFirstUserField), QStringLiteral("12.5")) << "shown as typed";

    prices::PriceList expected = samplePrices().userDefined;
    expected[0] = 12.5;
    expected[1] = 0.0;
    expected[12] = 0.75;
    EXPECT_EQ(prices.data().userDefined, expected);
    EXPECT_EQ(prices.data().current, samplePrices().current) << "other lists untouched";
    EXPECT_EQ(prices.data().privateSector, samplePrices().privateSector);
}

TEST_F(TimberPricesLogicTest, AcceptedUserPricesInUseAreUsedAtOnce) {
    window.press(TimberPricesControl::OptUserPrices);
    window.press(TimberPricesControl::cmdChangePrices);
    window.typeText(kFirstUserField + 4, QStringLiteral("55"));
    window.press(TimberPricesControl::cmdChangePrices);
    EXPECT_EQ(prices.pricesInUse()[4], 55.0);
}

// ---- Option buttons ---------------------------------------------------------------------------

struct OptionCase {
    TimberPricesControl option;
    prices::PriceSet set;
};

class TimberPricesOptionTest : public TimberPricesLogicTest,
                               public ::testing::WithParamInterface<OptionCase> {};

TEST_P(TimberPricesOptionTest, ChoosesThePricesInUseAsAbsoluteValues) {
    const OptionCase &c = GetParam();
    // Start from another set, so the option's own choice is what is seen.
    window.press(c.set == prices::kUserPrices ? TimberPricesControl::OptNPVprices
                                              : TimberPricesControl::OptUserPrices);
    ASSERT_TRUE(window.press(c.option));

    EXPECT_EQ(prices.priceSetInUse(), c.set);
    const prices::PriceList &chosen = *prices.priceSet(c.set);
    for (std::size_t i = 0; i < chosen.size(); ++i) {
        EXPECT_EQ(prices.pricesInUse()[i], std::fabs(chosen[i])) << "class " << i;
    }
    for (const auto other :
         {TimberPricesControl::OptCurentPrices, TimberPricesControl::OptUserPrices,
          TimberPricesControl::OptNPVprices, TimberPricesControl::OptOvraPrices}) {
        EXPECT_EQ(view.isChecked(other), other == c.option);
    }
    // The window shows the same set checked when it opens again.
    window.show();
    EXPECT_TRUE(view.isChecked(c.option));
}

INSTANTIATE_TEST_SUITE_P(
    Options, TimberPricesOptionTest,
    ::testing::Values(OptionCase{TimberPricesControl::OptCurentPrices, prices::kCurrentPrices},
                      OptionCase{TimberPricesControl::OptUserPrices, prices::kUserPrices},
                      OptionCase{TimberPricesControl::OptNPVprices, prices::kLongTermPrices},
                      OptionCase{TimberPricesControl::OptOvraPrices, prices::kPrivatePrices}),
    [](const ::testing::TestParamInfo<OptionCase> &param) {
        return economics::controlName({param.param.option, 0}).toStdString();
    });

// ---- What the window shows --------------------------------------------------------------------

TEST_F(TimberPricesLogicTest, ShowsEveryListWithNegativePricesInRed) {
    EXPECT_EQ(field(3), QStringLiteral("-3.50"));
    EXPECT_TRUE(view.isNegative(3));
    EXPECT_EQ(field(51), QStringLiteral("-0.25"));
    EXPECT_TRUE(view.isNegative(51));
    EXPECT_EQ(field(13), QStringLiteral("20.00"));
    EXPECT_EQ(field(38), QStringLiteral("42.00"));
    int red = 0;
    for (int f = 0; f < economics::kPriceFieldCount; ++f) {
        red += view.isNegative(f) ? 1 : 0;
    }
    EXPECT_EQ(red, 2);
    // The private lists' period is the file's.
    EXPECT_EQ(view.text({TimberPricesControl::lblOVRA_TP, 0}),
              QStringLiteral("Average private sector standing roundwood prices (\u20ac / m3) for "
                             "the period\nJanuary 2025 to December 2025"));
}

TEST_F(TimberPricesLogicTest, AcceptingANegativeUserPriceOverTypedLeavesTheRed) {
    prices.data().userDefined[2] = -1.0;
    window.show();
    ASSERT_TRUE(view.isNegative(kFirstUserField + 2));
    window.cmdChangePrices_Click();
    window.typeText(kFirstUserField + 2, QStringLiteral("3"));
    window.cmdChangePrices_Click();
    EXPECT_FALSE(view.isNegative(kFirstUserField + 2));
    EXPECT_EQ(prices.data().userDefined[2], 3.0);
}

TEST(TimberPricesControlNames, ArraysCarryTheirIndexWithinBounds) {
    using economics::timberPricesItemFromName;
    EXPECT_EQ(timberPricesItemFromName(QStringLiteral("txtTimbVal(51)")), priceField(51));
    EXPECT_EQ(timberPricesItemFromName(QStringLiteral("OptOvraPrices")),
              TimberPricesItem{TimberPricesControl::OptOvraPrices});
    for (const char *wrong :
         {"txtTimbVal(52)", "txtTimbVal(-1)", "txtTimbVal", "lblTimbCat(13)", "fraTimbPrice(4)",
          "OptUserPrices(0)", "txtTimbVal(1", "txtTimbVal()", "optUserPrices"}) {
        EXPECT_FALSE(timberPricesItemFromName(QLatin1String(wrong))) << wrong;
    }
    EXPECT_EQ(economics::controlName(priceField(7)), QStringLiteral("txtTimbVal(7)"));
}

// ---- With the main window -----------------------------------------------------------------------

class TimberPricesMainTest : public MainWindowTest {
protected:
    TimberPricesMainTest() {
        copyShippedData(dir.path());
        logic.Form_Load(settings, QRect(0, 0, 1280, 800));
    }

    QString file(const char *name) const { return QDir(dir.path()).filePath(QLatin1String(name)); }

    QSettings settings{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    economics::TimberPricesWindowLogic &window = session.timberPrices();
};

TEST_F(TimberPricesMainTest, AnEditWrittenAtExitNeverTheAssociationsPrices) {
    const QByteArray privateBefore = readBytes(file("OVRA_PRIC.qdm"));
    logic.cmdShowTimberPrice_Click();
    window.cmdChangePrices_Click();
    window.typeText(kFirstUserField, QStringLiteral("12.5"));
    window.typeText(kFirstUserField + 1, QString());
    window.typeText(40, QStringLiteral("1")); // a private-sector field: refused
    window.cmdChangePrices_Click();
    writeBytes(file("OVRA_PRIC.qdm"), privateBefore + "tampered");
    // The assortment prices, opened from this window, are written too.
    window.press(TimberPricesControl::cmdAssortPrices);
    economics::AssortPricesWindowLogic &assort = session.assortPrices();
    assort.cmdChangeAsmtPrices_Click();
    assort.typeText(2, QStringLiteral("55"));
    assort.cmdChangeAsmtPrices_Click();

    logic.Form_Unload(settings);
    EXPECT_EQ(readBytes(file("AssortPrices.qdm")), QByteArray("10\r\n28\r\n55\r\n"));
    EXPECT_EQ(readBytes(file("USRPRIC.qdm")),
              QByteArray("12.5\r\n0\r\n12\r\n16\r\n20\r\n24\r\n28\r\n32\r\n36\r\n40\r\n44\r\n48\r\n"
                         "52\r\n"));
    EXPECT_EQ(readBytes(file("OVRA_PRIC.qdm")), privateBefore + "tampered");
    EXPECT_TRUE(logLines().isEmpty());
}

} // namespace
} // namespace arbolex::testing
