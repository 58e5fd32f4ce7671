#include "work/rowformat.hpp"

#include "rotation/growcommand.hpp"
#include "rotation/rotation.hpp"
#include "rotation/standmath.hpp"
#include "shell/vbformat.hpp"
#include "work/worktexts.hpp"

#include <array>
#include <cmath>

namespace arbolex::work::rowformat {

namespace {

using shell::formatNumber;

QString pattern(std::string_view p) {
    return QString::fromLatin1(p.data(), static_cast<qsizetype>(p.size()));
}

/// The columns an assortment row fills, in order: two per class (share, then
/// volume), the separator column left out.
constexpr std::array<int, 10> kAssortmentColumns = {
    kColTopHeight,   kColStocking,     kColDbh,     kColBasalArea,     kColVolumePerTree,
    kColVolumePerHa, kColThinStocking, kColThinDbh, kColThinBasalArea, kColThinVolumePerTree};

} // namespace

QString wholeText(double value) {
    return QString::number(static_cast<qint64>(std::nearbyint(value)));
}

void writeStandCells(TableRow &row) {
    const RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    cells[kColAge] = shell::singleText(rec.age);
    cells[kColTopHeight] = formatNumber(rec.topHeight, pattern(rotation::kTopHeightCell));
    const double stocking = std::nearbyint(double{rec.stocking});
    cells[kColStocking] = wholeText(rec.stocking);
    cells[kColDbh] = formatNumber(rec.dbh, u"##0.0");
    cells[kColBasalArea] = formatNumber(rec.basalArea, pattern(rotation::kBasalAreaCell));
    if (rec.volume <= 0.0f) {
        cells[kColVolumePerTree] = text::outOfRange();
        cells[kColVolumePerHa] = text::outOfRange();
    } else {
        cells[kColVolumePerTree] =
            stocking > 0.0 ? formatNumber(rec.volume / stocking, pattern(rotation::kMeanTreeCell))
                           : QString();
        cells[kColVolumePerHa] = formatNumber(rec.volume, u"###0");
    }
}

void writeTotalProduction(TableRow &row, const ProjectionTable::Removals &before, double netArea) {
    const RowRecord &rec = row.record;
    QStringList &cells = row.cells;
    auto totalStocking = static_cast<float>(rec.stocking + rec.removedStocking + before.stocking);
    auto totalBasalArea =
        static_cast<float>(rec.basalArea + rec.removedBasalArea + before.basalArea);
    const double totalVolume = rec.volume + rec.removedVolume + before.volume;
    cells[kColTotStocking] = wholeText(totalStocking);
    cells[kColTotBasalArea] = formatNumber(totalBasalArea, u"##0.0");
    cells[kColTotDbh] =
        formatNumber(rotation::dbhFromBasalArea(totalBasalArea, totalStocking), u"##0.0");
    if (totalVolume <= 0.0) {
        cells[kColTotVolumePerTree] = text::outOfRange();
        cells[kColTotVolumePerHa] = text::outOfRange();
    } else {
        cells[kColTotVolumePerTree] =
            formatNumber(totalVolume / std::nearbyint(double{totalStocking}), u"#0.000");
        cells[kColTotVolumePerHa] = formatNumber(totalVolume, u"###0");
    }
    cells[kColTotVolume] = formatNumber(totalVolume * netArea, u"##0");
}

void writeThinningCells(TableRow &row, double valuePerHa, double cumulativeVolume,
                        double cumulativeValue, double netArea) {
    const RowRecord &rec = row.record;
    row.cells = QStringList();
    for (int c = 0; c < kColumnCount; ++c) {
        row.cells.append(QString());
    }
    QStringList &cells = row.cells;

    // The summary carries every thinning: its marker cell is not empty.
    cells[kColSeparator1] = text::summaryMarker();

    // Main crop: the stand after the thinning.
    cells[kColAge] = shell::singleText(rec.age);
    cells[kColTopHeight] = formatNumber(rec.topHeight, pattern(rotation::kTopHeightCell));
    cells[kColStocking] = wholeText(rec.stocking);
    cells[kColDbh] = formatNumber(rec.dbh, u"##0.0");
    cells[kColBasalArea] = formatNumber(rec.basalArea, pattern(rotation::kBasalAreaCell));
    const double postTrees = std::nearbyint(double{rec.stocking});
    cells[kColVolumePerTree] =
        postTrees > 0.0 ? formatNumber(rec.volume / postTrees, u"#0.000") : QString();
    cells[kColVolumePerHa] = formatNumber(rec.volume, u"###0");

    // The removal and its value at the price of its mean tree.
    const float removedTrees = std::fabs(rec.removedStocking);
    const float removedBasalArea = std::fabs(rec.removedBasalArea);
    cells[kColThinStocking] = formatNumber(removedTrees, u"###0");
    float b = removedBasalArea;
    float n = removedTrees;
    cells[kColThinDbh] =
        formatNumber(rotation::truncateToTenth(rotation::dbhFromBasalArea(b, n)), u"##0.0");
    cells[kColThinBasalArea] = formatNumber(removedBasalArea, u"##0.0");
    if (rec.removedVolume <= 0.0f) {
        cells[kColThinVolumePerTree] = text::outOfRange();
        cells[kColThinVolumePerHa] = text::outOfRange();
    } else {
        cells[kColThinVolumePerTree] = formatNumber(
            rotation::removedMeanTree(rec.removedVolume, rec.removedStocking), u"#0.000");
        cells[kColThinVolumePerHa] = formatNumber(rec.removedVolume, u"###0");
    }
    cells[kColValuePerHa] = formatNumber(valuePerHa, u"####0");
    cells[kColThinTotalVolume] = formatNumber(cumulativeVolume * netArea, u"####0");
    cells[kColThinTotalValue] = formatNumber(cumulativeValue * netArea, u"####0");
}

void writeFinalCutCells(TableRow &row, double standingVolume, double trees, double meanTree,
                        double price, double netArea) {
    QStringList &cells = row.cells;
    cells[kColSeparator1] = text::summaryMarker();
    // The standing crop becomes the removal.
    for (int c = kColStocking; c <= kColVolumePerHa; ++c) {
        if (c == kColVolumePerHa) {
            cells[c] = formatNumber(standingVolume, u"0.0");
        }
        cells[c + 6] = cells[c];
    }
    cells[kColValuePerHa] = formatNumber(standingVolume * price, u"0");
    cells[kColThinTotalVolume] = formatNumber(trees * meanTree * netArea, u"##0");
    cells[kColThinTotalValue] = formatNumber(trees * meanTree * price * netArea, u"##0");
    cells[kColSeparator2].clear();
    // The crop is gone: its total-production cells read 0; the summary keeps
    // the rotation's totals.
    for (int c = kColTotStocking; c <= kColTotVolume; ++c) {
        cells[c] = QStringLiteral("0");
    }
}

void writeCurrentIncrement(TableRow &row, double cai) {
    row.cells[kColCai] = formatNumber(cai, u"#");
}

void writeMeanIncrement(TableRow &row, double mai) {
    row.cells[kColMai] = formatNumber(mai, u"#");
}

TableRow assortmentRow(const QString &label, float age,
                       const std::vector<AssortmentClass> &classes) {
    TableRow row;
    row.kind = RowKind::Text;
    row.label = label;
    row.record.age = age;
    row.numbers[kNumAge] = age;
    for (int c = 0; c < kColumnCount; ++c) {
        row.cells.append(QString());
    }
    row.cells[kColAge] = shell::singleText(age);
    for (std::size_t i = 0; i < classes.size() && 2 * i + 1 < kAssortmentColumns.size(); ++i) {
        const AssortmentClass &c = classes[i];
        row.cells[kAssortmentColumns[2 * i]] =
            c.name + QStringLiteral("(%) ") + formatNumber(c.percent, u"##0.0");
        row.cells[kAssortmentColumns[2 * i + 1]] =
            c.name + QStringLiteral("(m3/ha) ") + formatNumber(c.volume, u"###0.00");
    }
    return row;
}

TableRow totalsRow(const QString &label) {
    TableRow row;
    row.kind = RowKind::Text;
    row.label = label;
    for (int c = 0; c < kColumnCount; ++c) {
        row.cells.append(QString());
    }
    return row;
}

} // namespace arbolex::work::rowformat
