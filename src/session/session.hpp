#pragma once

// One run of the program: the engine, the prices, the error log, the work on
// the sub-compartment, and the logic of every window built over it and
// connected once. The desktop program gives it its windows, the command-line
// runner and the tests their headless views; nothing else builds a logic.

#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "document/documentcontroller.hpp"
#include "economics/assortpriceswindowlogic.hpp"
#include "economics/carbonpricewindowlogic.hpp"
#include "economics/economicswindowlogic.hpp"
#include "economics/npvwindowlogic.hpp"
#include "economics/timberpriceswindowlogic.hpp"
#include "engine/grow.hpp"
#include "estatewindow/estatewindowlogic.hpp"
#include "prices/prices.hpp"
#include "shell/enginereport.hpp"
#include "shell/errorlog.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"
#include "workflow/mainwindowlogic.hpp"

#include <QString>

class QSettings;

namespace arbolex::shell {
class IClipboard;
class IInteractive;
} // namespace arbolex::shell

namespace arbolex::session {

/// The windows a session's logics talk to, and how they reach the user.
struct SessionViews {
    workflow::IMainView &main;
    thinning::IThinView &thin;
    assortments::IAssortView &assort;
    assortments::IAssortUserView &assortUser;
    economics::INpvView &npv;
    economics::ITimberPricesView &timberPrices;
    economics::IEconomicsView &economics;
    economics::IAssortPricesView &assortPrices;
    economics::ICarbonPriceView &carbonPrice;
    estatewindow::IEstateView &estate;
    shell::IInteractive &interactive;
    shell::IClipboard &clipboard;
    /// Keeps the recent documents and the last folder; null without a user (a script).
    QSettings *settings = nullptr;
    /// The file and identification dialogs; null without a user (a script).
    document::IDocumentDialogs *documentDialogs = nullptr;
};

class Session : public workflow::IWorkWindows {
public:
    /// A session on the data folder `dataFolder` (its price lists, start-up
    /// file and error log).
    Session(const QString &dataFolder, const SessionViews &views);
    ~Session() override;
    Session(const Session &) = delete;
    Session &operator=(const Session &) = delete;

    const QString &dataFolder() const { return m_dataFolder; }
    /// The windows the logics talk to.
    const SessionViews &views() const { return m_views; }
    shell::ErrorLog &errorLog() { return m_log; }
    engine::Grow &grow() { return m_grow; }
    prices::Prices &prices() { return m_prices; }
    work::StandWork &work() { return m_work; }

    workflow::MainWindowLogic &main() { return m_main; }
    thinning::ThinWindowLogic &thinning() { return m_thin; }
    economics::NpvWindowLogic &npv() { return m_npv; }
    economics::TimberPricesWindowLogic &timberPrices() { return m_timberPrices; }
    assortments::AssortWindowLogic &assort() { return m_assort; }
    assortments::AssortUserLogic &assortUser() { return m_assortUser; }
    economics::EconomicsWindowLogic &economics() { return m_economics; }
    economics::AssortPricesWindowLogic &assortPrices() { return m_assortPrices; }
    economics::CarbonPriceWindowLogic &carbonPrice() { return m_carbonPrice; }
    document::DocumentController &documents() { return m_documents; }
    estatewindow::EstateWindowLogic &estate() { return m_estate; }

    // IWorkWindows
    void openThinning() override;
    void closeThinning() override;
    void openAssortment(int row) override;
    void openNpv() override;
    void closeNpv() override;
    void openTimberPrices() override;

private:
    QString m_dataFolder;
    SessionViews m_views;
    shell::ErrorLog m_log;
    shell::EngineReport m_report;
    engine::Grow m_grow;
    prices::Prices m_prices;
    work::StandWork m_work;
    workflow::MainWindowLogic m_main;
    thinning::ThinWindowLogic m_thin;
    economics::NpvWindowLogic m_npv;
    economics::TimberPricesWindowLogic m_timberPrices;
    assortments::AssortWindowLogic m_assort;
    assortments::AssortUserLogic m_assortUser;
    economics::EconomicsWindowLogic m_economics;
    economics::AssortPricesWindowLogic m_assortPrices;
    economics::CarbonPriceWindowLogic m_carbonPrice;
    document::DocumentController m_documents;
    estatewindow::EstateWindowLogic m_estate;
};

} // namespace arbolex::session
