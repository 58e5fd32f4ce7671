#include "work/incrementrows.hpp"

namespace arbolex::work {

std::vector<int> incrementRows(const ProjectionTable &table) {
    std::vector<int> rows;
    double lastAge = -1.0;
    for (int r = 1; r <= table.lastRow(); ++r) {
        const TableRow &row = table.row(r);
        if ((row.kind == RowKind::Growth || row.kind == RowKind::Failed) &&
            row.numbers[kNumAge] != lastAge) {
            rows.push_back(r);
            lastAge = row.numbers[kNumAge];
        }
    }
    return rows;
}

} // namespace arbolex::work
