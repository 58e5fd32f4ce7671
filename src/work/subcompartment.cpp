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

} // namespace arbolex::work
