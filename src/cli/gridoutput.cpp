#include "cli/gridoutput.hpp"

#include <QJsonObject>

#include <array>

namespace arbolex::cli {

namespace {

using namespace work;

/// The key of each column of the grid (cli/units.hpp gives their units);
/// none for the separators.
constexpr std::array<const char *, kColumnCount> kGridKeys = {
    "age",
    "top_height",
    "stocking",
    "dbh",
    "basal_area",
    "mean_tree_volume",
    "volume",
    nullptr,
    "thin_stocking",
    "thin_dbh",
    "thin_basal_area",
    "thin_mean_tree_volume",
    "thin_volume",
    "thin_value",
    "thin_total_volume",
    "thin_total_value",
    nullptr,
    "production_stocking",
    "production_dbh",
    "production_basal_area",
    "production_mean_tree_volume",
    "production_volume",
    "production_total_volume",
    nullptr,
    "cai",
    "mai",
};

bool isSeparator(int column) {
    return kGridKeys.at(static_cast<std::size_t>(column)) == nullptr;
}

/// True for the rows the summary carries: their marker cell is not empty.
bool inSummary(const TableRow &row) {
    return !row.cells.value(kColSeparator1).isEmpty();
}

} // namespace

Table gridTable(const ProjectionTable &table, bool labels) {
    const std::vector<int> columns = table.visibleColumns();
    QStringList header;
    if (labels) {
        header << QStringLiteral("Row");
    }
    for (const int c : columns) {
        header << table.caption(c);
    }
    Table grid(header);
    for (int r = 1; r <= table.lastRow(); ++r) {
        const TableRow &row = table.row(r);
        std::vector<Value> cells;
        if (labels) {
            cells.push_back(Value::word(row.label));
        }
        for (const int c : columns) {
            const QString &cell = row.cells.value(c);
            cells.push_back(Value::word(isSeparator(c) ? cell.trimmed() : cell));
        }
        grid.add(std::move(cells));
    }
    return grid;
}

QStringList gridKeys(const ProjectionTable &table) {
    QStringList keys;
    for (const int c : table.visibleColumns()) {
        if (!isSeparator(c)) {
            keys << QLatin1String(kGridKeys.at(static_cast<std::size_t>(c)));
        }
    }
    return keys;
}

QJsonArray gridJson(const ProjectionTable &table) {
    const std::vector<int> columns = table.visibleColumns();
    QJsonArray rows;
    for (int r = 1; r <= table.lastRow(); ++r) {
        const TableRow &row = table.row(r);
        QJsonObject o{{QStringLiteral("label"), row.label},
                      {QStringLiteral("in_summary"), inSummary(row)}};
        for (const int c : columns) {
            if (!isSeparator(c)) {
                o.insert(QLatin1String(kGridKeys.at(static_cast<std::size_t>(c))),
                         Value::printed(row.cells.value(c)).json());
            }
        }
        rows.append(o);
    }
    return rows;
}

} // namespace arbolex::cli
