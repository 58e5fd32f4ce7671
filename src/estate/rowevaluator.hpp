#pragma once

// The work of one row: read it, check it as the main window would, grow the
// rotation and value it with the one rotation every command uses. Each thread
// owns an evaluator (and its engine).

#include "engine/grow.hpp"
#include "estate/layout.hpp"
#include "estate/rowplan.hpp"
#include "estate/rowresult.hpp"

namespace arbolex::estate {

class RowEvaluator {
public:
    RowEvaluator(const Layout &layout, const EstateDefaults &defaults);
    RowEvaluator(const RowEvaluator &) = delete;
    RowEvaluator &operator=(const RowEvaluator &) = delete;

    RowResult evaluate(const RowValues &values);

private:
    /// Keeps the engine's messages and failure lines of the row in hand.
    class RowReport : public engine::IEngineReport {
    public:
        void showMessage(std::string_view title, std::string_view text, int style) override;
        void logError(std::string_view message) override;
        RowResult *row = nullptr;
    };

    void grow(const RowPlan &plan, RowResult &result);
    /// The carbon figures of the row and its carbon by calendar year from today.
    static void carbon(const carbon::Account &account, int presentAge, int presentYear,
                       double areaHa, RowResult &result);

    const Layout &m_layout;
    const EstateDefaults &m_defaults;
    RowReport m_report;
    engine::Grow m_grow;
};

} // namespace arbolex::estate
