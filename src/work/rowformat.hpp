#pragma once

// The one formatter of the projection table: every cell text of a row is made
// here from the row's numbers, in the patterns the table has always shown.
// Where a figure is read back from what a cell shows, the reader uses the
// same pattern (rotation::kTopHeightCell, kBasalAreaCell, kMeanTreeCell).

#include "work/projectiontable.hpp"

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::work::rowformat {

/// A stocking as the table shows it: rounded to a whole number.
QString wholeText(double value);

/// The stand cells of a growth row (age to volume per ha) from its record.
void writeStandCells(TableRow &row);

/// The total-production cells of `row`: its stand and its own removal plus
/// the removals `before` it, and their volume over `netArea` ha.
void writeTotalProduction(TableRow &row, const ProjectionTable::Removals &before, double netArea);

/// The cells of a thinning row from its record: the stand after the thinning,
/// the removal, its value (euro/ha) and the cumulative thinned volume and
/// value of the sub-compartment over `netArea` ha.
void writeThinningCells(TableRow &row, double valuePerHa, double cumulativeVolume,
                        double cumulativeValue, double netArea);

/// The cells of the final cut on a stand row: the standing crop (m³/ha)
/// becomes the removal, valued at `price` (euro/m³) for its `trees` mean trees
/// of `meanTree` m³ over `netArea` ha; its total production reads 0.
void writeFinalCutCells(TableRow &row, double standingVolume, double trees, double meanTree,
                        double price, double netArea);

/// The current and mean annual increments, m³/ha/yr.
void writeCurrentIncrement(TableRow &row, double cai);
void writeMeanIncrement(TableRow &row, double mai);

/// One class of an assortment row: its name, share (%) and volume (m³/ha).
struct AssortmentClass {
    QString name;
    double percent = 0.0;
    double volume = 0.0;
};

/// An assortment row labelled `label` at `age`, one class after another.
TableRow assortmentRow(const QString &label, float age,
                       const std::vector<AssortmentClass> &classes);

/// A row of the summary's totals labelled `label`, no cell filled yet.
TableRow totalsRow(const QString &label);

} // namespace arbolex::work::rowformat
