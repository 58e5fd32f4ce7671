#pragma once

#include <QAbstractTableModel>
#include <QStringList>

#include <functional>
#include <vector>

namespace arbolex::ui {

/// A grid of texts whose first row holds the captions, as an item model: the
/// summary `flxSummary` and the cash flow `NPV_Grid`. The grid is read through
/// `source` each time, so the model always shows what its logic holds.
class StringGridModel : public QAbstractTableModel {
    Q_OBJECT
public:
    using Source = std::function<std::vector<QStringList>()>;
    /// Horizontal header role holding the group above a column, as the
    /// projection table's (a caption "Thinning N/ha" then shows "N/ha").
    static constexpr int GroupRole = Qt::UserRole + 1;

    explicit StringGridModel(Source source, QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation,
                        int role = Qt::DisplayRole) const override;

    /// Reads the grid again; a change of shape resets the model.
    void refresh();
    /// Columns shown left-aligned (texts); the others are numbers, right-aligned.
    void setTextColumns(std::vector<int> columns) { m_textColumns = std::move(columns); }
    /// Groups above the columns, read with the grid.
    void setGroups(std::function<QStringList()> groups) { m_groupSource = std::move(groups); }
    /// Item rows shown bold (totals).
    void setBoldFrom(int row) { m_boldFrom = row; }

private:
    Source m_source;
    std::vector<QStringList> m_grid;
    std::function<QStringList()> m_groupSource;
    QStringList m_groups;
    std::vector<int> m_textColumns{0};
    int m_boldFrom = -1;
};

} // namespace arbolex::ui
