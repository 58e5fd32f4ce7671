#pragma once

// The documents for other parts of the program: the report command, the
// estate's "open sub-compartment as a new document" and anything else that
// reads or builds a sub-compartment without the File menu.

#include "document/document.hpp"
#include "rotation/rotation.hpp"

#include <QString>

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::document {

/// Reads the sub-compartment saved in `path` (a .arbolex file) and puts it
/// back through `main` exactly as it was saved: the table, the records, the cash flow,
/// the prices in use and the identification; growing goes on from the last
/// row as if the program had never closed. Works on a headless session as on
/// the window. A file that cannot be taken changes nothing in `main` and
/// leaves in `fault` the "FAULT - " message that names the file and what is
/// wrong. Asks nothing: the caller decides about unsaved work first.
bool openDocumentInto(const QString &path, workflow::IMainCommands &main, QString &fault);

/// A new document for `stand` under `id`: the model and the grow-from fields
/// of the stand as the window formats them, target age, step and net area,
/// an empty table, the prices and interest rate that `work` uses now, and the
/// data folder's costs.
/// Put it back into a window (IMainCommands::restore), replay a regime, then
/// take StandWork::snapshot() to have the grown document.
Document documentForStand(const work::StandWork &work, const rotation::Stand &stand,
                          const work::SubCompartment &id, int targetAge, int step, double netArea);

} // namespace arbolex::document
