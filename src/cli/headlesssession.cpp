#include "cli/headlesssession.hpp"

namespace arbolex::cli {

QString PrintingInteractive::escaped(QString text) {
    return text.replace(QLatin1Char('\r'), QStringLiteral("\\r"))
        .replace(QLatin1Char('\n'), QStringLiteral("\\n"));
}

void PrintingInteractive::message(const QString &title, const QString &text, int style) {
    ++m_messages;
    m_out << "MSG\t" << escaped(title) << '\t' << escaped(text) << '\t' << style << '\n';
}

bool PrintingInteractive::askYesNo(const QString &title, const QString &text) {
    if (m_answers.isEmpty()) {
        throw ScriptStop{QStringLiteral("no answer queued for the question \"") + escaped(text) +
                         QLatin1Char('"')};
    }
    const bool yes = m_answers.takeFirst();
    m_out << "ASK\t" << escaped(title) << '\t' << escaped(text) << '\t' << (yes ? "yes" : "no")
          << '\n';
    return yes;
}

HeadlessSession::HeadlessSession(const QString &dataFolder, QTextStream &out)
    : m_log(dataFolder), m_interactive(out), m_report(m_interactive, m_log), m_grow(&m_report),
      m_main(m_grow, m_prices, m_log, dataFolder, m_mainView, m_interactive),
      m_thin(m_main, m_thinView, m_interactive),
      m_npv(m_main.cashFlow(), m_main.timberRevenue(), m_log, m_npvView, m_interactive,
            m_clipboard),
      m_assort(m_main, m_assortView, m_interactive),
      m_assortUser(m_prices.data(), m_assort.session(), m_assortUserView, m_interactive) {
    m_main.attachThinning(&m_thin);
    m_main.attachNpv(&m_npv);
    m_main.attachClipboard(&m_clipboard);
    m_main.attachTimberPrices(&m_timberPrices);
    m_timberPrices.attachAssortmentPrices(&m_assortPrices);
    m_main.attachAssortments(&m_assort);
    m_thin.attachAssortments(&m_assort);
}

} // namespace arbolex::cli
