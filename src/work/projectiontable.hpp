#pragma once

#include "work/rowrecord.hpp"

#include <QString>
#include <QStringList>

#include <algorithm>

#include <vector>

namespace arbolex::work {

/// Columns of a row of `flxMain`. Every data row carries all 26 cells; the
/// header layout without the money column hides `kColValuePerHa`.
enum Column : int {
    kColAge = 0,
    kColTopHeight = 1,
    kColStocking = 2,
    kColDbh = 3,
    kColBasalArea = 4,
    kColVolumePerTree = 5,
    kColVolumePerHa = 6,
    kColSeparator1 = 7,
    kColThinStocking = 8,
    kColThinDbh = 9,
    kColThinBasalArea = 10,
    kColThinVolumePerTree = 11,
    kColThinVolumePerHa = 12,
    kColValuePerHa = 13,
    kColThinTotalVolume = 14,
    kColThinTotalValue = 15,
    kColSeparator2 = 16,
    kColTotStocking = 17,
    kColTotDbh = 18,
    kColTotBasalArea = 19,
    kColTotVolumePerTree = 20,
    kColTotVolumePerHa = 21,
    kColTotVolume = 22,
    kColSeparator3 = 23,
    kColCai = 24,
    kColMai = 25,
    kColumnCount = 26,
};

/// Kind of an appended row and its flags.
enum class RowKind : int {
    Failed = -1, ///< a row of a projection that failed: age and increments only
    Growth = 0,
    Thinning = 1,
    Text = 2,
};

/// The two header layouts.
enum class HeaderLayout {
    WithMoney,    ///< start-up, Clear, model menu, row deletion
    WithoutMoney, ///< Clear All: no per-hectare money column
};

/// One data row of the projection table.
struct TableRow {
    QStringList cells; ///< kColumnCount cells
    RowKind kind = RowKind::Growth;
    QString label; ///< "G yr", "T yr", "AC yr" …
    RowRecord record;
    RowNumbers numbers{};
    /// Value of the timber removed on this row, euro per ha (thinning rows).
    double removedValue = 0.0;
    /// Timber revenue earned on this row at long-term average prices, euro
    /// per ha: a thinning's removal or the final cut's crop. The cash flow
    /// reads it by year.
    double timberRevenue = 0.0;
    /// True for the clear-fell row that ends the rotation.
    bool finalCut = false;

    bool isGrowth() const { return kind == RowKind::Growth; }
    bool isThinning() const { return kind == RowKind::Thinning; }
    bool isText() const { return kind == RowKind::Text; }
    bool operator==(const TableRow &) const = default;
};

/// The projection table `flxMain`: the header row, the data rows with their
/// records and numbers, the current row and the end of the selection. Row 0
/// is the header; data rows are 1 to rowCount() − 1, as the grid counts them.
class ProjectionTable {
public:
    ProjectionTable();

    /// Rows of the grid including the header row.
    int rowCount() const { return static_cast<int>(m_rows.size()) + 1; }
    /// True when the table holds no data row.
    bool empty() const { return m_rows.empty(); }
    int lastRow() const { return rowCount() - 1; }

    /// Data row `r` (1-based, as the grid counts).
    const TableRow &row(int r) const { return m_rows.at(static_cast<std::size_t>(r - 1)); }
    /// A row to change: the running sums of the removals are read again from it on.
    TableRow &row(int r) {
        TableRow &changed = m_rows.at(static_cast<std::size_t>(r - 1));
        m_removalsKnown = std::min(m_removalsKnown, r - 1);
        return changed;
    }

    /// Appends a data row and returns its index.
    int append(TableRow row);
    /// Removes every data row and writes the header in `layout`.
    void clear(HeaderLayout layout);
    /// Removes data rows `firstRemoved` to the last; the current row and the
    /// end of the selection move to the new last row.
    void removeFrom(int firstRemoved);
    void setHeaderLayout(HeaderLayout layout) { m_layout = layout; }
    HeaderLayout headerLayout() const { return m_layout; }

    /// Columns the grid shows in the current layout, in order.
    std::vector<int> visibleColumns() const;
    /// Caption of a data column in the current layout.
    QString caption(int column) const;
    /// Group caption above a column (stand, main crop, thinning …).
    static QString groupCaption(int column);

    /// The grid as it is seen: the header row, then every data row, each as
    /// its visible cells.
    std::vector<QStringList> visibleGrid() const;
    /// The table as a spreadsheet receives it: a first column with the row
    /// labels, the visible columns without the blank separators, and captions
    /// that name their group ("Thinning N/ha").
    std::vector<QStringList> exportGrid() const;
    /// The same layout for `rows`, rows of this table's shape (the summary),
    /// keeping only `columns` of those the table shows, when given.
    std::vector<QStringList> exportGrid(const std::vector<TableRow> &rows,
                                        const QString &labelCaption,
                                        const std::vector<int> &columns = {}) const;
    /// The group above each column of exportGrid(rows, caption, columns):
    /// none above the row labels, then "Stand", "Main crop", "Thinning" …
    QStringList exportGroups(const std::vector<int> &columns = {}) const;

    int currentRow() const { return m_row; }
    int selectionEnd() const { return m_rowSel; }
    /// Sets the current row and the end of the selection (clamped to the table).
    void select(int row, int endRow);

    /// What the thinnings on rows 1..upTo removed, per ha.
    struct Removals {
        double basalArea = 0.0;
        double stocking = 0.0;
        double volume = 0.0;
    };
    /// Summed once per row and kept, so that growing row after row stays
    /// linear in the number of rows; a row changed, removed or cleared is
    /// summed again, in the same order, to the same values.
    Removals removalsUpTo(int upTo) const;

private:
    /// The visible columns among `wanted` (all when empty), without separators.
    std::vector<int> exportColumns(const std::vector<int> &wanted) const;

    std::vector<TableRow> m_rows;
    /// Running sums of the removals: element r − 1 holds rows 1..r; the first
    /// m_removalsKnown are up to date.
    mutable std::vector<Removals> m_removals;
    mutable int m_removalsKnown = 0;
    HeaderLayout m_layout = HeaderLayout::WithMoney;
    int m_row = 0;
    int m_rowSel = 0;
};

} // namespace arbolex::work
