// The rows the work's commands write: growth rows with their increments,
// thinning rows, assortment rows and the final cut; deleting and clearing.
#include "work/standwork.hpp"

#include "engine/standstate.hpp"
#include "prices/pricelookup.hpp"
#include "prices/prices.hpp"
#include "rotation/rotation.hpp"
#include "rotation/standmath.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/rowformat.hpp"
#include "work/worktexts.hpp"

#include <QLocale>

#include <cmath>
#include <limits>

namespace arbolex::work {

namespace {

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

/// A row of `kind` for the stand of `s`, its cells still empty.
TableRow rowOfStand(const engine::StandState &s, RowKind kind, const QString &label) {
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
    row.record.dbh = rotation::dbhFromBasalArea(basalArea, stocking);
    row.numbers[kNumAge] = s.age;
    row.numbers[kNumVolume] = s.volume;
    row.numbers[kNumRemovedVolume] = 0.0;
    for (int c = 0; c < kColumnCount; ++c) {
        row.cells.append(QString());
    }
    return row;
}

} // namespace

void StandWork::writeIncrements(int rowIndex, bool currentIncrement) {
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
            rowformat::writeCurrentIncrement(row, row.numbers[kNumCai]);
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
        rowformat::writeMeanIncrement(row, row.numbers[kNumMai]);
    }
}

void StandWork::AppendGrid(const std::vector<engine::StandState> &states, std::size_t first,
                           RowKind kind, const QString &label) {
    const int firstRow = m_table.rowCount();
    const double area = netArea();
    for (std::size_t i = first; i < states.size(); ++i) {
        TableRow row = rowOfStand(states[i], kind, label);
        const int index = m_table.rowCount();
        if (kind == RowKind::Growth) {
            rowformat::writeStandCells(row);
            rowformat::writeTotalProduction(row, m_table.removalsUpTo(index - 1), area);
        } else {
            // A row of a failed projection shows its age and increments only.
            row.cells[kColAge] = shell::singleText(states[i].age);
        }
        if (index == 1) {
            // The summary carries the start of the rotation.
            row.cells[kColSeparator1] = text::summaryMarker();
        }
        m_table.append(std::move(row));
        writeIncrements(index, true);
    }
    notifyTable(firstRow);
}

int StandWork::WriteThinLine(const RowRecord &record, const QString &label, bool replaceCurrent,
                             shell::IInteractive &interactive) {
    int row = m_table.currentRow();
    if (replaceCurrent) {
        // A second Accept at the same age replaces the old thinning.
        m_table.row(row).record = record;
    } else {
        TableRow thinning;
        thinning.kind = RowKind::Thinning;
        thinning.label = label;
        thinning.record = record;
        row = m_table.append(std::move(thinning));
    }
    shell::guard(m_log, QStringLiteral(" in Misc.WriteThinLine()"), [&] {
        TableRow &r = m_table.row(row);
        const RowRecord &rec = r.record;
        r.kind = RowKind::Thinning;
        r.label = label;

        // The removal valued at the current price of its mean tree.
        const double meanTree = rotation::removedMeanTree(rec.removedVolume, rec.removedStocking);
        const double price =
            prices::TrouveIndicePrix(meanTree, m_prices.data().current, interactive);
        const double valuePerHa = rec.removedVolume * price;

        // Cumulative thinning volume and value of the sub-compartment: this
        // removal and every earlier one.
        double cumulativeVolume = 0.0;
        double cumulativeValue = 0.0;
        for (int i = 1; i <= row; ++i) {
            const TableRow &earlier = m_table.row(i);
            if (earlier.isThinning()) {
                cumulativeVolume += earlier.record.removedVolume;
                cumulativeValue += i == row ? valuePerHa : earlier.removedValue;
            }
        }
        const double area = netArea();
        rowformat::writeThinningCells(r, valuePerHa, cumulativeVolume, cumulativeValue, area);

        // Numbers: the volume before the thinning, so the next growth row's
        // increment counts the growth since the thinning; the removal.
        r.numbers = {};
        r.numbers[kNumAge] = rec.age;
        r.numbers[kNumVolume] = rec.volume + rec.removedVolume;
        r.numbers[kNumRemovedVolume] = rec.removedVolume;
        r.removedValue = valuePerHa;
        rowformat::writeTotalProduction(r, m_table.removalsUpTo(row - 1), area);
        writeIncrements(row, false);

        // The cash flow values thinnings at long-term average prices, in the
        // class the lookup above found (a failed lookup has already said so).
        const int priceClass = prices::walkPriceClasses(meanTree, QLocale::system()).priceClass;
        r.timberRevenue = rec.removedVolume *
                          m_prices.data().longTermAverage.at(static_cast<std::size_t>(priceClass));
    });
    m_table.select(row, row);
    notifyTable(row);
    return row;
}

