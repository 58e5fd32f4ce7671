#include "cli/economicsscript.hpp"

#include "cli/headlesssession.hpp"
#include "shell/tableexport.hpp"

#include <QRegularExpression>

namespace arbolex::cli {

namespace {

constexpr QLatin1String kWindow("frmEconomics");

using economics::EconomicsControl;

QString windowClosed(const QString &control) {
    return QStringLiteral("'") + control +
           QStringLiteral("': the economics window is not open (press cmdEconomics)");
}

/// The part of `control` after "frmEconomics.", if it names this window.
std::optional<QString> windowPart(const QString &control) {
    const QString lead = kWindow + QLatin1Char('.');
    if (!control.startsWith(lead)) {
        return std::nullopt;
    }
    return control.mid(lead.size());
}

} // namespace

std::optional<QString> setEconomicsControl(ScriptTarget &session, const QString &control,
                                           const QString &text) {
    const auto part = windowPart(control);
    if (!part) {
        return std::nullopt;
    }
    if (!session.economicsView().isShown()) {
        return windowClosed(control);
    }
    const auto found = economics::economicsControlFromName(*part);
    if (!found || !economics::isEconomicsField(*found)) {
        return noControl(QStringLiteral("field"), control);
    }
    session.economics().typeText(*found, text);
    return QString();
}

std::optional<QString> pressEconomicsControl(ScriptTarget &session, const QString &control) {
    if (control == QLatin1String("cmdEconomics")) {
        session.economics().cmdEconomics_Click();
        return QString();
    }
    const auto part = windowPart(control);
    if (!part) {
        return std::nullopt;
    }
    if (!session.economicsView().isShown()) {
        return windowClosed(control);
    }
    // "cmdApply(K)": Apply with the K-th best regime chosen.
    static const QRegularExpression apply(QStringLiteral(R"(^cmdApply\((\d+)\)$)"));
    if (const QRegularExpressionMatch m = apply.match(*part); m.hasMatch()) {
        session.economics().chooseRegime(m.captured(1).toInt());
        session.economics().press(EconomicsControl::cmdApply);
        return QString();
    }
    const auto found = economics::economicsControlFromName(*part);
    if (!found || !session.economics().press(*found)) {
        return noControl(QStringLiteral("command"), control);
    }
    return QString();
}

std::optional<QString> printEconomicsControl(ScriptTarget &session, const QString &control,
                                             QTextStream &out) {
    if (control == kWindow) {
        out << session.economics().figuresText();
        return QString();
    }
    const auto part = windowPart(control);
    if (!part) {
        return std::nullopt;
    }
    if (*part == QLatin1String("grdRegimes")) {
        out << shell::tabSeparated(session.economics().regimeGrid());
        return QString();
    }
    const auto found = economics::economicsControlFromName(*part);
    if (!found) {
        return noControl(QStringLiteral("control"), control);
    }
    out << session.economicsView().text(*found) << '\n';
    return QString();
}

} // namespace arbolex::cli
