#include "cli/documentscript.hpp"

#include "cli/headlesssession.hpp"
#include "document/documentcontroller.hpp"

namespace arbolex::cli {

std::optional<QString> runDocumentCommand(document::DocumentController &documents,
                                          HeadlessSession &session, const QString &command,
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
    if (command == QLatin1String("print") && rest == QLatin1String("caption")) {
        documents.refreshCaption();
        out << session.mainView().caption() << '\n';
        return QString();
    }
    return std::nullopt;
}

} // namespace arbolex::cli
