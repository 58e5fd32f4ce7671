#pragma once

#include "assortments/iassortview.hpp"
#include "prices/pricedata.hpp"

#include <QDialog>

#include <array>

class QCheckBox;
class QLineEdit;

namespace arbolex::assortments {
class AssortUserLogic;
}

namespace arbolex::ui {

/// The user categories window `frmAssortUser`: five rows of name, small-end
/// and big-end diameter and in-use, the switch that builds reports over them,
/// OK and Cancel. Modal over the main window.
class AssortUserWindow : public QDialog, public assortments::IAssortUserView {
    Q_OBJECT
public:
    explicit AssortUserWindow(QWidget *parent = nullptr);

    void attach(assortments::AssortUserLogic &logic) { m_logic = &logic; }
    /// The widget of a control (`index` 1 to 5 for the per-category ones).
    QWidget *control(assortments::AssortUserControl control, int index) const;

    // IAssortUserView
    QString text(assortments::AssortUserControl control, int index) const override;
    void setText(assortments::AssortUserControl control, int index, const QString &text) override;
    bool isChecked(assortments::AssortUserControl control, int index) const override;
    void setChecked(assortments::AssortUserControl control, int index, bool checked) override;
    void focus(assortments::AssortUserControl control, int index) override;
    void showEditor() override;
    void close() override;
    bool isShown() const override;

    void reject() override;

private:
    QLineEdit *field(assortments::AssortUserControl control, int index) const;

    assortments::AssortUserLogic *m_logic = nullptr;
    /// Name, small end and big end of each category.
    std::array<std::array<QLineEdit *, 3>, prices::kUserCategoryCount> m_fields{};
    std::array<QCheckBox *, prices::kUserCategoryCount> m_use{};
    QCheckBox *m_flag = nullptr;
};

} // namespace arbolex::ui
