#pragma once

#include "workflow/maincontrols.hpp"

#include <QRect>
#include <QString>

namespace arbolex::workflow {

/// What the main window's logic may read and change in its window.
class IMainView {
public:
    virtual ~IMainView() = default;
    virtual QString text(MainControl control) const = 0;
    virtual void setText(MainControl control, const QString &text) = 0;
    virtual void setEnabled(MainControl control, bool enabled) = 0;
    virtual bool isEnabled(MainControl control) const = 0;
    /// The hint (tool tip) of a control.
    virtual void setHint(MainControl control, const QString &hint) = 0;
    virtual void focus(MainControl control) = 0;
    virtual void setCaption(const QString &caption) = 0;
    virtual QString caption() const = 0;
    /// The hourglass pointer while a command runs.
    virtual void setBusy(bool busy) = 0;
    /// The projection table changed from data row `firstRow` on (1 = all).
    virtual void tableChanged(int firstRow) = 0;
    /// Scrolls the table so that `row` is the top visible row.
    virtual void scrollToRow(int row) = 0;
    /// Shows the summary `flxSummary` in place of the projections, or back.
    virtual void showSummary(bool summary) = 0;
    /// Marks the active model in the model menu.
    virtual void setActiveModel(int modelId) = 0;
    /// Placement of the window on the screen.
    virtual QRect placement() const = 0;
    virtual void setPlacement(const QRect &placement) = 0;
};

} // namespace arbolex::workflow
