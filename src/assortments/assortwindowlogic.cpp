#include "assortments/assortwindowlogic.hpp"

#include "assortments/assortmessages.hpp"
#include "engine/grow.hpp"
#include "prices/prices.hpp"
#include "shell/apperror.hpp"
#include "shell/interactive.hpp"
#include "shell/vbformat.hpp"
#include "work/rowformat.hpp"
#include "work/standwork.hpp"
#include "workflow/mainmessages.hpp"

#include <cmath>

namespace arbolex::assortments {

using shell::formatNumber;

namespace {

constexpr char16_t kVolumeFormat[] = u"###0.00";
constexpr char16_t kPercentFormat[] = u"##0.0";

/// A thinning is a rack thinning when it removes the same share of basal
/// area as of stems: the mean tree stays.
thinning::ThinningWork workOf(float preBasalArea, float preStocking, float postBasalArea,
                              float postStocking, const thinning::ThinningWork &volumes) {
    thinning::ThinningWork w = volumes;
    w.preBasalArea = preBasalArea;
    w.preStocking = preStocking;
    w.postBasalArea = postBasalArea;
    w.postStocking = postStocking;
    return w;
}

/// The removal's classes keep their shares but add up to the removed volume
/// that the thinning row shows (pre volume − post volume), which the volume
/// function of the removed basal area and stems does not quite give.
void scaleToRemoval(engine::Assortment &result, float removedVolume) {
    if (result.volume <= 0.0f || removedVolume <= 0.0f) {
        return;
    }
    const double factor = double{removedVolume} / double{result.volume};
    for (std::size_t i = 0; i < result.count; ++i) {
        result.classVolume[i] = static_cast<float>(result.classVolume[i] * factor);
    }
    result.volume = removedVolume;
}

bool isRackThinning(float preBasalArea, float preStocking, float postBasalArea,
                    float postStocking) {
    const float rB = postBasalArea / preBasalArea;
    const float rN = postStocking / preStocking;
    return std::fabs(rB - rN) < 0.001f;
}

QString bounds(const prices::UserCategory &c) {
    const QString small = shell::singleText(c.smallEnd);
    return c.bigEnd == 0.0f ? small + text::openEnded()
                            : small + QStringLiteral(" - ") + shell::singleText(c.bigEnd);
}

} // namespace

AssortWindowLogic::AssortWindowLogic(work::StandWork &work, IAssortView &view,
                                     shell::IInteractive &interactive)
    : m_standWork(work), m_view(view), m_interactive(interactive) {}

void AssortWindowLogic::message(const QString &text) {
    m_interactive.message(workflow::text::titleArbolex(), text, shell::kExclamation);
}

void AssortWindowLogic::reportOnGrowthRow(int row) {
    const work::RowRecord &r = m_standWork.table().row(row).record;
    m_fromMain = true;
    m_actualThinning = false;
    m_volumes = {};
    m_age = r.age;
    m_session.pending = QStringLiteral("0");
    m_session.reportKind = kPreThin;
    const bool built =
        m_session.userCategories
            ? frmAssortLoadMod(r.basalArea, r.stocking, r.topHeight, r.basalArea, r.stocking)
            : frmAssortLoad(r.basalArea, r.stocking, r.topHeight, r.basalArea, r.stocking);
    if (built) {
        m_view.showReport();
    }
}

bool AssortWindowLogic::reportOnThinning(int kind, const thinning::ThinningWork &work, float age,
                                         bool actualThinning) {
    m_fromMain = false;
    m_actualThinning = actualThinning;
    m_volumes = {};
    m_volumes.preVolume = work.preVolume;
    m_volumes.postVolume = work.previewed ? work.postVolume : work.preVolume;
    m_age = age;
    m_session.reportKind = kind;
    const float postB = work.previewed ? work.postBasalArea : work.preBasalArea;
    const float postN = work.previewed ? work.postStocking : work.preStocking;
    const bool built =
        m_session.userCategories
            ? frmAssortLoadMod(work.preBasalArea, work.preStocking, work.topHeight, postB, postN)
            : frmAssortLoad(work.preBasalArea, work.preStocking, work.topHeight, postB, postN);
    if (built) {
        m_session.pending += QString::number(kind);
        m_view.showReport();
    }
    return built;
}

QString AssortWindowLogic::chooseTitle(float preBasalArea, float preStocking, float postBasalArea,
                                       float postStocking) const {
    if (m_fromMain) {
        return text::titleCrop();
    }
    const bool rack = isRackThinning(preBasalArea, preStocking, postBasalArea, postStocking);
    switch (m_session.reportKind) {
    case kPostThin:
        if (m_actualThinning) {
            return text::titlePostActual();
        }
        return rack ? text::titlePostRackThin() : text::titlePostThin();
    case kThinning:
        return rack ? text::titleRackThinning() : text::titleThinning();
    case kPreThin:
        return text::titlePreThin();
    default:
        return {};
    }
}

bool AssortWindowLogic::thinningUsable(float preBasalArea, float preStocking, float postBasalArea,
                                       float postStocking) {
    if (m_fromMain || m_session.reportKind == kPreThin) {
        return true;
    }
    // A thinning that adds basal area or stems runs backwards.
    if (postBasalArea > preBasalArea || postStocking > preStocking) {
        message(text::backwardThinning());
        return false;
    }
    if (postBasalArea == preBasalArea && postStocking == preStocking) {
        message(text::previewFirst());
        return false;
    }
    return true;
}

ReportStand AssortWindowLogic::standOf(int kind, const thinning::ThinningWork &work) {
    switch (kind) {
    case kThinning:
        return {work.preBasalArea - work.postBasalArea, work.preStocking - work.postStocking,
                std::fabs(work.preVolume - work.postVolume)};
    case kPostThin:
        return {work.postBasalArea, work.postStocking, 0.0f};
    default:
        return {work.preBasalArea, work.preStocking, 0.0f};
    }
}

bool AssortWindowLogic::categoriesInUse(std::vector<engine::AssortmentCategory> &bounds,
                                        QStringList &names) {
    for (const prices::UserCategory &c : m_standWork.prices().data().categories) {
        if (c.inUse) {
            bounds.push_back({c.smallEnd, c.bigEnd});
            names << c.name;
        }
    }
    if (bounds.empty()) {
        message(text::noCategoryInUse());
        return false;
    }
    return true;
}

bool AssortWindowLogic::calculate(const ReportStand &stand, float topHeight, bool user,
                                  engine::Assortment &result) {
    std::vector<engine::AssortmentCategory> bounds;
    QStringList names;
    if (user && !categoriesInUse(bounds, names)) {
        return false;
    }
    if (!m_standWork.grow().AsmtB(stand.basalArea, stand.stocking, topHeight, bounds, result)) {
        return false;
    }
    if (stand.removedVolume > 0.0f) {
        scaleToRemoval(result, stand.removedVolume);
    }
    return true;
}

bool AssortWindowLogic::prepareReport(const thinning::ThinningWork &work, float topHeight,
                                      bool user, engine::Assortment &result) {
    const QString title =
        chooseTitle(work.preBasalArea, work.preStocking, work.postBasalArea, work.postStocking);
    if (title.isEmpty() || !thinningUsable(work.preBasalArea, work.preStocking, work.postBasalArea,
                                           work.postStocking)) {
        return false;
    }
    if (!calculate(standOf(m_session.reportKind, work), topHeight, user, result)) {
        return false;
    }
    m_session.descriptions.at(static_cast<std::size_t>(m_session.reportKind)) = title;
    m_view.setCaption(text::captionLead() + shell::singleText(m_age));
    m_view.setText(AssortControl::lblDesc, title);
    return true;
}

bool AssortWindowLogic::frmAssortLoad(float preBasalArea, float preStocking, float topHeight,
                                      float postBasalArea, float postStocking) {
    bool built = false;
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in Misc.frmAssortLoad()"), [&] {
        const thinning::ThinningWork work =
            workOf(preBasalArea, preStocking, postBasalArea, postStocking, m_volumes);
        engine::Assortment result;
        if (!prepareReport(work, topHeight, false, result)) {
            return;
        }
        m_view.setText(AssortControl::lblVol, text::volumeColumn());
        m_view.setText(AssortControl::lblPct, text::percentColumn());
        m_view.setText(AssortControl::lbl714, text::class714());
        m_view.setText(AssortControl::lbl1420, text::class1420());
        m_view.setText(AssortControl::lbl20, text::class20());
        const std::array<AssortControl, 3> volumes{
            AssortControl::lblVol714, AssortControl::lblVol1420, AssortControl::lblVol20};
        const std::array<AssortControl, 3> percents{
            AssortControl::lblPct714, AssortControl::lblPct1420, AssortControl::lblPct20};
        for (std::size_t i = 0; i < 3; ++i) {
            m_view.setText(volumes[i], formatNumber(result.classVolume[i], kVolumeFormat));
            m_view.setText(percents[i], formatNumber(result.percent(i), kPercentFormat));
        }
        m_view.showFixedClasses();
        built = true;
    });
    return built;
}

