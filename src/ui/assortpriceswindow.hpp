#pragma once

#include "economics/iassortpricesview.hpp"

#include <QDialog>

#include <array>

class QLabel;
class QLineEdit;
class QPushButton;

namespace arbolex::economics {
class AssortPricesWindowLogic;
}

namespace arbolex::ui {

/// The assortment prices window `frmAssortPrices`: what the prices are, then
/// the top-diameter classes, each beside its price field, and the commands.
/// It is not modal. Everything it shows is set by its logic through
/// IAssortPricesView; every key typed into a price field goes through the
/// logic's key filter.
class AssortPricesWindow : public QDialog, public economics::IAssortPricesView {
    Q_OBJECT
public:
    explicit AssortPricesWindow(QWidget *parent = nullptr);

    /// Binds the window to its logic, which must outlive the window.
    void attach(economics::AssortPricesWindowLogic &logic);

    QWidget *control(economics::AssortPricesItem item) const;

    // IAssortPricesView
    QString text(economics::AssortPricesItem item) const override;
    void setText(economics::AssortPricesItem item, const QString &text) override;
    void setPricesEditable(bool editable) override;
    void setCaption(const QString &caption) override;
    void showCentred() override;
    void close() override;
    bool isShown() const override;

    /// Escape: the same as Close.
    void reject() override;

protected:
    void closeEvent(QCloseEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    /// Index of a price field, −1 for any other object.
    int fieldIndex(const QObject *object) const;

    economics::AssortPricesWindowLogic *m_logic = nullptr;
    std::array<QLineEdit *, rotation::kAssortmentClassCount> m_fields{};
    std::array<QLabel *, rotation::kAssortmentClassCount> m_captions{};
    QLabel *m_description = nullptr;
    QPushButton *m_change = nullptr;
    QPushButton *m_close = nullptr;
};

} // namespace arbolex::ui
