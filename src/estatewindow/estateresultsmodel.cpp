#include "estatewindow/estateresultsmodel.hpp"

#include "estate/resulttable.hpp"
#include "estatewindow/estatemessages.hpp"
#include "shell/vbformat.hpp"

#include <array>
#include <string_view>

namespace arbolex::estatewindow {

namespace {

/// The figure of estate::figureColumns each column of the table shows, by
/// name; empty for the columns that are not figures.
constexpr std::array<std::string_view, EstateResultsModel::kColumnCount> kFigureName = {
    "",                 // id
    "model_label",      //
    "",                 // area
    "site_index",       //
    "yield_class",      //
    "thinnings",        //
    "thinning_volume",  // of the sub-compartment, m³
    "final_cut_age",    //
    "final_cut_year",   //
    "final_cut_volume", // of the sub-compartment, m³
    "npv_ha",           //
    "lev_ha",           //
    "forest_value_ha",  //
    "status",           //
    "",                 // message
};

/// Where column `column` is among estate::figureValues; -1 for none.
int figureOf(int column) {
    static const std::array<int, EstateResultsModel::kColumnCount> positions = [] {
        std::array<int, EstateResultsModel::kColumnCount> p{};
        const std::vector<estate::ResultColumn> &figures = estate::figureColumns();
        for (std::size_t c = 0; c < p.size(); ++c) {
            p[c] = -1;
            for (std::size_t f = 0; f < figures.size(); ++f) {
                if (!kFigureName[c].empty() && figures[f].name == kFigureName[c]) {
                    p[c] = static_cast<int>(f);
                }
            }
        }
        return p;
    }();
    return positions.at(static_cast<std::size_t>(column));
}

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
    const int figure = figureOf(column);
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
