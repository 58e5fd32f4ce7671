#include "estatewindow/estateresultsmodel.hpp"

#include "estatewindow/estatemessages.hpp"
#include "shell/vbformat.hpp"

#include <array>

namespace arbolex::estatewindow {

namespace {

/// Where each column of the table is among estate::figureValues; -1 for the
/// columns that are not figures.
constexpr std::array<int, EstateResultsModel::kColumnCount> kFigureOf = {
    -1, // id
    0,  // model label
    -1, // area
    1,  // site index
    2,  // yield class
    3,  // thinnings
    5,  // thinning volume of the sub-compartment, m³
    6,  // final-cut age
    7,  // final-cut year
    9,  // final-cut volume of the sub-compartment, m³
    11, // NPV, euro/ha
    13, // LEV, euro/ha
    15, // forest value, euro/ha
    17, // status
    -1, // message
};

bool isTextColumn(int column) {
    return column == EstateResultsModel::kIdColumn || column == EstateResultsModel::kModelColumn ||
           column == EstateResultsModel::kStatusColumn ||
           column == EstateResultsModel::kMessageColumn;
}

} // namespace

void EstateResultsModel::setRows(std::vector<EstateResultRow> rows) {
    beginResetModel();
    m_rows = std::move(rows);
    endResetModel();
}

int EstateResultsModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_rows.size());
}

int EstateResultsModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : kColumnCount;
}

QString EstateResultsModel::cellText(int row, int column) const {
    const EstateResultRow &r = m_rows.at(static_cast<std::size_t>(row));
    switch (column) {
    case kIdColumn:
        return r.id;
    case kAreaColumn:
        return r.grown ? shell::generalNumber(r.areaHa) : QString();
    case kMessageColumn:
        return r.message;
    default:
        break;
    }
    const int figure = kFigureOf.at(static_cast<std::size_t>(column));
    if (figure < 0 || static_cast<std::size_t>(figure) >= r.figures.size()) {
        return {};
    }
    const QString value = QString::fromStdString(r.figures[static_cast<std::size_t>(figure)]);
    // The site index as the main window shows it, volumes to the cubic metre.
    const int decimals = column == kSiteIndexColumn                            ? 1
                         : column == kThinnedColumn || column == kFelledColumn ? 0
                                                                               : -1;
    bool ok = false;
    const double number = value.toDouble(&ok);
    return decimals >= 0 && ok ? QString::number(number, 'f', decimals) : value;
}

QVariant EstateResultsModel::data(const QModelIndex &index, int role) const {
    if (!index.isValid() || index.row() >= rowCount() || index.column() >= kColumnCount) {
        return {};
    }
    const EstateResultRow &r = m_rows[static_cast<std::size_t>(index.row())];
    switch (role) {
    case Qt::DisplayRole:
        return cellText(index.row(), index.column());
    case Qt::ToolTipRole:
        return r.grown ? QVariant() : QVariant(r.message);
    case Qt::TextAlignmentRole:
        return isTextColumn(index.column()) ? QVariant(Qt::AlignLeft | Qt::AlignVCenter)
                                            : QVariant(Qt::AlignRight | Qt::AlignVCenter);
    case kNotGrownRole:
        return !r.grown;
    case kSortRole: {
        const QString text = cellText(index.row(), index.column());
        if (isTextColumn(index.column())) {
            return text;
        }
        bool ok = false;
        const double number = text.toDouble(&ok);
        // No value for a row without the figure: the view keeps those last.
        return ok ? QVariant(number) : QVariant();
    }
    default:
        return {};
    }
}

QVariant EstateResultsModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (role != Qt::DisplayRole) {
        return {};
    }
    if (orientation == Qt::Vertical) {
        return section + 1;
    }
    return text::columnCaptions().value(section);
}

} // namespace arbolex::estatewindow
