// Taking and putting back the work of one sub-compartment: its fields, the
// projection table with every row's record, the rotation's close, the cash
// flow and the prices the rows were valued with.
#include "workflow/mainsnapshot.hpp"

#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <cmath>

namespace arbolex::workflow {

bool MainSnapshot::sameWork(const MainSnapshot &other) const {
    return identification == other.identification && modelId == other.modelId &&
           fields == other.fields && siteIndexText == other.siteIndexText &&
           layout == other.layout && rows == other.rows && standingVolume == other.standingVolume &&
           felled == other.felled && cashFlowFirstYear == other.cashFlowFirstYear &&
           cashFlow == other.cashFlow && interestRate == other.interestRate &&
           priceSetInUse == other.priceSetInUse && pricesInUse == other.pricesInUse;
}

MainSnapshot MainWindowLogic::snapshot() const {
    MainSnapshot s;
    s.identification = m_identification;
    s.modelId = m_grow.modelId();
    for (std::size_t i = 0; i < kSnapshotFields.size(); ++i) {
        s.fields.at(i) = field(kSnapshotFields.at(i));
    }
    s.siteIndexText = field(MainControl::lblSI);
    s.siteIndex = m_grow.siteIndex();
    s.layout = m_table.headerLayout();
    s.rows.reserve(static_cast<std::size_t>(m_table.lastRow()));
    for (int r = 1; r <= m_table.lastRow(); ++r) {
        s.rows.push_back(m_table.row(r));
    }
    s.currentRow = m_table.currentRow();
    s.selectionEnd = m_table.selectionEnd();
    s.standingVolume = m_standingVolume;
    s.felled = m_felled;
    s.cashFlowFirstYear = m_cashFlow.firstYear();
    for (int i = 0; i < m_cashFlow.years(); ++i) {
        s.cashFlow.push_back(m_cashFlow.record(i));
    }
    s.interestRate = m_cashFlow.interestRate();
    s.priceSetInUse = m_prices.priceSetInUse();
    s.pricesInUse = m_prices.pricesInUse();
    return s;
}

void MainWindowLogic::restoreCashFlow(const MainSnapshot &s) {
    m_cashFlow.setInterestRate(s.interestRate);
    if (s.cashFlow.empty()) {
        m_cashFlow.reset();
        return;
    }
    const int years = static_cast<int>(s.cashFlow.size());
    m_cashFlow.SetRotationLength(s.cashFlowFirstYear, s.cashFlowFirstYear + years - 1);
    m_cashFlow.DimNPVArrays();
    for (int i = 0; i < years; ++i) {
        const work::CashFlowRecord &r = s.cashFlow.at(static_cast<std::size_t>(i));
        m_cashFlow.setOperation(i, r.operation);
        m_cashFlow.setMatrix(work::kCfYear, i, r.year);
        m_cashFlow.setMatrix(work::kCfCost, i, r.cost);
        m_cashFlow.setMatrix(work::kCfTimberRevenue, i, r.timberRevenue);
        m_cashFlow.setMatrix(work::kCfOtherRevenues, i, r.otherRevenues);
        m_cashFlow.setMatrix(work::kCfTotalRevenues, i, r.totalRevenues);
        m_cashFlow.setMatrix(work::kCfCashFlow, i, r.cashFlow);
        m_cashFlow.setMatrix(work::kCfDiscountedCashFlow, i, r.discountedCashFlow);
    }
}

void MainWindowLogic::restore(const MainSnapshot &s) {
    shell::guard(m_log, QStringLiteral(" in frmMain.RestoreSubCompartment()"), [&] {
        // The model menu first: it empties the cash flow and sets the captions.
        mnuModel_Click(s.modelId);
        afterClear(s.layout);
        m_identification = s.identification;
        for (const work::TableRow &row : s.rows) {
            m_table.append(row);
        }
        m_table.select(s.currentRow, s.selectionEnd);
        for (std::size_t i = 0; i < kSnapshotFields.size(); ++i) {
            m_view.setText(kSnapshotFields.at(i), s.fields.at(i));
        }
        m_view.setText(MainControl::lblSI, s.siteIndexText);
        // The engine continues from the site index the last projection used.
        m_grow.setSiteIndex(s.siteIndex);
        if (s.siteIndex > 0.0f) {
            m_grow.TM(s.siteIndex);
        }
        m_standingVolume = s.standingVolume;
        m_felled = s.felled;
        timberRevenueChanged();
        restoreCashFlow(s);
        m_prices.restoreInUse(s.priceSetInUse, s.pricesInUse);

        bool thinned = false;
        for (const work::TableRow &row : s.rows) {
            thinned = thinned || row.isThinning();
        }
        if (m_thinning != nullptr) {
            m_thinning->flags().noThinningYet = !thinned;
        }
        // The commands as the last handler before the save left them.
        const bool hasRows = !s.rows.empty();
        const bool thinnedModel = m_grow.isThinnedModel();
        m_view.setEnabled(MainControl::cmdGrow, !m_felled);
        m_view.setEnabled(MainControl::cmdThin, thinnedModel && !m_felled);
        m_view.setEnabled(MainControl::cmdFinalCut, hasRows && !m_felled);
        m_view.setEnabled(MainControl::cmdUseRow, hasRows);
        m_view.setEnabled(MainControl::cmdClear, !(thinnedModel && hasRows));
        m_view.setEnabled(MainControl::cmdNPV, m_cashFlow.years() > 0);
        if (m_felled) {
            m_view.setText(MainControl::lblYC, QString::number(yieldClass()));
            m_view.setHint(MainControl::lblYC, text::yieldClassAtClearfell());
        } else {
            updateYieldClassLabel();
        }
        m_view.tableChanged(1);
    });
}

void MainWindowLogic::setDocumentTitle(const QString &name, bool modified) {
    if (name == m_documentName && modified == m_modified) {
        return;
    }
    m_documentName = name;
    m_modified = modified;
    updateCaption();
}

} // namespace arbolex::workflow
