// Appending projected states to the projection table: the cells of a growth
// row, the increments and the yield class.
#include "shell/apperror.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "workflow/incrementrows.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"
#include "workflow/standmath.hpp"
#include "workflow/yieldclass.hpp"

#include <cmath>
#include <limits>

namespace arbolex::workflow {

using shell::formatNumber;

namespace {

/// Whole number as the grid prints a rounded stocking.
QString wholeText(double value) {
    return QString::number(static_cast<qint64>(std::nearbyint(value)));
}

/// Nearest whole number, halves to even, as increments round their terms. A
/// term no int holds (a stand grown far beyond its model) overflows, as the
/// sums of those terms do, instead of an undefined cast.
int roundWhole(double value) {
    const double rounded = std::nearbyint(value);
    if (!(rounded >= std::numeric_limits<int>::min() &&
          rounded <= std::numeric_limits<int>::max())) {
        shell::raiseAppFault(shell::RuntimeError::overflow());
    }
    return static_cast<int>(rounded);
}

} // namespace

void MainWindowLogic::buildGrowthCells(TableRow &row, int rowIndex) const {
    const RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    cells[kColAge] = shell::singleText(rec.age);
    cells[kColTopHeight] = formatNumber(rec.topHeight, u"#0.0");
    const double stocking = std::nearbyint(double{rec.stocking});
    cells[kColStocking] = wholeText(rec.stocking);
    cells[kColDbh] = formatNumber(rec.dbh, u"##0.0");
    cells[kColBasalArea] = formatNumber(rec.basalArea, u"##0.0");
    if (rec.volume <= 0.0f) {
        cells[kColVolumePerTree] = text::outOfRange();
        cells[kColVolumePerHa] = text::outOfRange();
    } else {
        cells[kColVolumePerTree] =
            stocking > 0.0 ? formatNumber(rec.volume / stocking, u"#0.000") : QString();
        cells[kColVolumePerHa] = formatNumber(rec.volume, u"###0");
    }

    fillTotalProduction(row, rowIndex);
}

void MainWindowLogic::fillTotalProduction(TableRow &row, int rowIndex) const {
    // Total production: the standing crop plus everything thinned so far.
    const RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    const ProjectionTable::Removals removed = m_table.removalsUpTo(rowIndex - 1);
    auto totalStocking = static_cast<float>(rec.stocking + rec.removedStocking + removed.stocking);
    auto totalBasalArea =
        static_cast<float>(rec.basalArea + rec.removedBasalArea + removed.basalArea);
    const double totalVolume = rec.volume + rec.removedVolume + removed.volume;
    cells[kColTotStocking] = wholeText(totalStocking);
    cells[kColTotBasalArea] = formatNumber(totalBasalArea, u"##0.0");
    cells[kColTotDbh] = formatNumber(dbhFromBasalArea(totalBasalArea, totalStocking), u"##0.0");
    if (totalVolume <= 0.0) {
        cells[kColTotVolumePerTree] = text::outOfRange();
        cells[kColTotVolumePerHa] = text::outOfRange();
    } else {
        cells[kColTotVolumePerTree] =
            formatNumber(totalVolume / std::nearbyint(double{totalStocking}), u"#0.000");
        cells[kColTotVolumePerHa] = formatNumber(totalVolume, u"###0");
    }
    cells[kColTotVolume] = formatNumber(totalVolume * netArea(), u"##0");
}

void MainWindowLogic::writeIncrements(int rowIndex, bool currentIncrement) {
    TableRow &row = m_table.row(rowIndex);
    // The increment runs from the nearest earlier row that holds a stand.
    int previous = rowIndex - 1;
    while (previous >= 1 && m_table.row(previous).isText()) {
        --previous;
    }
    if (currentIncrement && previous >= 1) {
        try {
            const RowNumbers &before = m_table.row(previous).numbers;
            // Volumes and the age difference are rounded to whole numbers and
            // the volumes summed in 16-bit whole numbers.
            const std::int16_t grown =
                shell::addInt16(shell::addInt16(roundWhole(row.numbers[kNumVolume]),
                                                roundWhole(before[kNumRemovedVolume])),
                                -roundWhole(before[kNumVolume]));
            const int years = roundWhole(row.numbers[kNumAge] - before[kNumAge]);
            if (years == 0) {
                shell::raiseAppFault(shell::RuntimeError::divisionByZero());
            }
            row.numbers[kNumCai] = static_cast<double>(grown) / years;
            row.cells[kColCai] = formatNumber(row.numbers[kNumCai], u"#");
        } catch (const shell::AppFault &fault) {
            m_log.append(shell::moduleFaultLine(fault, QStringLiteral(" in Misc.AppendGrid()")));
        }
    }
    // Mean annual increment: total production over age. The row's volume
    // number is the crop before any removal on the row, so the removals of
    // the rows before it complete the total.
    const double age = row.numbers[kNumAge];
    if (age > 0.0) {
        const double totalProduction =
            row.numbers[kNumVolume] + m_table.removalsUpTo(rowIndex - 1).volume;
        row.numbers[kNumMai] = totalProduction / age;
        row.cells[kColMai] = formatNumber(row.numbers[kNumMai], u"#");
    }
}

void MainWindowLogic::AppendGrid(RowKind kind, const QString &label) {
    const int firstRow = m_table.rowCount();
    for (std::size_t i = m_firstNew; i < m_states.size(); ++i) {
        const engine::StandState &s = m_states[i];
        TableRow row;
        row.kind = kind;
        row.label = label;
        row.record.age = s.age;
        row.record.topHeight = s.topHeight;
        row.record.basalArea = s.basalArea;
        row.record.stocking = s.stocking;
        row.record.volume = s.volume;
        float basalArea = s.basalArea;
        float stocking = s.stocking;
        row.record.dbh = dbhFromBasalArea(basalArea, stocking);
        row.numbers[kNumAge] = s.age;
        row.numbers[kNumVolume] = s.volume;
        row.numbers[kNumRemovedVolume] = 0.0;
        row.cells = QStringList();
        for (int c = 0; c < kColumnCount; ++c) {
            row.cells.append(QString());
        }
        const int index = m_table.rowCount();
        if (kind == RowKind::Growth) {
            buildGrowthCells(row, index);
            m_standingVolume = s.volume;
        } else {
            // A row of a failed projection shows its age and increments only.
            row.cells[kColAge] = shell::singleText(s.age);
        }
        if (index == 1) {
            // The summary carries the start of the rotation.
            row.cells[kColSeparator1] = text::summaryMarker();
        }
        m_table.append(std::move(row));
        writeIncrements(index, true);
    }
    updateYieldClassLabel();
    m_view.tableChanged(firstRow);
}

int MainWindowLogic::yieldClass() const {
    std::vector<double> mai;
    for (const int r : incrementRows(m_table)) {
        mai.push_back(m_table.row(r).numbers[kNumMai]);
    }
    return workflow::yieldClass(mai);
}

void MainWindowLogic::updateYieldClassLabel() {
    const int yc = yieldClass();
    if (yc > 0) {
        m_view.setText(MainControl::lblYC, QString::number(yc));
        m_view.setHint(MainControl::lblYC, text::yieldClassHint());
    } else {
        m_view.setText(MainControl::lblYC, QString());
        m_view.setHint(MainControl::lblYC, text::yieldClassInsufficient());
    }
}

} // namespace arbolex::workflow
