#pragma once

#include "work/subcompartment.hpp"

#include <QString>
#include <QStringList>

namespace arbolex::document {

/// The dialogs of the File menu: choosing a file and editing the
/// identification. The window shows them; a script or a test has none and
/// names its files directly.
class IDocumentDialogs {
public:
    virtual ~IDocumentDialogs() = default;
    /// The document to open, looked for in `folder`; empty when cancelled.
    virtual QString chooseFileToOpen(const QString &folder) = 0;
    /// Where to save, starting from `suggestedPath`; empty when cancelled.
    virtual QString chooseFileToSave(const QString &suggestedPath) = 0;
    /// Lets the user edit `id`; false when cancelled (then `id` is unchanged).
    virtual bool editIdentification(work::SubCompartment &id) = 0;
    /// The list of Open Recent changed.
    virtual void recentFilesChanged(const QStringList &files) = 0;
};

} // namespace arbolex::document
