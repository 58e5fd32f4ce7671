// The thinning window: loading the stand before the thinning, checking the
// prescription, solving it with the thinning response and showing it.
#include "thinning/thinwindowlogic.hpp"

#include "assortments/assortwindowlogic.hpp"
#include "rotation/growcommand.hpp"
#include "rotation/standmath.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "shell/vbtext.hpp"
#include "thinning/thinmessages.hpp"
#include "work/standwork.hpp"
#include "workflow/growfrompanel.hpp"
#include "workflow/iworkwindows.hpp"
#include "workflow/mainmessages.hpp"

#include <cmath>

namespace arbolex::thinning {

using rotation::dbhFromBasalArea;
using rotation::truncateToTenth;
using shell::formatNumber;
using shell::isNumeric;
using shell::val;

namespace {

// Display formats of the thinning window.
constexpr char16_t kStockingFormat[] = u"###0";
constexpr char16_t kBasalAreaFormat[] = u"##0.00";
/// Volumes as the window shows them: the pattern whose shown figure the
/// volume method checks a removal against.
const QString kVolumeFormat = QString::fromLatin1(rotation::kThinningVolumeShown.data(),
                                                  rotation::kThinningVolumeShown.size());
constexpr char16_t kDbhFormat[] = u"##0.0";
constexpr char16_t kMeanVolumeFormat[] = u"0.000";

/// Ratios closer than this make a rack thinning: the mean tree is unchanged.
constexpr float kRackTolerance = 0.001f;

QString stockingText(float n) {
    return formatNumber(n, kStockingFormat);
}

/// Mean tree volume text, empty where there are no trees to share it.
QString meanVolumeText(float volume, float stocking) {
    return stocking > 0.0f ? formatNumber(double{volume} / stocking, kMeanVolumeFormat) : QString();
}

/// Mean DBH as the window shows it: truncated to one decimal.
QString dbhText(float basalArea, float stocking) {
    return formatNumber(truncateToTenth(dbhFromBasalArea(basalArea, stocking)), kDbhFormat);
}

} // namespace

ThinWindowLogic::ThinWindowLogic(work::StandWork &work, workflow::IMainCommands &main,
                                 IThinView &view, shell::IInteractive &interactive)
    : m_standWork(work), m_main(main), m_view(view), m_interactive(interactive) {}

QString ThinWindowLogic::field(ThinControl c) const {
    return m_view.text(c);
}

void ThinWindowLogic::message(const QString &title, const QString &text) {
    m_interactive.message(title, text, shell::kExclamation);
}

bool ThinWindowLogic::refuse(const QString &text, ThinControl focus) {
    message(workflow::text::titleArbolexYeld(), text);
    m_view.focus(focus);
    return false;
}

void ThinWindowLogic::emptyResultColumns() {
    for (ThinControl c :
         {ThinControl::txtRemN, ThinControl::txtRemB, ThinControl::txtRemV, ThinControl::lblRemD,
          ThinControl::lblRemMV, ThinControl::txtPostN, ThinControl::txtPostB,
          ThinControl::txtPostV, ThinControl::lblPostD, ThinControl::lblPostMV}) {
        m_view.setText(c, QString());
    }
    m_work.previewed = false;
    m_view.setEnabled(ThinControl::cmdAccept, false);
}

void ThinWindowLogic::frmThinLoad() {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in Misc.frmThinLoad()"), [&] {
        m_flags.editingExisting = false;
        if (m_assort != nullptr) {
            m_assort->session().pending.clear();
        }
        const int row = m_standWork.table().currentRow();
        if (row < 1) {
            return;
        }
        const work::RowRecord &rec = m_standWork.table().row(row).record;
        m_view.setCaption(workflow::text::titleArbolexYeld() + QStringLiteral("      ") +
                          text::thinningAtAge() + shell::singleText(rec.age));
        // The stand before the thinning is always standing + removed, so an
        // already thinned row opens as it was before that thinning.
        m_work = {};
        m_work.preBasalArea = rec.basalArea + rec.removedBasalArea;
        m_work.preStocking = rec.stocking + rec.removedStocking;
        m_work.preVolume = rec.volume + rec.removedVolume;
        m_work.topHeight = rec.topHeight;
        m_view.setText(ThinControl::lblPreN, stockingText(m_work.preStocking));
        m_view.setText(ThinControl::lblPreB, formatNumber(m_work.preBasalArea, kBasalAreaFormat));
        m_view.setText(ThinControl::lblPreV, formatNumber(m_work.preVolume, kVolumeFormat));
        m_view.setText(ThinControl::lblPreD, dbhText(m_work.preBasalArea, m_work.preStocking));
        m_view.setText(ThinControl::lblPreMV, meanVolumeText(m_work.preVolume, m_work.preStocking));
        emptyResultColumns();
        if (rec.removedBasalArea != 0.0f) {
            m_flags.editingExisting = true;
            fillFromRecord(rec);
        }
    });
}

