// Closing the rotation: the final cut, its value and yield class, and the
// cash flow of the rotation that the net present value window opens on.
#include "economics/npvwindowlogic.hpp"
#include "prices/pricelookup.hpp"
#include "prices/prices.hpp"
#include "rotation/rotation.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <cmath>

namespace arbolex::workflow {

using shell::formatNumber;

int MainWindowLogic::lastStandRow() const {
    for (int r = m_table.lastRow(); r >= 1; --r) {
        const work::TableRow &row = m_table.row(r);
        if (row.isGrowth() || row.isThinning()) {
            return r;
        }
    }
    return 0;
}

void MainWindowLogic::timberRevenueChanged() {
    m_timberRevenue.clear();
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        const work::TableRow &row = m_table.row(r);
        if (row.timberRevenue != 0.0) {
            m_timberRevenue.add(static_cast<int>(std::nearbyint(row.record.age)),
                                row.timberRevenue);
        }
    }
}

void MainWindowLogic::cmdFinalCut_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdFinalCut_Click()"), [&] {
        if (m_felled) {
            return;
        }
        const int standRow = lastStandRow();
        if (standRow == 0) {
            message(text::titleArbolex(), text::nothingToFell(), shell::kExclamation);
            return;
        }
        for (int r = standRow + 1; r <= m_table.lastRow(); ++r) {
            if (m_table.row(r).kind == work::RowKind::Failed) {
                message(text::titleArbolex(), text::failedRowsBeforeFinalCut(),
                        shell::kExclamation);
                return;
            }
        }
        int R = m_table.lastRow();
        if (standRow != R || m_table.row(standRow).isThinning()) {
            // A thinning (or reports after it) ends the table: the final cut
            // fells the stand left by the thinning, in a row of its own at the
            // same age, so the thinning keeps its row and its revenue.
            work::TableRow felled;
            felled.kind = work::RowKind::Growth;
            // A copy: the append below may move every row of the table.
            const work::RowRecord stand = m_table.row(standRow).record;
            felled.record.age = stand.age;
            felled.record.topHeight = stand.topHeight;
            felled.record.basalArea = stand.basalArea;
            felled.record.stocking = stand.stocking;
            felled.record.volume = stand.volume;
            felled.record.dbh = stand.dbh;
            felled.numbers[work::kNumAge] = stand.age;
            felled.numbers[work::kNumVolume] = stand.volume;
            for (int c = 0; c < work::kColumnCount; ++c) {
                felled.cells.append(QString());
            }
            R = m_table.append(std::move(felled));
            buildGrowthCells(m_table.row(R), R);
            writeIncrements(R, false);
            m_standingVolume = stand.volume;
        }

        work::TableRow &row = m_table.row(R);
        QStringList &cells = row.cells;
        row.finalCut = true;
        row.label = text::rowLabelFinalCut();
        const double area = netArea();
        cells[work::kColSeparator1] = text::summaryMarker();
        // The standing crop becomes the removal.
        for (int c = work::kColStocking; c <= work::kColVolumePerHa; ++c) {
            if (c == work::kColVolumePerHa) {
                cells[c] = formatNumber(m_standingVolume, u"0.0");
            }
            cells[c + 6] = cells[c];
        }
        // The trees and the mean tree as the row shows them (format, then read).
        const double trees = std::nearbyint(shell::val(cells[work::kColStocking]));
        const double volumePerTree =
            rotation::felledMeanTree(row.record.volume, row.record.stocking);
        const auto index =
            static_cast<std::size_t>(prices::priceClassOf(volumePerTree, m_interactive));
        const double price = m_prices.pricesInUse().at(index);
        cells[work::kColValuePerHa] = formatNumber(m_standingVolume * price, u"0");
        row.removedValue = m_standingVolume * price;
        row.numbers[work::kNumRemovedVolume] = m_standingVolume;
        row.timberRevenue = m_standingVolume * m_prices.data().longTermAverage.at(index);
        timberRevenueChanged();
        cells[work::kColThinTotalVolume] = formatNumber(trees * volumePerTree * area, u"##0");
        cells[work::kColThinTotalValue] =
            formatNumber(trees * volumePerTree * price * area, u"##0");
        cells[work::kColSeparator2].clear();
        // The crop is gone: its total-production cells read 0; the summary
        // keeps the rotation's totals.
        for (int c = work::kColTotStocking; c <= work::kColTotVolume; ++c) {
            cells[c] = QStringLiteral("0");
        }

        m_felled = true;
        m_view.setEnabled(MainControl::cmdThin, false);
        m_view.setEnabled(MainControl::cmdFinalCut, false);
        m_view.setEnabled(MainControl::cmdGrow, false);
        if (m_thinning != nullptr) {
            m_thinning->view().close();
        }
        m_table.select(R, R);
        m_view.tableChanged(R);

        m_view.setText(MainControl::lblYC, QString::number(yieldClass()));
        m_view.setHint(MainControl::lblYC, text::yieldClassAtClearfell());

        if (m_interactive.askYesNo(text::titleNpv(), text::npvOffer())) {
            m_view.setEnabled(MainControl::cmdNPV, true);
            m_cashFlow.SetRotationLength(
                static_cast<int>(std::nearbyint(m_table.row(1).numbers[work::kNumAge])),
                static_cast<int>(std::nearbyint(row.numbers[work::kNumAge])));
            m_cashFlow.DimNPVArrays();
        }
    });
}

void MainWindowLogic::cmdNPV_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdNPV_Click()"), [&] {
        if (m_npv == nullptr || m_cashFlow.years() == 0) {
            return;
        }
        m_npv->Form_Load();
        m_npv->view().showWindow();
    });
}

} // namespace arbolex::workflow