void StandWork::appendAssortmentRow(TableRow row) {
    const int index = m_table.append(std::move(row));
    notifyTable(index);
}

int StandWork::fellLastStand(const QString &label, shell::IInteractive &interactive) {
    const int standRow = lastStandRow();
    int R = m_table.lastRow();
    const double area = netArea();
    if (standRow != R || m_table.row(standRow).isThinning()) {
        // A thinning (or reports after it) ends the table: the final cut fells
        // the stand left by the thinning, in a row of its own at the same age,
        // so the thinning keeps its row and its revenue.
        const RowRecord stand = m_table.row(standRow).record;
        TableRow felled = rowOfStand(engine::StandState{stand.age, stand.basalArea, stand.stocking,
                                                        stand.topHeight, stand.volume},
                                     RowKind::Growth, QString());
        felled.record.dbh = stand.dbh;
        R = m_table.append(std::move(felled));
        TableRow &row = m_table.row(R);
        rowformat::writeStandCells(row);
        rowformat::writeTotalProduction(row, m_table.removalsUpTo(R - 1), area);
        writeIncrements(R, false);
    }

    TableRow &row = m_table.row(R);
    const double standing = row.record.volume;
    row.finalCut = true;
    row.label = label;
    // The trees and the mean tree as the row shows them (format, then read).
    const double trees = std::nearbyint(shell::val(row.cells[kColStocking]));
    const double meanTree = rotation::felledMeanTree(row.record.volume, row.record.stocking);
    const auto index = static_cast<std::size_t>(prices::priceClassOf(meanTree, interactive));
    const double price = m_prices.pricesInUse().at(index);
    rowformat::writeFinalCutCells(row, standing, trees, meanTree, price, area);
    row.removedValue = standing * price;
    row.numbers[kNumRemovedVolume] = standing;
    row.timberRevenue = standing * m_prices.data().longTermAverage.at(index);
    m_table.select(R, R);
    notifyTable(R);
    return R;
}

void StandWork::removeRowsFrom(int first) {
    if (first <= 1) {
        clear(HeaderLayout::WithMoney);
        return;
    }
    m_table.removeFrom(first);
    m_table.setHeaderLayout(HeaderLayout::WithMoney);
    m_cashFlow.reset();
    // Growing goes on from the new last row.
    const int last = m_table.lastRow();
    m_table.select(last, last);
    if (lastStandRow() == last) {
        copyRowToFields(last);
    }
    emit cashFlowChanged();
    notifyTable(1);
}

void StandWork::clear(HeaderLayout layout) {
    m_table.clear(layout);
    m_cashFlow.reset();
    emit cashFlowChanged();
    notifyTable(1);
}

