#include "assortments/assortcontrols.hpp"

#include "prices/pricedata.hpp"
#include "shell/controlnames.hpp"

#include <QRegularExpression>

#include <array>

namespace arbolex::assortments {

namespace {
constexpr std::array<const char *, kAssortControlCount> kNames = {
    "lblDesc",    "lblVol",    "lblPct",     "lbl714",    "lbl1420",
    "lbl20",      "lblVol714", "lblVol1420", "lblVol20",  "lblPct714",
    "lblPct1420", "lblPct20",  "cmdOK",      "cmdAccept", "cmdCancel"};
constexpr std::array<const char *, kAssortUserControlCount> kUserNames = {
    "txtName", "txtSmall", "txtBig", "chkUse", "chkUserCategories", "cmdOK", "cmdCancel"};
} // namespace

QString controlName(AssortControl control) {
    return shell::controlNameIn(kNames, control);
}

std::optional<AssortControl> assortControlFromName(const QString &name) {
    return shell::controlNamedIn<AssortControl>(kNames, name);
}

std::optional<AssortUserControlRef> assortUserControlFromName(const QString &name) {
    static const QRegularExpression indexed(QStringLiteral("^(\\w+)\\((\\d)\\)$"));
    const QRegularExpressionMatch m = indexed.match(name);
    const QString base = m.hasMatch() ? m.captured(1) : name;
    const auto control = shell::controlNamedIn<AssortUserControl>(kUserNames, base);
    if (!control) {
        return std::nullopt;
    }
    const int index = m.hasMatch() ? m.captured(2).toInt() : 0;
    const bool indexOk =
        isPerCategory(*control) ? index >= 1 && index <= prices::kUserCategoryCount : !m.hasMatch();
    if (!indexOk) {
        return std::nullopt;
    }
    return AssortUserControlRef{*control, index};
}

} // namespace arbolex::assortments
