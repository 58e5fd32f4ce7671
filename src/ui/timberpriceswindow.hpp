#pragma once

#include "economics/itimberpricesview.hpp"
#include "prices/pricedata.hpp"
#include "ui/toolwindow.hpp"

#include <array>

class QGridLayout;
class QGroupBox;
class QLabel;
class QLineEdit;

namespace arbolex::economics {
class TimberPricesWindowLogic;
}

namespace arbolex::ui {

using TimberPricesToolWindow =
    ToolWindow<economics::ITimberPricesView, economics::TimberPricesWindowLogic>;

/// The timber prices window `frmTimberPrices`: the mean-tree-volume classes
/// down the left, beside them the four price lists in their frames, each with
/// the option button that makes it the prices in use; the notes and the
/// commands below. It is not modal. Everything it shows is set by its logic
/// through ITimberPricesView; every key typed into a price field goes through
/// the logic's key filter. Escape and the title bar's close button are Close
/// Price Option.
class TimberPricesWindow : public TimberPricesToolWindow {
    Q_OBJECT
public:
    explicit TimberPricesWindow(QWidget *main = nullptr);

    /// The widget of a control or of one element of a control array.
    QWidget *control(economics::TimberPricesItem item) const;

    // ITimberPricesView
    QString text(economics::TimberPricesItem item) const override;
    void setText(economics::TimberPricesItem item, const QString &text) override;
    void setNegative(int field, bool negative) override;
    bool isChecked(economics::TimberPricesControl option) const override;
    void setChecked(economics::TimberPricesControl option, bool checked) override;
    void setUserPricesEditable(bool editable) override;

protected:
    /// Keys typed into price field `field` (0 to 51) go through the logic's key filter.
    bool refusesKey(int field, const QKeyEvent &key) override;

private:
    QLayout *buildLists();
    QLayout *buildNotes();
    QLayout *buildCommands();
    QLabel *addLabel(economics::TimberPricesControl control, bool wrapped);

    std::array<QLineEdit *, economics::kPriceFieldCount> m_fields{};
    std::array<QLabel *, prices::kPriceClassCount> m_categories{};
    std::array<QGroupBox *, economics::kPriceBlockCount> m_frames{};
    std::array<QWidget *, economics::kTimberPricesControlCount> m_controls{};
    /// Width of the text of a list's option button and description, pixels.
    int m_blockWidth = 0;
};

} // namespace arbolex::ui
