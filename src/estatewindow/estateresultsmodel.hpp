#pragma once

// The sub-compartments of an estate as a table for a sortable view: one row
// per row of the input, the figures as the results file writes them, and
// the rows that were not grown marked with their message.

#include "estate/rowplan.hpp"

#include <QAbstractTableModel>
#include <QString>

#include <string>
#include <vector>

namespace arbolex::estatewindow {

/// One sub-compartment of the estate as it came out of the run.
struct EstateResultRow {
    /// Line of the row in the input (the header is line 1).
    long long line = 0;
    QString id;
    /// Area, ha.
    double areaHa = 0.0;
    /// Final-cut age, years (0 for a row not grown).
    int finalCutAge = 0;
    bool grown = false;
    /// Why the row was not grown.
    QString message;
    /// The figures as the results file writes them (estate::figureValues).
    std::vector<std::string> figures;
    /// The row as read, to plan it again when it is opened.
    estate::RowValues values;
};

class EstateResultsModel : public QAbstractTableModel {
    Q_OBJECT
public:
    enum Role {
        /// The value a column sorts by: a number, or the text; no value for
        /// a figure the row does not have.
        kSortRole = Qt::UserRole,
        /// True for a row that was not grown.
        kNotGrownRole,
    };
    enum Column {
        kIdColumn,
        kModelColumn,
        kAreaColumn,
        kSiteIndexColumn,
        kYieldClassColumn,
        kThinningsColumn,
        kThinnedColumn,
        kFinalCutAgeColumn,
        kFinalCutYearColumn,
        kFelledColumn,
        kNpvColumn,
        kLevColumn,
        kForestValueColumn,
        kStatusColumn,
        kMessageColumn,
        kColumnCount
    };

    using QAbstractTableModel::QAbstractTableModel;

    void setRows(std::vector<EstateResultRow> rows);
    const std::vector<EstateResultRow> &rows() const { return m_rows; }

    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

    /// The text of a cell as shown.
    QString cellText(int row, int column) const;

private:
    std::vector<EstateResultRow> m_rows;
};

} // namespace arbolex::estatewindow
