#pragma once

#include "engine/report.hpp"

namespace arbolex::shell {

class ErrorLog;
class IInteractive;

/// Connects the engine's reports to the program: its message boxes go to the
/// window logic's IInteractive, its failure lines to the error log.
class EngineReport : public engine::IEngineReport {
public:
    EngineReport(IInteractive &interactive, ErrorLog &log)
        : m_interactive(&interactive), m_log(&log) {}

    void setInteractive(IInteractive &interactive) { m_interactive = &interactive; }

    void showMessage(std::string_view title, std::string_view text, int style) override;
    void logError(std::string_view message) override;

private:
    IInteractive *m_interactive;
    ErrorLog *m_log;
};

} // namespace arbolex::shell
