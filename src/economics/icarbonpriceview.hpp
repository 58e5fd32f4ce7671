#pragma once

#include "economics/carbonpricecontrols.hpp"

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::economics {

/// What the carbon price window's logic may read and change in its window.
class ICarbonPriceView {
public:
    virtual ~ICarbonPriceView() = default;
    virtual QString text(CarbonPriceControl control) const = 0;
    virtual void setText(CarbonPriceControl control, const QString &text) = 0;
    /// Whether a payment option is chosen.
    virtual bool isChecked(CarbonPriceControl option) const = 0;
    virtual void setChecked(CarbonPriceControl option, bool checked) = 0;
    /// Whether the price field takes typing and the payment may be chosen.
    virtual void setEditable(bool editable) = 0;
    /// The table of the account's constants: its captions, then one row each.
    virtual void setConstants(const std::vector<QStringList> &grid) = 0;
    virtual void setCaption(const QString &caption) = 0;
    /// Shows the window centred over the window that opened it, not modal.
    virtual void showCentred() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

} // namespace arbolex::economics
