#include "work/regimereplay.hpp"

#include "engine/grow.hpp"
#include "rotation/standmath.hpp"
#include "work/standwork.hpp"
#include "work/worktexts.hpp"

#include <cmath>

namespace arbolex::work {

namespace {

QString fromStd(const std::string &text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

/// The record of the thinning row that accepting thinning `t` of the stand
/// `pre` writes.
RowRecord thinningRecord(const engine::StandState &pre, const rotation::Harvest &t) {
    const engine::StandState &post = t.residual;
    RowRecord record;
    record.age = pre.age;
    record.topHeight = pre.topHeight;
    record.basalArea = post.basalArea;
    record.stocking = post.stocking;
    record.volume = post.volume;
    float basalArea = post.basalArea;
    float stocking = post.stocking;
    record.dbh = rotation::truncateToTenth(rotation::dbhFromBasalArea(basalArea, stocking));
    record.removedBasalArea = pre.basalArea - post.basalArea;
    record.removedStocking = pre.stocking - post.stocking;
    record.removedVolume = std::fabs(pre.volume - post.volume);
    record.postDbh = record.dbh;
    return record;
}

} // namespace

std::optional<QString> replayRegime(StandWork &work, const rotation::Stand &stand,
                                    const rotation::Regime &regime, int rotation,
                                    shell::IInteractive &interactive) {
    work.clear(HeaderLayout::WithMoney);
    // The fields as the stand is typed into them, grown to the final cut by one year.
    work.setField(WorkField::FromDbh, QString());
    work.SetGrowFrom(stand.age, stand.basalArea, stand.stocking, stand.height,
                     static_cast<float>(rotation), 1.0f);
    rotation::GrowthFailure failure;
    const std::optional<rotation::GrowthPath> path =
        rotation::growPath(work.grow(), stand, regime, failure, nullptr, rotation);
    if (!path) {
        return fromStd(failure.text);
    }
    const std::optional<std::string> problem = rotation::rotationProblem(*path, regime, rotation);
    const int lastAge = std::min(rotation, path->lastAge());
    std::size_t nextThinning = 0;
    for (int age = path->presentAge; age <= lastAge; ++age) {
        work.AppendGrid({path->at(age)}, 0, RowKind::Growth, text::rowLabelGrowth());
        if (nextThinning < path->thinnings.size() && path->thinnings[nextThinning].age == age &&
            age < rotation) {
            const int row = work.table().lastRow();
            work.select(row, row);
            work.WriteThinLine(thinningRecord(path->at(age), path->thinnings[nextThinning]),
                               text::rowLabelThinning(), false, interactive);
            ++nextThinning;
        }
    }
    // The site index of the last grow: each grow reads it from its stand.
    work.showSiteIndex(true);
    if (work.grow().isThinnedModel()) {
        // The grow command of a thinned model leaves its last stand in the fields.
        work.copyRowToFields(work.lastStandRow());
    }
    if (problem) {
        return fromStd(*problem);
    }
    work.fellLastStand(text::rowLabelFinalCut(), interactive);
    work.layOutCashFlow();
    return std::nullopt;
}

} // namespace arbolex::work
