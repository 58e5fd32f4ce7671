#include "cli/assortscript.hpp"

#include "cli/headlesssession.hpp"

#include <QRegularExpression>

namespace arbolex::cli {

namespace {

constexpr QLatin1String kReportWindow("frmAssort");
constexpr QLatin1String kUserWindow("frmAssortUser.");

/// "frmAssortUser.txtName(1)" → the control, if the name is of that window.
std::optional<std::optional<assortments::AssortUserControlRef>>
userControl(const QString &control) {
    if (!control.startsWith(kUserWindow)) {
        return std::nullopt;
    }
    return assortments::assortUserControlFromName(control.mid(kUserWindow.size()));
}

std::optional<std::optional<assortments::AssortControl>> reportControl(const QString &control) {
    const QString lead = kReportWindow + QLatin1Char('.');
    if (!control.startsWith(lead)) {
        return std::nullopt;
    }
    return assortments::assortControlFromName(control.mid(lead.size()));
}

} // namespace

std::optional<QString> setAssortControl(ScriptTarget &session, const QString &control,
                                        const QString &text) {
    const auto user = userControl(control);
    if (!user) {
        return std::nullopt;
    }
    using assortments::AssortUserControl;
    if (!*user || (*user)->control == AssortUserControl::chkUse ||
        !assortments::isPerCategory((*user)->control)) {
        return noControl(QStringLiteral("field"), control);
    }
    session.assortUser().typeText((*user)->control, (*user)->index, text);
    return QString();
}

std::optional<QString> pressAssortControl(ScriptTarget &session, const QString &control) {
    if (control == QLatin1String("cmdAssort")) {
        session.main().cmdAssort_Click();
        return QString();
    }
    if (control == QLatin1String("mnuAssortUser")) {
        session.assortUser().mnuAssortUser_Click();
        return QString();
    }
    static const QRegularExpression thinButton(QStringLiteral("^frmThin\\.cmdAssort\\((\\d)\\)$"));
    const QRegularExpressionMatch m = thinButton.match(control);
    if (m.hasMatch()) {
        const int index = m.captured(1).toInt();
        if (index > 2) {
            return noControl(QStringLiteral("command"), control);
        }
        session.thinning().cmdAssort_Click(index);
        return QString();
    }
    if (const auto report = reportControl(control)) {
        if (!*report || !session.assort().press(**report)) {
            return noControl(QStringLiteral("command"), control);
        }
        return QString();
    }
    if (const auto user = userControl(control)) {
        if (!*user || !session.assortUser().press((*user)->control, (*user)->index)) {
            return noControl(QStringLiteral("command"), control);
        }
        return QString();
    }
    return std::nullopt;
}

std::optional<QString> printAssortControl(ScriptTarget &session, const QString &control,
                                          QTextStream &out) {
    if (control == kReportWindow) {
        // The whole report: caption, title, then the classes or the categories.
        const assortments::IAssortView &view = session.assortView();
        out << view.caption() << '\n' << view.text(assortments::AssortControl::lblDesc) << '\n';
        if (const auto &user = view.userReport()) {
            out << user->header.join(QLatin1Char('\t')) << '\n';
            for (const QStringList &row : user->rows) {
                out << row.join(QLatin1Char('\t')) << '\n';
            }
        } else {
            using C = assortments::AssortControl;
            for (const auto &[label, volume, percent] :
                 {std::tuple{C::lbl714, C::lblVol714, C::lblPct714},
                  std::tuple{C::lbl1420, C::lblVol1420, C::lblPct1420},
                  std::tuple{C::lbl20, C::lblVol20, C::lblPct20}}) {
                out << view.text(label) << '\t' << view.text(volume) << '\t' << view.text(percent)
                    << '\n';
            }
        }
        return QString();
    }
    if (const auto report = reportControl(control)) {
        if (!*report) {
            return noControl(QStringLiteral("control"), control);
        }
        out << session.assortView().text(**report) << '\n';
        return QString();
    }
    if (const auto user = userControl(control)) {
        if (!*user) {
            return noControl(QStringLiteral("control"), control);
        }
        using assortments::AssortUserControl;
        const AssortUserControl c = (*user)->control;
        const assortments::IAssortUserView &view = session.assortUserView();
        if (c == AssortUserControl::chkUse || c == AssortUserControl::chkUserCategories) {
            out << (view.isChecked(c, (*user)->index) ? "1" : "0") << '\n';
        } else {
            out << view.text(c, (*user)->index) << '\n';
        }
        return QString();
    }
    return std::nullopt;
}

} // namespace arbolex::cli
