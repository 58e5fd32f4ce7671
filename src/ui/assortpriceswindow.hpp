#pragma once

#include "economics/iassortpricesview.hpp"
#include "ui/toolwindow.hpp"

#include <array>

class QLabel;
class QLineEdit;
class QPushButton;

namespace arbolex::economics {
class AssortPricesWindowLogic;
}

namespace arbolex::ui {

using AssortPricesToolWindow =
    ToolWindow<economics::IAssortPricesView, economics::AssortPricesWindowLogic>;

/// The assortment prices window `frmAssortPrices`: what the prices are, then
/// the top-diameter classes, each beside its price field, and the commands.
/// It is not modal. Everything it shows is set by its logic through
/// IAssortPricesView; every key typed into a price field goes through the
/// logic's key filter. Escape and the title bar's close button are Close.
class AssortPricesWindow : public AssortPricesToolWindow {
    Q_OBJECT
public:
    explicit AssortPricesWindow(QWidget *parent = nullptr);

    QWidget *control(economics::AssortPricesItem item) const;

    // IAssortPricesView
    QString text(economics::AssortPricesItem item) const override;
    void setText(economics::AssortPricesItem item, const QString &text) override;
    void setPricesEditable(bool editable) override;

protected:
    /// Keys typed into price field `field` go through the logic's key filter.
    bool refusesKey(int field, const QKeyEvent &key) override;

private:
    std::array<QLineEdit *, rotation::kAssortmentClassCount> m_fields{};
    std::array<QLabel *, rotation::kAssortmentClassCount> m_captions{};
    QLabel *m_description = nullptr;
    QPushButton *m_change = nullptr;
    QPushButton *m_close = nullptr;
};

} // namespace arbolex::ui
