// The main window's commands: grow, thin, assort, the final cut, the summary,
// clearing, deleting rows and copying the table.
#include "workflow/mainwindowlogic.hpp"
#include "work/worktexts.hpp"

#include "assortments/assortmessages.hpp"
#include "engine/grow.hpp"
#include "rotation/growcommand.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/iclipboard.hpp"
#include "shell/interactive.hpp"
#include "shell/tableexport.hpp"
#include "thinning/thinmessages.hpp"
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

QString wholeAge(float age) {
    return QString::number(static_cast<qint64>(std::nearbyint(age)));
}

} // namespace

MainWindowLogic::MainWindowLogic(work::StandWork &work, QString dataFolder, IMainView &view,
                                 shell::IInteractive &interactive, IWorkWindows &windows)
    : m_work(work), m_dataFolder(std::move(dataFolder)), m_view(view), m_interactive(interactive),
      m_windows(windows), m_fields(work, work.grow(), work.errorLog(), view, interactive),
      m_summary(work, view, interactive) {
    m_tableShown = QObject::connect(&work, &work::StandWork::tableChanged, [this](int firstRow) {
        updateYieldClassLabel();
        m_view.tableChanged(firstRow);
    });
    m_captionShown = QObject::connect(&work, &work::StandWork::documentTitleChanged,
                                      [this] { updateCaption(); });
}

MainWindowLogic::~MainWindowLogic() {
    QObject::disconnect(m_tableShown);
    QObject::disconnect(m_captionShown);
}

void MainWindowLogic::message(const QString &title, const QString &text, int style) {
    m_interactive.message(title, text, style);
}

bool MainWindowLogic::changeCheck() const {
    const work::ProjectionTable &table = m_work.table();
    if (table.rowCount() <= 1) {
        return false;
    }
    const work::TableRow &row = table.row(std::max(table.currentRow(), 1));
    return m_fields.field(MainControl::txtFromA) != row.cells.value(work::kColAge) ||
           m_fields.field(MainControl::txtFromH) != row.cells.value(work::kColTopHeight) ||
           m_fields.field(MainControl::txtFromN) != row.cells.value(work::kColStocking) ||
           m_fields.field(MainControl::txtFromB) != row.cells.value(work::kColBasalArea);
}

void MainWindowLogic::restoreFromRow() {
    if (m_work.table().rowCount() > 1) {
        m_work.copyRowToFields(std::max(m_work.table().currentRow(), 1));
    }
}

void MainWindowLogic::cmdGrow_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdGrow_Click()"), [&] {
        // After the final cut the rotation is closed until rows are cleared or deleted.
        if (m_work.felled()) {
            return;
        }
        const work::ProjectionTable &table = m_work.table();
        const bool thinned = grow().isThinnedModel();
        // The start of a thinned projection is fixed once it has rows.
        if (thinned && table.rowCount() > 1 && changeCheck()) {
            message(text::titleArbolex(), text::changesNotAllowed(), shell::kInformation);
            restoreFromRow();
            return;
        }
        const BusyPointer busy(m_view);
        if (!m_fields.ChkGrowFromFlds() || !m_fields.ChkGrowFromBnds()) {
            return;
        }
        GrowFrom g = m_fields.GetGrowFrom();
        // Fields that still show the row they were taken from: the projection
        // continues from that row's exact state, not from its rounded cells.
        const int fromRow = std::max(table.currentRow(), 1);
        if (fromRow <= table.lastRow() &&
            (table.row(fromRow).isGrowth() || table.row(fromRow).isThinning()) && !changeCheck()) {
            const work::RowRecord &rec = table.row(fromRow).record;
            g.age = rec.age;
            g.topHeight = rec.topHeight;
            g.stocking = rec.stocking;
            g.basalArea = rec.basalArea;
        }
        const rotation::Growth growth = rotation::growStand(grow(), g.age, g.basalArea, g.stocking,
                                                            g.topHeight, g.targetAge, g.step);
        m_fields.showSiteIndex(growth.siteIndexKnown);
        m_work.SetGrowFrom(growth.age, growth.basalArea, growth.stocking, growth.topHeight,
                           growth.targetAge, g.step);
        // A projection that continues from the table's last row does not
        // repeat that row.
        const std::size_t first =
            !growth.states.empty() && !table.empty() &&
                    table.row(table.lastRow()).record.age == growth.states.front().age
                ? 1
                : 0;
        m_work.AppendGrid(growth.states, first,
                          growth.projected ? work::RowKind::Growth : work::RowKind::Failed,
                          work::text::rowLabelGrowth());
        if (!growth.projected) {
            message(text::titleOstran(), text::projectionFailed(), shell::kExclamationOkCancel);
        }
        const int last = table.lastRow();
        m_work.select(last, last);
        m_view.scrollToRow(last);

        m_view.setEnabled(MainControl::cmdUseRow, true);
        m_view.setEnabled(MainControl::cmdFinalCut, last >= 1);
        if (thinned) {
            // From now on the projection goes on only from its own rows.
            m_view.setEnabled(MainControl::cmdClear, false);
            if (last >= 1) {
                m_work.copyRowToFields(last);
            }
        } else {
            m_view.setEnabled(MainControl::cmdClear, true);
        }
    });
}

