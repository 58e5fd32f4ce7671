// The running sums of the removals that the total production reads.
#include "work/projectiontable.hpp"

#include <gtest/gtest.h>

namespace arbolex::workflow {
namespace {

work::TableRow removing(float volume) {
    work::TableRow row;
    row.record.removedVolume = volume;
    row.record.removedStocking = volume * 10.0f;
    return row;
}

TEST(ProjectionTableTest, RemovalSumsFollowEveryChangeOfTheRows) {
    work::ProjectionTable table;
    for (const float volume : {0.0f, 40.0f, 0.0f, 35.5f}) {
        table.append(removing(volume));
    }
    EXPECT_EQ(table.removalsUpTo(4).volume, 75.5);
    EXPECT_EQ(table.removalsUpTo(2).volume, 40.0);
    EXPECT_EQ(table.removalsUpTo(99).stocking, 755.0) << "past the end: the whole table";

    table.row(2).record.removedVolume = 10.0f; // a row changed after it was summed
    EXPECT_EQ(table.removalsUpTo(4).volume, 45.5);

    table.removeFrom(4);
    table.append(removing(1.0f));
    EXPECT_EQ(table.removalsUpTo(4).volume, 11.0) << "a removed row is not summed";

    table.clear(work::HeaderLayout::WithMoney);
    EXPECT_EQ(table.removalsUpTo(4).volume, 0.0);
    table.append(removing(2.0f));
    EXPECT_EQ(table.removalsUpTo(1).volume, 2.0);
}

} // namespace
} // namespace arbolex::workflow
