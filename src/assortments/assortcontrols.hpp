#pragma once

#include <QString>

#include <optional>

namespace arbolex::assortments {

/// The controls of the assortment report window `frmAssort`.
enum class AssortControl {
    lblDesc,
    lblVol,
    lblPct,
    lbl714,
    lbl1420,
    lbl20,
    lblVol714,
    lblVol1420,
    lblVol20,
    lblPct714,
    lblPct1420,
    lblPct20,
    cmdOK,
    cmdAccept,
    cmdCancel,
};

inline constexpr int kAssortControlCount = static_cast<int>(AssortControl::cmdCancel) + 1;

QString controlName(AssortControl control);
std::optional<AssortControl> assortControlFromName(const QString &name);

/// The controls of the user categories window `frmAssortUser`; the first four
/// come once per category, indexed 1 to 5 ("txtName(1)").
enum class AssortUserControl {
    txtName,
    txtSmall,
    txtBig,
    chkUse,
    chkUserCategories,
    cmdOK,
    cmdCancel,
};

inline constexpr int kAssortUserControlCount = static_cast<int>(AssortUserControl::cmdCancel) + 1;

/// A control of `frmAssortUser` with its category index (0 for the others).
struct AssortUserControlRef {
    AssortUserControl control = AssortUserControl::cmdOK;
    int index = 0;
};

/// "txtName(1)" … "cmdOK": the control and its index, if the window has it.
std::optional<AssortUserControlRef> assortUserControlFromName(const QString &name);
/// True for the controls that come once per category.
inline bool isPerCategory(AssortUserControl c) {
    return c <= AssortUserControl::chkUse;
}

} // namespace arbolex::assortments
