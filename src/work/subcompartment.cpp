#include "work/subcompartment.hpp"

namespace arbolex::work {

QStringList SubCompartment::heading() const {
    QStringList lines;
    const auto add = [&lines](const QString &caption, const QString &value) {
        if (!value.isEmpty()) {
            lines << caption + QStringLiteral(": ") + value;
        }
    };
    add(forestCaption(), forest);
    add(compartmentCaption(), compartment);
    add(subCompartmentCaption(), subCompartment);
    if (!notes.isEmpty()) {
        lines << notes.split(QLatin1Char('\n'));
    }
    return lines;
}

std::vector<QStringList> SubCompartment::headed(std::vector<QStringList> grid) const {
    const QStringList lines = heading();
    if (lines.isEmpty()) {
        return grid;
    }
    std::vector<QStringList> top;
    for (const QString &line : lines) {
        top.push_back({line});
    }
    top.push_back({QString()});
    grid.insert(grid.begin(), top.begin(), top.end());
    return grid;
}

} // namespace arbolex::work
