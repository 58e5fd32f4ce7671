#include "economics/npvwindowlogic.hpp"
#include "work/worktexts.hpp"

#include "economics/npvmessages.hpp"
#include "shell/apperror.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "shell/tableexport.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"

namespace arbolex::economics {

using shell::formatNumber;

namespace {

constexpr QChar kEnter = u'\r';
constexpr QChar kBackspace = u'\b';

/// Years from which the grid is widened for its vertical scroll bar.
constexpr int kScrollingYears = 30;

/// Value or zero: the number of a text, an empty text giving 0.
double valueOrZero(const QString &text) {
    return text.isEmpty() ? 0.0 : shell::val(text);
}

} // namespace

NpvWindowLogic::NpvWindowLogic(work::StandWork &work, INpvView &view,
                               shell::IInteractive &interactive, shell::IClipboard &clipboard)
    : m_standWork(work), m_cashFlow(work.cashFlow()), m_log(work.errorLog()), m_view(view),
      m_interactive(interactive), m_clipboard(clipboard) {}

void NpvWindowLogic::Form_Load() {
    shell::guard(m_log, QStringLiteral(" in frmNPV.Form_Load()"), [&] {
        const int years = m_cashFlow.years();
        m_grid.assign(static_cast<std::size_t>(years) + 1, QStringList());
        m_grid[0] = work::text::cashFlowHeaders();
        for (int i = 0; i < years; ++i) {
            QStringList &row = m_grid[static_cast<std::size_t>(i) + 1];
            for (int c = 0; c < work::kCashFlowColumnCount; ++c) {
                row << QString();
            }
            row[work::kCfYear] = QString::number(m_cashFlow.firstYear() + i);
        }
        m_cashFlow.LoadTimberRevenues(m_standWork.timberRevenue());
        LoadNPV_GridWithArray();
        m_view.setText(NpvControl::txtInterestRate,
                       formatNumber(m_cashFlow.interestRate(), u"0.00##"));
        showNetPresentValue();
        m_view.setGridWidened(years >= kScrollingYears);
        m_row = years > 0 ? 1 : 0;
        m_column = work::kCfCost;
        m_view.setCurrentCell(m_row, m_column);
        m_view.gridChanged();
    });
}

void NpvWindowLogic::LoadNPV_GridWithArray() {
    shell::guard(m_log, QStringLiteral(" in frmNPV.LoadNPV_GridWithArray()"), [&] {
        for (int i = 0; i < m_cashFlow.years(); ++i) {
            QStringList &row = m_grid.at(static_cast<std::size_t>(i) + 1);
            row[work::kCfOperation] = m_cashFlow.operation(i);
            for (int c = work::kCfCost; c < work::kCashFlowColumnCount; ++c) {
                row[c] = formatNumber(m_cashFlow.matrix(c, i), u"#0");
            }
        }
    });
}

void NpvWindowLogic::writeComputedRow(int i) {
    QStringList &row = m_grid.at(static_cast<std::size_t>(i) + 1);
    row[work::kCfTotalRevenues] = formatNumber(m_cashFlow.matrix(work::kCfTotalRevenues, i), u"#0");
    row[work::kCfCashFlow] = formatNumber(m_cashFlow.matrix(work::kCfCashFlow, i), u"0");
    row[work::kCfDiscountedCashFlow] =
        formatNumber(m_cashFlow.matrix(work::kCfDiscountedCashFlow, i), u"#0");
}

void NpvWindowLogic::showNetPresentValue() {
    m_view.setText(NpvControl::txtNPV, formatNumber(m_cashFlow.SumNPV(), u"#0"));
}

void NpvWindowLogic::cmdNPV_Click() {
    const int computed = m_cashFlow.ComputeCashFlow(m_log);
    for (int i = 0; i < computed; ++i) {
        writeComputedRow(i);
    }
    // A computation that failed part-way keeps the years before the failure
    // and leaves the net present value as it was.
    if (computed == m_cashFlow.years()) {
        showNetPresentValue();
    }
    m_view.gridChanged();
    m_standWork.cashFlowEdited();
}

bool NpvWindowLogic::editable(int column) const {
    return column == work::kCfOperation || column == work::kCfCost ||
           column == work::kCfOtherRevenues;
}

void NpvWindowLogic::NPV_Grid_KeyPress(QChar key) {
    shell::guard(m_log, QStringLiteral(" in frmNPV.NPV_Grid_KeyPress()"), [&] {
        const int years = m_cashFlow.years();
        if (m_row < 1 || m_row > years) {
            return;
        }
        if (key == kEnter) {
            cmdNPV_Click();
            if (m_row < years) {
                selectCell(m_row + 1, m_column);
            }
            return;
        }
        if (!editable(m_column)) {
            return;
        }
        const int i = m_row - 1;
        QString &cell = m_grid.at(static_cast<std::size_t>(m_row))[m_column];
        if (m_column == work::kCfOperation) {
            if (key == kBackspace) {
                cell.chop(1);
            } else {
                cell.append(key);
            }
            m_cashFlow.setOperation(i, cell);
        } else {
            if (key == kBackspace) {
                cell.chop(1);
            } else if (key.isDigit()) {
                if (cell == QLatin1String("0")) {
                    cell.clear();
                }
                cell.append(key);
            } else if (key == u'.' && !cell.contains(u'.')) {
                cell.append(key);
            } else {
                return;
            }
            m_cashFlow.setMatrix(m_column, i, valueOrZero(cell));
        }
        m_view.gridChanged();
        m_standWork.cashFlowEdited();
    });
}

void NpvWindowLogic::selectCell(int row, int column) {
    m_row = std::clamp(row, 0, m_cashFlow.years());
    m_column = std::clamp(column, 0, work::kCashFlowColumnCount - 1);
    m_view.setCurrentCell(m_row, m_column);
}

void NpvWindowLogic::typeInCell(int row, int column, const QString &typed) {
    selectCell(row, column);
    if (m_row < 1) {
        return;
    }
    const qsizetype old = m_grid.at(static_cast<std::size_t>(m_row)).at(m_column).size();
    for (qsizetype k = 0; k < old; ++k) {
        NPV_Grid_KeyPress(kBackspace);
    }
    for (const QChar c : typed) {
        NPV_Grid_KeyPress(c);
    }
}

bool NpvWindowLogic::txtInterestRate_KeyPress(QChar key) const {
    if (key.isDigit() || key == kBackspace) {
        return true;
    }
    return key == u'.' && !m_view.text(NpvControl::txtInterestRate).contains(u'.');
}

void NpvWindowLogic::typeInterestRate(const QString &typed) {
    m_view.setText(NpvControl::txtInterestRate, QString());
    for (const QChar c : typed) {
        if (txtInterestRate_KeyPress(c)) {
            m_view.setText(NpvControl::txtInterestRate,
                           m_view.text(NpvControl::txtInterestRate) + c);
        }
    }
    txtInterestRate_LostFocus();
}

bool NpvWindowLogic::txtInterestRate_LostFocus() {
    const QString typed = m_view.text(NpvControl::txtInterestRate);
    if (typed.isEmpty()) {
        m_interactive.message(text::titleNetPresentValue(), text::typeInterestRate(),
                              shell::kInformation);
        m_view.focus(NpvControl::txtInterestRate);
        return false;
    }
    m_cashFlow.setInterestRate(shell::val(typed));
    m_standWork.cashFlowEdited();
    return true;
}

void NpvWindowLogic::CmdCopyToClipboard_Click() {
    bool copied = false;
    shell::guard(m_log, QStringLiteral(" in frmNPV.CmdCopyToClipboard_Click()"), [&] {
        copied = m_clipboard.setTable(shell::tabSeparated(m_grid), shell::htmlTable(m_grid));
    });
    if (copied) {
        m_interactive.message(text::titleNetPresentValue(), text::copiedToClipboard(),
                              shell::kInformation);
    } else {
        m_interactive.message(text::titleNetPresentValue(), text::copyFailed(),
                              shell::kExclamation);
    }
}

void NpvWindowLogic::cmdClose_Click() {
    m_view.close();
}

bool NpvWindowLogic::press(NpvControl control) {
    switch (control) {
    case NpvControl::cmdNPV:
        cmdNPV_Click();
        return true;
    case NpvControl::CmdCopyToClipboard:
        CmdCopyToClipboard_Click();
        return true;
    case NpvControl::cmdClose:
        cmdClose_Click();
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::economics
