#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::work {

/// Which piece of ground a document describes: the forest, the compartment
/// and the sub-compartment as the estate's maps name them, and a free note.
/// It heads every report of the document.
struct SubCompartment {
    QString forest;
    QString compartment;
    QString subCompartment;
    /// Free text: owner, species mix, anything the forester wants kept.
    QString notes;

    bool isEmpty() const {
        return forest.isEmpty() && compartment.isEmpty() && subCompartment.isEmpty() &&
               notes.isEmpty();
    }
    bool operator==(const SubCompartment &) const = default;

    /// Captions of the three parts, as the identification dialog shows them.
    static QString forestCaption() { return QStringLiteral("Forest"); }
    static QString compartmentCaption() { return QStringLiteral("Compartment"); }
    static QString subCompartmentCaption() { return QStringLiteral("Sub-compartment"); }

    /// The lines that head a report: "Forest: Kilbrack", "Compartment: 12",
    /// "Sub-compartment: b", then the note; a part left empty is left out.
    QStringList heading() const;
    /// `grid` with the heading above it, one line a row and a blank row
    /// below it (as the clipboard copy carries it); `grid` alone without one.
    std::vector<QStringList> headed(std::vector<QStringList> grid) const;
};

} // namespace arbolex::work
