// Prescribing and previewing a thinning: the main window's refusals, the
// field checks, and the four methods.
#include "thinningfixture.hpp"

#include "thinning/thinmessages.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::testing {
namespace {

namespace tt = thinning::text;

TEST_F(ThinningTest, OnlyTheLastSingleGrowthRowMayBeThinned) {
    logic.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1) << "an empty table";
    EXPECT_EQ(interactive.messages[0].text, tt::growthRowRequired());

    growTo(QStringLiteral("40"));
    interactive.messages.clear();
    logic.select(3, 3);
    logic.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].title, workflow::text::titleArbolexYeld());
    EXPECT_EQ(
        interactive.messages[0].text,
        QStringLiteral("A Sub-Compartment of 40 years of age \r\ncannot be thinned at age 25"));
    EXPECT_EQ(logic.table().currentRow(), logic.table().lastRow()) << "moved to the last row";

    logic.select(5, 6);
    logic.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 2);
    EXPECT_EQ(interactive.messages[1].text,
              QStringLiteral(
                  "FAULT - Thinning requires selection of a \n\rsingle Growth Projection row."));
    EXPECT_FALSE(thinView.isShown());

    logic.select(6, 6);
    logic.cmdThin_Click();
    EXPECT_TRUE(thinView.isShown());
    EXPECT_EQ(thinView.caption(),
              workflow::text::titleArbolexYeld() + QStringLiteral("      Thinning at age 40"));
    EXPECT_TRUE(interactive.questions.isEmpty()) << "no loop offer before the first thinning";
}

struct FieldFault {
    const char *name;
    ThinControl control;
    const char *value;
    QString message;
};

class ThinFieldTest : public ThinningTest, public ::testing::WithParamInterface<FieldFault> {};

TEST_P(ThinFieldTest, RefusesAndKeepsTheTable) {
    openThinning();
    const int rows = logic.table().rowCount();
    thinView.setText(GetParam().control, QLatin1String(GetParam().value));
    thin.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, GetParam().message);
    EXPECT_EQ(thinView.focused(), GetParam().control);
    EXPECT_FALSE(thin.work().previewed);
    EXPECT_TRUE(thinView.text(ThinControl::lblPostD).isEmpty()) << "nothing previewed";
    EXPECT_EQ(logic.table().rowCount(), rows);
}

// clang-format off
INSTANTIATE_TEST_SUITE_P(Faults, ThinFieldTest, ::testing::Values(
    FieldFault{"RemBText", ThinControl::txtRemB, "1.2.3", tt::remBNonNumeric()},
    FieldFault{"RemNText", ThinControl::txtRemN, "a", tt::remNNonNumeric()},
    FieldFault{"RemVText", ThinControl::txtRemV, "-", tt::remVNonNumeric()},
    FieldFault{"PostBText", ThinControl::txtPostB, "x", tt::postBNonNumeric()},
    FieldFault{"PostNText", ThinControl::txtPostN, "..", tt::postNNonNumeric()},
    FieldFault{"PostVText", ThinControl::txtPostV, "v", tt::postVNonNumeric()},
    FieldFault{"PostBZero", ThinControl::txtPostB, "0", tt::postBNotPositive()},
    FieldFault{"PostNZero", ThinControl::txtPostN, "0", tt::postNNotPositive()},
    FieldFault{"PostVZero", ThinControl::txtPostV, "0", tt::postVNotPositive()},
    FieldFault{"RemoveAllBasalArea", ThinControl::txtRemB, "999", tt::removalLeavesNoBasalArea()},
    FieldFault{"RemoveAllStocking", ThinControl::txtRemN, "99999", tt::removalLeavesNoStocking()},
    FieldFault{"RemoveAllVolume", ThinControl::txtRemV, "99999", tt::removalLeavesNoVolume()}),
    [](const auto &test) { return std::string(test.param.name); });
// clang-format on

TEST_F(ThinningTest, NothingPrescribedExplainsTheFourMethods) {
    openThinning();
    thin.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, tt::howToPrescribe());
    EXPECT_TRUE(interactive.messages[0].text.contains(QStringLiteral("by:\n\r\n1) ")));
    EXPECT_EQ(thinView.focused(), ThinControl::txtRemB);
}

