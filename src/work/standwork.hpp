#pragma once

// The work on one sub-compartment as every window sees it: the grow-from
// fields as typed, the projection table (rows of numbers and kinds with their
// records, their cells made by the row formatter), the cash-flow inputs of
// the net present value window, the identification and the state of its
// document. Window logics read it and change it through its functions, and it
// announces every change. What the table already says (felled, thinned, the
// standing volume, the timber revenue by year, the yield class) is derived
// from it, never kept in step by hand.

#include "rotation/rotation.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"
#include "work/subcompartment.hpp"
#include "work/timberrevenue.hpp"
#include "work/worksnapshot.hpp"

#include <QObject>
#include <QString>

#include <array>
#include <optional>
#include <vector>

namespace arbolex::engine {
class Grow;
struct StandState;
} // namespace arbolex::engine

namespace arbolex::prices {
class Prices;
}

namespace arbolex::shell {
class ErrorLog;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::work {

/// The rotation summary: the start, every thinning with its assortment rows
/// and the final cut, then the rotation's totals from `totalsFrom` on.
struct Summary {
    std::vector<TableRow> rows;
    int totalsFrom = 0;
};

class StandWork : public QObject {
    Q_OBJECT
public:
    /// The work of the sub-compartment grown by `grow` and valued at `prices`;
    /// failures of its writers go to `log`.
    StandWork(engine::Grow &grow, prices::Prices &prices, shell::ErrorLog &log);

    engine::Grow &grow() { return m_grow; }
    const engine::Grow &grow() const { return m_grow; }
    prices::Prices &prices() { return m_prices; }
    shell::ErrorLog &errorLog() { return m_log; }

    // ---- The fields ---------------------------------------------------------------------

    const QString &field(WorkField field) const {
        return m_fields.at(static_cast<std::size_t>(field));
    }
    /// Sets a field as typed or as a command writes it.
    void setField(WorkField field, const QString &text);
    /// The net area of the sub-compartment, ha (0 when empty).
    double netArea() const;
    /// The site index as `lblSI` shows it.
    const QString &siteIndexText() const { return m_siteIndexText; }
    void setSiteIndexText(const QString &text);
    /// Shows the engine's site index (to a tenth) when `known`, else nothing,
    /// as the grow command and the stand's fields leave it.
    void showSiteIndex(bool known);

    /// SetGrowFrom: writes the grow-from fields in their display formats, the
    /// age only forward and each value only when it is above 0 (the step when
    /// it is not negative).
    void SetGrowFrom(float age, float basalArea, float stocking, float topHeight, float targetAge,
                     float step);
    /// Copies the stand cells of table row `row` into the grow-from fields
    /// (age, top height, stocking, basal area and the diameter with them).
    void copyRowToFields(int row);

    // ---- The projection table -------------------------------------------------------------

    const ProjectionTable &table() const { return m_table; }
    /// Sets the current row and the end of the selection.
    void select(int row, int endRow);
    void setHeaderLayout(HeaderLayout layout);

    /// AppendGrid: one row of `kind` and `label` for every state from
    /// `states[first]` on, with its increments.
    void AppendGrid(const std::vector<engine::StandState> &states, std::size_t first, RowKind kind,
                    const QString &label);
    /// WriteThinLine: `record` as the thinning row `label` on the current row
    /// when `replaceCurrent` (a thinning accepted again), else on a new row;
    /// valued at the current prices for the table and at the long-term
    /// averages for the cash flow. A price lookup that fails says so through
    /// `interactive`. Returns the row, which becomes the current row.
    int WriteThinLine(const RowRecord &record, const QString &label, bool replaceCurrent,
                      shell::IInteractive &interactive);
    /// Appends an assortment row.
    void appendAssortmentRow(TableRow row);
    /// The final cut: the last stand becomes the felled row `label` (a row of
    /// its own at the same age after a thinning), valued at the prices in use
    /// for the table and at the long-term averages for the cash flow. Returns
    /// the felled row.
    int fellLastStand(const QString &label, shell::IInteractive &interactive);
    /// Removes the rows from `first` on; growing goes on from the new last row.
    void removeRowsFrom(int first);
    /// Removes every row and shows the header in `layout`; the cash flow goes.
    void clear(HeaderLayout layout);

    // ---- What the table says --------------------------------------------------------------

