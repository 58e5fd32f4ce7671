// The grid's item model over the projection table: appended rows arrive as
// inserted rows, a cleared table resets the model, and thinning rows stand
// out from growth rows. Separators stay blank: mainwindow_test.cpp.
#include "ui/projectionmodel.hpp"

#include <QBrush>

#include <gtest/gtest.h>

namespace arbolex::testing {
namespace {

using work::ProjectionTable;
using work::RowKind;
using work::TableRow;

TableRow rowOf(RowKind kind, const QString &age) {
    TableRow row;
    row.kind = kind;
    row.cells = QStringList(work::kColumnCount, QString());
    row.cells[work::kColAge] = age;
    return row;
}

struct Signals {
    int resets = 0;
    int insertedFirst = -1;
    int insertedLast = -1;
};

void listen(ui::ProjectionModel &model, Signals &seen) {
    QObject::connect(&model, &QAbstractItemModel::modelReset, [&seen] { ++seen.resets; });
    QObject::connect(&model, &QAbstractItemModel::rowsInserted,
                     [&seen](const QModelIndex &, int first, int last) {
                         seen.insertedFirst = first;
                         seen.insertedLast = last;
                     });
}

TEST(ProjectionModelTest, AppendedRowsAreInsertedAndClearingResets) {
    ProjectionTable table;
    table.append(rowOf(RowKind::Growth, QStringLiteral("15")));
    ui::ProjectionModel model(table);
    Signals seen;
    listen(model, seen);

    // The model reports what it told its views until it is refreshed.
    table.append(rowOf(RowKind::Growth, QStringLiteral("20")));
    table.append(rowOf(RowKind::Growth, QStringLiteral("25")));
    EXPECT_EQ(model.rowCount(), 1);
    model.refresh(2);
    EXPECT_EQ(model.rowCount(), 3);
    EXPECT_EQ(seen.resets, 0);
    EXPECT_EQ(seen.insertedFirst, 1);
    EXPECT_EQ(seen.insertedLast, 2);
    EXPECT_EQ(model.data(model.index(2, 0)).toString(), QStringLiteral("25"));

    table.clear(work::HeaderLayout::WithoutMoney);
    model.refresh(1);
    EXPECT_EQ(seen.resets, 1);
    EXPECT_EQ(model.rowCount(), 0);
    EXPECT_EQ(model.columnCount(), work::kColumnCount - 1);
}

TEST(ProjectionModelTest, ThinningRowsAreToldApart) {
    ProjectionTable table;
    table.append(rowOf(RowKind::Growth, QStringLiteral("30")));
    table.append(rowOf(RowKind::Thinning, QStringLiteral("30")));
    ui::ProjectionModel model(table);

    const auto background = [&model](int row, int column) {
        return model.data(model.index(row, column), Qt::BackgroundRole);
    };
    // Growth rows keep the grid's alternating colours; thinning rows are tinted.
    EXPECT_FALSE(background(0, work::kColAge).isValid());
    ASSERT_TRUE(background(1, work::kColAge).canConvert<QBrush>());
    EXPECT_EQ(
        model.data(model.index(0, work::kColAge), Qt::TextAlignmentRole).value<Qt::Alignment>() &
            Qt::AlignRight,
        Qt::AlignRight);
}

} // namespace
} // namespace arbolex::testing
