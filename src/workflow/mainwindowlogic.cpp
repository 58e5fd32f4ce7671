// The main window's commands: grow, clear, clear all and continuing from a row.
#include "workflow/mainwindowlogic.hpp"

#include "economics/npvwindowlogic.hpp"
#include "rotation/growcommand.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"

#include <cmath>

namespace arbolex::workflow {

namespace {

/// Shows the hourglass for as long as a command runs.
class BusyPointer {
public:
    explicit BusyPointer(IMainView &view) : m_view(view) { m_view.setBusy(true); }
    ~BusyPointer() { m_view.setBusy(false); }
    BusyPointer(const BusyPointer &) = delete;
    BusyPointer &operator=(const BusyPointer &) = delete;

private:
    IMainView &m_view;
};

} // namespace

MainWindowLogic::MainWindowLogic(engine::Grow &grow, prices::Prices &prices, shell::ErrorLog &log,
                                 QString dataFolder, IMainView &view,
                                 shell::IInteractive &interactive)
    : m_grow(grow), m_prices(prices), m_log(log), m_dataFolder(std::move(dataFolder)), m_view(view),
      m_interactive(interactive) {}

QString MainWindowLogic::field(MainControl c) const {
    return m_view.text(c);
}

void MainWindowLogic::message(const QString &title, const QString &text, int style) {
    m_interactive.message(title, text, style);
}

void MainWindowLogic::select(int row, int endRow) {
    m_table.select(row, endRow);
}

double MainWindowLogic::netArea() const {
    return shell::val(field(MainControl::txtNetArea));
}

void MainWindowLogic::thinningWritten(int firstRow, double standingVolume) {
    m_standingVolume = standingVolume;
    updateYieldClassLabel();
    m_view.tableChanged(firstRow);
}

bool MainWindowLogic::changeCheck() const {
    if (m_table.rowCount() <= 1) {
        return false;
    }
    const work::TableRow &row = m_table.row(std::max(m_table.currentRow(), 1));
    return field(MainControl::txtFromA) != row.cells.value(work::kColAge) ||
           field(MainControl::txtFromH) != row.cells.value(work::kColTopHeight) ||
           field(MainControl::txtFromN) != row.cells.value(work::kColStocking) ||
           field(MainControl::txtFromB) != row.cells.value(work::kColBasalArea);
}

void MainWindowLogic::copyRowToFields(int row) {
    const work::TableRow &r = m_table.row(row);
    m_view.setText(MainControl::txtFromA, r.cells.value(work::kColAge));
    m_view.setText(MainControl::txtFromH, r.cells.value(work::kColTopHeight));
    m_view.setText(MainControl::txtFromN, r.cells.value(work::kColStocking));
    m_view.setText(MainControl::txtFromB, r.cells.value(work::kColBasalArea));
    // The diameter follows the row too, so the pair never disagrees.
    m_view.setText(MainControl::txtFromD, r.cells.value(work::kColDbh));
}

void MainWindowLogic::restoreFromRow() {
    if (m_table.rowCount() > 1) {
        copyRowToFields(std::max(m_table.currentRow(), 1));
    }
}

bool MainWindowLogic::continuesFromRow(int row) const {
    // The fields still show the row they were taken from: the projection
    // continues from that row's exact state, not from its rounded cells.
    if (row < 1 || row > m_table.lastRow()) {
        return false;
    }
    const work::TableRow &r = m_table.row(row);
    return (r.isGrowth() || r.isThinning()) && !changeCheck();
}

void MainWindowLogic::cmdGrow_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdGrow_Click()"), [&] {
        // After the final cut the rotation is closed until rows are cleared or deleted.
        if (m_felled) {
            return;
        }
        const bool thinned = m_grow.isThinnedModel();
        // The start of a thinned projection is fixed once it has rows.
        if (thinned && m_table.rowCount() > 1 && changeCheck()) {
            message(text::titleArbolex(), text::changesNotAllowed(), shell::kInformation);
            restoreFromRow();
            return;
        }
        if (m_thinning != nullptr) {
            m_thinning->flags().thinnedSinceLastGrow = false;
        }
        const BusyPointer busy(m_view);
        if (!ChkGrowFromFlds() || !ChkGrowFromBnds()) {
            return;
        }
        GrowFrom g = GetGrowFrom();
        const int fromRow = std::max(m_table.currentRow(), 1);
        if (continuesFromRow(fromRow)) {
            const work::RowRecord &rec = m_table.row(fromRow).record;
            g.age = rec.age;
            g.topHeight = rec.topHeight;
            g.stocking = rec.stocking;
            g.basalArea = rec.basalArea;
        }
        rotation::Growth growth = rotation::growStand(m_grow, g.age, g.basalArea, g.stocking,
                                                      g.topHeight, g.targetAge, g.step);
        showSiteIndex(growth.siteIndexKnown);
        SetGrowFrom(growth.age, growth.basalArea, growth.stocking, growth.topHeight,
                    growth.targetAge, g.step);
        m_states = std::move(growth.states);
        const bool projected = growth.projected;
        // A projection that continues from the table's last row does not
        // repeat that row.
        m_firstNew = 0;
        if (!m_states.empty() && !m_table.empty() &&
            m_table.row(m_table.lastRow()).record.age == m_states.front().age) {
            m_firstNew = 1;
        }
        AppendGrid(projected ? work::RowKind::Growth : work::RowKind::Failed,
                   text::rowLabelGrowth());
        if (!projected) {
            message(text::titleOstran(), text::projectionFailed(), shell::kExclamationOkCancel);
        }
        const int last = m_table.lastRow();
        m_table.select(last, last);
        m_view.scrollToRow(last);

