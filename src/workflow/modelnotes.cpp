#include "workflow/modelnotes.hpp"

#include "engine/grow.hpp"
#include "rotation/rotation.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "workflow/mainmessages.hpp"

#include <vector>

namespace arbolex::workflow {

namespace {

/// Reference stand from which the threshold basal area is projected.
constexpr float kReferenceAge = 15.0f;
constexpr float kReferenceStocking = 2500.0f;
constexpr float kReferenceHeight = 7.0f;
constexpr float kReferenceBasalArea = 20.0f;
/// Top height at which a thinned crop is first thinned, m.
constexpr float kFirstThinningHeight = 12.0f;

} // namespace

QString speciesCode(const QString &label) {
    for (const char *code : {"SS", "NS", "DF", "LP", "SP"}) {
        if (label.startsWith(QLatin1String(code))) {
            return QLatin1String(code);
        }
    }
    return {};
}

float thresholdBasalArea(const engine::Grow &grow) {
    engine::Grow probe = grow;
    probe.setReport(nullptr);
    if (!probe.SiteIndex(kReferenceAge, kReferenceHeight)) {
        return 0.0f;
    }
    probe.TM(probe.siteIndex());
    std::vector<engine::StandState> states;
    probe.PROJ(kReferenceAge, kReferenceBasalArea, kReferenceStocking, kReferenceHeight, 60.0f,
               1.0f, states);
    for (const engine::StandState &s : states) {
        if (s.topHeight >= kFirstThinningHeight) {
            return s.basalArea;
        }
    }
    return states.empty() ? 0.0f : states.back().basalArea;
}

QString thresholdText(const engine::Grow &grow) {
    const QString code = speciesCode(QString::fromStdString(grow.label()));
    if (code.isEmpty()) {
        return {};
    }
    const QString value = shell::formatNumber(thresholdBasalArea(grow), u"##0.0");
    // Without a thinning response the threshold is not calculated; the
    // reference value is a lower bound for it.
    const bool calculated = grow.T(1) != 0.0;
    return text::thresholdLead() + code +
           (calculated ? text::thresholdIs() : text::thresholdNotCalculated()) + value;
}

QString warnText(const engine::Grow &grow) {
    const QString crlf = QStringLiteral("\r\n");
    return text::warnLead() + crlf + QString::fromStdString(grow.label()) + crlf + crlf +
           QStringLiteral("- Start from a stand aged 10 to 60 years, with 100 to 5000 stems/ha, "
                          "a top height of 5 to ") +
           shell::formatNumber(grow.maxTopHeight(), u"##0.0") +
           QStringLiteral(" m and a basal area of 10 to 100 m2/ha.") + crlf +
           QStringLiteral("- Projections end at age ") +
           QString::number(rotation::modelAgeLimit(grow.modelId())) +
           QStringLiteral(" at the latest.") + crlf +
           (grow.isThinnedModel()
                ? QStringLiteral("- This model follows a thinned crop: thin the last growth row "
                                 "to continue from the thinned stand.")
                : QStringLiteral("- This model follows an un-thinned crop: it offers no "
                                 "thinning.")) +
           crlf + QStringLiteral("- Volumes are merchantable volumes to 7 cm top diameter.");
}

void tellThreshold(const engine::Grow &grow, shell::IInteractive &interactive,
                   shell::ErrorLog &log) {
    shell::guard(log, QStringLiteral(" in frmMain.TrhesholdInfo()"), [&] {
        const QString threshold = thresholdText(grow);
        if (threshold.isEmpty()) {
            interactive.message(text::titleArbolex(), text::speciesNotFound(), shell::kExclamation);
            return;
        }
        interactive.message(text::titleArbolex(), threshold, shell::kInformation);
    });
}

void tellNotes(const engine::Grow &grow, shell::IInteractive &interactive, shell::ErrorLog &log) {
    shell::guard(log, QStringLiteral(" in frmMain.Warn()"), [&] {
        interactive.message(text::titleArbolex(), warnText(grow), shell::kInformation);
    });
}

} // namespace arbolex::workflow
