// The regime read back from the thinning rows of the projection table.
#include "economics/tableregime.hpp"
#include "work/projectiontable.hpp"

#include <gtest/gtest.h>

#include <optional>
#include <vector>

namespace arbolex::testing {
namespace {

struct Thinning {
    int age;
    float volume;
};

struct Case {
    const char *name;
    std::vector<Thinning> thinnings;
    std::optional<int> finalCut;
    int thinFrom;
    int thinEvery;
    int thinUntil;
    float thinVolume;
    bool irregular;
};

/// A table grown from 15: a growth row before each thinning row, then the
/// final cut.
work::ProjectionTable tableOf(const Case &c) {
    work::ProjectionTable table;
    const auto append = [&](int age, work::RowKind kind, float removed, bool felled) {
        work::TableRow row;
        row.kind = kind;
        row.record.age = static_cast<float>(age);
        row.record.removedVolume = removed;
        row.finalCut = felled;
        table.append(row);
    };
    append(15, work::RowKind::Growth, 0.0f, false);
    for (const Thinning &t : c.thinnings) {
        append(t.age, work::RowKind::Growth, 0.0f, false);
        append(t.age, work::RowKind::Thinning, t.volume, false);
    }
    if (c.finalCut) {
        append(*c.finalCut, work::RowKind::Growth, 0.0f, true);
    }
    return table;
}

class TableRegimeTest : public ::testing::TestWithParam<Case> {};

TEST_P(TableRegimeTest, ThinningRowsGiveTheRegime) {
    const Case &c = GetParam();
    const economics::TableRegime read = economics::regimeFromTable(tableOf(c));
    EXPECT_EQ(read.finalCut, c.finalCut);
    EXPECT_EQ(read.regime.thinFrom, c.thinFrom);
    if (c.thinFrom == 0) {
        EXPECT_FALSE(read.regime.thins());
        return;
    }
    EXPECT_EQ(read.regime.thinEvery, c.thinEvery);
    EXPECT_EQ(read.regime.thinUntil, c.thinUntil);
    EXPECT_EQ(read.regime.thinVolume, c.thinVolume);
    EXPECT_EQ(read.irregular, c.irregular);
    EXPECT_EQ(economics::irregularNote(read).isEmpty(), !c.irregular);
}

INSTANTIATE_TEST_SUITE_P(
    Regimes, TableRegimeTest,
    ::testing::Values(
        Case{"NoThinning", {}, 50, 0, 0, 0, 0.0f, false},
        Case{"OneThinning", {{20, 40.0f}}, 50, 20, 1, 20, 40.0f, false},
        // The volume method leaves a typed removal up to rounding.
        Case{"Regular",
             {{20, 39.99998f}, {25, 40.00003f}, {30, 40.0f}},
             45,
             20,
             5,
             30,
             40.0f,
             false},
        Case{"UnevenIntervals",
             {{20, 40.0f}, {25, 40.0f}, {32, 40.0f}},
             std::nullopt,
             20,
             6,
             32,
             40.0f,
             true},
        Case{"UnevenVolumes", {{20, 30.0f}, {25, 50.0f}, {30, 40.0f}}, 45, 20, 5, 30, 40.0f, true},
        // A thinning in the year of the final cut belongs to the final cut.
        Case{"ThinningAtTheFinalCut",
             {{20, 40.0f}, {25, 40.0f}, {30, 40.0f}},
             30,
             20,
             5,
             25,
             40.0f,
             false}),
    [](const ::testing::TestParamInfo<Case> &param) { return std::string(param.param.name); });

TEST(TableStandTest, FirstGrowthRowIsTheStand) {
    work::ProjectionTable table;
    EXPECT_FALSE(economics::standFromTable(table, 0));
    work::TableRow first;
    first.record = {15.0f, 7.0f, 20.0f, 2500.0f, 44.0f, 10.1f, 0.0f, 0.0f, 0.0f, 0.0f};
    table.append(first);
    const auto stand = economics::standFromTable(table, 3);
    ASSERT_TRUE(stand);
    EXPECT_EQ(stand->model, 3);
    EXPECT_EQ(stand->age, 15.0f);
    EXPECT_EQ(stand->stocking, 2500.0f);
    EXPECT_EQ(stand->height, 7.0f);
    EXPECT_EQ(stand->basalArea, 20.0f);
}

} // namespace
} // namespace arbolex::testing
