#pragma once

#include "economics/timberpricescontrols.hpp"

#include <QString>

namespace arbolex::economics {

/// What the timber prices window's logic may read and change in its window.
class ITimberPricesView {
public:
    virtual ~ITimberPricesView() = default;
    /// Text of a field, label, frame, option button or command.
    virtual QString text(TimberPricesItem item) const = 0;
    virtual void setText(TimberPricesItem item, const QString &text) = 0;
    /// Shows price field `field` (0 to 51) in red, or in the normal colour.
    virtual void setNegative(int field, bool negative) = 0;
    virtual bool isChecked(TimberPricesControl option) const = 0;
    virtual void setChecked(TimberPricesControl option, bool checked) = 0;
    /// Whether the user-defined fields take typing; the others never do.
    virtual void setUserPricesEditable(bool editable) = 0;
    virtual void setCaption(const QString &caption) = 0;
    /// Shows the window centred on the screen, not modal.
    virtual void showCentred() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

} // namespace arbolex::economics
