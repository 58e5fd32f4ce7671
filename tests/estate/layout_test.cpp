// Columns found by name in any order; the others carried in table order.
#include "estate/layout.hpp"

#include "estatefixture.hpp"

#include <gtest/gtest.h>

namespace arbolex::estate {
namespace {

TEST(EstateLayoutTest, FindsColumnsByNameAndCarriesTheOthersInOrder) {
    const Layout layout = testing::testLayout();
    EXPECT_EQ(layout.at(Column::kAreaHa), 0);
    EXPECT_EQ(layout.at(Column::kModel), 2);
    EXPECT_EQ(layout.at(Column::kRotation), 14);
    EXPECT_EQ(layout.carried, (std::vector<int>{1, 13}));
    EXPECT_EQ(layout.carriedNames, (std::vector<std::string>{"owner", "note"}));
}

TEST(EstateLayoutTest, MatchesShapefileNamesCutToTenCharactersInAnyCase) {
    std::string problem;
    const auto layout = layoutOf({"ID", "Model", "AGE", "STOCKING", "TOP_HEIGHT", "DBH", "AREA_HA",
                                  "THIN_VOLUM", "thin_volu"},
                                 problem);
    ASSERT_TRUE(layout.has_value()) << problem;
    EXPECT_EQ(layout->at(Column::kThinVolume), 7);
    EXPECT_FALSE(layout->has(Column::kBasalArea));
    // A shorter cut is someone else's column.
    EXPECT_EQ(layout->carriedNames, (std::vector<std::string>{"thin_volu"}));
}

TEST(EstateLayoutTest, RefusesATableWithoutAColumnItNeedsOrWithOneTwice) {
    std::string problem;
    EXPECT_FALSE(layoutOf({"id", "model", "age", "stocking", "top_height", "dbh"}, problem));
    EXPECT_EQ(problem, "the input has no column \"area_ha\"");
    EXPECT_FALSE(layoutOf({"id", "model", "age", "stocking", "top_height", "area_ha"}, problem));
    EXPECT_EQ(problem, "the input has neither a column \"basal_area\" nor \"dbh\"");
    EXPECT_FALSE(layoutOf({"id", "model", "age", "Age", "stocking", "top_height", "dbh", "area_ha"},
                          problem));
    EXPECT_EQ(problem, "the column \"age\" is given twice");
}

} // namespace
} // namespace arbolex::estate
