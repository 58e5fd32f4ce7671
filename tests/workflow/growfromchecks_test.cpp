// The grow-from checks: order, messages, styles and focus; BA/DBH completion;
// the key filter and the site index shown on leaving a field.
#include "mainwindowfixture.hpp"

#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

namespace text = workflow::text;

struct CheckCase {
    const char *name;
    MainControl control; ///< field changed from the valid stand
    const char *value;   ///< set directly, bypassing the key filter
    QString expected;    ///< message text
    int style;
    MainControl focus;
};

class GrowFromCheckTest : public MainWindowTest, public ::testing::WithParamInterface<CheckCase> {};

TEST_P(GrowFromCheckTest, RefusesWithItsMessageAndFocus) {
    const CheckCase &c = GetParam();
    typeStand();
    logic.fields().fieldEdited(c.control, QLatin1String(c.value));
    if (c.control == MainControl::txtFromB) {
        logic.fields().fieldEdited(MainControl::txtFromD, QString());
    }
    logic.cmdGrow_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, c.expected);
    EXPECT_EQ(interactive.messages[0].style, c.style);
    EXPECT_EQ(interactive.messages[0].title,
              c.style == 48 ? text::titleOstran() : text::titleArbolex());
    EXPECT_EQ(view.focused(), c.focus);
    EXPECT_TRUE(logic.table().empty());
    EXPECT_EQ(view.text(c.control), QLatin1String(c.value)) << "the typed value is kept";
}

// clang-format off
INSTANTIATE_TEST_SUITE_P(Faults, GrowFromCheckTest, ::testing::Values(
    CheckCase{"AgeEmpty", MainControl::txtFromA, "", text::faultFromAge(), 48, MainControl::txtFromA},
    CheckCase{"StockingText", MainControl::txtFromN, "abc", text::faultFromStocking(), 48, MainControl::txtFromN},
    CheckCase{"HeightDots", MainControl::txtFromH, "1.2.3", text::faultFromHeight(), 48, MainControl::txtFromH},
    CheckCase{"NoBasalAreaNorDbh", MainControl::txtFromB, "", text::faultFromBasalAreaOrDbh(), 48, MainControl::txtFromB},
    CheckCase{"TargetEmpty", MainControl::txtToA, "", text::faultToAge(), 48, MainControl::txtToA},
    CheckCase{"StepEmpty", MainControl::txtByA, "", text::faultByStep(), 48, MainControl::txtByA},
    CheckCase{"StepZero", MainControl::txtByA, "0", text::faultByStep(), 48, MainControl::txtByA},
    CheckCase{"StepBeyondSpan", MainControl::txtByA, "36", text::faultByStep(), 48, MainControl::txtByA},
    CheckCase{"AgeBelow", MainControl::txtFromA, "9.9", text::rangeAge(), 49, MainControl::txtFromA},
    CheckCase{"AgeAbove", MainControl::txtFromA, "60.1", text::rangeAge(), 49, MainControl::txtFromA},
    CheckCase{"StockingBelow", MainControl::txtFromN, "99", text::rangeStocking(), 49, MainControl::txtFromN},
    CheckCase{"StockingAbove", MainControl::txtFromN, "5001", text::rangeStocking(), 49, MainControl::txtFromN},
    CheckCase{"HeightBelow", MainControl::txtFromH, "4.9", text::rangeHeightLead() + QStringLiteral("49.35]"), 49, MainControl::txtFromH},
    CheckCase{"HeightAboveAsymptote", MainControl::txtFromH, "49.4", text::rangeHeightLead() + QStringLiteral("49.35]"), 49, MainControl::txtFromH},
    CheckCase{"BasalAreaBelow", MainControl::txtFromB, "9.99", text::rangeBasalArea(), 49, MainControl::txtFromB},
    CheckCase{"TargetAbove", MainControl::txtToA, "61", text::rangeToAgeLead() + QStringLiteral("60]"), 49, MainControl::txtToA}),
    [](const auto &test) { return std::string(test.param.name); });
