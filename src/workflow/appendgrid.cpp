// Appending projected states to the projection table: the cells of a growth
// row, the increments and the yield class.
#include "shell/apperror.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/incrementrows.hpp"
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

void MainWindowLogic::buildGrowthCells(work::TableRow &row, int rowIndex) const {
    const work::RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    cells[work::kColAge] = shell::singleText(rec.age);
    cells[work::kColTopHeight] = formatNumber(rec.topHeight, u"#0.0");
    const double stocking = std::nearbyint(double{rec.stocking});
    cells[work::kColStocking] = wholeText(rec.stocking);
    cells[work::kColDbh] = formatNumber(rec.dbh, u"##0.0");
    cells[work::kColBasalArea] = formatNumber(rec.basalArea, u"##0.0");
    if (rec.volume <= 0.0f) {
        cells[work::kColVolumePerTree] = text::outOfRange();
        cells[work::kColVolumePerHa] = text::outOfRange();
    } else {
        cells[work::kColVolumePerTree] =
            stocking > 0.0 ? formatNumber(rec.volume / stocking, u"#0.000") : QString();
        cells[work::kColVolumePerHa] = formatNumber(rec.volume, u"###0");
    }

    fillTotalProduction(row, rowIndex);
}

void MainWindowLogic::fillTotalProduction(work::TableRow &row, int rowIndex) const {
    // Total production: the standing crop plus everything thinned so far.
    const work::RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    const work::ProjectionTable::Removals removed = m_table.removalsUpTo(rowIndex - 1);
    auto totalStocking = static_cast<float>(rec.stocking + rec.removedStocking + removed.stocking);
    auto totalBasalArea =
        static_cast<float>(rec.basalArea + rec.removedBasalArea + removed.basalArea);
    const double totalVolume = rec.volume + rec.removedVolume + removed.volume;
    cells[work::kColTotStocking] = wholeText(totalStocking);
    cells[work::kColTotBasalArea] = formatNumber(totalBasalArea, u"##0.0");
    cells[work::kColTotDbh] =
        formatNumber(dbhFromBasalArea(totalBasalArea, totalStocking), u"##0.0");
    if (totalVolume <= 0.0) {
        cells[work::kColTotVolumePerTree] = text::outOfRange();
        cells[work::kColTotVolumePerHa] = text::outOfRange();
    } else {
        cells[work::kColTotVolumePerTree] =
            formatNumber(totalVolume / std::nearbyint(double{totalStocking}), u"#0.000");
        cells[work::kColTotVolumePerHa] = formatNumber(totalVolume, u"###0");
    }
    cells[work::kColTotVolume] = formatNumber(totalVolume * netArea(), u"##0");
}

void MainWindowLogic::writeIncrements(int rowIndex, bool currentIncrement) {
    work::TableRow &row = m_table.row(rowIndex);
    // The increment runs from the nearest earlier row that holds a stand.
    int previous = rowIndex - 1;
    while (previous >= 1 && m_table.row(previous).isText()) {
        --previous;
    }
    if (currentIncrement && previous >= 1) {
        try {
            const work::RowNumbers &before = m_table.row(previous).numbers;
            // Volumes and the age difference are rounded to whole numbers and
            // the volumes summed in 16-bit whole numbers.
            const std::int16_t grown =
                shell::addInt16(shell::addInt16(roundWhole(row.numbers[work::kNumVolume]),
                                                roundWhole(before[work::kNumRemovedVolume])),
                                -roundWhole(before[work::kNumVolume]));
            const int years = roundWhole(row.numbers[work::kNumAge] - before[work::kNumAge]);
            if (years == 0) {
                shell::raiseAppFault(shell::RuntimeError::divisionByZero());
            }
            row.numbers[work::kNumCai] = static_cast<double>(grown) / years;
            row.cells[work::kColCai] = formatNumber(row.numbers[work::kNumCai], u"#");
        } catch (const shell::AppFault &fault) {
            m_log.append(shell::moduleFaultLine(fault, QStringLiteral(" in Misc.AppendGrid()")));
        }
    }
    // Mean annual increment: total production over age. The row's volume
    // number is the crop before any removal on the row, so the removals of
    // the rows before it complete the total.
    const double age = row.numbers[work::kNumAge];
    if (age > 0.0) {
        const double totalProduction =
            row.numbers[work::kNumVolume] + m_table.removalsUpTo(rowIndex - 1).volume;
        row.numbers[work::kNumMai] = totalProduction / age;
        row.cells[work::kColMai] = formatNumber(row.numbers[work::kNumMai], u"#");
    }
}

void MainWindowLogic::AppendGrid(work::RowKind kind, const QString &label) {
    const int firstRow = m_table.rowCount();
    for (std::size_t i = m_firstNew; i < m_states.size(); ++i) {
        const engine::StandState &s = m_states[i];
        work::TableRow row;
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
        row.numbers[work::kNumAge] = s.age;
        row.numbers[work::kNumVolume] = s.volume;
        row.numbers[work::kNumRemovedVolume] = 0.0;
        row.cells = QStringList();
        for (int c = 0; c < work::kColumnCount; ++c) {
            row.cells.append(QString());
        }
        const int index = m_table.rowCount();
        if (kind == work::RowKind::Growth) {
            buildGrowthCells(row, index);
            m_standingVolume = s.volume;
        } else {
            // A row of a failed projection shows its age and increments only.
            row.cells[work::kColAge] = shell::singleText(s.age);
        }
        if (index == 1) {
            // The summary carries the start of the rotation.
            row.cells[work::kColSeparator1] = text::summaryMarker();
        }
        m_table.append(std::move(row));
        writeIncrements(index, true);
    }
    updateYieldClassLabel();
    m_view.tableChanged(firstRow);
}

int MainWindowLogic::yieldClass() const {
    std::vector<double> mai;
    for (const int r : work::incrementRows(m_table)) {
        mai.push_back(m_table.row(r).numbers[work::kNumMai]);
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
