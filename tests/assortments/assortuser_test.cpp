// The user categories window: its fields, the switch, and the refusals that
// name the category and change nothing.
#include "assortfixture.hpp"

#include "assortments/assortmessages.hpp"

namespace arbolex::testing {
namespace {

namespace at = assortments::text;

TEST_F(AssortTest, CategoriesWindowEditsTheCategories) {
    user.mnuAssortUser_Click();
    ASSERT_TRUE(userView.isShown());
    EXPECT_EQ(userView.text(AssortUserControl::txtName, 4), QStringLiteral("Stakes"));
    EXPECT_EQ(userView.text(AssortUserControl::txtSmall, 4), QStringLiteral("8"));
    user.typeText(AssortUserControl::txtName, 4, QStringLiteral("Fencing, round"));
    user.typeText(AssortUserControl::txtBig, 4, QStringLiteral("13"));
    user.press(AssortUserControl::chkUse, 4);
    user.press(AssortUserControl::cmdOK, 0);
    ASSERT_TRUE(interactive.messages.isEmpty());
    EXPECT_FALSE(userView.isShown());
    const prices::UserCategory &c = prices.data().categories[3];
    EXPECT_EQ(c.name, QStringLiteral("Fencing, round"));
    EXPECT_EQ(c.bigEnd, 13.0f);
    EXPECT_TRUE(c.inUse);
    EXPECT_FALSE(assort.session().userCategories);

    // Cancel keeps what was there.
    user.mnuAssortUser_Click();
    user.typeText(AssortUserControl::txtName, 4, QStringLiteral("Other"));
    user.press(AssortUserControl::chkUserCategories, 0);
    user.press(AssortUserControl::cmdCancel, 0);
    EXPECT_EQ(prices.data().categories[3].name, QStringLiteral("Fencing, round"));
    EXPECT_FALSE(assort.session().userCategories);
}

struct BadBounds {
    const char *name;
    const char *small;
    const char *big;
    AssortUserControl focus;
    QString (*why)();
};

class CategoryRefusalTest : public AssortTest, public ::testing::WithParamInterface<BadBounds> {};

TEST_P(CategoryRefusalTest, NamesTheCategoryAndChangesNothing) {
    const BadBounds &b = GetParam();
    const auto before = prices.data().categories;
    user.mnuAssortUser_Click();
    user.typeText(AssortUserControl::txtSmall, 2, QLatin1String(b.small));
    user.typeText(AssortUserControl::txtBig, 2, QLatin1String(b.big));
    user.press(AssortUserControl::chkUserCategories, 0);
    user.cmdOK_Click();
    ASSERT_EQ(interactive.messages.size(), 1);
    EXPECT_EQ(interactive.messages[0].text,
              QStringLiteral("FAULT - Category 2 (Pallet): ") + b.why());
    EXPECT_TRUE(userView.isShown());
    EXPECT_EQ(userView.focused().control, b.focus);
    EXPECT_EQ(userView.focused().index, 2);
    for (std::size_t i = 0; i < before.size(); ++i) {
        EXPECT_EQ(prices.data().categories[i].smallEnd, before[i].smallEnd);
        EXPECT_EQ(prices.data().categories[i].bigEnd, before[i].bigEnd);
    }
    EXPECT_FALSE(assort.session().userCategories);
}

INSTANTIATE_TEST_SUITE_P(
    Refusals, CategoryRefusalTest,
    ::testing::Values(
        BadBounds{"BigEndNotAbove", "14", "14", AssortUserControl::txtBig, &at::bigEndNotAbove},
        BadBounds{"Negative", "14", "-20", AssortUserControl::txtBig, &at::negativeDiameter},
        BadBounds{"SmallEndUnder7", "6", "20", AssortUserControl::txtSmall, &at::smallEndUnder7},
        BadBounds{"NotANumber", "x", "20", AssortUserControl::txtSmall, &at::notANumber}),
    [](const auto &test) { return std::string(test.param.name); });

TEST_F(AssortTest, OpenEndedAndOverlappingCategoriesAreAccepted) {
    user.mnuAssortUser_Click();
    user.typeText(AssortUserControl::txtBig, 2, QStringLiteral("0"));
    user.typeText(AssortUserControl::txtSmall, 5, QStringLiteral("10"));
    user.cmdOK_Click();
    EXPECT_TRUE(interactive.messages.isEmpty());
    EXPECT_EQ(prices.data().categories[1].bigEnd, 0.0f);
    EXPECT_EQ(prices.data().categories[4].smallEnd, 10.0f);
}

} // namespace
} // namespace arbolex::testing
