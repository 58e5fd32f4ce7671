#include "work/projectiontable.hpp"

#include <algorithm>

namespace arbolex::work {

namespace {

// Captions of the layout with the money column, column by column.
QStringList moneyCaptions() {
    return {QStringLiteral("Age"),     QStringLiteral("Top Ht"),   QStringLiteral("N/ha"),
            QStringLiteral("DBH"),     QStringLiteral(" BA"),      QStringLiteral(" V/N"),
            QStringLiteral(" V/ha"),   QStringLiteral(" "),        QStringLiteral("N/ha"),
            QStringLiteral("DBH"),     QStringLiteral(" BA"),      QStringLiteral(" V/N"),
            QStringLiteral(" V/ha"),   QStringLiteral(" € / ha"),  QStringLiteral("Tot Vol "),
            QStringLiteral(" €  Tot"), QStringLiteral(" "),        QStringLiteral("N/ha"),
            QStringLiteral(" DBH"),    QStringLiteral(" BA"),      QStringLiteral(" V/N"),
            QStringLiteral(" V/ha"),   QStringLiteral(" Tot Vol"), QStringLiteral(" "),
            QStringLiteral(" CAI"),    QStringLiteral(" MAI")};
}

// The layout without the money column: the per-hectare value column is gone
// and every later caption moves one place left.
QStringList withoutMoneyCaptions() {
    QStringList c = moneyCaptions().mid(0, kColValuePerHa);
    c << QStringLiteral("Tot Vol ") << QStringLiteral("Tot Val") << QStringLiteral(" ")
      << QStringLiteral("N/ha") << QStringLiteral(" DBH") << QStringLiteral(" BA")
      << QStringLiteral(" V/N") << QStringLiteral(" V/ha") << QStringLiteral(" Tot Vol")
      << QStringLiteral(" Tot Val");
    return c;
}

} // namespace

ProjectionTable::ProjectionTable() = default;

int ProjectionTable::append(TableRow row) {
    while (row.cells.size() < kColumnCount) {
        row.cells.append(QString());
    }
    m_rows.push_back(std::move(row));
    return lastRow();
}

void ProjectionTable::clear(HeaderLayout layout) {
    m_rows.clear();
    m_removalsKnown = 0;
    m_layout = layout;
    m_row = 0;
    m_rowSel = 0;
}

void ProjectionTable::removeFrom(int firstRemoved) {
    const auto kept = static_cast<std::size_t>(std::clamp(firstRemoved - 1, 0, lastRow()));
    m_rows.erase(m_rows.begin() + static_cast<std::ptrdiff_t>(kept), m_rows.end());
    m_removalsKnown = std::min(m_removalsKnown, static_cast<int>(kept));
    m_row = lastRow();
    m_rowSel = lastRow();
}

std::vector<int> ProjectionTable::visibleColumns() const {
    std::vector<int> columns;
    columns.reserve(kColumnCount);
    for (int c = 0; c < kColumnCount; ++c) {
        if (m_layout == HeaderLayout::WithoutMoney && c == kColValuePerHa) {
            continue;
        }
        columns.push_back(c);
    }
    return columns;
}

QString ProjectionTable::caption(int column) const {
    static const QStringList money = moneyCaptions();
    static const QStringList withoutMoney = withoutMoneyCaptions();
    if (m_layout == HeaderLayout::WithMoney || column < kColValuePerHa) {
        return money.value(column);
    }
    if (column == kColValuePerHa) {
        return {};
    }
    // Past the hidden column the captions of this layout run one place left;
    // the increments keep their captions after them.
    return column - 1 < withoutMoney.size() ? withoutMoney.at(column - 1) : money.value(column);
}

QString ProjectionTable::groupCaption(int column) {
    if (column <= kColTopHeight) {
        return QStringLiteral("Stand");
    }
    if (column <= kColVolumePerHa) {
        return QStringLiteral("Main crop");
    }
    if (column >= kColThinStocking && column <= kColThinTotalValue) {
        return QStringLiteral("Thinning");
    }
    if (column >= kColTotStocking && column <= kColTotVolume) {
        return QStringLiteral("Total production");
    }
    if (column >= kColCai) {
        return QStringLiteral("Increment");
    }
    return {};
}

std::vector<QStringList> ProjectionTable::visibleGrid() const {
    const std::vector<int> columns = visibleColumns();
    std::vector<QStringList> grid;
    grid.reserve(m_rows.size() + 1);
    QStringList header;
    for (int c : columns) {
        header << caption(c);
    }
    grid.push_back(header);
    for (const TableRow &r : m_rows) {
        QStringList cells;
        for (int c : columns) {
            cells << r.cells.value(c);
        }
        grid.push_back(cells);
    }
    return grid;
}

std::vector<int> ProjectionTable::exportColumns(const std::vector<int> &wanted) const {
    std::vector<int> columns;
    for (int c : visibleColumns()) {
        const bool kept =
            wanted.empty() || std::find(wanted.begin(), wanted.end(), c) != wanted.end();
        if (kept && c != kColSeparator1 && c != kColSeparator2 && c != kColSeparator3) {
            columns.push_back(c);
        }
    }
    return columns;
}

QStringList ProjectionTable::exportGroups(const std::vector<int> &wanted) const {
    QStringList groups{QString()};
    for (int c : exportColumns(wanted)) {
        groups << groupCaption(c);
    }
    return groups;
}

std::vector<QStringList> ProjectionTable::exportGrid() const {
    return exportGrid(m_rows, QStringLiteral("Row"));
}

std::vector<QStringList> ProjectionTable::exportGrid(const std::vector<TableRow> &rows,
                                                     const QString &labelCaption,
                                                     const std::vector<int> &wanted) const {
    const std::vector<int> columns = exportColumns(wanted);
    std::vector<QStringList> grid;
    grid.reserve(rows.size() + 1);
    QStringList header{labelCaption};
    for (int c : columns) {
        const QString group = groupCaption(c);
        const QString own = caption(c).trimmed();
        header << (group.isEmpty() || c <= kColTopHeight ? own : group + u' ' + own);
    }
    grid.push_back(header);
    for (const TableRow &r : rows) {
        QStringList cells{r.label};
        for (int c : columns) {
            cells << r.cells.value(c).trimmed();
        }
        grid.push_back(cells);
    }
    return grid;
}

void ProjectionTable::select(int row, int endRow) {
    const int last = lastRow();
    m_row = std::clamp(row, 0, last);
    m_rowSel = std::clamp(endRow, 0, last);
}

ProjectionTable::Removals ProjectionTable::removalsUpTo(int upTo) const {
    const int last = std::min(upTo, lastRow());
    if (last < 1) {
        return {};
    }
    m_removals.resize(m_rows.size());
    for (int r = m_removalsKnown + 1; r <= last; ++r) {
        Removals sum = r > 1 ? m_removals[static_cast<std::size_t>(r - 2)] : Removals{};
        const RowRecord &rec = row(r).record;
        sum.basalArea += rec.removedBasalArea;
        sum.stocking += rec.removedStocking;
        sum.volume += rec.removedVolume;
        m_removals[static_cast<std::size_t>(r - 1)] = sum;
    }
    m_removalsKnown = std::max(m_removalsKnown, last);
    return m_removals[static_cast<std::size_t>(last - 1)];
}

} // namespace arbolex::work