void MainWindowLogic::cmdThin_Click() {
    namespace tt = thinning::text;
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdThin_Click()"), [&] {
        // After the final cut there is no crop left to thin.
        if (!grow().isThinnedModel() || m_work.felled()) {
            return;
        }
        const work::ProjectionTable &table = m_work.table();
        const QString title = text::titleArbolexYeld();
        const int last = table.lastRow();
        if (last < 1) {
            message(title, tt::growthRowRequired(), shell::kExclamation);
            return;
        }
        const int current = table.currentRow();
        const int end = table.selectionEnd();
        if (end != last) {
            const float selectedAge = current >= 1 ? table.row(current).record.age : 0.0f;
            m_work.select(last, last);
            m_view.scrollToRow(last);
            message(title,
                    tt::cannotThinLead() + wholeAge(table.row(last).record.age) +
                        tt::cannotThinYears() + tt::cr() + tt::lf() + tt::cannotThinAt() +
                        wholeAge(selectedAge),
                    shell::kExclamation);
            return;
        }
        if (current != end) {
            message(title, tt::singleRowRequired(), shell::kExclamation);
            return;
        }
        const work::TableRow &row = table.row(last);
        // A thinning row stands for its thinned stand: opening it again lets
        // the user change that thinning.
        if (!row.isGrowth() && !row.isThinning()) {
            message(title, tt::growthRowRequired(), shell::kExclamation);
            return;
        }
        if (row.isGrowth() && row.record.isThinned()) {
            message(title, tt::growBeforeThinning(), shell::kExclamation);
            return;
        }
        m_windows.openThinning();
    });
}

void MainWindowLogic::cmdAssort_Click() {
    namespace at = assortments::text;
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdAssort_Click()"), [&] {
        const work::ProjectionTable &table = m_work.table();
        const QString title = text::titleArbolex();
        const int current = table.currentRow();
        if (current != table.selectionEnd()) {
            message(title, at::singleGrowthRow(), shell::kExclamation);
            return;
        }
        const bool onRow = current >= 1 && current <= table.lastRow();
        if (!onRow || !(table.row(current).isGrowth() || table.row(current).isThinning())) {
            message(title, at::notGrowthRow(), shell::kExclamation);
            return;
        }
        // A growth row carries a thinning when a thinning row of its age follows it.
        const work::TableRow &row = table.row(current);
        bool thinned = row.isThinning() || row.record.isThinned();
        for (int r = current + 1; !thinned && r <= table.lastRow(); ++r) {
            thinned = table.row(r).isThinning() && table.row(r).record.age == row.record.age;
        }
        if (thinned) {
            message(title, at::useThinCommand(), shell::kExclamation);
            return;
        }
        m_windows.openAssortment(current);
    });
}

void MainWindowLogic::afterClear(work::HeaderLayout layout) {
    m_work.clear(layout);
    m_windows.closeNpv();
    if (m_summary.showing()) {
        m_summary.show(false);
    }
    // A thinning window open on the old rows has nothing left to thin.
    m_windows.closeThinning();
    m_view.setEnabled(MainControl::cmdGrow, true);
    m_view.setEnabled(MainControl::cmdClear, true);
    m_view.setEnabled(MainControl::cmdUseRow, false);
    m_view.setEnabled(MainControl::cmdFinalCut, false);
    m_view.setEnabled(MainControl::cmdNPV, false);
    m_view.setEnabled(MainControl::cmdThin, grow().isThinnedModel());
}

void MainWindowLogic::cmdClear_Click() {
    try {
        afterClear(work::HeaderLayout::WithMoney);
    } catch (const shell::AppFault &fault) {
        errorLog().append(QStringLiteral("Error ") + fault.error.description +
                          QStringLiteral(" in procedure cmdClear_Click of Feuille frmMain"));
    }
}

void MainWindowLogic::ClearAll() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.ClearAll()"),
                 [&] { afterClear(work::HeaderLayout::WithoutMoney); });
}

