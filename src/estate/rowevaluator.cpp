#include "estate/rowevaluator.hpp"

#include "engine/catalogue.hpp"
#include "engine/modeldescription.hpp"
#include "engine/vectorstate.hpp"
#include "rotation/standchecks.hpp"

#include <cmath>

namespace arbolex::estate {

namespace {

std::int64_t whole(double x) {
    return static_cast<std::int64_t>(std::llround(x));
}

} // namespace

const char *statusWord(RowStatus status) {
    switch (status) {
    case RowStatus::kOk:
        return "ok";
    case RowStatus::kRefused:
        return "refused";
    case RowStatus::kFailed:
        return "failed";
    }
    return "";
}

void RowEvaluator::RowReport::showMessage(std::string_view /*title*/, std::string_view text,
                                          int /*style*/) {
    if (row != nullptr && row->message.empty()) {
        row->message = std::string(text);
    }
}

void RowEvaluator::RowReport::logError(std::string_view message) {
    if (row != nullptr) {
        row->logLines.emplace_back(message);
    }
}

RowEvaluator::RowEvaluator(const Layout &layout, const EstateDefaults &defaults)
    : m_layout(layout), m_defaults(defaults), m_grow(&m_report) {}

RowResult RowEvaluator::evaluate(const RowValues &values) {
    engine::clearUpperVectorState();
    RowResult result;
    auto planned = planRow(m_layout, values, m_defaults);
    if (auto *fault = std::get_if<std::string>(&planned)) {
        result.status = RowStatus::kRefused;
        result.message = std::move(*fault);
        // A row refused for another value still names its model.
        if (const auto model = modelOf(m_layout, values)) {
            result.modelLabel = engine::catalogue()[static_cast<std::size_t>(*model)].label;
        }
        return result;
    }
    const RowPlan &plan = std::get<RowPlan>(planned);
    result.areaHa = plan.areaHa;
    // Each row starts from an engine as `rotation` finds it: the volume
    // correction factor follows the site index current when a model is
    // chosen, and must not be the previous row's.
    m_grow = engine::Grow(&m_report);
    m_grow.GetModel(plan.stand.model);
    result.modelLabel = m_grow.label();
    result.species = std::string(engine::speciesCode(plan.stand.model));
    if (auto fault = rotation::standFault(plan.stand, m_grow.maxTopHeight())) {
        result.status = RowStatus::kRefused;
        result.message = std::move(*fault);
        return result;
    }
    m_report.row = &result;
    grow(plan, result);
    m_report.row = nullptr;
    return result;
}

void RowEvaluator::grow(const RowPlan &plan, RowResult &result) {
    const unsigned faultsBefore = m_grow.faultCount();
    rotation::GrowthFailure failure;
    // The whole path, to the model's age limit, whatever the final cut: the
    // economic rotation is looked for over it, and the yield class is the
    // stand's productivity over it, not only up to an early final cut.
    const std::optional<rotation::GrowthPath> path =
        rotation::growPath(m_grow, plan.stand, plan.regime, failure);
    if (!path) {
        result.status = failure.badInput ? RowStatus::kRefused : RowStatus::kFailed;
        // The engine's own message, when it gave one, says more.
        if (failure.badInput || result.message.empty()) {
            result.message = failure.text;
        }
        return;
    }
    result.siteIndex = path->siteIndex;
    const rotation::RotationChoice choice =
        rotation::chooseRotation(*path, plan.regime, m_defaults.economics, plan.rotation);
    if (choice.problem) {
        result.status = RowStatus::kRefused;
        result.message = *choice.problem;
        return;
    }
    const rotation::RotationValue value = rotation::valueRotation(
        *path, choice.age, m_defaults.economics, rotation::Appraisal::kWithoutRates);
    if (m_grow.faultCount() != faultsBefore) {
        result.status = RowStatus::kFailed;
        return;
    }
    const int presentYear = m_defaults.year - path->presentAge;
    for (const rotation::Harvest &t : value.thinnings) {
        result.thinningVolume += double{t.volume};
        result.harvests.push_back({presentYear + t.age,
                                   whole(double{t.volume} * plan.areaHa * 1000.0), 0,
                                   whole(t.revenue * plan.areaHa * 100.0), 0, 0});
    }
    const rotation::Harvest &f = value.finalCut;
    result.harvests.push_back({presentYear + f.age, 0,
                               whole(double{f.volume} * plan.areaHa * 1000.0),
                               whole(f.revenue * plan.areaHa * 100.0), 0, 0});
    carbon(value.carbon, path->presentAge, presentYear, plan.areaHa, result);
    result.npvCarbon = value.npvCarbon;
    result.thinningCount = static_cast<int>(value.thinnings.size());
    result.yieldClass = rotation::pathYieldClass(*path);
    result.finalCutAge = f.age;
    result.finalCutYear = presentYear + f.age;
    result.finalCutVolume = f.volume;
    result.maxMai = value.maxMai;
    result.finalCutMai = value.mai;
    result.npv = value.npv;
    result.lev = value.lev;
    result.forestValue = value.forestValue;
}

void RowEvaluator::carbon(const carbon::Account &account, int presentAge, int presentYear,
                          double areaHa, RowResult &result) {
    if (account.years.size() <= static_cast<std::size_t>(presentAge)) {
        return;
    }
    const carbon::AccountYear &today = account.years[static_cast<std::size_t>(presentAge)];
    result.hasCarbon = true;
    result.carbonStock = today.trees + today.harvested;
    result.carbonLongTermAverage = account.longTermAverage;
    result.carbonUnits = account.unitsTotal;
    // The years from today on: what is removed and issued before it is past.
    for (std::size_t a = static_cast<std::size_t>(presentAge); a < account.years.size(); ++a) {
        const carbon::AccountYear &y = account.years[a];
        result.harvests.push_back({presentYear + y.age, 0, 0, 0,
                                   whole(y.netRemoval * areaHa * 1000.0),
                                   whole(y.units * areaHa * 1000.0)});
    }
}

} // namespace arbolex::estate
