// The main window's load and unload, the model menu and its information
// boxes, the price commands and putting back a whole work.
#include "engine/grow.hpp"
#include "prices/pricefiles.hpp"
#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "shell/errorlog.hpp"
#include "shell/interactive.hpp"
#include "shell/settings.hpp"
#include "shell/startupfile.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/worktexts.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"
#include "workflow/modelnotes.hpp"

#include <QSettings>

namespace arbolex::workflow {

void MainWindowLogic::Form_Load(QSettings &settings, const QRect &screen) {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.Load()"), [&] {
        m_view.setPlacement(shell::readMainPlacement(settings, screen));
        m_work.cashFlow().setInterestRate(shell::readInterestRate(settings));
        afterClear(work::HeaderLayout::WithMoney);
        shell::StartupValues stored;
        shell::readStartupFile(m_dataFolder, stored, errorLog());
        mnuModel_Click(stored.modelIndex);
        m_work.SetGrowFrom(stored.age, stored.basalArea, stored.stocking, stored.topHeight,
                           stored.targetAge, stored.step);
        m_view.setEnabled(MainControl::cmdGrow, true);
        if (stored.netArea > 0.0) {
            m_work.setField(work::WorkField::NetArea, shell::generalNumber(stored.netArea));
        }
        m_fields.ChkGrowFromBD();
        m_fields.showSiteIndex(stored.age, stored.topHeight);
        prices::readPriceFiles(m_dataFolder, prices(), errorLog());
        prices().selectPriceSet(prices::kCurrentPrices);
        // The work starts with the data folder's costs.
        m_work.resetCosts();
        m_summary.show(false);
        m_view.setText(MainControl::cmdShowTimberPrice, text::showTimberPrices());
    });
}

void MainWindowLogic::Form_Unload(QSettings &settings) {
    // Each step is tried on its own: a failure in one still lets the others save.
    const QString label = QStringLiteral(" in frmMain.Unload()");
    shell::guard(errorLog(), label, [&] {
        shell::writeMainPlacement(settings, m_view.placement());
        shell::writeInterestRate(settings, m_work.cashFlow().interestRate());
    });
    shell::guard(errorLog(), label, [&] {
        shell::StartupValues values;
        values.modelIndex = grow().modelId();
        const GrowFrom g = m_fields.GetGrowFrom();
        values.age = g.age;
        values.basalArea = g.basalArea;
        values.stocking = g.stocking;
        values.topHeight = g.topHeight;
        values.targetAge = g.targetAge;
        values.step = g.step;
        values.netArea = m_work.netArea();
        shell::writeStartupFile(m_dataFolder, values, errorLog());
    });
    prices::writePriceFilesAtExit(m_dataFolder, prices(), m_dataHistory, label, errorLog());
}

void MainWindowLogic::reloadDataFiles() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.reloadDataFiles()"),
                 [&] { prices::rereadPriceFiles(m_dataFolder, prices(), errorLog()); });
}

void MainWindowLogic::cmdChangePrices_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdChangePrices_Click()"), [&] {
        if (!prices().priceChanges()) {
            prices().setPriceChanges(true);
            return;
        }
        prices().setPriceChanges(false);
        m_view.setText(MainControl::cmdShowTimberPrice, text::showTimberPrices());
    });
}

void MainWindowLogic::cmdShowTimberPrice_Click() {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.cmdShowTimberPrice_Click()"),
                 [&] { m_windows.openTimberPrices(); });
}

void MainWindowLogic::mnuModel_Click(int index) {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.mnuModel_Click()"), [&] {
        if (!grow().GetModel(static_cast<std::int16_t>(index))) {
            return;
        }
        grow().GetVCF();
        m_work.resetCashFlow();
        m_view.setEnabled(MainControl::cmdNPV, false);
        m_work.setHeaderLayout(work::HeaderLayout::WithMoney);
        m_view.tableChanged(1);
        updateCaption();
        m_view.setActiveModel(grow().modelId());
        m_view.setEnabled(MainControl::cmdThin, grow().isThinnedModel());
    });
}

void MainWindowLogic::updateCaption() {
    m_view.setCaption(text::titleArbolex() + text::captionModelInUse() +
                      QString::fromStdString(grow().label()) + m_work.documentCaption());
}

void MainWindowLogic::restore(const work::WorkSnapshot &s) {
    shell::guard(errorLog(), QStringLiteral(" in frmMain.RestoreSubCompartment()"), [&] {
        // The model menu first: it empties the cash flow and sets the captions.
        mnuModel_Click(s.modelId);
        afterClear(s.layout);
        m_work.restore(s);
        // The commands as the last handler before the save left them.
        const bool hasRows = !s.rows.empty();
        const bool thinnedModel = grow().isThinnedModel();
        const bool felled = m_work.felled();
        m_view.setEnabled(MainControl::cmdGrow, !felled);
        m_view.setEnabled(MainControl::cmdThin, thinnedModel && !felled);
        m_view.setEnabled(MainControl::cmdFinalCut, hasRows && !felled);
        m_view.setEnabled(MainControl::cmdUseRow, hasRows);
        m_view.setEnabled(MainControl::cmdClear, !(thinnedModel && hasRows));
        m_view.setEnabled(MainControl::cmdNPV, m_work.cashFlow().years() > 0);
    });
}

} // namespace arbolex::workflow
