#include "ui/stringgridmodel.hpp"

#include <QFont>

#include <algorithm>

namespace arbolex::ui {

StringGridModel::StringGridModel(Source source, QObject *parent)
    : QAbstractTableModel(parent), m_source(std::move(source)) {
    m_grid = m_source();
}

int StringGridModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() || m_grid.empty() ? 0 : static_cast<int>(m_grid.size()) - 1;
}

int StringGridModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() || m_grid.empty() ? 0 : static_cast<int>(m_grid.front().size());
}

QVariant StringGridModel::data(const QModelIndex &index, int role) const {
    if (!index.isValid()) {
        return {};
    }
    const QStringList &row = m_grid.at(static_cast<std::size_t>(index.row()) + 1);
    switch (role) {
    case Qt::DisplayRole:
        return row.value(index.column());
    case Qt::TextAlignmentRole: {
        const bool text = std::find(m_textColumns.begin(), m_textColumns.end(), index.column()) !=
                          m_textColumns.end();
        return QVariant::fromValue(Qt::AlignVCenter | (text ? Qt::AlignLeft : Qt::AlignRight));
    }
    case Qt::FontRole:
        if (m_boldFrom >= 0 && index.row() >= m_boldFrom) {
            QFont bold;
            bold.setBold(true);
            return bold;
        }
        return {};
    default:
        return {};
    }
}

QVariant StringGridModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation == Qt::Vertical) {
        return role == Qt::DisplayRole ? QVariant(section + 1) : QVariant();
    }
    const QString group = m_groups.value(section);
    if (role == GroupRole) {
        return group;
    }
    if (role != Qt::DisplayRole || m_grid.empty()) {
        return {};
    }
    const QString caption = m_grid.front().value(section);
    const QString prefix = group + u' ';
    return !group.isEmpty() && caption.startsWith(prefix) ? caption.mid(prefix.size()) : caption;
}

void StringGridModel::refresh() {
    if (m_groupSource) {
        m_groups = m_groupSource();
    }
    std::vector<QStringList> next = m_source();
    const bool sameShape = next.size() == m_grid.size() &&
                           (next.empty() || next.front().size() == m_grid.front().size());
    if (!sameShape) {
        beginResetModel();
        m_grid = std::move(next);
        endResetModel();
        return;
    }
    m_grid = std::move(next);
    if (rowCount() > 0 && columnCount() > 0) {
        emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
    }
    emit headerDataChanged(Qt::Horizontal, 0, columnCount() - 1);
}

} // namespace arbolex::ui
