#pragma once

// The runner's reach into the carbon price window: "press
// frmTimberPrices.cmdCarbonPrice" opens it, "press
// frmCarbonPrice.cmdChangeCarbonPrice", "set frmCarbonPrice.txtCarbonPrice
// 56", "press frmCarbonPrice.OptPaymentFlow", "print
// frmCarbonPrice.txtCarbonPrice" (an option prints 1 when chosen, else 0),
// "print frmCarbonPrice.grdConstants" the constants, tab-separated.

#include <QString>
#include <QTextStream>

#include <optional>

namespace arbolex::cli {

class ScriptTarget;

/// Each returns nothing when `control` is not one of the window's controls,
/// else the runner's error text (empty when the line ran).
std::optional<QString> setCarbonPriceControl(ScriptTarget &session, const QString &control,
                                             const QString &text);
std::optional<QString> pressCarbonPriceControl(ScriptTarget &session, const QString &control);
std::optional<QString> printCarbonPriceControl(ScriptTarget &session, const QString &control,
                                               QTextStream &out);

} // namespace arbolex::cli
