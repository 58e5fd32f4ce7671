#pragma once

// The runner's reach into the assortment prices window: "press
// mnuAssortPrices", "press frmAssortPrices.cmdChangeAsmtPrices", "set
// frmAssortPrices.txtAsmtVal(2) 52.5", "print frmAssortPrices.txtAsmtVal(2)".

#include <QString>
#include <QTextStream>

#include <optional>

namespace arbolex::cli {

class ScriptTarget;

/// Each returns nothing when `control` is not one of the window's controls,
/// else the runner's error text (empty when the line ran).
std::optional<QString> setAssortPricesControl(ScriptTarget &session, const QString &control,
                                              const QString &text);
std::optional<QString> pressAssortPricesControl(ScriptTarget &session, const QString &control);
std::optional<QString> printAssortPricesControl(ScriptTarget &session, const QString &control,
                                                QTextStream &out);

} // namespace arbolex::cli