bool AssortWindowLogic::frmAssortLoadMod(float preBasalArea, float preStocking, float topHeight,
                                         float postBasalArea, float postStocking) {
    bool built = false;
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in Misc.frmAssortLoadMod()"), [&] {
        const thinning::ThinningWork work =
            workOf(preBasalArea, preStocking, postBasalArea, postStocking, m_volumes);
        engine::Assortment result;
        if (!prepareReport(work, topHeight, true, result)) {
            return;
        }
        UserReport report;
        report.header = QStringList{text::userCategory(), text::userDiameters(), text::userVolume(),
                                    text::userPercent()};
        // A thinning's report shows how each category develops.
        std::array<engine::Assortment, 3> development;
        if (!m_fromMain) {
            report.header << text::developmentPre() << text::developmentRemoved()
                          << text::developmentPost();
            for (int k = kPreThin; k <= kPostThin; ++k) {
                if (!calculate(standOf(k, work), topHeight, true,
                               development.at(static_cast<std::size_t>(k)))) {
                    return;
                }
            }
        }
        QStringList names;
        for (const prices::UserCategory &c : m_standWork.prices().data().categories) {
            if (!c.inUse) {
                continue;
            }
            const auto i = static_cast<std::size_t>(names.size());
            names << c.name;
            QStringList row{c.name, bounds(c),
                            formatNumber(result.classVolume.at(i), kVolumeFormat),
                            formatNumber(result.percent(i), kPercentFormat)};
            if (!m_fromMain) {
                for (const engine::Assortment &d : development) {
                    row << formatNumber(d.classVolume.at(i), kVolumeFormat);
                }
            }
            report.rows.push_back(row);
        }
        m_view.showUserReport(report);
        built = true;
    });
    return built;
}

