#pragma once

#include "document/document.hpp"

#include <QByteArray>
#include <QString>

#include <optional>

namespace arbolex::document {

/// Largest file taken for a sub-compartment, bytes.
inline constexpr qint64 kMaxDocumentBytes = 32LL * 1024 * 1024;

/// Reads the text of a document into a complete, checked Document: every
/// value is checked against the ranges the windows keep (a model 0 to 21, no
/// negative stocking, rows in age order …) before anything is returned.
/// std::nullopt with `reason` (one sentence, line and column for a syntax
/// error) when the text is damaged, foreign or of a newer version.
std::optional<Document> documentFromJson(const QByteArray &json, QString &reason);

/// The same for the file at `path`.
std::optional<Document> readDocumentFile(const QString &path, QString &reason);

} // namespace arbolex::document