TEST_F(ThinningTest, RackThinningKeepsTheMeanTree) {
    openThinning();
    const float preB = thin.work().preBasalArea;
    const float preN = thin.work().preStocking;
    thinView.setText(ThinControl::txtPostB, shell::generalNumber(preB * 0.7));
    thinView.setText(ThinControl::txtPostN, shell::generalNumber(preN * 0.7));
    thin.cmdThin_Click();
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_EQ(thin.work().postVolume, thin.work().preVolume * (thin.work().postBasalArea / preB));
    EXPECT_EQ(thinView.text(ThinControl::lblRemMV), thinView.text(ThinControl::lblPreMV));
}

TEST_F(ThinningTest, EachMethodSolvesTheOtherQuantity) {
    openThinning();
    const thinning::ThinningWork pre = thin.work();

    // Basal area only: stocking from the thinning response.
    typeThin(ThinControl::txtRemB, QStringLiteral("10"));
    thin.cmdThin_Click();
    EXPECT_FLOAT_EQ(thin.work().postBasalArea, pre.preBasalArea - 10.0f);
    EXPECT_EQ(thin.work().postStocking, grow.NRES(pre.topHeight, pre.preStocking, pre.preBasalArea,
                                                  thin.work().postBasalArea));
    EXPECT_EQ(thin.work().postVolume,
              grow.GetV7(thin.work().postBasalArea, thin.work().postStocking, pre.topHeight));

    // Stocking only: basal area from the response. The removal beats a post value.
    thin.resetFields();
    typeThin(ThinControl::txtRemN, QStringLiteral("500"));
    typeThin(ThinControl::txtPostN, QStringLiteral("100"));
    thin.cmdThin_Click();
    EXPECT_FLOAT_EQ(thin.work().postStocking, pre.preStocking - 500.0f);
    EXPECT_EQ(thin.work().postBasalArea,
              static_cast<float>(grow.BRES(pre.topHeight, pre.preStocking, pre.preBasalArea,
                                           thin.work().postStocking)));

    // Volume only: the shown post volume is the one typed.
    thin.resetFields();
    typeThin(ThinControl::txtPostV, QStringLiteral("250"));
    thin.cmdThin_Click();
    EXPECT_EQ(thinView.text(ThinControl::txtPostV), QStringLiteral("250.00"));
    EXPECT_NEAR(grow.GetV7(thin.work().postBasalArea, thin.work().postStocking, pre.topHeight),
                250.0, 0.5);
    EXPECT_LT(thin.work().postStocking, pre.preStocking);
    EXPECT_TRUE(interactive.messages.isEmpty());
    EXPECT_TRUE(thinView.isEnabled(ThinControl::cmdAccept));
}

TEST_F(ThinningTest, ModelWithoutResponseNeedsBothReductions) {
    logic.mnuModel_Click(20); // labelled thinned, but no thinning response
    openThinning();
    typeThin(ThinControl::txtRemB, QStringLiteral("5"));
    thin.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text, tt::noThinningResponse());
    typeThin(ThinControl::txtRemN, QStringLiteral("300"));
    thin.cmdThin_Click();
    EXPECT_EQ(interactive.messages.size(), 1);
    EXPECT_TRUE(thin.work().previewed);
}

TEST_F(ThinningTest, UnreachableVolumeGivesOnlyTheEngineMessage) {
    openThinning();
    typeThin(ThinControl::txtPostV, QStringLiteral("0.001"));
    thin.cmdThin_Click();
    ASSERT_EQ(interactive.messages.size(), 1) << "one message, from the engine";
    EXPECT_TRUE(interactive.messages[0].text.startsWith(QStringLiteral("ERROR - ")))
        << interactive.messages[0].text.toStdString();
    EXPECT_FALSE(thin.work().previewed);
    EXPECT_TRUE(thinView.text(ThinControl::lblPostD).isEmpty());
}

} // namespace
} // namespace arbolex::testing
