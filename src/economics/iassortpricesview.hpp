#pragma once

#include "economics/assortpricescontrols.hpp"

#include <QString>

namespace arbolex::economics {

/// What the assortment prices window's logic may read and change in its window.
class IAssortPricesView {
public:
    virtual ~IAssortPricesView() = default;
    virtual QString text(AssortPricesItem item) const = 0;
    virtual void setText(AssortPricesItem item, const QString &text) = 0;
    /// Whether the price fields take typing.
    virtual void setPricesEditable(bool editable) = 0;
    virtual void setCaption(const QString &caption) = 0;
    /// Shows the window centred over the window that opened it, not modal.
    virtual void showCentred() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

} // namespace arbolex::economics
