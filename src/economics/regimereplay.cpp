// "Apply": a regime of the optimiser written into the projection table by the
// commands a user would press: clear, type the stand, grow to each thinning
// age, thin by the volume method and accept, grow to the rotation, final cut.
#include "economics/regimereplay.hpp"
#include "economics/economicsmessages.hpp"
#include "economics/economicswindowlogic.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"

#include <algorithm>
#include <cmath>

namespace arbolex::economics {

using workflow::MainControl;
using C = EconomicsControl;

namespace {

/// Grow step of the replay when the main window's field holds none, years.
constexpr double kDefaultStep = 5.0;

/// Drives the thinning window as the thinning loop does: the window is loaded
/// and filled without being shown, and no loop is offered.
class DrivingThinning {
public:
    explicit DrivingThinning(thinning::ThinningFlags &flags) : m_flags(flags) {
        m_flags.loopUnderWay = true;
    }
    ~DrivingThinning() { m_flags.loopUnderWay = false; }
    DrivingThinning(const DrivingThinning &) = delete;
    DrivingThinning &operator=(const DrivingThinning &) = delete;

private:
    thinning::ThinningFlags &m_flags;
};

} // namespace

std::optional<QString> replayRegime(work::StandWork &work, workflow::IMainCommands &main,
                                    thinning::ThinWindowLogic &thin, const rotation::Stand &stand,
                                    const rotation::Regime &regime, int rotation) {
    const double typedStep = shell::val(work.field(work::WorkField::ByStep));
    const double step = typedStep >= 1.0 ? typedStep : kDefaultStep;
    // Whole years: the grow command moves the start to the nearest one.
    int grownTo = static_cast<int>(std::nearbyint(stand.age));
    main.cmdClear_Click();
    main.typeText(MainControl::txtFromA, shell::singleText(stand.age));
    main.typeText(MainControl::txtFromN, shell::singleText(stand.stocking));
    main.typeText(MainControl::txtFromH, shell::singleText(stand.height));
    main.typeText(MainControl::txtFromB, shell::singleText(stand.basalArea));
    main.typeText(MainControl::txtFromD, QString());
    const auto growTo = [&](int age) -> std::optional<QString> {
        main.typeText(MainControl::txtToA, QString::number(age));
        // A step fits in the span it divides, as the grow command asks.
        main.typeText(MainControl::txtByA,
                      shell::generalNumber(std::min(step, static_cast<double>(age - grownTo))));
        main.cmdGrow_Click();
        const work::ProjectionTable &table = work.table();
        if (table.empty() || !table.row(table.lastRow()).isGrowth() ||
            static_cast<int>(std::nearbyint(table.row(table.lastRow()).record.age)) != age) {
            return QStringLiteral("the stand could not be grown to ") + QString::number(age) +
                   QStringLiteral(" years.");
        }
        grownTo = age;
        return std::nullopt;
    };
    if (regime.thins()) {
        const int until = regime.thinUntil.value_or(rotation - 1);
        for (int age = regime.thinFrom; age <= until && age < rotation; age += regime.thinEvery) {
            if (auto failed = growTo(age)) {
                return failed;
            }
            const DrivingThinning driving(thin.flags());
            main.cmdThin_Click();
            thin.resetFields();
            thin.typeText(thinning::ThinControl::txtRemV, shell::singleText(regime.thinVolume));
            thin.cmdThin_Click();
            if (!thin.work().previewed) {
                return QStringLiteral("the thinning at ") + QString::number(age) +
                       QStringLiteral(" years could not be made.");
            }
            thin.cmdAccept_Click();
        }
    }
    if (auto failed = growTo(rotation)) {
        return failed;
    }
    main.cmdFinalCut_Click();
    return std::nullopt;
}

void EconomicsWindowLogic::cmdApply_Click(int rank) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmEconomics.cmdApply_Click()"), [&] {
        if (m_optimising) {
            return;
        }
        if (rank < 1 || rank > static_cast<int>(m_best.size())) {
            message(economicstext::nothingToApply(), C::cmdOptimise);
            return;
        }
        const rotation::Candidate chosen = m_best[static_cast<std::size_t>(rank - 1)];
        if (const auto failed = replayRegime(m_standWork, m_main, m_thin, m_stand, chosen.regime,
                                             chosen.rotation)) {
            m_interactive.message(economicstext::titleEconomics(),
                                  economicstext::applyStopped() + *failed, shell::kExclamation);
        }
        // The figures of the table as it now stands.
        cmdCompute_Click();
    });
}

} // namespace arbolex::economics
