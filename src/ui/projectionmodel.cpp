#include "ui/projectionmodel.hpp"

#include <QBrush>
#include <QColor>
#include <QFont>
#include <QSize>

namespace arbolex::ui {

using work::RowKind;

namespace {

bool isSeparatorColumn(int tableColumn) {
    return tableColumn == work::kColSeparator1 || tableColumn == work::kColSeparator2 ||
           tableColumn == work::kColSeparator3;
}

/// Thinning rows stand out from the growth rows around them.
QColor thinningTint() {
    return {0xf6, 0xe7, 0xc8};
}
/// The clear-fell row that ends the rotation.
QColor finalCutTint() {
    return {0xd5, 0xe8, 0xd0};
}
/// Rows of a projection that failed half-way.
QColor failedTint() {
    return {0xf4, 0xd3, 0xd0};
}
/// Assortment rows ("AC yr", "AT yr", "AP yr"): reports, not stands.
QColor assortmentTint() {
    return {0xdd, 0xea, 0xf4};
}
QColor separatorTint() {
    return {0xd8, 0xdc, 0xd4};
}

} // namespace

ProjectionModel::ProjectionModel(const work::ProjectionTable &table, QObject *parent)
    : QAbstractTableModel(parent), m_table(table), m_rows(table.rowCount() - 1),
      m_columns(table.visibleColumns()) {}

int ProjectionModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : m_rows;
}

int ProjectionModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_columns.size());
}

QVariant ProjectionModel::data(const QModelIndex &index, int role) const {
    if (!index.isValid() || index.row() >= m_rows || index.column() >= columnCount()) {
        return {};
    }
    const work::TableRow &row = m_table.row(index.row() + 1);
    const int column = tableColumn(index.column());
    const bool separator = isSeparator(index.column());
    if (row.isText() && index.column() > 0) {
        return textRowData(row, index.column(), role);
    }
    switch (role) {
    case Qt::DisplayRole:
        // A separator's cell may hold the summary's marker: blank on screen.
        return separator ? QString() : row.cells.value(column);
    case Qt::TextAlignmentRole:
        return QVariant::fromValue(Qt::AlignRight | Qt::AlignVCenter);
    case Qt::BackgroundRole:
        if (separator) {
            return QBrush(separatorTint());
        }
        if (row.finalCut) {
            return QBrush(finalCutTint());
        }
        if (row.kind == RowKind::Thinning) {
            return QBrush(thinningTint());
        }
        if (row.kind == RowKind::Failed) {
            return QBrush(failedTint());
        }
        return {};
    case Qt::FontRole:
        if (row.isText()) {
            QFont italic;
            italic.setItalic(true);
            return italic;
        }
        if (row.finalCut) {
            QFont bold;
            bold.setBold(true);
            return bold;
        }
        return {};
    case SeparatorRole:
        return separator;
    default:
        return {};
    }
}

QVariant ProjectionModel::textRowData(const work::TableRow &row, int column, int role) const {
    switch (role) {
    case Qt::DisplayRole: {
        // The report reads as one line across the row (item column 1 spans it).
        if (column != 1) {
            return {};
        }
        QStringList parts;
        for (int c = 1; c < columnCount(); ++c) {
            const QString cell = row.cells.value(tableColumn(c));
            if (!cell.isEmpty()) {
                parts << cell;
            }
        }
        return parts.join(QStringLiteral("    "));
    }
    case Qt::TextAlignmentRole:
        return QVariant::fromValue(Qt::AlignLeft | Qt::AlignVCenter);
    case Qt::SizeHintRole:
        // The line must not widen the columns of the stands under it.
        return QSize(0, 0);
    case Qt::BackgroundRole:
        return QBrush(assortmentTint());
    case Qt::FontRole: {
        QFont italic;
        italic.setItalic(true);
        return italic;
    }
    default:
        return {};
    }
}

void ProjectionModel::spanTextRows(QTableView &view) const {
    view.clearSpans();
    for (int r = 0; r < m_rows; ++r) {
        if (isTextRow(r) && columnCount() > 2) {
            view.setSpan(r, 1, 1, columnCount() - 1);
        }
    }
}

bool ProjectionModel::isSeparator(int column) const {
    // A separator column that the header layout gives a caption of its own
    // is shown as a column like the others.
    const int shown = tableColumn(column);
    return isSeparatorColumn(shown) && m_table.caption(shown).trimmed().isEmpty();
}

QVariant ProjectionModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation == Qt::Vertical) {
        if (section < 0 || section >= m_rows) {
            return {};
        }
        if (role == Qt::DisplayRole) {
            return m_table.row(section + 1).label;
        }
        if (role == Qt::TextAlignmentRole) {
            return QVariant::fromValue(Qt::AlignLeft | Qt::AlignVCenter);
        }
        return {};
    }
    if (section < 0 || section >= columnCount()) {
        return {};
    }
    const int column = tableColumn(section);
    switch (role) {
    case Qt::DisplayRole:
        return m_table.caption(column);
    case GroupRole:
        return work::ProjectionTable::groupCaption(column);
    case SeparatorRole:
        return isSeparator(section);
    default:
        return {};
    }
}

void ProjectionModel::refresh(int firstRow) {
    const int rows = m_table.rowCount() - 1;
    const std::vector<int> columns = m_table.visibleColumns();
    if (columns != m_columns || rows < m_rows || firstRow <= 1) {
        beginResetModel();
        m_rows = rows;
        m_columns = columns;
        endResetModel();
        return;
    }
    // Rows the table rewrote in place, then the rows it appended.
    const int lastKept = std::min(m_rows, rows);
    if (firstRow - 1 < lastKept) {
        emit dataChanged(index(firstRow - 1, 0), index(lastKept - 1, columnCount() - 1));
        emit headerDataChanged(Qt::Vertical, firstRow - 1, lastKept - 1);
    }
    if (rows > m_rows) {
        beginInsertRows({}, m_rows, rows - 1);
        m_rows = rows;
        endInsertRows();
    }
}

} // namespace arbolex::ui
