// The thinning loop: the same volume removal every few years up to an age,
// driven through the same commands a user would press.
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinmessages.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"
#include "workflow/mainmessages.hpp"

#include <algorithm>
#include <cmath>

namespace arbolex::thinning {

namespace {

/// Keeps the loop flag set for as long as the loop runs, whatever ends it.
class LoopUnderWay {
public:
    explicit LoopUnderWay(bool &flag) : m_flag(flag) { m_flag = true; }
    ~LoopUnderWay() { m_flag = false; }
    LoopUnderWay(const LoopUnderWay &) = delete;
    LoopUnderWay &operator=(const LoopUnderWay &) = delete;

private:
    bool &m_flag;
};

/// More passes than any rotation holds; the loop stops earlier, when a grow
/// is refused.
constexpr double kMostLoopPasses = 1.0e6;

double wholeYears(const QString &text) {
    return std::nearbyint(shell::val(text));
}

} // namespace

void ThinWindowLogic::chkActivLoop_Click() {
    const bool on = m_view.isChecked(ThinControl::chkActivLoop);
    for (ThinControl c : {ThinControl::fraLoop, ThinControl::txtThinFreq, ThinControl::txtThinUntil,
                          ThinControl::cmdLoop}) {
        m_view.setEnabled(c, on);
    }
}

bool ThinWindowLogic::loopFieldCheck() {
    if (field(ThinControl::txtThinFreq).isEmpty()) {
        return refuse(text::enterFrequency(), ThinControl::txtThinFreq);
    }
    if (field(ThinControl::txtThinUntil).isEmpty()) {
        return refuse(text::enterThinUntil(), ThinControl::txtThinUntil);
    }
    return true;
}

void ThinWindowLogic::resetFields() {
    for (ThinControl c : {ThinControl::txtRemB, ThinControl::txtRemN, ThinControl::txtRemV,
                          ThinControl::txtPostB, ThinControl::txtPostN, ThinControl::txtPostV}) {
        m_view.setText(c, QString());
    }
}

void ThinWindowLogic::cmdLoop_Click() {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmThin.cmdLoop_Click()"), [&] {
        if (!loopFieldCheck()) {
            return;
        }
        // The last previewed thinning waits in the window for the user.
        struct ShowWhenDone {
            IThinView &view;
            ~ShowWhenDone() {
                if (!view.isShown()) {
                    view.showCentred();
                }
            }
        } showWhenDone{m_view};
        const QString intensityText = field(ThinControl::txtRemV);
        if (!shell::isNumeric(intensityText)) {
            shell::raiseAppFault(shell::RuntimeError::typeMismatch());
        }
        const double intensity = shell::val(intensityText);
        const double age = wholeYears(m_standWork.field(work::WorkField::FromAge));
        const double until = wholeYears(field(ThinControl::txtThinUntil));
        const double frequency = wholeYears(field(ThinControl::txtThinFreq));
        if (frequency == 0.0) {
            shell::raiseAppFault(shell::RuntimeError::divisionByZero());
        }
        // n + 1 passes: the last one leaves a previewed thinning in the window.
        // The age field takes any digits: an age far beyond every model gives
        // a count no long holds, and then no pass at all.
        const double passCount = std::nearbyint((until - age) / frequency);
        const long passes =
            passCount >= 0.0 ? static_cast<long>(std::min(passCount, kMostLoopPasses)) : -1;
        const LoopUnderWay underWay(m_flags.loopUnderWay);
        for (long i = 0; i <= passes; ++i) {
            cmdAccept_Click();
            const int rowsBefore = m_standWork.table().rowCount();
            m_main.cmdGrow_Click();
            if (m_standWork.table().rowCount() == rowsBefore) {
                break; // the grow was refused or failed: stop with the rows so far
            }
            m_main.cmdThin_Click();
            resetFields();
            m_view.setText(ThinControl::txtRemV, shell::generalNumber(intensity));
            cmdThin_Click();
            if (!m_work.previewed) {
                break;
            }
        }
    });
}

} // namespace arbolex::thinning