        m_view.setEnabled(MainControl::cmdUseRow, true);
        m_view.setEnabled(MainControl::cmdFinalCut, last >= 1);
        if (thinned) {
            // From now on the projection goes on only from its own rows.
            m_view.setEnabled(MainControl::cmdClear, false);
            if (last >= 1) {
                copyRowToFields(last);
            }
        } else {
            m_view.setEnabled(MainControl::cmdClear, true);
        }
    });
}

void MainWindowLogic::afterClear(work::HeaderLayout layout) {
    m_table.clear(layout);
    m_states.clear();
    m_firstNew = 0;
    m_standingVolume = 0.0;
    m_timberRevenue.clear();
    m_felled = false;
    m_cashFlow.reset();
    if (m_npv != nullptr) {
        m_npv->view().close();
    }
    if (m_showingSummary) {
        showSummary(false);
    }
    if (m_thinning != nullptr) {
        // A thinning window open on the old rows has nothing left to thin.
        m_thinning->flags().noThinningYet = true;
        m_thinning->view().close();
    }
    updateYieldClassLabel();
    m_view.setEnabled(MainControl::cmdGrow, true);
    m_view.setEnabled(MainControl::cmdClear, true);
    m_view.setEnabled(MainControl::cmdUseRow, false);
    m_view.setEnabled(MainControl::cmdFinalCut, false);
    m_view.setEnabled(MainControl::cmdNPV, false);
    m_view.setEnabled(MainControl::cmdThin, m_grow.isThinnedModel());
    m_view.tableChanged(1);
}

void MainWindowLogic::cmdClear_Click() {
    try {
        afterClear(work::HeaderLayout::WithMoney);
    } catch (const shell::AppFault &fault) {
        m_log.append(QStringLiteral("Error ") + fault.error.description +
                     QStringLiteral(" in procedure cmdClear_Click of Feuille frmMain"));
    }
}

void MainWindowLogic::ClearAll() {
    shell::guard(m_log, QStringLiteral(" in frmMain.ClearAll()"),
                 [&] { afterClear(work::HeaderLayout::WithoutMoney); });
}

void MainWindowLogic::UseFlxRow() {
    const int row = m_table.currentRow();
    if (row < 1 || row > m_table.lastRow() || m_table.row(row).isText() ||
        m_table.row(row).kind == work::RowKind::Failed) {
        message(text::titleArbolex(), text::transferFailed(), shell::kExclamation);
        return;
    }
    copyRowToFields(row);
    showSiteIndex(m_table.row(row).record.age, m_table.row(row).record.topHeight);
}

} // namespace arbolex::workflow