void AssortWindowLogic::cmdOK_Click() {
    m_view.close();
}

void AssortWindowLogic::cmdAccept_Click() {
    // A growth row's report is not kept: rows are written for a thinning only.
    if (!m_fromMain) {
        const QString digit = QString::number(m_session.reportKind);
        if (!m_session.pending.contains(digit)) {
            m_session.pending += digit;
        }
    }
    m_view.close();
}

void AssortWindowLogic::cmdCancel_Click() {
    if (!m_fromMain) {
        m_session.pending.remove(QString::number(m_session.reportKind));
    }
    m_view.close();
}

bool AssortWindowLogic::press(AssortControl control) {
    switch (control) {
    case AssortControl::cmdOK:
        cmdOK_Click();
        return true;
    case AssortControl::cmdAccept:
        cmdAccept_Click();
        return true;
    case AssortControl::cmdCancel:
        cmdCancel_Click();
        return true;
    default:
        return false;
    }
}

QString AssortWindowLogic::rowLabel(const QString &description) {
    // The tests run in this order: a description holding both
    // "Pre-[Actual]-Thin" and "Thinning" is a crop row.
    if (description == text::titleCrop() ||
        description.contains(QLatin1String("Pre-[Actual]-Thin"))) {
        return text::rowLabelCrop();
    }
    if (description.contains(QLatin1String("Rack-thin")) ||
        description.contains(QLatin1String("Thinning"))) {
        return text::rowLabelThinning();
    }
    return text::rowLabelPostThin();
}

void AssortWindowLogic::appendRow(const QString &description, float age,
                                  const engine::Assortment &result, const QStringList &names) {
    std::vector<work::rowformat::AssortmentClass> classes;
    for (std::size_t i = 0; i < result.count; ++i) {
        classes.push_back({names.isEmpty() ? text::rowClass(static_cast<int>(i))
                                           : names.at(static_cast<qsizetype>(i)),
                           result.percent(i), result.classVolume[i]});
    }
    m_standWork.appendAssortmentRow(
        work::rowformat::assortmentRow(rowLabel(description), age, classes));
}

void AssortWindowLogic::appendPendingRows(const thinning::ThinningWork &work, float age) {
    shell::guard(m_standWork.errorLog(), QStringLiteral(" in Misc.WriteAssortLines()"), [&] {
        for (int kind = kPreThin; kind <= kPostThin; ++kind) {
            const QString &description = m_session.descriptions.at(static_cast<std::size_t>(kind));
            if (!m_session.pending.contains(QString::number(kind)) || description.isEmpty()) {
                continue;
            }
            std::vector<engine::AssortmentCategory> bounds;
            QStringList names;
            if (m_session.userCategories && !categoriesInUse(bounds, names)) {
                continue;
            }
            engine::Assortment result;
            if (calculate(standOf(kind, work), work.topHeight, m_session.userCategories, result)) {
                appendRow(description, age, result, names);
            }
        }
        m_session.pending.clear();
    });
}

} // namespace arbolex::assortments
