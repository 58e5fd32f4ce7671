#pragma once

#include "work/projectiontable.hpp"

#include <QAbstractTableModel>
#include <QTableView>

#include <vector>

namespace arbolex::ui {

/// The projection table `flxMain` as an item model: one item row per data row
/// of the table (item row 0 is table row 1), one item column per column the
/// current header layout shows. The header row of the table becomes the
/// horizontal header, with the column groups under GroupRole.
class ProjectionModel : public QAbstractTableModel {
    Q_OBJECT
public:
    /// Horizontal header role holding the group above a column ("Main crop" …).
    static constexpr int GroupRole = Qt::UserRole + 1;
    /// Item and header role: true for the narrow separator columns.
    static constexpr int SeparatorRole = Qt::UserRole + 2;

    explicit ProjectionModel(const work::ProjectionTable &table, QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation,
                        int role = Qt::DisplayRole) const override;

    /// Follows the table after it changed from data row `firstRow` on: rows
    /// appended at the end are inserted, a changed layout or a shorter table
    /// resets the model.
    void refresh(int firstRow);

    /// Table column shown in item column `column`.
    int tableColumn(int column) const { return m_columns.at(static_cast<std::size_t>(column)); }
    /// True for the narrow, blank columns between the column groups.
    bool isSeparator(int column) const;
    /// True for an assortment row (item row `row`): a report, not a stand.
    bool isTextRow(int row) const { return m_table.row(row + 1).isText(); }
    /// Lets every assortment row of `view` run as one cell from item column
    /// 1 to the last, which shows the whole report.
    void spanTextRows(QTableView &view) const;

private:
    QVariant textRowData(const work::TableRow &row, int column, int role) const;

    const work::ProjectionTable &m_table;
    /// What the views were last told: the data rows and the visible columns.
    int m_rows = 0;
    std::vector<int> m_columns;
};

} // namespace arbolex::ui
