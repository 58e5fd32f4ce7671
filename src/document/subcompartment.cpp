#include "document/subcompartment.hpp"

#include "document/documentmessages.hpp"

namespace arbolex::document {

QStringList SubCompartment::heading() const {
    QStringList lines;
    const auto add = [&lines](const QString &caption, const QString &value) {
        if (!value.isEmpty()) {
            lines << caption + QStringLiteral(": ") + value;
        }
    };
    add(text::captionForest(), forest);
    add(text::captionCompartment(), compartment);
    add(text::captionSubCompartment(), subCompartment);
    if (!notes.isEmpty()) {
        lines << notes.split(QLatin1Char('\n'));
    }
    return lines;
}

} // namespace arbolex::document
