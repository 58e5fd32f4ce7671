#include "cli/carbonpricescript.hpp"

#include "cli/scripttarget.hpp"
#include "economics/carbonformat.hpp"
#include "shell/tableexport.hpp"

namespace arbolex::cli {

namespace {

constexpr QLatin1String kWindow("frmCarbonPrice.");

using economics::CarbonPriceControl;

/// "frmCarbonPrice.txtCarbonPrice" → the control, if the name is of that window.
std::optional<std::optional<CarbonPriceControl>> item(const QString &control) {
    if (!control.startsWith(kWindow)) {
        return std::nullopt;
    }
    return economics::carbonPriceControlFromName(control.mid(kWindow.size()));
}

} // namespace

std::optional<QString> setCarbonPriceControl(ScriptTarget &session, const QString &control,
                                             const QString &text) {
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (*found != CarbonPriceControl::txtCarbonPrice) {
        return noControl(QStringLiteral("field"), control);
    }
    session.carbonPrice().typeText(text);
    return QString();
}

std::optional<QString> pressCarbonPriceControl(ScriptTarget &session, const QString &control) {
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (!*found || !session.carbonPrice().press(**found)) {
        return noControl(QStringLiteral("command"), control);
    }
    return QString();
}

std::optional<QString> printCarbonPriceControl(ScriptTarget &session, const QString &control,
                                               QTextStream &out) {
    if (control == kWindow + QLatin1String("grdConstants")) {
        out << shell::tabSeparated(
            economics::constantsGrid(session.session().prices().data().carbon));
        return QString();
    }
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (!*found) {
        return noControl(QStringLiteral("control"), control);
    }
    const economics::ICarbonPriceView &view = session.carbonPriceView();
    if (economics::isPaymentOption(**found)) {
        out << (view.isChecked(**found) ? "1" : "0") << '\n';
    } else {
        out << view.text(**found) << '\n';
    }
    return QString();
}

} // namespace arbolex::cli
