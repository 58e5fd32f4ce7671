#include "cli/documentscript.hpp"

#include "cli/headlesssession.hpp"
#include "document/documentcontroller.hpp"
#include "work/standwork.hpp"

namespace arbolex::cli {

std::optional<QString> runDocumentCommand(document::DocumentController &documents,
                                          ScriptTarget &session, const QString &command,
                                          const QString &rest, QTextStream &out) {
    if (command == QLatin1String("save") || command == QLatin1String("open")) {
        if (rest.isEmpty()) {
            return command + QStringLiteral(" needs a FILE");
        }
        // A refusal is the program's own message, already printed; the script goes on.
        if (command == QLatin1String("save")) {
            documents.saveAs(rest);
        } else {
            documents.open(rest);
        }
        return QString();
    }
    if (command == QLatin1String("new")) {
        documents.fileNew();
        return QString();
    }
    if (command == QLatin1String("identify")) {
        // identify forest|compartment|subcompartment|notes TEXT
        const QString part = rest.section(QLatin1Char(' '), 0, 0);
        const QString text = rest.mid(part.size()).trimmed();
        work::SubCompartment id = documents.identification();
        QString *field = part == QLatin1String("forest")           ? &id.forest
                         : part == QLatin1String("compartment")    ? &id.compartment
                         : part == QLatin1String("subcompartment") ? &id.subCompartment
                         : part == QLatin1String("notes")          ? &id.notes
                                                                   : nullptr;
        if (field == nullptr) {
            return QStringLiteral("identify needs forest, compartment, subcompartment or notes");
        }
        *field = text;
        documents.setIdentification(id);
        return QString();
    }
    if (command == QLatin1String("press") && rest == QLatin1String("mnuIdentification")) {
        documents.editIdentification();
        return QString();
    }
    if (command == QLatin1String("estate")) {
        if (rest.isEmpty()) {
            return QStringLiteral("estate needs a FILE");
        }
        session.estate().openEstate(rest);
        return QString();
    }
    if (command == QLatin1String("print") && rest == QLatin1String("caption")) {
        documents.refreshCaption();
        out << session.mainView().caption() << '\n';
        return QString();
    }
    return std::nullopt;
}

} // namespace arbolex::cli
