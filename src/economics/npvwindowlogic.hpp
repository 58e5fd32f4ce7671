#pragma once

// The logic of the net present value window `frmNPV`: the rotation year by
// year in the grid `NPV_Grid`, typing costs, other revenues and operations
// into it, the interest rate, the computation and the copy to the clipboard.

#include "economics/inpvview.hpp"
#include "work/mdlnpv.hpp"
#include "work/standwork.hpp"

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::shell {
class ErrorLog;
class IClipboard;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::economics {

class NpvWindowLogic {
public:
    /// The window shows and edits the cash flow of `work`.
    NpvWindowLogic(work::StandWork &work, INpvView &view, shell::IInteractive &interactive,
                   shell::IClipboard &clipboard);

    /// The window's load: headers, one row per year, the timber revenues, the
    /// values typed so far, the interest rate and the net present value.
    void Form_Load();
    /// Fills the grid's rows from the cash flow: operations, then columns 2 to 7.
    void LoadNPV_GridWithArray();
    /// "Compute": totals, cash flows, discounted cash flows and their sum.
    void cmdNPV_Click();
    /// Key typed into the current cell of the grid: Enter ('\r') computes and
    /// moves down, Backspace ('\b') removes the last character.
    void NPV_Grid_KeyPress(QChar key);
    /// Makes (row, column) the current cell of the grid.
    void selectCell(int row, int column);
    /// Types `text` into a cell as a user would: its old text is backspaced
    /// away, then every character goes through the grid's key handling.
    void typeInCell(int row, int column, const QString &text);

    /// The key filter of the interest rate: digits, Backspace and one point.
    bool txtInterestRate_KeyPress(QChar key) const;
    /// Types `text` into the interest rate (through its filter), then leaves it.
    void typeInterestRate(const QString &text);
    /// Leaving the interest rate: an empty field is refused and keeps the focus.
    /// Returns false when the field may not be left.
    bool txtInterestRate_LostFocus();

    void CmdCopyToClipboard_Click();
    void cmdClose_Click();

    /// Presses the command `control`; false when it is no command.
    bool press(NpvControl control);

    /// The grid as shown: the header row, then one row per year.
    const std::vector<QStringList> &grid() const { return m_grid; }
    int currentRow() const { return m_row; }
    int currentColumn() const { return m_column; }
    INpvView &view() { return m_view; }

private:
    void writeComputedRow(int i);
    void showNetPresentValue();
    bool editable(int column) const;

    work::StandWork &m_standWork;
    work::CashFlow &m_cashFlow;
    shell::ErrorLog &m_log;
    INpvView &m_view;
    shell::IInteractive &m_interactive;
    shell::IClipboard &m_clipboard;
    std::vector<QStringList> m_grid;
    int m_row = 1;
    int m_column = work::kCfCost;
};

} // namespace arbolex::economics
