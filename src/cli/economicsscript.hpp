#pragma once

// The runner's reach into the economics window: "press cmdEconomics" opens it,
// "set frmEconomics.txtInterestRate 3", "press frmEconomics.cmdOptimise",
// "press frmEconomics.cmdApply(2)" writes the second best regime into the
// table, "print frmEconomics" prints every figure, "print
// frmEconomics.grdRegimes" the optimiser's table, "print frmEconomics.lblLEV"
// one figure. Its controls take typing and presses only while it is open.

#include <QString>
#include <QTextStream>

#include <optional>

namespace arbolex::cli {

class ScriptTarget;

/// Each returns nothing when `control` is not one of the economics window's
/// controls, else the runner's error text (empty when the line ran).
std::optional<QString> setEconomicsControl(ScriptTarget &session, const QString &control,
                                           const QString &text);
std::optional<QString> pressEconomicsControl(ScriptTarget &session, const QString &control);
std::optional<QString> printEconomicsControl(ScriptTarget &session, const QString &control,
                                             QTextStream &out);

} // namespace arbolex::cli
