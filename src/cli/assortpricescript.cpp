#include "cli/assortpricescript.hpp"

#include "cli/headlesssession.hpp"

namespace arbolex::cli {

namespace {

constexpr QLatin1String kWindow("frmAssortPrices.");

/// "frmAssortPrices.txtAsmtVal(1)" → the control, if the name is of that window.
std::optional<std::optional<economics::AssortPricesItem>> item(const QString &control) {
    if (!control.startsWith(kWindow)) {
        return std::nullopt;
    }
    return economics::assortPricesItemFromName(control.mid(kWindow.size()));
}

} // namespace

std::optional<QString> setAssortPricesControl(ScriptTarget &session, const QString &control,
                                              const QString &text) {
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (!*found || (*found)->control != economics::AssortPricesControl::txtAsmtVal) {
        return noControl(QStringLiteral("field"), control);
    }
    session.assortPrices().typeText((*found)->index, text);
    return QString();
}

std::optional<QString> pressAssortPricesControl(ScriptTarget &session, const QString &control) {
    if (control == QLatin1String("mnuAssortPrices")) {
        session.assortPrices().show();
        return QString();
    }
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (!*found || !session.assortPrices().press((*found)->control)) {
        return noControl(QStringLiteral("command"), control);
    }
    return QString();
}

std::optional<QString> printAssortPricesControl(ScriptTarget &session, const QString &control,
                                                QTextStream &out) {
    const auto found = item(control);
    if (!found) {
        return std::nullopt;
    }
    if (!*found) {
        return noControl(QStringLiteral("control"), control);
    }
    out << session.assortPricesView().text(**found) << '\n';
    return QString();
}

} // namespace arbolex::cli
