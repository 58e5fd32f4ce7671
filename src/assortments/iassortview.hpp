#pragma once

#include "assortments/assortcontrols.hpp"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace arbolex::assortments {

/// The report of the user categories: a header and one row per category.
struct UserReport {
    QStringList header;
    std::vector<QStringList> rows;
};

/// What the report window's logic may read and change in `frmAssort`.
class IAssortView {
public:
    virtual ~IAssortView() = default;
    virtual QString text(AssortControl control) const = 0;
    virtual void setText(AssortControl control, const QString &text) = 0;
    virtual void setCaption(const QString &caption) = 0;
    virtual QString caption() const = 0;
    /// Shows the three fixed classes, or instead the table of `report`.
    virtual void showFixedClasses() = 0;
    virtual void showUserReport(const UserReport &report) = 0;
    /// The report over the user categories on show, if the window shows one.
    virtual std::optional<UserReport> userReport() const = 0;
    /// Shows the window, modal: the handler that opens it waits until it closes.
    virtual void showReport() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

/// What the user categories window's logic may read and change in `frmAssortUser`.
class IAssortUserView {
public:
    virtual ~IAssortUserView() = default;
    /// Text of a per-category field, `index` 1 to 5.
    virtual QString text(AssortUserControl control, int index) const = 0;
    virtual void setText(AssortUserControl control, int index, const QString &text) = 0;
    /// A check box: chkUse(index) or chkUserCategories (index 0).
    virtual bool isChecked(AssortUserControl control, int index) const = 0;
    virtual void setChecked(AssortUserControl control, int index, bool checked) = 0;
    virtual void focus(AssortUserControl control, int index) = 0;
    /// Shows the window, modal.
    virtual void showEditor() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

} // namespace arbolex::assortments
