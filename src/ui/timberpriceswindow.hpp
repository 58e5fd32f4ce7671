#pragma once

#include "economics/itimberpricesview.hpp"
#include "prices/pricedata.hpp"

#include <QDialog>

#include <array>

class QGridLayout;
class QGroupBox;
class QLabel;
class QLineEdit;

namespace arbolex::economics {
class TimberPricesWindowLogic;
}

namespace arbolex::ui {

/// The timber prices window `frmTimberPrices`: the mean-tree-volume classes
/// down the left, beside them the four price lists in their frames, each with
/// the option button that makes it the prices in use; the notes and the
/// commands below. It is not modal. Everything it shows is set by its logic
/// through ITimberPricesView; every key typed into a price field goes through
/// the logic's key filter.
class TimberPricesWindow : public QDialog, public economics::ITimberPricesView {
    Q_OBJECT
public:
    explicit TimberPricesWindow(QWidget *main = nullptr);

    /// Binds the window to its logic, which must outlive the window.
    void attach(economics::TimberPricesWindowLogic &logic);

    /// The widget of a control or of one element of a control array.
    QWidget *control(economics::TimberPricesItem item) const;

    // ITimberPricesView
    QString text(economics::TimberPricesItem item) const override;
    void setText(economics::TimberPricesItem item, const QString &text) override;
    void setNegative(int field, bool negative) override;
    bool isChecked(economics::TimberPricesControl option) const override;
    void setChecked(economics::TimberPricesControl option, bool checked) override;
    void setUserPricesEditable(bool editable) override;
    void setCaption(const QString &caption) override;
    /// Shows the window centred over the main window and brings it to the front.
    void showCentred() override;
    /// Hides the window; the logic has already done what closing means.
    void close() override;
    bool isShown() const override;

    /// Escape: the same as Close Price Option.
    void reject() override;

protected:
    /// The title bar's close button: the same as Close Price Option.
    void closeEvent(QCloseEvent *event) override;
    /// Keys typed into a price field go through the logic's key filter.
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QLayout *buildLists();
    QLayout *buildNotes();
    QLayout *buildCommands();
    QLabel *addLabel(economics::TimberPricesControl control, bool wrapped);
    /// Index 0 to 51 of a price field, −1 for any other object.
    int fieldIndex(const QObject *object) const;
    /// Runs `handler` of the logic, once it is attached.
    void run(void (economics::TimberPricesWindowLogic::*handler)());

    economics::TimberPricesWindowLogic *m_logic = nullptr;
    std::array<QLineEdit *, economics::kPriceFieldCount> m_fields{};
    std::array<QLabel *, prices::kPriceClassCount> m_categories{};
    std::array<QGroupBox *, economics::kPriceBlockCount> m_frames{};
    std::array<QWidget *, economics::kTimberPricesControlCount> m_controls{};
    /// Width of the text of a list's option button and description, pixels.
    int m_blockWidth = 0;
};

} // namespace arbolex::ui