void ThinWindowLogic::fillFromRecord(const work::RowRecord &rec) {
    m_work.postBasalArea = rec.basalArea;
    m_work.postStocking = rec.stocking;
    m_work.postVolume = rec.volume;
    m_work.previewed = true;
    m_view.setText(ThinControl::txtRemN, stockingText(rec.removedStocking));
    m_view.setText(ThinControl::txtRemB, formatNumber(rec.removedBasalArea, kBasalAreaFormat));
    m_view.setText(ThinControl::txtRemV, formatNumber(rec.removedVolume, kVolumeFormat));
    m_view.setText(ThinControl::lblRemD, dbhText(rec.removedBasalArea, rec.removedStocking));
    m_view.setText(ThinControl::lblRemMV, meanVolumeText(rec.removedVolume, rec.removedStocking));
    m_view.setText(ThinControl::txtPostN, stockingText(rec.stocking));
    m_view.setText(ThinControl::txtPostB, formatNumber(rec.basalArea, kBasalAreaFormat));
    m_view.setText(ThinControl::txtPostV, formatNumber(rec.volume, kVolumeFormat));
    m_view.setText(ThinControl::lblPostD, formatNumber(rec.dbh, kDbhFormat));
    m_view.setText(ThinControl::lblPostMV, meanVolumeText(rec.volume, rec.stocking));
    m_view.setEnabled(ThinControl::cmdAccept, true);
}

void ThinWindowLogic::openFromMain() {
    frmThinLoad();
    if (m_flags.loopUnderWay) {
        return; // the loop drives the window itself
    }
    // The loop repeats an earlier thinning, so it is offered only once a
    // thinning has been written.
    const bool loopMode =
        m_standWork.thinned() &&
        m_interactive.askYesNo(workflow::text::titleArbolexYeld(), text::loopOffer());
    show(loopMode);
}

void ThinWindowLogic::show(bool loopMode) {
    m_view.setChecked(ThinControl::chkActivLoop, loopMode);
    chkActivLoop_Click();
    m_view.showCentred();
}

bool ThinWindowLogic::chkThinFlds() {
    struct Numeric {
        ThinControl control;
        QString fault;
    };
    const Numeric numeric[] = {{ThinControl::txtRemB, text::remBNonNumeric()},
                               {ThinControl::txtRemN, text::remNNonNumeric()},
                               {ThinControl::txtRemV, text::remVNonNumeric()},
                               {ThinControl::txtPostB, text::postBNonNumeric()},
                               {ThinControl::txtPostN, text::postNNonNumeric()},
                               {ThinControl::txtPostV, text::postVNonNumeric()}};
    for (const Numeric &n : numeric) {
        const QString t = field(n.control);
        if (!t.isEmpty() && !isNumeric(t)) {
            return refuse(n.fault, n.control);
        }
    }
    struct Quantity {
        ThinControl removal;
        ThinControl post;
        ThinControl pre;
        QString postNotPositive;
        QString nothingLeft;
    };
    const Quantity quantities[] = {
        {ThinControl::txtRemB, ThinControl::txtPostB, ThinControl::lblPreB,
         text::postBNotPositive(), text::removalLeavesNoBasalArea()},
        {ThinControl::txtRemN, ThinControl::txtPostN, ThinControl::lblPreN,
         text::postNNotPositive(), text::removalLeavesNoStocking()},
        {ThinControl::txtRemV, ThinControl::txtPostV, ThinControl::lblPreV,
         text::postVNotPositive(), text::removalLeavesNoVolume()}};
    for (const Quantity &q : quantities) {
        if (!field(q.post).isEmpty()) {
            if (val(field(q.post)) <= 0.0) {
                return refuse(q.postNotPositive, q.post);
            }
        } else if (!field(q.removal).isEmpty()) {
            if (val(field(q.pre)) - val(field(q.removal)) <= 0.0) {
                return refuse(q.nothingLeft, q.removal);
            }
        }
    }
    return true;
}

