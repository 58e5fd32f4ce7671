// The grow-from fields: the key filter, the lost-focus handlers that show the
// site index, the form and range checks, and reading and writing the values.
#include "rotation/rotation.hpp"
#include "rotation/standchecks.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "workflow/mainmessages.hpp"
#include "workflow/mainwindowlogic.hpp"
#include "workflow/standmath.hpp"

namespace arbolex::workflow {

using shell::formatNumber;
using shell::isNumeric;
using shell::val;

namespace {
using rotation::kHeightFieldLimit;

float valF(const QString &text) {
    return static_cast<float>(val(text));
}
} // namespace

bool MainWindowLogic::KeyFilter(QChar key) {
    return key.isDigit() || key == QLatin1Char('.');
}

void MainWindowLogic::typeText(MainControl control, const QString &text) {
    QString typed;
    for (const QChar c : text) {
        if (!isNumericField(control) || KeyFilter(c)) {
            typed.append(c);
        }
    }
    m_view.setText(control, typed);
    leaveField(control);
}

void MainWindowLogic::leaveField(MainControl control) {
    if (control == MainControl::txtFromA) {
        txtFromA_LostFocus();
    } else if (control == MainControl::txtFromH) {
        txtFromH_LostFocus();
    }
}

void MainWindowLogic::showSiteIndex(float age, float topHeight) {
    showSiteIndex(m_grow.SiteIndex(age, topHeight));
}

void MainWindowLogic::showSiteIndex(bool known) {
    m_view.setText(MainControl::lblSI,
                   known ? formatNumber(m_grow.siteIndex(), u"#.0") : QString());
}

void MainWindowLogic::txtFromA_LostFocus() {
    shell::guard(m_log, QStringLiteral(" in frmMain.txtFromA_LostFocus()"), [&] {
        const float age = valF(field(MainControl::txtFromA));
        const float height = valF(field(MainControl::txtFromH));
        if (age > 0.0f && height > 0.0f) {
            showSiteIndex(age, height);
        }
    });
}

void MainWindowLogic::txtFromH_LostFocus() {
    shell::guard(m_log, QStringLiteral(" in frmMain.txtFromH_LostFocus()"), [&] {
        const float height = valF(field(MainControl::txtFromH));
        if (height > kHeightFieldLimit) {
            // The typed height stays for the user to correct.
            message(text::titleOstran(), text::maximumHeight(), shell::kExclamation);
            m_view.focus(MainControl::txtFromH);
            return;
        }
        const float age = valF(field(MainControl::txtFromA));
        if (age > 0.0f && height > 0.0f) {
            showSiteIndex(age, height);
        }
    });
}

bool MainWindowLogic::refuse(const QString &title, const QString &text, int style,
                             MainControl control) {
    message(title, text, style);
    m_view.focus(control);
    return false;
}

bool MainWindowLogic::ChkGrowFromFlds() {
    const QString title = text::titleOstran();
    const int style = shell::kExclamation;
    struct Required {
        MainControl control;
        QString fault;
    };
    const Required required[] = {{MainControl::txtFromA, text::faultFromAge()},
                                 {MainControl::txtFromN, text::faultFromStocking()},
                                 {MainControl::txtFromH, text::faultFromHeight()}};
    for (const Required &r : required) {
        if (!isNumeric(field(r.control))) {
            return refuse(title, r.fault, style, r.control);
        }
    }
    if (!isNumeric(field(MainControl::txtFromB)) && !isNumeric(field(MainControl::txtFromD))) {
        return refuse(title, text::faultFromBasalAreaOrDbh(), style, MainControl::txtFromB);
    }
    if (!isNumeric(field(MainControl::txtToA))) {
        return refuse(title, text::faultToAge(), style, MainControl::txtToA);
    }
    const QString stepText = field(MainControl::txtByA);
    if (!isNumeric(stepText)) {
        return refuse(title, text::faultByStep(), style, MainControl::txtByA);
    }
    // A step must move forward and fit in the span it divides.
    const double step = val(stepText);
    const double span =
        std::abs(val(field(MainControl::txtToA)) - val(field(MainControl::txtFromA)));
    if (step <= 0.0 || (span > 0.0 && step > span)) {
        return refuse(title, text::faultByStep(), style, MainControl::txtByA);
    }
    return true;
}

int MainWindowLogic::maxTargetAge() const {
    return rotation::modelAgeLimit(m_grow.modelId());
}

bool MainWindowLogic::ChkGrowFromBnds() {
    // The ranges, their order and their messages are the grow command's own,
    // shared with every rotation grown without the window.
    const auto refused = [&](const rotation::GrowFromFault &fault) {
        static constexpr MainControl kFocus[] = {MainControl::txtFromA, MainControl::txtFromN,
                                                 MainControl::txtFromH, MainControl::txtFromB,
                                                 MainControl::txtToA};
        return refuse(text::titleArbolex(), text::stand(fault.text), shell::kExclamationOkCancel,
                      kFocus[static_cast<int>(fault.field)]);
    };
    if (const auto fault = rotation::standRangeFault(
            valF(field(MainControl::txtFromA)), valF(field(MainControl::txtFromN)),
            valF(field(MainControl::txtFromH)), maxTopHeight())) {
        return refused(*fault);
    }
    if (!ChkGrowFromBD()) {
        return refuse(text::titleArbolex(), text::incompatibleBasalAreaDbh(),
                      shell::kExclamationOkCancel, MainControl::txtFromD);
    }
    if (const auto fault = rotation::basalAreaAndTargetFault(
            valF(field(MainControl::txtFromB)), valF(field(MainControl::txtToA)), maxTargetAge())) {
        return refused(*fault);
    }
    return true;
}

bool MainWindowLogic::ChkGrowFromBD() {
    try {
        float stocking = valF(field(MainControl::txtFromN));
        const bool haveBasalArea = isNumeric(field(MainControl::txtFromB));
        const bool haveDbh = isNumeric(field(MainControl::txtFromD));
        if (haveBasalArea) {
            // The basal area wins whenever it is given.
            float basalArea = valF(field(MainControl::txtFromB));
            const float dbh = dbhFromBasalArea(basalArea, stocking);
            m_view.setText(MainControl::txtFromD, formatNumber(dbh, u"##0.0"));
        } else if (haveDbh) {
            const float dbh = valF(field(MainControl::txtFromD));
            m_view.setText(MainControl::txtFromB,
                           formatNumber(basalAreaFromDbh(stocking, dbh), u"##0.00"));
        }
        return true;
    } catch (const shell::AppFault &fault) {
        m_log.append(shell::windowFaultLine(fault, QStringLiteral(" in frmMain.ChkGrowFromBD()")));
        return false;
    }
}

GrowFrom MainWindowLogic::GetGrowFrom() const {
    GrowFrom g;
    g.age = valF(field(MainControl::txtFromA));
    g.stocking = valF(field(MainControl::txtFromN));
    g.topHeight = valF(field(MainControl::txtFromH));
    g.basalArea = valF(field(MainControl::txtFromB));
    g.dbh = valF(field(MainControl::txtFromD));
    g.targetAge = valF(field(MainControl::txtToA));
    g.step = valF(field(MainControl::txtByA));
    return g;
}

bool MainWindowLogic::SetGrowFrom(float age, float basalArea, float stocking, float topHeight,
                                  float targetAge, float step) {
    // The age is written only forward: a field that already holds a later age keeps it.
    if (age > 0.0f && valF(field(MainControl::txtFromA)) < age) {
        m_view.setText(MainControl::txtFromA, formatNumber(age, u"##0"));
    }
    if (basalArea > 0.0f) {
        m_view.setText(MainControl::txtFromB, formatNumber(basalArea, u"##0.00"));
    }
    if (stocking > 0.0f) {
        m_view.setText(MainControl::txtFromN, formatNumber(stocking, u"#####0"));
    }
    if (topHeight > 0.0f) {
        m_view.setText(MainControl::txtFromH, formatNumber(topHeight, u"##0.0"));
    }
    if (targetAge > 0.0f) {
        m_view.setText(MainControl::txtToA, formatNumber(targetAge, u"##0"));
    }
    if (step >= 0.0f) {
        m_view.setText(MainControl::txtByA, formatNumber(step, u"##0"));
    }
    return true;
}

} // namespace arbolex::workflow
