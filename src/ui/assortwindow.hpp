#pragma once

#include "assortments/iassortview.hpp"

#include <QDialog>

#include <array>

class QLabel;
class QPushButton;
class QTableWidget;

namespace arbolex::assortments {
class AssortWindowLogic;
}

namespace arbolex::ui {

/// The assortment report window `frmAssort`: the title, the three fixed
/// classes with their volume and share, or the table of the user categories,
/// and OK, Accept and Cancel. Modal over the window that asked for it.
class AssortWindow : public QDialog, public assortments::IAssortView {
    Q_OBJECT
public:
    explicit AssortWindow(QWidget *parent = nullptr);

    void attach(assortments::AssortWindowLogic &logic) { m_logic = &logic; }
    QWidget *control(assortments::AssortControl control) const;
    QTableWidget *userTable() const { return m_userTable; }

    // IAssortView
    QString text(assortments::AssortControl control) const override;
    void setText(assortments::AssortControl control, const QString &text) override;
    void setCaption(const QString &caption) override;
    QString caption() const override { return windowTitle(); }
    void showFixedClasses() override;
    void showUserReport(const assortments::UserReport &report) override;
    std::optional<assortments::UserReport> userReport() const override { return m_userReport; }
    /// Opens the window modal, without waiting: its buttons reach the logic.
    void showReport() override;
    void close() override;
    bool isShown() const override;

    /// Escape and the title bar's close button: the same as Cancel.
    void reject() override;

private:
    QWidget *buildFixed();
    QPushButton *addButton(assortments::AssortControl control, const QString &caption,
                           const QString &hint);

    assortments::AssortWindowLogic *m_logic = nullptr;
    std::array<QWidget *, assortments::kAssortControlCount> m_controls{};
    QWidget *m_fixed = nullptr;
    QTableWidget *m_userTable = nullptr;
    QLabel *m_notes = nullptr;
    std::optional<assortments::UserReport> m_userReport;
};

} // namespace arbolex::ui
