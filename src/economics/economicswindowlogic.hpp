#pragma once

// The logic of the economics window `frmEconomics`: the value of the rotation
// in the projection table (NPV, LEV, annuity, forest value, IRR, break-even
// price), the rotation explorer, the regime optimiser and its "Apply", the
// tornado and the Monte Carlo draws. Every figure comes from the rotation
// library for the stand, regime and final cut the table holds.

#include "economics/ieconomicsview.hpp"
#include "economics/tableregime.hpp"
#include "rotation/optimiser.hpp"
#include "rotation/rotation.hpp"
#include "rotation/uncertainty.hpp"

#include <QString>

#include <atomic>
#include <memory>
#include <optional>
#include <vector>

namespace arbolex::shell {
class IInteractive;
}

namespace arbolex::work {
class StandWork;
}

namespace arbolex::workflow {
class IMainCommands;
}

namespace arbolex::economics {

class EconomicsWindowLogic {
public:
    /// The economics of `work`; "Apply" writes a regime into a copy of the
    /// work and gives it to the main window through `main`.
    EconomicsWindowLogic(work::StandWork &work, workflow::IMainCommands &main, IEconomicsView &view,
                         shell::IInteractive &interactive);

    /// The main window's "Economics…": loads the window and shows it.
    void cmdEconomics_Click();
    /// The window's load: the interest rate of the cash flow, the defaults of
    /// the draws, then the figures.
    void Form_Load();
    /// "Compute": reads the rate and the costs (they become the work's), and
    /// values the rotation of the table: its own thinnings and final cut with
    /// the costs and other revenues of its cash flow, or without a final cut
    /// the regime of its thinnings felled at the economic rotation. The
    /// explorer and the optimiser work from that regime.
    void cmdCompute_Click();
    /// "Optimise": searches the regimes away from the window's thread.
    void cmdOptimise_Click();
    /// "Cancel": the search stops at its next report of progress.
    void cmdCancel_Click() { m_cancel = true; }
    /// "Apply": writes regime `rank` (1 = best) into the projection table
    /// through the main window's and the thinning window's commands.
    void cmdApply_Click(int rank);
    /// "Run": the Monte Carlo draws of the rotation valued.
    void cmdMonteCarlo_Click();
    void cmdClose_Click() { m_view.close(); }

    /// Types `text` into a field, as the runner and the tests do.
    void typeText(EconomicsControl control, const QString &text);
    /// Presses the command `control` (Apply takes the chosen rank); false when
    /// it is no command.
    bool press(EconomicsControl control);
    /// The regime Apply writes (1 = best).
    void chooseRegime(int rank) { m_chosen = rank; }
    int chosenRegime() const { return m_chosen; }

    // ---- What the window shows -------------------------------------------------------

    /// True once the figures of a rotation are shown.
    bool valued() const { return m_value.has_value(); }
    /// True when the figures shown are those of the table as it stands: the
    /// stand of its first row, its thinnings and its final cut are the ones
    /// valued (the table may have changed since).
    bool figuresOfTable() const;
    const rotation::Stand &stand() const { return m_stand; }
    const rotation::Regime &regime() const { return m_table.regime; }
    int rotationAge() const { return m_rotation; }
    const rotation::Economics &economics() const { return m_economics; }
    const std::optional<rotation::RotationValue> &value() const { return m_value; }
    const rotation::RotationExplorer &explorer() const { return m_explorer; }
    /// The economic rotation of the same explorer without carbon money,
    /// years; 0 unless carbon is paid (or no LEV could be computed).
    int economicRotationWithoutCarbon() const { return m_economicWithoutCarbon; }
    const std::vector<rotation::TornadoBar> &tornado() const { return m_tornado; }
    const std::optional<rotation::MonteCarloResult> &monteCarlo() const { return m_monteCarlo; }
    /// The optimiser's regimes, best first, and the user's own as it scores.
    const std::vector<rotation::Candidate> &regimes() const { return m_best; }
    const std::optional<rotation::Candidate> &yourRegime() const { return m_yours; }
    bool optimising() const { return m_optimising; }
    /// The optimiser's table as shown: headers, the regimes, then the user's.
    std::vector<QStringList> regimeGrid() const;
    /// The rate the figures used, as shown ("3.00").
    QString rateText() const;
    /// Every figure as "name<TAB>text" lines, for the runner.
    QString figuresText() const;

    IEconomicsView &view() { return m_view; }

private:
    void message(const QString &text, EconomicsControl focus);
    bool readEconomics();
    bool readStand();
    void showFigures();
    void clearFigures(const QString &why);
    /// The costs of the work in their fields.
    void showCosts();
    /// Values the table's own rotation (m_own).
    void valueTable();
    /// Values the regime felled at the economic rotation; false (the figures
    /// cleared) when that rotation cannot be valued.
    bool valueEconomicRotation();
    /// Timber and carbon side by side, and what carbon does to the economic
    /// rotation.
    void showCarbon();

    work::StandWork &m_standWork;
    workflow::IMainCommands &m_main;
    IEconomicsView &m_view;
    shell::IInteractive &m_interactive;

    rotation::Stand m_stand;
    TableRegime m_table;
    rotation::Economics m_economics;
    int m_rotation = 0;
    /// The engine of the figures; the optimiser grows with one of its own.
    engine::Grow m_grow;
    std::optional<rotation::GrowthPath> m_path;
    /// The harvests of a felled table as it holds them; every figure but the
    /// explorer's and the optimiser's values them.
    std::optional<rotation::RotationHarvests> m_own;
    std::optional<rotation::RotationValue> m_value;
    rotation::RotationExplorer m_explorer;
    int m_economicWithoutCarbon = 0;
    std::vector<rotation::TornadoBar> m_tornado;
    std::optional<rotation::MonteCarloResult> m_monteCarlo;

    std::vector<rotation::Candidate> m_best;
    std::optional<rotation::Candidate> m_yours;
    int m_chosen = 1;
    bool m_optimising = false;
    std::atomic<bool> m_cancel{false};
};

} // namespace arbolex::economics
