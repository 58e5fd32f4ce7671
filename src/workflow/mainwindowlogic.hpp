#pragma once

// The logic of the main window `frmMain`: the grow-from inputs and their
// checks, the grow command, the projection table, clearing, the model menu,
// and the window's load and unload. It talks to its window only through
// IMainView and asks the user only through IInteractive, so its handlers can
// call one another with no person at the keyboard.

#include "engine/grow.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"
#include "work/timberrevenue.hpp"
#include "workflow/imainview.hpp"
#include "workflow/mainsnapshot.hpp"

#include <QString>

#include <cstdint>
#include <vector>

class QSettings;

namespace arbolex::shell {
class DataHistory;
class ErrorLog;
class IClipboard;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::prices {
class Prices;
}

namespace arbolex::economics {
class NpvWindowLogic;
class TimberPricesWindowLogic;
} // namespace arbolex::economics

namespace arbolex::thinning {
class ThinWindowLogic;
} // namespace arbolex::thinning

namespace arbolex::assortments {
class AssortWindowLogic;
} // namespace arbolex::assortments

namespace arbolex::workflow {

/// The grow-from values as read from the fields.
struct GrowFrom {
    float age = 0.0f;       ///< years
    float stocking = 0.0f;  ///< stems/ha
    float topHeight = 0.0f; ///< m
    float basalArea = 0.0f; ///< m²/ha
    float dbh = 0.0f;       ///< cm
    float targetAge = 0.0f; ///< years
    float step = 0.0f;      ///< years
};

class MainWindowLogic {
public:
    MainWindowLogic(engine::Grow &grow, prices::Prices &prices, shell::ErrorLog &log,
                    QString dataFolder, IMainView &view, shell::IInteractive &interactive);

    // ---- Start-up and exit --------------------------------------------------

    /// The window's load: placement from `settings` (centred on `screen` when
    /// absent), the start-up file, the stored model, the price lists, captions.
    void Form_Load(QSettings &settings, const QRect &screen);
    /// The window's unload: placement, the start-up file, prices and categories.
    void Form_Unload(QSettings &settings);
    /// The model chosen in the model-choice window.
    void SetModelFromfrmModelChoice(int modelId);
    /// Model menu entry `index` (the model identifier).
    void mnuModel_Click(int index);

    // ---- Commands -------------------------------------------------------------

    void cmdGrow_Click();
    /// Thin: opens the thinning window on the last growth row.
    void cmdThin_Click();
    /// Assort: the assortment report of the selected growth row.
    void cmdAssort_Click();
    void cmdClear_Click();
    /// Allows or ends changes to the user-defined prices.
    void cmdChangePrices_Click();
    /// Show Timber Prices: opens the timber prices window.
    void cmdShowTimberPrice_Click();
    /// Clear All: empties the table and shows the header without money column.
    void ClearAll();
    /// Copies the current table row into the grow-from fields.
    void UseFlxRow();
    /// Tells the threshold basal area of the active species.
    void TrhesholdInfo();
    /// Notes on the valid use of the active model.
    void Warn();

    // ---- Closing the rotation ---------------------------------------------------

    /// Final cut: the last stand of the table becomes the clear-fell row,
    /// valued, with the yield class of the rotation; offers the net present value.
    void cmdFinalCut_Click();
    /// Fills the summary `flxSummary` and shows it; false when there was
    /// nothing to summarise.
    bool FillSummary();
    /// Toggles between "Stand Projections" and "Summary".
    void cmdSummary_Click();
    /// Opens the net present value window on the rotation.
    void cmdNPV_Click();
    /// Deletes the rows from the first selected one to the end, after a question.
    void cmdDeleteRows_Click();
    /// Copies the projection table or the summary to the clipboard.
    void CopyTable(bool summary);
    /// True once the final cut has ended the rotation.
    bool felled() const { return m_felled; }
    /// The summary as last filled: its rows, in the projection table's shape.
    const std::vector<work::TableRow> &summaryRows() const { return m_summary; }
    /// Index in summaryRows() of the first row of the rotation's totals.
    int summaryTotalsFrom() const { return m_summaryTotalsFrom; }
    /// The summary as shown: captions first, then its rows.
    std::vector<QStringList> summaryGrid() const;
    /// The group above each column of the summary ("Thinning" …).
    QStringList summaryGroups() const;
    bool showingSummary() const { return m_showingSummary; }
    /// Text of the notes shown by Warn().
    QString warnText() const;

