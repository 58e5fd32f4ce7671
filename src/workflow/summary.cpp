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
TableRow totalsRow(const QString &label) {
    TableRow row;
    row.kind = RowKind::Text;
    row.label = label;
    for (int c = 0; c < kColumnCount; ++c) {
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
            const TableRow &source = m_table.row(r);
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
            standCopied = !source.cells.value(kColSeparator1).isEmpty();
            if (!standCopied) {
                continue;
            }
            TableRow copy = source;
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
            const TableRow &end = m_table.row(last);
            const double finalVolume = end.finalCut ? end.numbers[kNumRemovedVolume] : 0.0;
            const double standing = end.finalCut ? 0.0 : end.record.volume;
            const double production = thinnedVolume + finalVolume + standing;
            TableRow total = totalsRow(text::summaryTotalProduction());
            total.cells[kColAge] = end.cells.value(kColAge);
            total.cells[kColTotVolumePerHa] = formatNumber(production, u"###0");
            total.cells[kColTotVolume] = formatNumber(production * area, u"##0");
            m_summary.push_back(std::move(total));
        }
        TableRow thinned = totalsRow(text::summaryTotalThinned());
        thinned.cells[kColThinVolumePerHa] = formatNumber(thinnedVolume, u"###0");
        thinned.cells[kColValuePerHa] = formatNumber(thinnedValue, u"0");
        thinned.cells[kColThinTotalVolume] = formatNumber(thinnedVolume * area, u"##0");
        thinned.cells[kColThinTotalValue] = formatNumber(thinnedValue * area, u"##0");
        m_summary.push_back(std::move(thinned));

        int maiRow = 0;
        for (int r = 1; r <= m_table.lastRow(); ++r) {
            const TableRow &row = m_table.row(r);
            if ((row.isGrowth() || row.isThinning()) &&
                (maiRow == 0 || row.numbers[kNumMai] > m_table.row(maiRow).numbers[kNumMai])) {
                maiRow = r;
            }
        }
        if (maiRow > 0) {
            TableRow mai = totalsRow(text::summaryMaximumMai());
            mai.cells[kColAge] = m_table.row(maiRow).cells.value(kColAge);
            mai.cells[kColMai] = formatNumber(m_table.row(maiRow).numbers[kNumMai], u"#0.0");
            m_summary.push_back(std::move(mai));
        }
        TableRow yc = totalsRow(text::summaryYieldClass());
        yc.cells[kColMai] = QString::number(yieldClass());
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
