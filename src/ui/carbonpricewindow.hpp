#pragma once

#include "economics/icarbonpriceview.hpp"
#include "ui/toolwindow.hpp"

#include <array>

class QLineEdit;
class QTableWidget;

namespace arbolex::economics {
class CarbonPriceWindowLogic;
}

namespace arbolex::ui {

using CarbonPriceToolWindow =
    ToolWindow<economics::ICarbonPriceView, economics::CarbonPriceWindowLogic>;

/// The carbon price window `frmCarbonPrice`: what carbon money is, the price
/// field, the three payments each with its one line, the constants of the
/// carbon account with their sources, and the commands. It is not modal.
/// Everything it shows is set by its logic through ICarbonPriceView; every
/// key typed into the price field goes through the logic's key filter. Escape
/// and the title bar's close button are Close.
class CarbonPriceWindow : public CarbonPriceToolWindow {
    Q_OBJECT
public:
    explicit CarbonPriceWindow(QWidget *parent = nullptr);

    QWidget *control(economics::CarbonPriceControl control) const;
    QTableWidget *constantsTable() const { return m_constants; }

    // ICarbonPriceView
    QString text(economics::CarbonPriceControl control) const override;
    void setText(economics::CarbonPriceControl control, const QString &text) override;
    bool isChecked(economics::CarbonPriceControl option) const override;
    void setChecked(economics::CarbonPriceControl option, bool checked) override;
    void setEditable(bool editable) override;
    void setConstants(const std::vector<QStringList> &grid) override;

protected:
    /// Keys typed into the price field go through the logic's key filter.
    bool refusesKey(int field, const QKeyEvent &key) override;

private:
    std::array<QWidget *, economics::kCarbonPriceControlCount> m_controls{};
    QTableWidget *m_constants = nullptr;
};

} // namespace arbolex::ui