    // ---- Fields -----------------------------------------------------------------

    /// The key filter of every numeric field: digits and the decimal point
    /// pass; any other character is discarded.
    static bool KeyFilter(QChar key);
    /// Types `text` into a field as a user would (each character through the
    /// key filter of a numeric field), then leaves it.
    void typeText(MainControl control, const QString &text);
    /// Leaving a field runs its lost-focus handler.
    void leaveField(MainControl control);
    void txtFromA_LostFocus();
    void txtFromH_LostFocus();

    // ---- Checks and the grow-from values ----------------------------------------

    bool ChkGrowFromFlds();
    bool ChkGrowFromBnds();
    bool ChkGrowFromBD();
    GrowFrom GetGrowFrom() const;
    /// Writes the grow-from fields in their display formats.
    bool SetGrowFrom(float age, float basalArea, float stocking, float topHeight, float targetAge,
                     float step);

    // ---- The projection table -------------------------------------------------------

    /// Appends one row per newly projected state (m_states[m_firstNew..]) of
    /// `kind`, then refreshes the yield class.
    void AppendGrid(work::RowKind kind, const QString &label);
    const work::ProjectionTable &table() const { return m_table; }
    /// Writes the total-production cells of row `rowIndex`: its stand plus
    /// every removal so far (growth and thinning rows alike).
    void fillTotalProduction(work::TableRow &row, int rowIndex) const;
    /// Writes the increments of row `rowIndex`: the mean annual increment,
    /// and the current one from the row before when `currentIncrement`.
    void writeIncrements(int rowIndex, bool currentIncrement);
    /// Sets the current row and the end of the selection of `flxMain`.
    void select(int row, int endRow);

    /// Yield class of the rows so far: 0 while the MAI has not culminated.
    int yieldClass() const;
    /// Tallest top height the active model accepts, m.
    float maxTopHeight() const { return m_grow.maxTopHeight(); }
    /// Oldest target age the active model accepts, years.
    int maxTargetAge() const;
    /// Volume per ha of the last growth row, m³/ha.
    double standingVolume() const { return m_standingVolume; }

    /// The thinning window's logic that the thin command opens.
    void attachThinning(thinning::ThinWindowLogic *thinning) { m_thinning = thinning; }
    /// The net present value window's logic that cmdNPV opens.
    void attachNpv(economics::NpvWindowLogic *npv) { m_npv = npv; }
    /// The clipboard that the copy commands fill.
    void attachClipboard(shell::IClipboard *clipboard) { m_clipboard = clipboard; }
    /// The timber prices window's logic that Show Timber Prices opens.
    void attachTimberPrices(economics::TimberPricesWindowLogic *prices) { m_timberPrices = prices; }
    /// The assortment report window's logic that the assort command opens.
    void attachAssortments(assortments::AssortWindowLogic *assort) { m_assort = assort; }
    /// The history that keeps the data files the exit writes over.
    void attachDataHistory(const shell::DataHistory *history) { m_dataHistory = history; }
    /// Reads the price lists and the categories from the data folder again
    /// (after a file was restored), keeping the price set in use.
    void reloadDataFiles();

    /// The table as the thinning rows change it.
    work::ProjectionTable &tableForThinning() { return m_table; }
    /// Tells the window that rows from `firstRow` on changed, and makes the
    /// thinned stand the standing crop.
    void thinningWritten(int firstRow, double standingVolume);
    const work::TimberRevenue &timberRevenue() const { return m_timberRevenue; }
    /// Rebuilds the timber revenue by year from the rows' own revenues.
    void timberRevenueChanged();
    /// The cash flow of the rotation (module `mdlNPV`).
    work::CashFlow &cashFlow() { return m_cashFlow; }
    /// The net area of the sub-compartment, ha (0 when empty).
    double netArea() const;

