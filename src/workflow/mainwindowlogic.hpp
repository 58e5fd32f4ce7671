#pragma once

// The logic of the main window `frmMain`: the grow command, thinning and
// assortments of a row, the final cut, the summary, clearing and deleting
// rows, the model menu, and the window's load and unload. The work it shows
// and changes is the StandWork every window shares; it talks to its window
// only through IMainView, asks the user only through IInteractive, and opens
// the other windows through IWorkWindows, so its handlers can call one
// another with no person at the keyboard.

#include "work/standwork.hpp"
#include "workflow/growfrompanel.hpp"
#include "workflow/imainview.hpp"
#include "workflow/iworkwindows.hpp"
#include "workflow/modelnotes.hpp"
#include "workflow/summarypanel.hpp"

#include <QString>

#include <vector>

class QSettings;

namespace arbolex::engine {
class Grow;
}

namespace arbolex::prices {
class Prices;
}

namespace arbolex::shell {
class DataHistory;
class ErrorLog;
class IClipboard;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::workflow {

class MainWindowLogic : public IMainCommands {
public:
    MainWindowLogic(work::StandWork &work, QString dataFolder, IMainView &view,
                    shell::IInteractive &interactive, IWorkWindows &windows);
    ~MainWindowLogic() override;
    MainWindowLogic(const MainWindowLogic &) = delete;
    MainWindowLogic &operator=(const MainWindowLogic &) = delete;

    // ---- Start-up and exit --------------------------------------------------

    /// The window's load: placement from `settings` (centred on `screen` when
    /// absent), the start-up file, the stored model, the price lists, captions.
    void Form_Load(QSettings &settings, const QRect &screen);
    /// The window's unload: placement, the start-up file, prices and categories.
    void Form_Unload(QSettings &settings);
    /// The model chosen in the model-choice window.
    void SetModelFromfrmModelChoice(int modelId) { mnuModel_Click(modelId); }
    /// Model menu entry `index` (the model identifier).
    void mnuModel_Click(int index) override;
    /// Reads the price lists and the categories from the data folder again
    /// (after a file was restored), keeping the price set in use.
    void reloadDataFiles();

    // ---- Commands -------------------------------------------------------------

    void cmdGrow_Click() override;
    /// Thin: opens the thinning window on the last growth row.
    void cmdThin_Click() override;
    /// Assort: the assortment report of the selected growth row.
    void cmdAssort_Click();
    void cmdClear_Click() override;
    /// Clear All: empties the table and shows the header without money column.
    void ClearAll();
    /// Copies the current table row into the grow-from fields.
    void UseFlxRow();
    /// Allows or ends changes to the user-defined prices.
    void cmdChangePrices_Click();
    /// Show Timber Prices: opens the timber prices window.
    void cmdShowTimberPrice_Click();
    /// Tells the threshold basal area of the active species.
    void TrhesholdInfo() { tellThreshold(grow(), m_interactive, errorLog()); }
    /// Notes on the valid use of the active model.
    void Warn() { tellNotes(grow(), m_interactive, errorLog()); }

    /// Final cut: the last stand of the table becomes the clear-fell row,
    /// valued, with the yield class of the rotation; offers the net present value.
    void cmdFinalCut_Click() override;
    /// Fills the summary `flxSummary` and shows it; false when there was
    /// nothing to summarise.
    bool FillSummary() { return m_summary.fill(); }
    /// Toggles between "Stand Projections" and "Summary".
    void cmdSummary_Click() { m_summary.toggle(); }
    /// Opens the net present value window on the rotation.
    void cmdNPV_Click();
    /// Deletes the rows from the first selected one to the end, after a question.
    void cmdDeleteRows_Click();
    /// Copies the projection table or the summary to the clipboard.
    void CopyTable(bool summary);

    bool checkGrowFrom() override;
    void restore(const work::WorkSnapshot &snapshot) override;

    // ---- What the window shows ------------------------------------------------

    GrowFromPanel &fields() { return m_fields; }
    /// Types into a field as a user would (see GrowFromPanel::typeText).
    void typeText(MainControl control, const QString &text) override {
        m_fields.typeText(control, text);
    }
    void leaveField(MainControl control) { m_fields.leaveField(control); }
    const work::ProjectionTable &table() const { return m_work.table(); }
    /// Sets the current row and the end of the selection of `flxMain`.
    void select(int row, int endRow) { m_work.select(row, endRow); }
    /// The summary as last filled (SummaryPanel).
    const std::vector<work::TableRow> &summaryRows() const { return m_summary.rows(); }
    int summaryTotalsFrom() const { return m_summary.totalsFrom(); }
    std::vector<QStringList> summaryGrid() const { return m_summary.grid(); }
    QStringList summaryGroups() const { return m_summary.groups(); }
    bool showingSummary() const { return m_summary.showing(); }
    /// The carbon block under the summary, as last filled.
    const CarbonSummary &summaryCarbon() const { return m_summary.carbon(); }

    /// The clipboard that the copy commands fill.
    void attachClipboard(shell::IClipboard *clipboard) { m_clipboard = clipboard; }
    /// The history that keeps the data files the exit writes over.
    void attachDataHistory(const shell::DataHistory *history) { m_dataHistory = history; }

    work::StandWork &work() { return m_work; }
    engine::Grow &grow() { return m_work.grow(); }
    prices::Prices &prices() { return m_work.prices(); }
    IMainView &view() { return m_view; }
    shell::IInteractive &interactive() { return m_interactive; }
    shell::ErrorLog &errorLog() { return m_work.errorLog(); }

private:
    void message(const QString &title, const QString &text, int style);
    bool changeCheck() const;
    /// Puts the fields back from the current row.
    void restoreFromRow();
    /// What every clearing shares: the table emptied in `layout`, the windows
    /// on the old rows closed, the commands of an empty table.
    void afterClear(work::HeaderLayout layout);
    void updateCaption();
    void updateYieldClassLabel();

    work::StandWork &m_work;
    QString m_dataFolder;
    IMainView &m_view;
    shell::IInteractive &m_interactive;
    IWorkWindows &m_windows;
    GrowFromPanel m_fields;
    shell::IClipboard *m_clipboard = nullptr;
    const shell::DataHistory *m_dataHistory = nullptr;
    SummaryPanel m_summary;
    QMetaObject::Connection m_tableShown;
    QMetaObject::Connection m_captionShown;
};

} // namespace arbolex::workflow
