// The rotation summary `flxSummary`: the start, every thinning and the final
// cut, then the rotation's totals, each value under its own caption.
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

namespace arbolex::workflow {

using shell::formatNumber;

namespace {

/// A summary row with `label` and no cell filled yet.
work::TableRow totalsRow(const QString &label) {
    work::TableRow row;
    row.kind = work::RowKind::Text;
    row.label = label;
    for (int c = 0; c < work::kColumnCount; ++c) {
        row.cells.append(QString());
    }
    return row;
}

} // namespace

bool MainWindowLogic::FillSummary() {
    bool filled = false;
    shell::guard(m_log, QStringLiteral(" in frmMain.FillSummary()"), [&] {
        if (m_table.rowCount() < 2) {
            message(text::titleArbolex(), text::nothingToSummarize(), shell::kInformation);
            return;
        }
        m_summary.clear();
        showSummary(true);

        // Rows whose marker cell is not empty: the start, the thinnings and
        // the final cut.
        double thinnedVolume = 0.0;
        double thinnedValue = 0.0;
        // Assortment rows go with the stand row they follow.
        bool standCopied = false;
        for (int r = 1; r <= m_table.lastRow(); ++r) {
            const work::TableRow &source = m_table.row(r);
            if (source.isThinning()) {
                thinnedVolume += source.record.removedVolume;
                thinnedValue += source.removedValue;
            }
            if (source.isText()) {
                if (standCopied) {
                    m_summary.push_back(source);
                }
                continue;
            }
            standCopied = !source.cells.value(work::kColSeparator1).isEmpty();
            if (!standCopied) {
                continue;
            }
            work::TableRow copy = source;
            copy.label = source.finalCut       ? text::summaryFinalCut()
                         : source.isThinning() ? text::summaryThinning()
                                               : text::summaryStart();
            m_summary.push_back(std::move(copy));
        }
        if (m_summary.empty()) {
            message(text::titleArbolex(), text::nothingToSummarize(), shell::kInformation);
            return;
        }

        // The rotation's totals, at the age of the last stand.
        m_summaryTotalsFrom = static_cast<int>(m_summary.size());
        const int last = lastStandRow();
        const double area = netArea();
        if (last > 0) {
            const work::TableRow &end = m_table.row(last);
            const double finalVolume = end.finalCut ? end.numbers[work::kNumRemovedVolume] : 0.0;
            const double standing = end.finalCut ? 0.0 : end.record.volume;
            const double production = thinnedVolume + finalVolume + standing;
            work::TableRow total = totalsRow(text::summaryTotalProduction());
            total.cells[work::kColAge] = end.cells.value(work::kColAge);
            total.cells[work::kColTotVolumePerHa] = formatNumber(production, u"###0");
            total.cells[work::kColTotVolume] = formatNumber(production * area, u"##0");
            m_summary.push_back(std::move(total));
        }
        work::TableRow thinned = totalsRow(text::summaryTotalThinned());
        thinned.cells[work::kColThinVolumePerHa] = formatNumber(thinnedVolume, u"###0");
        thinned.cells[work::kColValuePerHa] = formatNumber(thinnedValue, u"0");
        thinned.cells[work::kColThinTotalVolume] = formatNumber(thinnedVolume * area, u"##0");
        thinned.cells[work::kColThinTotalValue] = formatNumber(thinnedValue * area, u"##0");
        m_summary.push_back(std::move(thinned));

        int maiRow = 0;
        for (int r = 1; r <= m_table.lastRow(); ++r) {
            const work::TableRow &row = m_table.row(r);
            if ((row.isGrowth() || row.isThinning()) &&
                (maiRow == 0 ||
                 row.numbers[work::kNumMai] > m_table.row(maiRow).numbers[work::kNumMai])) {
                maiRow = r;
            }
        }
        if (maiRow > 0) {
            work::TableRow mai = totalsRow(text::summaryMaximumMai());
            mai.cells[work::kColAge] = m_table.row(maiRow).cells.value(work::kColAge);
            mai.cells[work::kColMai] =
                formatNumber(m_table.row(maiRow).numbers[work::kNumMai], u"#0.0");
            m_summary.push_back(std::move(mai));
        }
        work::TableRow yc = totalsRow(text::summaryYieldClass());
        yc.cells[work::kColMai] = QString::number(yieldClass());
        m_summary.push_back(std::move(yc));
        filled = true;
    });
    m_view.tableChanged(1);
    return filled;
}

namespace {
/// What a rotation is read by: the stand, the removals and their value, total
/// production and the mean annual increment.
const std::vector<int> &summaryColumns() {
    static const std::vector<int> columns = {work::kColAge,
                                             work::kColTopHeight,
                                             work::kColStocking,
                                             work::kColDbh,
                                             work::kColBasalArea,
                                             work::kColVolumePerTree,
                                             work::kColVolumePerHa,
                                             work::kColThinStocking,
                                             work::kColThinDbh,
                                             work::kColThinBasalArea,
                                             work::kColThinVolumePerTree,
                                             work::kColThinVolumePerHa,
                                             work::kColValuePerHa,
                                             work::kColThinTotalVolume,
                                             work::kColThinTotalValue,
                                             work::kColTotVolumePerHa,
                                             work::kColTotVolume,
                                             work::kColMai};
    return columns;
}
} // namespace

std::vector<QStringList> MainWindowLogic::summaryGrid() const {
    return m_table.exportGrid(m_summary, text::summaryLabelCaption(), summaryColumns());
}

QStringList MainWindowLogic::summaryGroups() const {
    return m_table.exportGroups(summaryColumns());
}

void MainWindowLogic::showSummary(bool summary) {
    m_showingSummary = summary;
    m_view.showSummary(summary);
    m_view.setText(MainControl::lblTableTitle,
                   summary ? text::summary() : text::standProjections());
    m_view.setText(MainControl::cmdSummary,
                   summary ? text::gotoStandProjections() : text::gotoSummary());
}

void MainWindowLogic::cmdSummary_Click() {
    if (m_showingSummary) {
        showSummary(false);
    } else {
        FillSummary();
    }
}

} // namespace arbolex::workflow