void MainWindowLogic::UseFlxRow() {
    const work::ProjectionTable &table = m_work.table();
    const int row = table.currentRow();
    if (row < 1 || row > table.lastRow() || table.row(row).isText() ||
        table.row(row).kind == work::RowKind::Failed) {
        message(text::titleArbolex(), text::transferFailed(), shell::kExclamation);
        return;
    }
    m_work.copyRowToFields(row);
    m_fields.showSiteIndex(table.row(row).record.age, table.row(row).record.topHeight);
}

void MainWindowLogic::cmdFinalCut_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdFinalCut_Click()"), [&] {
        if (m_work.felled()) {
            return;
        }
        const work::ProjectionTable &table = m_work.table();
        const int standRow = m_work.lastStandRow();
        if (standRow == 0) {
            message(text::titleArbolex(), text::nothingToFell(), shell::kExclamation);
            return;
        }
        for (int r = standRow + 1; r <= table.lastRow(); ++r) {
            if (table.row(r).kind == work::RowKind::Failed) {
                message(text::titleArbolex(), text::failedRowsBeforeFinalCut(),
                        shell::kExclamation);
                return;
            }
        }
        m_work.fellLastStand(work::text::rowLabelFinalCut(), m_interactive);
        m_view.setEnabled(MainControl::cmdThin, false);
        m_view.setEnabled(MainControl::cmdFinalCut, false);
        m_view.setEnabled(MainControl::cmdGrow, false);
        m_windows.closeThinning();
        if (m_interactive.askYesNo(text::titleNpv(), text::npvOffer())) {
            m_view.setEnabled(MainControl::cmdNPV, true);
            m_work.layOutCashFlow();
        }
    });
}

void MainWindowLogic::updateYieldClassLabel() {
    const int yc = m_work.yieldClass();
    if (m_work.felled()) {
        m_view.setText(MainControl::lblYC, QString::number(yc));
        m_view.setHint(MainControl::lblYC, text::yieldClassAtClearfell());
    } else if (yc > 0) {
        m_view.setText(MainControl::lblYC, QString::number(yc));
        m_view.setHint(MainControl::lblYC, text::yieldClassHint());
    } else {
        m_view.setText(MainControl::lblYC, QString());
        m_view.setHint(MainControl::lblYC, text::yieldClassInsufficient());
    }
}

void MainWindowLogic::cmdNPV_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdNPV_Click()"), [&] {
        if (m_work.cashFlow().years() > 0) {
            m_windows.openNpv();
        }
    });
}

void MainWindowLogic::cmdDeleteRows_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdDeleteRows_Click()"), [&] {
        const work::ProjectionTable &table = m_work.table();
        const int first = std::min(table.currentRow(), table.selectionEnd());
        if (table.empty() || first < 1) {
            message(text::titleArbolex(), text::selectRowToDelete(), shell::kExclamation);
            return;
        }
        if (!m_interactive.askYesNo(text::titleArbolex(),
                                    text::confirmDelete(first, table.lastRow()))) {
            return;
        }
        // AjustArraysAfterDelete: the rotation is open again unless its final
        // cut survived, without a cash flow; growing goes on from the new last row.
        if (first <= 1) {
            afterClear(work::HeaderLayout::WithMoney);
            return;
        }
        m_windows.closeNpv();
        m_windows.closeThinning();
        if (m_summary.showing()) {
            m_summary.show(false);
        }
        m_work.removeRowsFrom(first);
        const bool felled = m_work.felled();
        m_view.setEnabled(MainControl::cmdGrow, !felled);
        m_view.setEnabled(MainControl::cmdThin, !felled && grow().isThinnedModel());
        m_view.setEnabled(MainControl::cmdFinalCut, !felled);
        m_view.setEnabled(MainControl::cmdNPV, false);
        m_view.scrollToRow(table.lastRow());
    });
}

void MainWindowLogic::CopyTable(bool summary) {
    bool copied = false;
    shell::guard(errorLog(), QStringLiteral(" in frmMain.CopyTable()"), [&] {
        if (m_clipboard == nullptr) {
            return;
        }
        const std::vector<QStringList> grid =
            m_work.identification().headed(summary ? summaryGrid() : m_work.table().exportGrid());
        copied = m_clipboard->setTable(shell::tabSeparated(grid), shell::htmlTable(grid));
    });
    if (!copied) {
        message(text::titleArbolex(), text::transferFailed(), shell::kExclamation);
    }
}

bool MainWindowLogic::checkGrowFrom() {
    return m_fields.ChkGrowFromFlds() && m_fields.ChkGrowFromBnds();
}

} // namespace arbolex::workflow
