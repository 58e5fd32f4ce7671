#pragma once

#include "economics/inpvview.hpp"

#include <QDialog>

#include <array>

class QLineEdit;
class QPushButton;
class QTableView;

namespace arbolex::economics {
class NpvWindowLogic;
}

namespace arbolex::ui {

class StringGridModel;

/// The net present value window `frmNPV`: the rotation year by year in the
/// grid `NPV_Grid`, the interest rate, the net present value and the
/// commands. Not modal. Keys typed on the grid go to the logic's key handler,
/// which edits the cost, other revenue and operation cells.
class NpvWindow : public QDialog, public economics::INpvView {
    Q_OBJECT
public:
    explicit NpvWindow(QWidget *main = nullptr);

    /// Binds the window to its logic, which must outlive the window.
    void attach(economics::NpvWindowLogic &logic);

    QWidget *control(economics::NpvControl control) const;
    QTableView *grid() const { return m_grid; }
    /// "Economics…": the value of the same rotation in the economics window.
    QPushButton *economicsButton() const { return m_economicsButton; }

    // INpvView
    QString text(economics::NpvControl control) const override;
    void setText(economics::NpvControl control, const QString &text) override;
    void focus(economics::NpvControl control) override;
    void gridChanged() override;
    void setCurrentCell(int row, int column) override;
    void setGridWidened(bool widened) override;
    void showWindow() override;
    void close() override;
    bool isShown() const override;

signals:
    /// The cash flow's texts changed: a computation, typing, another rotation.
    void cashFlowChanged();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void fitColumns();

    economics::NpvWindowLogic *m_logic = nullptr;
    std::array<QWidget *, economics::kNpvControlCount> m_controls{};
    QTableView *m_grid = nullptr;
    QPushButton *m_economicsButton = nullptr;
    StringGridModel *m_model = nullptr;
    bool m_followingLogic = false;
    bool m_widened = false;
};

} // namespace arbolex::ui
