// The grow-from fields: the key filter, the lost-focus handlers that show the
// site index, and the form and range checks of the grow command.
#include "workflow/growfrompanel.hpp"

#include "engine/grow.hpp"
#include "rotation/rotation.hpp"
#include "rotation/standchecks.hpp"
#include "rotation/standmath.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "work/standwork.hpp"
#include "workflow/imainview.hpp"
#include "workflow/mainmessages.hpp"

namespace arbolex::workflow {

using shell::formatNumber;
using shell::isNumeric;
using shell::val;

namespace {

float valF(const QString &text) {
    return static_cast<float>(val(text));
}

} // namespace

GrowFromPanel::GrowFromPanel(work::StandWork &work, engine::Grow &grow, shell::ErrorLog &log,
                             IMainView &view, shell::IInteractive &interactive)
    : m_work(work), m_grow(grow), m_log(log), m_view(view), m_interactive(interactive) {
    // The window shows what the work holds; a field the user is typing in
    // already shows it and is left alone.
    m_fieldShown =
        QObject::connect(&work, &work::StandWork::fieldChanged, [this](work::WorkField f) {
            const MainControl c = controlOf(f);
            if (m_view.text(c) != m_work.field(f)) {
                m_view.setText(c, m_work.field(f));
            }
        });
    m_siteIndexShown = QObject::connect(&work, &work::StandWork::siteIndexChanged, [this] {
        m_view.setText(MainControl::lblSI, m_work.siteIndexText());
    });
}

GrowFromPanel::~GrowFromPanel() {
    QObject::disconnect(m_fieldShown);
    QObject::disconnect(m_siteIndexShown);
}

const QString &GrowFromPanel::field(MainControl control) const {
    return m_work.field(workFieldOf(control));
}

bool GrowFromPanel::KeyFilter(QChar key) {
    return key.isDigit() || key == QLatin1Char('.');
}

void GrowFromPanel::typeText(MainControl control, const QString &text) {
    QString typed;
    for (const QChar c : text) {
        if (!isNumericField(control) || KeyFilter(c)) {
            typed.append(c);
        }
    }
    fieldEdited(control, typed);
    leaveField(control);
}

void GrowFromPanel::fieldEdited(MainControl control, const QString &text) {
    if (isNumericField(control)) {
        m_work.setField(workFieldOf(control), text);
    }
}

void GrowFromPanel::leaveField(MainControl control) {
    if (control == MainControl::txtFromA) {
        txtFromA_LostFocus();
    } else if (control == MainControl::txtFromH) {
        txtFromH_LostFocus();
    }
}

void GrowFromPanel::showSiteIndex(float age, float topHeight) {
    showSiteIndex(m_grow.SiteIndex(age, topHeight));
}

void GrowFromPanel::showSiteIndex(bool known) {
    m_work.showSiteIndex(known);
}

void GrowFromPanel::txtFromA_LostFocus() {
    shell::guard(m_log, QStringLiteral(" in frmMain.txtFromA_LostFocus()"), [&] {
        const float age = valF(field(MainControl::txtFromA));
        const float height = valF(field(MainControl::txtFromH));
        if (age > 0.0f && height > 0.0f) {
            showSiteIndex(age, height);
        }
    });
}

void GrowFromPanel::txtFromH_LostFocus() {
    shell::guard(m_log, QStringLiteral(" in frmMain.txtFromH_LostFocus()"), [&] {
        const float height = valF(field(MainControl::txtFromH));
        if (height > rotation::kHeightFieldLimit) {
            // The typed height stays for the user to correct.
            m_interactive.message(text::titleOstran(), text::maximumHeight(), shell::kExclamation);
            m_view.focus(MainControl::txtFromH);
            return;
        }
        const float age = valF(field(MainControl::txtFromA));
        if (age > 0.0f && height > 0.0f) {
            showSiteIndex(age, height);
        }
    });
}

bool GrowFromPanel::refuse(const QString &title, const QString &text, int style,
                           MainControl control) {
    m_interactive.message(title, text, style);
    m_view.focus(control);
    return false;
}

bool GrowFromPanel::ChkGrowFromFlds() {
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

bool GrowFromPanel::ChkGrowFromBnds() {
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
            valF(field(MainControl::txtFromH)), m_grow.maxTopHeight())) {
        return refused(*fault);
    }
    if (!ChkGrowFromBD()) {
        return refuse(text::titleArbolex(), text::incompatibleBasalAreaDbh(),
                      shell::kExclamationOkCancel, MainControl::txtFromD);
    }
    if (const auto fault = rotation::basalAreaAndTargetFault(
            valF(field(MainControl::txtFromB)), valF(field(MainControl::txtToA)),
            rotation::modelAgeLimit(m_grow.modelId()))) {
        return refused(*fault);
    }
    return true;
}

bool GrowFromPanel::ChkGrowFromBD() {
    try {
        float stocking = valF(field(MainControl::txtFromN));
        const bool haveBasalArea = isNumeric(field(MainControl::txtFromB));
        const bool haveDbh = isNumeric(field(MainControl::txtFromD));
        if (haveBasalArea) {
            // The basal area wins whenever it is given.
            float basalArea = valF(field(MainControl::txtFromB));
            const float dbh = rotation::dbhFromBasalArea(basalArea, stocking);
            m_work.setField(work::WorkField::FromDbh, formatNumber(dbh, u"##0.0"));
        } else if (haveDbh) {
            const float dbh = valF(field(MainControl::txtFromD));
            m_work.setField(work::WorkField::FromBasalArea,
                            formatNumber(rotation::basalAreaFromDbh(stocking, dbh), u"##0.00"));
        }
        return true;
    } catch (const shell::AppFault &fault) {
        m_log.append(shell::windowFaultLine(fault, QStringLiteral(" in frmMain.ChkGrowFromBD()")));
        return false;
    }
}

GrowFrom GrowFromPanel::GetGrowFrom() const {
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

} // namespace arbolex::workflow
