#pragma once

// The runner's reach into the assortment windows: "press cmdAssort",
// "press frmThin.cmdAssort(1)", "print frmAssort.lblVol714", "press
// frmAssort.cmdAccept", "press mnuAssortUser", "set frmAssortUser.txtName(1)
// Stakes", "press frmAssortUser.chkUse(1)", "print frmAssort" (the window).

#include <QString>
#include <QTextStream>

#include <optional>

namespace arbolex::cli {

class ScriptTarget;

/// Each returns nothing when `control` is not one of the assortment
/// controls, else the runner's error text (empty when the line ran).
std::optional<QString> setAssortControl(ScriptTarget &session, const QString &control,
                                        const QString &text);
std::optional<QString> pressAssortControl(ScriptTarget &session, const QString &control);
std::optional<QString> printAssortControl(ScriptTarget &session, const QString &control,
                                          QTextStream &out);

} // namespace arbolex::cli
