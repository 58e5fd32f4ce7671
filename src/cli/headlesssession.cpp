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
    : m_interactive(out),
      m_session(dataFolder, {m_mainView, m_thinView, m_assortView, m_assortUserView, m_npvView,
                             m_timberPricesView, m_economicsView, m_assortPricesView,
                             m_carbonPriceView, m_estateView, m_interactive, m_clipboard}) {}

} // namespace arbolex::cli
