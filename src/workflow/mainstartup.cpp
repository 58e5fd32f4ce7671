// The main window's load and unload, the model menu and its information boxes.
#include "document/documentmessages.hpp"
#include "prices/assortmentpricefile.hpp"
#include "prices/pricedata.hpp"
#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "shell/datahistory.hpp"
#include "shell/interactive.hpp"
#include "shell/settings.hpp"
#include "shell/startupfile.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QDir>
#include <QSettings>

namespace arbolex::workflow {

namespace {

/// Species code of a model label, "" when the label names no known species.
QString speciesCode(const QString &label) {
    for (const char *code : {"SS", "NS", "DF", "LP", "SP"}) {
        if (label.startsWith(QLatin1String(code))) {
            return QLatin1String(code);
        }
    }
    return {};
}

/// Reference stand from which the threshold basal area is projected.
constexpr float kReferenceAge = 15.0f;
constexpr float kReferenceStocking = 2500.0f;
constexpr float kReferenceHeight = 7.0f;
constexpr float kReferenceBasalArea = 20.0f;
/// Top height at which a thinned crop is first thinned, m.
constexpr float kFirstThinningHeight = 12.0f;

} // namespace

void MainWindowLogic::Form_Load(QSettings &settings, const QRect &screen) {
    shell::guard(m_log, QStringLiteral(" in frmMain.Load()"), [&] {
        m_view.setPlacement(shell::readMainPlacement(settings, screen));
        m_cashFlow.setInterestRate(shell::readInterestRate(settings));
        afterClear(work::HeaderLayout::WithMoney);
        shell::StartupValues stored;
        shell::readStartupFile(m_dataFolder, stored, m_log);
        mnuModel_Click(stored.modelIndex);
        const bool restored = SetGrowFrom(stored.age, stored.basalArea, stored.stocking,
                                          stored.topHeight, stored.targetAge, stored.step);
        m_view.setEnabled(MainControl::cmdGrow, restored);
        if (stored.netArea > 0.0) {
            m_view.setText(MainControl::txtNetArea, shell::generalNumber(stored.netArea));
        }
        ChkGrowFromBD();
        showSiteIndex(stored.age, stored.topHeight);
        readPriceFiles();
        m_prices.selectPriceSet(prices::kCurrentPrices);
        showSummary(false);
        m_view.setText(MainControl::cmdShowTimberPrice, text::showTimberPrices());
    });
}

void MainWindowLogic::Form_Unload(QSettings &settings) {
    // Each step is tried on its own: a failure in one still lets the others save.
    const QString label = QStringLiteral(" in frmMain.Unload()");
    shell::guard(m_log, label, [&] {
        shell::writeMainPlacement(settings, m_view.placement());
        shell::writeInterestRate(settings, m_cashFlow.interestRate());
    });
    shell::guard(m_log, label, [&] {
        shell::StartupValues values;
        values.modelIndex = m_grow.modelId();
        const GrowFrom g = GetGrowFrom();
        values.age = g.age;
        values.basalArea = g.basalArea;
        values.stocking = g.stocking;
        values.topHeight = g.topHeight;
        values.targetAge = g.targetAge;
        values.step = g.step;
        values.netArea = shell::val(field(MainControl::txtNetArea));
        shell::writeStartupFile(m_dataFolder, values, m_log);
    });
    if (m_dataHistory != nullptr) {
        for (const char *name : prices::kFilesWrittenAtExit) {
            shell::guard(m_log, label, [&] {
                if (!m_dataHistory->keep(QDir(m_dataFolder).filePath(QLatin1String(name)))) {
                    shell::raiseAppFault(shell::RuntimeError::pathFileAccessError());
                }
            });
        }
    }
    prices::WritePricesInFiles(3, m_dataFolder, m_prices.data(), m_log);
    prices::WriteUserDefinedAssortmentsInFile(m_dataFolder, m_prices.data(), m_log);
    prices::WriteAssortmentPricesInFile(m_dataFolder, m_prices.data(), m_log);
}

void MainWindowLogic::readPriceFiles() {
    prices::GetPricesFromFiles(m_dataFolder, m_prices.data(), m_log);
    prices::GetAssortmentPricesFromFile(m_dataFolder, m_prices.data(), m_log);
}

void MainWindowLogic::reloadDataFiles() {
    shell::guard(m_log, QStringLiteral(" in frmMain.reloadDataFiles()"), [&] {
        const std::int16_t inUse = m_prices.priceSetInUse();
        m_prices.data() = prices::PriceData{};
        readPriceFiles();
        m_prices.selectPriceSet(inUse);
    });
}

void MainWindowLogic::cmdChangePrices_Click() {
    shell::guard(m_log, QStringLiteral(" in frmMain.cmdChangePrices_Click()"), [&] {
        if (!m_prices.priceChanges()) {
            m_prices.setPriceChanges(true);
            return;
        }
        m_prices.setPriceChanges(false);
        m_view.setText(MainControl::cmdShowTimberPrice, text::showTimberPrices());
    });
}

void MainWindowLogic::SetModelFromfrmModelChoice(int modelId) {
    mnuModel_Click(modelId);
}

void MainWindowLogic::mnuModel_Click(int index) {
    shell::guard(m_log, QStringLiteral(" in frmMain.mnuModel_Click()"), [&] {
        if (!m_grow.GetModel(static_cast<std::int16_t>(index))) {
            return;
        }
        m_grow.GetVCF();
        m_cashFlow.reset();
        m_view.setEnabled(MainControl::cmdNPV, false);
        m_table.setHeaderLayout(work::HeaderLayout::WithMoney);
        m_view.tableChanged(1);
        updateCaption();
        m_view.setActiveModel(m_grow.modelId());
        m_view.setEnabled(MainControl::cmdThin, m_grow.isThinnedModel());
    });
}

void MainWindowLogic::updateCaption() {
    QString caption =
        text::titleArbolex() + text::captionModelInUse() + QString::fromStdString(m_grow.label());
    if (!m_documentName.isEmpty()) {
        caption += document::text::captionDocument() + m_documentName +
                   (m_modified ? document::text::unsavedMark() : QString());
    }
    m_view.setCaption(caption);
}

float MainWindowLogic::thresholdBasalArea() {
    // The basal area the active model projects for a reference stand at the
    // age its top height reaches the first-thinning height. Works on a copy of
    // the engine so the site index of the user's stand stays as it is.
    engine::Grow probe = m_grow;
    probe.setReport(nullptr);
    if (!probe.SiteIndex(kReferenceAge, kReferenceHeight)) {
        return 0.0f;
    }
    probe.TM(probe.siteIndex());
    std::vector<engine::StandState> states;
    probe.PROJ(kReferenceAge, kReferenceBasalArea, kReferenceStocking, kReferenceHeight, 60.0f,
               1.0f, states);
    for (const engine::StandState &s : states) {
        if (s.topHeight >= kFirstThinningHeight) {
            return s.basalArea;
        }
    }
    return states.empty() ? 0.0f : states.back().basalArea;
}

void MainWindowLogic::TrhesholdInfo() {
    shell::guard(m_log, QStringLiteral(" in frmMain.TrhesholdInfo()"), [&] {
        const QString code = speciesCode(QString::fromStdString(m_grow.label()));
        if (code.isEmpty()) {
            message(text::titleArbolex(), text::speciesNotFound(), shell::kExclamation);
            return;
        }
        const QString value = shell::formatNumber(thresholdBasalArea(), u"##0.0");
        // Without a thinning response the threshold is not calculated; the
        // reference value is a lower bound for it.
        const bool calculated = m_grow.T(1) != 0.0;
        message(text::titleArbolex(),
                text::thresholdLead() + code +
                    (calculated ? text::thresholdIs() : text::thresholdNotCalculated()) + value,
                shell::kInformation);
    });
}

QString MainWindowLogic::warnText() const {
    const QString crlf = QStringLiteral("\r\n");
    return text::warnLead() + crlf + QString::fromStdString(m_grow.label()) + crlf + crlf +
           QStringLiteral("- Start from a stand aged 10 to 60 years, with 100 to 5000 stems/ha, "
                          "a top height of 5 to ") +
           shell::formatNumber(m_grow.maxTopHeight(), u"##0.0") +
           QStringLiteral(" m and a basal area of 10 to 100 m2/ha.") + crlf +
           QStringLiteral("- Projections end at age ") + QString::number(maxTargetAge()) +
           QStringLiteral(" at the latest.") + crlf +
           (m_grow.isThinnedModel()
                ? QStringLiteral("- This model follows a thinned crop: thin the last growth row "
                                 "to continue from the thinned stand.")
                : QStringLiteral("- This model follows an un-thinned crop: it offers no "
                                 "thinning.")) +
           crlf + QStringLiteral("- Volumes are merchantable volumes to 7 cm top diameter.");
}

void MainWindowLogic::Warn() {
    shell::guard(m_log, QStringLiteral(" in frmMain.Warn()"),
                 [&] { message(text::titleArbolex(), warnText(), shell::kInformation); });
}

} // namespace arbolex::workflow