// clang-format on

TEST_F(MainWindowTest, RangeBoundsAreInclusive) {
    for (const auto &[age, stocking] : {std::pair{"10", "100"}, std::pair{"60", "5000"}}) {
        typeStand(QStringLiteral("60"), QStringLiteral("0.1"));
        logic.fields().fieldEdited(MainControl::txtFromA, QLatin1String(age));
        logic.fields().fieldEdited(MainControl::txtFromN, QLatin1String(stocking));
        EXPECT_TRUE(logic.fields().ChkGrowFromFlds());
        EXPECT_TRUE(logic.fields().ChkGrowFromBnds()) << age << " " << stocking;
    }
    EXPECT_TRUE(interactive.messages.isEmpty());
}

TEST_F(MainWindowTest, LodgepoleUnthinnedStopsAtAge58) {
    logic.mnuModel_Click(7);
    typeStand(QStringLiteral("59"));
    type(MainControl::txtFromH, QStringLiteral("6"));
    EXPECT_FALSE(logic.fields().ChkGrowFromBnds());
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, text::rangeToAgeLead() + QStringLiteral("58]"));
}

TEST_F(MainWindowTest, BasalAreaAndDbhCompleteEachOther) {
    type(MainControl::txtFromN, QStringLiteral("2500"));
    type(MainControl::txtFromB, QStringLiteral("20"));
    ASSERT_TRUE(logic.fields().ChkGrowFromBD());
    EXPECT_EQ(view.text(MainControl::txtFromD), QStringLiteral("10.1"));

    logic.fields().fieldEdited(MainControl::txtFromB, QString());
    type(MainControl::txtFromD, QStringLiteral("12"));
    ASSERT_TRUE(logic.fields().ChkGrowFromBD());
    EXPECT_EQ(view.text(MainControl::txtFromB), QStringLiteral("28.27"));

    // Both typed: the basal area wins and the DBH is derived again.
    type(MainControl::txtFromB, QStringLiteral("20"));
    type(MainControl::txtFromD, QStringLiteral("30"));
    ASSERT_TRUE(logic.fields().ChkGrowFromBD());
    EXPECT_EQ(view.text(MainControl::txtFromD), QStringLiteral("10.1"));

    // A stocking of 0 counts as one stem: DBH = 200·√(BA/π).
    type(MainControl::txtFromN, QStringLiteral("0"));
    logic.fields().fieldEdited(MainControl::txtFromD, QString());
    ASSERT_TRUE(logic.fields().ChkGrowFromBD());
    EXPECT_EQ(view.text(MainControl::txtFromD), QStringLiteral("504.6"));

    // Neither given: nothing changes and the check still succeeds.
    logic.fields().fieldEdited(MainControl::txtFromB, QString());
    logic.fields().fieldEdited(MainControl::txtFromD, QString());
    EXPECT_TRUE(logic.fields().ChkGrowFromBD());
    EXPECT_TRUE(view.text(MainControl::txtFromB).isEmpty());
}

TEST_F(MainWindowTest, KeyFilterAndSiteIndexOnLeavingAField) {
    type(MainControl::txtFromA, QStringLiteral("3a0-"));
    EXPECT_EQ(view.text(MainControl::txtFromA), QStringLiteral("30"));
    EXPECT_TRUE(view.text(MainControl::lblSI).isEmpty()) << "no height yet";
    type(MainControl::txtFromH, QStringLiteral("16.5"));
    EXPECT_EQ(view.text(MainControl::lblSI), QStringLiteral("16.5")) << "SI at 30 is H";

    type(MainControl::txtFromH, QStringLiteral("49.5"));
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, text::maximumHeight());
    EXPECT_EQ(view.focused(), MainControl::txtFromH);
    EXPECT_EQ(view.text(MainControl::txtFromH), QStringLiteral("49.5"));
    EXPECT_EQ(view.text(MainControl::lblSI), QStringLiteral("16.5"));
}

} // namespace
} // namespace arbolex::testing