int ThinWindowLogic::ThinMethod() {
    auto given = [this](ThinControl removal, ThinControl post) {
        return isNumeric(field(removal)) || isNumeric(field(post));
    };
    const bool basalArea = given(ThinControl::txtRemB, ThinControl::txtPostB);
    const bool stocking = given(ThinControl::txtRemN, ThinControl::txtPostN);
    if (basalArea && stocking) {
        return kBasalAreaAndStocking;
    }
    if (basalArea) {
        return kBasalArea;
    }
    if (stocking) {
        return kStocking;
    }
    if (given(ThinControl::txtRemV, ThinControl::txtPostV)) {
        return kVolume;
    }
    message(workflow::text::titleOstran(), text::howToPrescribe());
    m_view.focus(ThinControl::txtRemB);
    return kNoMethod;
}

float ThinWindowLogic::postValue(ThinControl removal, ThinControl post, float pre) const {
    if (!field(removal).isEmpty()) {
        return static_cast<float>(pre - val(field(removal)));
    }
    return static_cast<float>(val(field(post)));
}

void ThinWindowLogic::cmdThin_Click() {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmThin.cmdThin_Click()"), [&] {
        if (!chkThinFlds()) {
            return;
        }
        const int method = ThinMethod();
        if (method == kNoMethod) {
            return;
        }
        engine::Grow &grow = m_standWork.grow();
        if (method != kBasalAreaAndStocking && method != kVolume && grow.T(1) == 0.0) {
            // Without a thinning response basal area and stocking are not
            // tied: both must be given.
            message(workflow::text::titleOstran(), text::noThinningResponse());
            return;
        }
        const float preB = m_work.preBasalArea;
        const float preN = m_work.preStocking;
        const float preV = m_work.preVolume;
        const float h = m_work.topHeight;
        float postB = 0.0f;
        float postN = 0.0f;
        float postV = 0.0f;
        // An engine procedure that fails shows its own message; the preview
        // then stops and changes nothing.
        const unsigned faultsBefore = grow.faultCount();
        switch (method) {
        case kBasalAreaAndStocking:
            postB = postValue(ThinControl::txtRemB, ThinControl::txtPostB, preB);
            postN = postValue(ThinControl::txtRemN, ThinControl::txtPostN, preN);
            m_ratioBasalArea = postB / preB;
            m_ratioStocking = postN / preN;
            postV = grow.GetV7(postB, postN, h);
            break;
        case kBasalArea:
            postB = postValue(ThinControl::txtRemB, ThinControl::txtPostB, preB);
            postN = grow.NRES(h, preN, preB, postB);
            postV = grow.GetV7(postB, postN, h);
            break;
        case kStocking:
            postN = postValue(ThinControl::txtRemN, ThinControl::txtPostN, preN);
            postB = static_cast<float>(grow.BRES(h, preN, preB, postN));
            postV = grow.GetV7(postB, postN, h);
            break;
        default: {
            // The volume method every rotation thins by.
            const engine::VolumeThinning t = grow.thinToVolume(
                preN, preB, h, postValue(ThinControl::txtRemV, ThinControl::txtPostV, preV));
            if (t.outcome == engine::VolumeThinningOutcome::kNoThinningResponse) {
                message(workflow::text::titleOstran(), text::noThinningResponse());
                return;
            }
            if (t.outcome == engine::VolumeThinningOutcome::kSolverFailed) {
                return;
            }
            postB = t.basalArea;
            postN = t.stocking;
            postV = t.volume;
            break;
        }
        }
        if (grow.faultCount() != faultsBefore) {
            return;
        }
        if (!(postB > 0.0f) || !(postN > 0.0f) || !std::isfinite(postV)) {
            message(workflow::text::titleOstran(), text::nothingLeft());
            return;
        }
        if (method == kBasalAreaAndStocking &&
            std::fabs(m_ratioBasalArea - m_ratioStocking) < kRackTolerance) {
            // A rack thinning keeps the mean tree: volume falls in proportion.
            postV = preV * m_ratioBasalArea;
        }
        m_work.postBasalArea = postB;
        m_work.postStocking = postN;
        m_work.postVolume = postV;
        m_work.previewed = true;
        ShowThin(preB, preN, h, preV, postB, postN, postV);
        m_view.setEnabled(ThinControl::cmdAccept, true);
    });
}

