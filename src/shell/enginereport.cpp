#include "shell/enginereport.hpp"

#include "shell/errorlog.hpp"
#include "shell/interactive.hpp"

namespace arbolex::shell {

namespace {
QString fromUtf8(std::string_view s) {
    return QString::fromUtf8(s.data(), static_cast<qsizetype>(s.size()));
}
} // namespace

void EngineReport::showMessage(std::string_view title, std::string_view text, int style) {
    m_interactive->message(fromUtf8(title), fromUtf8(text), style);
}

void EngineReport::logError(std::string_view message) {
    m_log->append(fromUtf8(message));
}

} // namespace arbolex::shell
