#pragma once

// The runner's File menu: "save FILE" (Save As to FILE), "open FILE", "new",
// and "print caption". Opening or starting anew over unsaved work asks the
// question first; the script answers it with "answer no" (discard) or
// "answer yes" (save, which a document never saved cannot do from a script).

#include <QString>
#include <QTextStream>

#include <optional>

namespace arbolex::document {
class DocumentController;
}

namespace arbolex::cli {

class ScriptTarget;

/// Nothing when `command` is not a File menu command, else the runner's
/// error text (empty when the line ran). `rest` is the rest of the line.
std::optional<QString> runDocumentCommand(document::DocumentController &documents,
                                          ScriptTarget &session, const QString &command,
                                          const QString &rest, QTextStream &out);

} // namespace arbolex::cli
