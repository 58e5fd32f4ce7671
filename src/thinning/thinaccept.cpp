// Accepting a thinning: the thinning record, the thinning row of the
// projection table, its value, and the thinned stand as the new grow-from.
#include "assortments/assortwindowlogic.hpp"
#include "prices/pricelookup.hpp"
#include "prices/prices.hpp"
#include "rotation/rotation.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinmessages.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"
#include "workflow/standmath.hpp"

#include <QLocale>

#include <cmath>

namespace arbolex::thinning {

using shell::formatNumber;
using work::Column;
using workflow::MainControl;

namespace {

QString wholeText(double value) {
    return QString::number(static_cast<qint64>(std::nearbyint(value)));
}

} // namespace

void ThinWindowLogic::cmdAccept_Click() {
    try {
        work::ProjectionTable &table = m_main.tableForThinning();
        const int row = table.currentRow();
        if (row < 1) {
            return;
        }
        const work::TableRow &current = table.row(row);
        const ThinningWork &w = m_work;
        const bool nothingRemoved = !w.previewed || w.preBasalArea == w.postBasalArea;
        if (current.isGrowth() && !m_flags.editingExisting && nothingRemoved) {
            // Nothing removed: no thinning is stored.
            m_main.SetGrowFrom(0.0f, w.preBasalArea, w.preStocking, w.topHeight, 0.0f, -1.0f);
            if (!m_flags.loopUnderWay) {
                m_view.close();
            }
            return;
        }
        m_main.SetGrowFrom(0.0f, w.postBasalArea, w.postStocking, w.topHeight, 0.0f, -1.0f);

        work::RowRecord record;
        record.age = current.record.age;
        record.topHeight = w.topHeight;
        record.basalArea = w.postBasalArea;
        record.stocking = w.postStocking;
        record.volume = w.postVolume;
        // The loop takes the diameter the window shows; both are the same
        // truncated value.
        float postB = w.postBasalArea;
        float postN = w.postStocking;
        record.dbh = m_flags.loopUnderWay && shell::isNumeric(m_view.text(ThinControl::lblPostD))
                         ? static_cast<float>(shell::val(m_view.text(ThinControl::lblPostD)))
                         : workflow::truncateToTenth(workflow::dbhFromBasalArea(postB, postN));
        record.removedBasalArea = w.preBasalArea - w.postBasalArea;
        record.removedStocking = w.preStocking - w.postStocking;
        record.removedVolume = std::fabs(w.preVolume - w.postVolume);
        record.postDbh = record.dbh;

        int thinRow = row;
        if (m_flags.editingExisting) {
            // A second Accept at the same age replaces the old thinning.
            table.row(row).record = record;
        } else {
            work::TableRow thinning;
            thinning.kind = work::RowKind::Thinning;
            thinning.label = workflow::text::rowLabelThinning();
            thinning.record = record;
            thinRow = table.append(std::move(thinning));
        }
        WriteThinLine(workflow::text::rowLabelThinning(), thinRow);
        if (m_assort != nullptr) {
            m_assort->appendPendingRows(w, record.age);
        }
        table.select(thinRow, thinRow);
        SetGrowFromAfterThin();
        if (!m_flags.loopUnderWay) {
            m_view.close();
        }
    } catch (const shell::AppFault &fault) {
        m_interactive.message(workflow::text::titleArbolex(), text::acceptFailed(),
                              shell::kExclamation);
        m_main.errorLog().append(
            shell::windowFaultLine(fault, QStringLiteral(" in frmThin.cmdAccept_Click()")));
    }
}

void ThinWindowLogic::WriteThinLine(const QString &label, int row) {
    shell::guard(m_main.errorLog(), QStringLiteral(" in Misc.WriteThinLine()"), [&] {
        work::ProjectionTable &table = m_main.tableForThinning();
        work::TableRow &r = table.row(row);
        const work::RowRecord &rec = r.record;
        r.kind = work::RowKind::Thinning;
        r.label = label;
        r.cells = QStringList();
        for (int c = 0; c < work::kColumnCount; ++c) {
            r.cells.append(QString());
        }
        QStringList &cells = r.cells;

        // The summary carries every thinning: its marker cell is not empty.
        cells[work::kColSeparator1] = workflow::text::summaryMarker();

        // Main crop: the stand after the thinning.
        cells[work::kColAge] = shell::singleText(rec.age);
        cells[work::kColTopHeight] = formatNumber(rec.topHeight, u"#0.0");
        cells[work::kColStocking] = wholeText(rec.stocking);
        cells[work::kColDbh] = formatNumber(rec.dbh, u"##0.0");
        cells[work::kColBasalArea] = formatNumber(rec.basalArea, u"##0.0");
        const double postTrees = std::nearbyint(double{rec.stocking});
        cells[work::kColVolumePerTree] =
            postTrees > 0.0 ? formatNumber(rec.volume / postTrees, u"#0.000") : QString();
        cells[work::kColVolumePerHa] = formatNumber(rec.volume, u"###0");

        // The removal and its value at the price of its mean tree.
        const float removedTrees = std::fabs(rec.removedStocking);
        const float removedBasalArea = std::fabs(rec.removedBasalArea);
        cells[work::kColThinStocking] = formatNumber(removedTrees, u"###0");
        float b = removedBasalArea;
        float n = removedTrees;
        cells[work::kColThinDbh] =
            formatNumber(workflow::truncateToTenth(workflow::dbhFromBasalArea(b, n)), u"##0.0");
        cells[work::kColThinBasalArea] = formatNumber(removedBasalArea, u"##0.0");
        const double meanTree = rotation::removedMeanTree(rec.removedVolume, rec.removedStocking);
        if (rec.removedVolume <= 0.0f) {
            cells[work::kColThinVolumePerTree] = workflow::text::outOfRange();
            cells[work::kColThinVolumePerHa] = workflow::text::outOfRange();
        } else {
            cells[work::kColThinVolumePerTree] = formatNumber(meanTree, u"#0.000");
            cells[work::kColThinVolumePerHa] = formatNumber(rec.removedVolume, u"###0");
        }
        prices::Prices &prices = m_main.prices();
        const double price =
            prices::TrouveIndicePrix(meanTree, prices.data().current, m_interactive);
        const double valuePerHa = rec.removedVolume * price;
        cells[work::kColValuePerHa] = formatNumber(valuePerHa, u"####0");

        // Cumulative thinning volume and value of the sub-compartment: this
        // removal and every earlier one, over the net area.
        double cumulativeVolume = 0.0;
        double cumulativeValue = 0.0;
        for (int i = 1; i <= row; ++i) {
            const work::TableRow &earlier = table.row(i);
            if (earlier.isThinning()) {
                cumulativeVolume += earlier.record.removedVolume;
                cumulativeValue += i == row ? valuePerHa : earlier.removedValue;
            }
        }
        const double area = m_main.netArea();
        cells[work::kColThinTotalVolume] = formatNumber(cumulativeVolume * area, u"####0");
        cells[work::kColThinTotalValue] = formatNumber(cumulativeValue * area, u"####0");

        // Numbers: the volume before the thinning, so the next growth row's
        // increment counts the growth since the thinning; the removal.
        r.numbers = {};
        r.numbers[work::kNumAge] = rec.age;
        r.numbers[work::kNumVolume] = rec.volume + rec.removedVolume;
        r.numbers[work::kNumRemovedVolume] = rec.removedVolume;
        r.removedValue = valuePerHa;
        m_main.fillTotalProduction(r, row);
        m_main.writeIncrements(row, false);

        // The cash flow values thinnings at long-term average prices, in the
        // class the lookup above found (a failed lookup has already said so).
        const int priceClass = prices::walkPriceClasses(meanTree, QLocale::system()).priceClass;
        r.timberRevenue = rec.removedVolume *
                          prices.data().longTermAverage.at(static_cast<std::size_t>(priceClass));
        m_main.timberRevenueChanged();

        m_flags.noThinningYet = false;
        m_main.thinningWritten(row, rec.volume);
    });
}

void ThinWindowLogic::SetGrowFromAfterThin() {
    shell::guard(m_main.errorLog(), QStringLiteral(" in Misc.SetGrowFromAfterThin()"), [&] {
        const work::ProjectionTable &table = m_main.table();
        const int row = table.currentRow();
        if (row < 1) {
            return;
        }
        const QStringList &cells = table.row(row).cells;
        workflow::IMainView &main = m_main.view();
        main.setText(MainControl::txtFromA, cells.value(work::kColAge));
        main.setText(MainControl::txtFromH, cells.value(work::kColTopHeight));
        main.setText(MainControl::txtFromN, cells.value(work::kColStocking));
        main.setText(MainControl::txtFromB, cells.value(work::kColBasalArea));
        main.setText(MainControl::txtFromD, cells.value(work::kColDbh));
        if (m_flags.loopUnderWay) {
            // The next grow of the loop reaches the next thinning age.
            const double frequency =
                std::nearbyint(shell::val(m_view.text(ThinControl::txtThinFreq)));
            const double age = shell::val(cells.value(work::kColAge));
            main.setText(MainControl::txtToA, formatNumber(age + frequency, u"##0"));
            main.setText(MainControl::txtByA, formatNumber(frequency, u"##0"));
        }
    });
}

} // namespace arbolex::thinning
