#include "session/session.hpp"

namespace arbolex::session {

Session::Session(const QString &dataFolder, const SessionViews &views)
    : m_dataFolder(dataFolder), m_views(views), m_log(dataFolder),
      m_report(views.interactive, m_log), m_grow(&m_report), m_work(m_grow, m_prices, m_log),
      m_main(m_work, dataFolder, views.main, views.interactive, *this),
      m_thin(m_work, m_main, views.thin, views.interactive),
      m_npv(m_work, views.npv, views.interactive, views.clipboard),
      m_timberPrices(m_prices, m_log, views.timberPrices),
      m_assort(m_work, views.assort, views.interactive),
      m_assortUser(m_prices.data(), m_assort.session(), views.assortUser, views.interactive),
      m_economics(m_work, m_main, views.economics, views.interactive),
      m_assortPrices(m_prices.data(), m_log, views.assortPrices, views.interactive),
      m_carbonPrice(m_prices.data(), m_log, views.carbonPrice, views.interactive),
      m_documents(m_work, m_main, views.interactive, views.settings, views.documentDialogs),
      m_estate(m_work, m_main, m_documents, views.estate, views.interactive) {
    m_main.attachClipboard(&views.clipboard);
    m_timberPrices.attachAssortmentPrices(&m_assortPrices);
    m_timberPrices.attachCarbonPrice(&m_carbonPrice);
    // New carbon money: an open economics window values its rotation again.
    m_carbonPrice.onChanged([this] {
        if (m_views.economics.isShown()) {
            m_economics.cmdCompute_Click();
        }
    });
    m_thin.attachAssortments(&m_assort);
}

Session::~Session() = default;

void Session::openThinning() {
    m_thin.openFromMain();
}

void Session::closeThinning() {
    m_thin.view().close();
}

void Session::openAssortment(int row) {
    m_assort.reportOnGrowthRow(row);
}

void Session::openNpv() {
    m_npv.Form_Load();
    m_npv.view().showWindow();
}

void Session::closeNpv() {
    m_npv.view().close();
}

void Session::openTimberPrices() {
    m_timberPrices.show();
}

} // namespace arbolex::session
