#pragma once

#include "document/document.hpp"

#include <QByteArray>
#include <QString>

namespace arbolex::document {

/// The document as the text of its file: JSON that opens with the "format"
/// and "version" fields.
QByteArray documentToJson(const Document &document);

/// Writes the document to `path` through a QSaveFile: the old file is
/// replaced only once the new one is complete on the disk, so a crash or a
/// full disk leaves it as it was. False, with `reason`, when it failed.
bool writeDocumentFile(const QString &path, const Document &document, QString &reason);

} // namespace arbolex::document