    // ---- The sub-compartment as a document ------------------------------------------

    /// The work of the sub-compartment as it stands.
    MainSnapshot snapshot() const;
    /// Puts back the work of `snapshot` exactly as it was taken (no recomputation):
    /// growing, thinning and the cash flow go on from there.
    void restore(const MainSnapshot &snapshot);
    /// The document's name and whether it has unsaved changes, for the caption.
    void setDocumentTitle(const QString &name, bool modified);
    const QString &documentName() const { return m_documentName; }
    bool documentModified() const { return m_modified; }
    /// The identification that heads every report of the sub-compartment.
    const work::SubCompartment &identification() const { return m_identification; }
    void setIdentification(const work::SubCompartment &id) { m_identification = id; }

    engine::Grow &grow() { return m_grow; }
    prices::Prices &prices() { return m_prices; }
    IMainView &view() { return m_view; }
    shell::IInteractive &interactive() { return m_interactive; }
    shell::ErrorLog &errorLog() { return m_log; }

private:
    QString field(MainControl c) const;
    void message(const QString &title, const QString &text, int style);
    /// Shows a range fault, moves the focus to `control` and returns false.
    bool refuse(const QString &title, const QString &text, int style, MainControl control);
    void showSiteIndex(float age, float topHeight);
    /// Shows the engine's site index in `lblSI`, or nothing when it is not `known`.
    void showSiteIndex(bool known);
    bool changeCheck() const;
    void restoreFromRow();
    void copyRowToFields(int row);
    void afterClear(work::HeaderLayout layout);
    void updateCaption();
    /// The price lists, categories and assortment prices from the data folder.
    void readPriceFiles();
    void updateYieldClassLabel();
    void buildGrowthCells(work::TableRow &row, int rowIndex) const;
    bool continuesFromRow(int row) const;
    float thresholdBasalArea();
    /// The last row that holds a stand (growth or thinning), 0 when none.
    int lastStandRow() const;
    /// Renumbers the table's state after rows were deleted from `firstDeleted` on.
    void AjustArraysAfterDelete(int firstDeleted);
    /// Switches the table view between the projections and the summary.
    void showSummary(bool summary);
    void restoreCashFlow(const MainSnapshot &snapshot);

    engine::Grow &m_grow;
    prices::Prices &m_prices;
    shell::ErrorLog &m_log;
    QString m_dataFolder;
    IMainView &m_view;
    shell::IInteractive &m_interactive;

    work::ProjectionTable m_table;
    /// The states of the last projection and the first of them to append.
    std::vector<engine::StandState> m_states;
    std::size_t m_firstNew = 0;
    /// Volume per ha of the last growth row, m³/ha.
    double m_standingVolume = 0.0;
    thinning::ThinWindowLogic *m_thinning = nullptr;
    economics::NpvWindowLogic *m_npv = nullptr;
    shell::IClipboard *m_clipboard = nullptr;
    economics::TimberPricesWindowLogic *m_timberPrices = nullptr;
    assortments::AssortWindowLogic *m_assort = nullptr;
    const shell::DataHistory *m_dataHistory = nullptr;
    work::TimberRevenue m_timberRevenue;
    work::CashFlow m_cashFlow;
    /// Set by the final cut; no growing or thinning until rows are cleared or deleted.
    bool m_felled = false;
    std::vector<work::TableRow> m_summary;
    /// Index in m_summary of the first row of the rotation's totals.
    int m_summaryTotalsFrom = 0;
    bool m_showingSummary = false;
    work::SubCompartment m_identification;
    /// Name of the open document ("" before any) and its unsaved changes.
    QString m_documentName;
    bool m_modified = false;
};

} // namespace arbolex::workflow
