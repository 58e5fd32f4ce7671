#pragma once

#include "thinning/thincontrols.hpp"

#include <QString>

namespace arbolex::thinning {

/// What the thinning window's logic may read and change in its window.
class IThinView {
public:
    virtual ~IThinView() = default;
    virtual QString text(ThinControl control) const = 0;
    virtual void setText(ThinControl control, const QString &text) = 0;
    virtual void setEnabled(ThinControl control, bool enabled) = 0;
    virtual bool isChecked(ThinControl control) const = 0;
    virtual void setChecked(ThinControl control, bool checked) = 0;
    virtual void focus(ThinControl control) = 0;
    virtual void setCaption(const QString &caption) = 0;
    /// Shows the window centred on the screen, not modal.
    virtual void showCentred() = 0;
    virtual void close() = 0;
    virtual bool isShown() const = 0;
};

} // namespace arbolex::thinning