void ThinWindowLogic::ShowThin(float preBasalArea, float preStocking, float /*topHeight*/,
                               float preVolume, float postBasalArea, float postStocking,
                               float postVolume) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in frmThin.ShowThin()"), [&] {
        const float remN = std::fabs(preStocking - postStocking);
        const float remB = std::fabs(preBasalArea - postBasalArea);
        const float remV = std::fabs(preVolume - postVolume);
        m_view.setText(ThinControl::txtRemN, stockingText(remN));
        m_view.setText(ThinControl::txtRemB, formatNumber(remB, kBasalAreaFormat));
        m_view.setText(ThinControl::txtRemV, formatNumber(remV, kVolumeFormat));
        m_view.setText(ThinControl::lblRemD, dbhText(remB, remN));
        m_view.setText(ThinControl::lblRemMV, meanVolumeText(remV, remN));
        m_view.setText(ThinControl::txtPostN, stockingText(postStocking));
        m_view.setText(ThinControl::txtPostB, formatNumber(postBasalArea, kBasalAreaFormat));
        m_view.setText(ThinControl::txtPostV, formatNumber(postVolume, kVolumeFormat));
        m_view.setText(ThinControl::lblPostD, dbhText(postBasalArea, postStocking));
        m_view.setText(ThinControl::lblPostMV, meanVolumeText(postVolume, postStocking));
    });
}

void ThinWindowLogic::cmdClear_Click() {
    try {
        emptyResultColumns();
    } catch (const shell::AppFault &fault) {
        m_standWork.errorLog().append(
            QStringLiteral("Error ") + fault.error.description +
            QStringLiteral("  in procedure cmdClear_Click of Feuille frmThin"));
    }
}

void ThinWindowLogic::cmdCancel_Click() {
    m_view.close();
}

void ThinWindowLogic::typeText(ThinControl control, const QString &text) {
    QString typed;
    for (const QChar c : text) {
        if (workflow::GrowFromPanel::KeyFilter(c)) {
            typed.append(c);
        }
    }
    m_view.setText(control, typed);
}

bool ThinWindowLogic::press(ThinControl control) {
    switch (control) {
    case ThinControl::cmdThin:
        cmdThin_Click();
        return true;
    case ThinControl::cmdAccept:
        cmdAccept_Click();
        return true;
    case ThinControl::cmdClear:
        cmdClear_Click();
        return true;
    case ThinControl::cmdCancel:
        cmdCancel_Click();
        return true;
    case ThinControl::cmdLoop:
        cmdLoop_Click();
        return true;
    case ThinControl::chkActivLoop:
        m_view.setChecked(ThinControl::chkActivLoop, !m_view.isChecked(ThinControl::chkActivLoop));
        chkActivLoop_Click();
        return true;
    default:
        return false;
    }
}

} // namespace arbolex::thinning