    /// True once the final cut has ended the rotation.
    bool felled() const;
    /// True when the table holds a thinning row.
    bool thinned() const;
    /// The last row that holds a stand (growth or thinning), 0 when none.
    int lastStandRow() const;
    /// Volume per ha of the last stand, m³/ha.
    double standingVolume() const;
    /// Timber revenue of the thinnings and the final cut by year, euro/ha.
    TimberRevenue timberRevenue() const;
    /// Yield class of the rows so far: 0 while the MAI has not culminated.
    int yieldClass() const;
    /// The rotation summary; std::nullopt when the table holds nothing to
    /// summarise.
    std::optional<Summary> summary() const;
    /// `summary` as the summary grid shows it: captions first, then its rows,
    /// in the columns a rotation is read by.
    std::vector<QStringList> summaryGrid(const Summary &summary) const;
    /// The group above each column of summaryGrid ("Thinning" …).
    QStringList summaryGroups() const;

    // ---- The cash flow ------------------------------------------------------------------------

    /// The cash flow of the rotation (module `mdlNPV`): the years, the costs,
    /// other revenues and operations typed, and the interest rate.
    CashFlow &cashFlow() { return m_cashFlow; }
    const CashFlow &cashFlow() const { return m_cashFlow; }
    /// Lays out the cash flow of the felled rotation, year by year from the
    /// table's first row to the final cut, every entry empty.
    void layOutCashFlow();
    /// Forgets the cash flow.
    void resetCashFlow();
    /// Tells the work that the cash flow was edited or computed.
    void cashFlowEdited();
    /// The costs and other revenues typed into the cash flow, by age, for
    /// the rotation library (years with neither left out).
    std::vector<rotation::CashFlowEntry> cashFlowEntries() const;

    /// Cost of establishing the crop, euro/ha, paid at planting: it counts in
    /// the figures of bare land (LEV, annuity, IRR, break-even, the economic
    /// rotation), never in the value of the stand standing today.
    double establishmentCost() const { return m_establishmentCost; }
    /// Yearly cost, euro/ha/year, of every age from 1 to the final cut.
    double annualCost() const { return m_annualCost; }
    void setCosts(double establishment, double annual);
    /// The costs of the data folder ("Costs.qdm"), which a new work starts with.
    double defaultEstablishmentCost() const;
    double defaultAnnualCost() const;
    /// Puts the costs back to the data folder's.
    void resetCosts();

    /// What the money of the work is counted with: the cash flow's interest
    /// rate, the work's costs and the costs and other revenues typed into the
    /// cash flow, the long-term average prices (as their absolute values) for
    /// the mean tree, and the carbon price, payment and constants of the data
    /// folder ("Carbon.qdm"). The economics window reads its own fields over it.
    rotation::Economics economics() const;

    // ---- The sub-compartment as a document -------------------------------------------------

    const SubCompartment &identification() const { return m_identification; }
    void setIdentification(const SubCompartment &id);
    /// The document's name ("" before any) and whether it has unsaved changes.
    const QString &documentName() const { return m_documentName; }
    bool documentModified() const { return m_modified; }
    void setDocumentTitle(const QString &name, bool modified);
    /// What the window's caption adds for the document: "   ----  " and its
    /// name, then " *" while it has unsaved changes; "" before any document.
    QString documentCaption() const;

    /// The work as it stands, with the engine's model and site index and the
    /// prices in use.
    WorkSnapshot snapshot() const;
    /// Puts back the work of `snapshot` exactly as it was taken (no
    /// recomputation), for the model already chosen.
    void restore(const WorkSnapshot &snapshot);

signals:
    void fieldChanged(arbolex::work::WorkField field);
    /// `lblSI` changed.
    void siteIndexChanged();
    /// The table changed from data row `firstRow` on (1 = all).
    void tableChanged(int firstRow);
    void cashFlowChanged();
    /// The establishment or yearly cost changed.
    void costsChanged();
    void identificationChanged();
    /// The document's name or its unsaved mark changed.
    void documentTitleChanged();
    /// Anything of the work changed.
    void changed();

private:
    void notifyTable(int firstRow);
    /// The current and mean annual increments of row `rowIndex`, the current
    /// one from the stand row before it when `currentIncrement`.
    void writeIncrements(int rowIndex, bool currentIncrement);

    engine::Grow &m_grow;
    prices::Prices &m_prices;
    shell::ErrorLog &m_log;

    std::array<QString, kWorkFieldCount> m_fields;
    QString m_siteIndexText;
    ProjectionTable m_table;
    CashFlow m_cashFlow;
    double m_establishmentCost = 0.0;
    double m_annualCost = 0.0;
    SubCompartment m_identification;
    QString m_documentName;
    bool m_modified = false;
};

} // namespace arbolex::work