std::optional<Summary> StandWork::summary() const {
    using shell::formatNumber;
    Summary s;
    // Rows whose marker cell is not empty: the start, the thinnings and the
    // final cut.
    double thinnedVolume = 0.0;
    double thinnedValue = 0.0;
    // Assortment rows go with the stand row they follow.
    bool standCopied = false;
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        const TableRow &source = m_table.row(r);
        if (source.isThinning()) {
            thinnedVolume += source.record.removedVolume;
            thinnedValue += source.removedValue;
        }
        if (source.isText()) {
            if (standCopied) {
                s.rows.push_back(source);
            }
            continue;
        }
        standCopied = !source.cells.value(kColSeparator1).isEmpty();
        if (!standCopied) {
            continue;
        }
        TableRow copy = source;
        copy.label = source.finalCut       ? text::summaryFinalCut()
                     : source.isThinning() ? text::summaryThinning()
                                           : text::summaryStart();
        s.rows.push_back(std::move(copy));
    }
    if (s.rows.empty()) {
        return std::nullopt;
    }

    // The rotation's totals, at the age of the last stand.
    s.totalsFrom = static_cast<int>(s.rows.size());
    const int last = lastStandRow();
    const double area = netArea();
    if (last > 0) {
        const TableRow &end = m_table.row(last);
        const double finalVolume = end.finalCut ? end.numbers[kNumRemovedVolume] : 0.0;
        const double standing = end.finalCut ? 0.0 : end.record.volume;
        const double production = thinnedVolume + finalVolume + standing;
        TableRow total = rowformat::totalsRow(text::summaryTotalProduction());
        total.cells[kColAge] = end.cells.value(kColAge);
        total.cells[kColTotVolumePerHa] = formatNumber(production, u"###0");
        total.cells[kColTotVolume] = formatNumber(production * area, u"##0");
        s.rows.push_back(std::move(total));
    }
    TableRow thinned = rowformat::totalsRow(text::summaryTotalThinned());
    thinned.cells[kColThinVolumePerHa] = formatNumber(thinnedVolume, u"###0");
    thinned.cells[kColValuePerHa] = formatNumber(thinnedValue, u"0");
    thinned.cells[kColThinTotalVolume] = formatNumber(thinnedVolume * area, u"##0");
    thinned.cells[kColThinTotalValue] = formatNumber(thinnedValue * area, u"##0");
    s.rows.push_back(std::move(thinned));

    int maiRow = 0;
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        const TableRow &row = m_table.row(r);
        if ((row.isGrowth() || row.isThinning()) &&
            (maiRow == 0 || row.numbers[kNumMai] > m_table.row(maiRow).numbers[kNumMai])) {
            maiRow = r;
        }
    }
    if (maiRow > 0) {
        TableRow mai = rowformat::totalsRow(text::summaryMaximumMai());
        mai.cells[kColAge] = m_table.row(maiRow).cells.value(kColAge);
        mai.cells[kColMai] = formatNumber(m_table.row(maiRow).numbers[kNumMai], u"#0.0");
        s.rows.push_back(std::move(mai));
    }
    TableRow yc = rowformat::totalsRow(text::summaryYieldClass());
    yc.cells[kColMai] = QString::number(yieldClass());
    s.rows.push_back(std::move(yc));
    return s;
}

namespace {
/// What a rotation is read by: the stand, the removals and their value, total
/// production and the mean annual increment.
const std::vector<int> &summaryColumns() {
    static const std::vector<int> columns = {kColAge,
                                             kColTopHeight,
                                             kColStocking,
                                             kColDbh,
                                             kColBasalArea,
                                             kColVolumePerTree,
                                             kColVolumePerHa,
                                             kColThinStocking,
                                             kColThinDbh,
                                             kColThinBasalArea,
                                             kColThinVolumePerTree,
                                             kColThinVolumePerHa,
                                             kColValuePerHa,
                                             kColThinTotalVolume,
                                             kColThinTotalValue,
                                             kColTotVolumePerHa,
                                             kColTotVolume,
                                             kColMai};
    return columns;
}
} // namespace

std::vector<QStringList> StandWork::summaryGrid(const Summary &summary) const {
    return m_table.exportGrid(summary.rows, text::summaryLabelCaption(), summaryColumns());
}

QStringList StandWork::summaryGroups() const {
    return m_table.exportGroups(summaryColumns());
}

} // namespace arbolex::work
