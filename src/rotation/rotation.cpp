#include "rotation/rotation.hpp"

#include "engine/vectorstate.hpp"
#include "format/displayformat.hpp"
#include "rotation/growcommand.hpp"
#include "rotation/optimiser.hpp"
#include "rotation/standchecks.hpp"
#include "rotation/yieldclass.hpp"
#include "valuation/discounting.hpp"

#include <algorithm>
#include <cmath>
#include <limits>
#include <span>

namespace arbolex::rotation {

namespace {

std::string ageText(int age) {
    return std::to_string(age);
}

/// Last thinning age the regime names below `ageLimit`, or std::nullopt.
std::optional<int> lastThinningAge(const Regime &regime, int ageLimit) {
    if (!regime.thins()) {
        return std::nullopt;
    }
    const int last = std::min(regime.thinUntil.value_or(ageLimit - 1), ageLimit - 1);
    if (last < regime.thinFrom) {
        return std::nullopt;
    }
    return regime.thinFrom + (last - regime.thinFrom) / regime.thinEvery * regime.thinEvery;
}

/// Mean tree volume, m³: volume over the whole number of trees, 0 without trees.
double meanTree(float volume, float stocking) {
    const double trees = std::nearbyint(double{stocking});
    return trees > 0.0 ? double{volume} / trees : 0.0;
}

/// Stand volume removed by the thinnings before `age`, m³/ha.
double removedBefore(const GrowthPath &path, int age) {
    double removed = 0.0;
    for (const Harvest &t : path.thinnings) {
        if (t.age < age) {
            removed += double{t.volume};
        }
    }
    return removed;
}

double meanAnnualIncrement(const GrowthPath &path, int age) {
    return age > 0 ? (double{path.at(age).volume} + removedBefore(path, age)) / age : 0.0;
}

/// meanAnnualIncrement of every age from `from` to `to`, appended to `mai`:
/// the thinnings' volumes summed once, oldest first, as removedBefore sums
/// them for each age.
void meanAnnualIncrements(const GrowthPath &path, int from, int to, std::vector<double> &mai) {
    mai.reserve(mai.size() + static_cast<std::size_t>(std::max(0, to - from + 1)));
    double removed = 0.0;
    auto next = path.thinnings.begin();
    for (int a = from; a <= to; ++a) {
        while (next != path.thinnings.end() && next->age < a) {
            removed += double{next->volume};
            ++next;
        }
        mai.push_back(a > 0 ? (double{path.at(a).volume} + removed) / a : 0.0);
    }
}

/// Cash flow by age 0..rotation: timber revenue, other revenues, costs and
/// their net.
struct Flows {
    std::vector<double> revenue;
    std::vector<double> other;
    std::vector<double> cost;
    std::vector<double> net;
    /// What carbon earns by age, and the net without it; empty unless
    /// carbon counts.
    std::vector<double> carbon;
    std::vector<double> timberNet;
};

/// `carbon` (what carbon earns by age, 0 to the rotation) counts in the net
/// when it is not empty.
Flows cashFlows(const std::vector<Harvest> &harvests, int rotation, const Economics &economics,
                std::vector<double> carbon = {}) {
    const auto years = static_cast<std::size_t>(rotation) + 1;
    Flows f{std::vector<double>(years, 0.0),
            std::vector<double>(years, 0.0),
            std::vector<double>(years, 0.0),
            std::vector<double>(years, 0.0),
            {},
            {}};
    for (std::size_t a = 0; a < years; ++a) {
        f.cost[a] = a == 0 ? economics.establishmentCost : economics.annualCost;
    }
    // An entry counts in every rotation that reaches its age.
    for (const CashFlowEntry &e : economics.entries) {
        if (e.age >= 0 && e.age <= rotation) {
            const auto a = static_cast<std::size_t>(e.age);
            f.cost[a] += e.cost;
            f.other[a] += e.otherRevenue;
        }
    }
    for (const Harvest &h : harvests) {
        f.revenue[static_cast<std::size_t>(h.age)] += h.revenue;
    }
    // Revenues first, then the costs, as the cash-flow window sums a year.
    for (std::size_t a = 0; a < years; ++a) {
        f.net[a] = f.revenue[a] + f.other[a] - f.cost[a];
    }
    if (carbon.size() == years) {
        f.timberNet = f.net;
        for (std::size_t a = 0; a < years; ++a) {
            f.net[a] += carbon[a];
        }
        f.carbon = std::move(carbon);
    }
    return f;
}

struct Figures {
    std::optional<double> npv;
    std::optional<double> lev;
    std::optional<double> forestValue;
};

Figures figures(const std::vector<double> &net, int presentAge, double ratePercent) {
    Figures out;
    const std::span<const double> fromPresent =
        std::span<const double>(net).subspan(static_cast<std::size_t>(presentAge));
    out.npv = valuation::netPresentValueOf(fromPresent, ratePercent);
    out.lev = valuation::landExpectationValue(net, ratePercent);
    if (out.lev) {
        // The forest value adds the LEV to the same net present value.
        const int yearsToFinalCut =
            fromPresent.empty() ? 0 : static_cast<int>(fromPresent.size()) - 1;
        out.forestValue = valuation::forestValue(out.npv, yearsToFinalCut, *out.lev, ratePercent);
    }
    return out;
}

Figures figures(const Flows &f, int presentAge, double ratePercent) {
    return figures(f.net, presentAge, ratePercent);
}

/// What carbon earns by age in the rotation felled at `rotation` on `path`;
/// empty unless carbon counts.
std::vector<double> carbonMoney(const GrowthPath &path, int rotation, const Economics &economics) {
    if (!economics.carbon.counts()) {
        return {};
    }
    return carbon::carbonCashFlow(
        rotationCarbon(rotationHarvests(path, rotation), economics.carbonParameters),
        economics.carbon, economics.carbonParameters, economics.ratePercent);
}

/// Values `h` as `economics` says; valued by assortments, the harvest is
/// first divided into its classes by `volumeRatio` unless it was `divided`
/// before.
void price(Harvest &h, const engine::VolumeRatioCoefficients &volumeRatio,
           const Economics &economics, bool divided) {
    if (economics.valuation == Valuation::kAssortments && !divided) {
        h.assortments = divideHarvest(h.volume, h.basalArea, h.stocking, volumeRatio);
    }
    h.revenue = harvestRevenue(h, economics);
}

/// Thinnings before `rotation` and the final cut at it, valued.
std::vector<Harvest> harvests(const GrowthPath &path, int rotation, const Economics &economics,
                              Harvest &finalCut) {
    std::vector<Harvest> all;
    for (const Harvest &t : path.thinnings) {
        if (t.age < rotation) {
            all.push_back(t);
            price(all.back(), path.volumeRatio, economics, path.thinningsDivided);
        }
    }
    finalCut = finalCutHarvest(rotation, path.at(rotation));
    price(finalCut, path.volumeRatio, economics, false);
    all.push_back(finalCut);
    return all;
}

} // namespace

double removedMeanTree(float removedVolume, float removedStocking) {
    return removedVolume > 0.0f ? meanTree(removedVolume, std::fabs(removedStocking)) : 0.0;
}

double felledMeanTree(float volume, float stocking) {
    return volume > 0.0f ? format::shownValue(meanTree(volume, stocking), kMeanTreeCell) : 0.0;
}

Harvest thinningHarvest(int age, float volume, float stocking, float basalArea,
                        const engine::StandState &residual) {
    Harvest t;
    t.age = age;
    t.volume = volume;
    t.stocking = stocking;
    t.basalArea = basalArea;
    t.meanTreeVolume = removedMeanTree(volume, stocking);
    t.priceClass = priceClassOf(t.meanTreeVolume);
    t.residual = residual;
    return t;
}

Harvest finalCutHarvest(int age, const engine::StandState &crop) {
    Harvest finalCut;
    finalCut.age = age;
    finalCut.volume = crop.volume;
    finalCut.stocking = crop.stocking;
    finalCut.basalArea = crop.basalArea;
    finalCut.meanTreeVolume = felledMeanTree(crop.volume, crop.stocking);
    finalCut.priceClass = priceClassOf(finalCut.meanTreeVolume);
    return finalCut;
}

double harvestRevenue(const Harvest &harvest, const Economics &economics, double volumeFactor) {
    if (economics.valuation == Valuation::kAssortments) {
        return volumeFactor * assortmentRevenue(harvest.assortments, economics.assortmentPrices);
    }
    const int k = priceClassOf(harvest.meanTreeVolume * volumeFactor);
    return volumeFactor * double{harvest.volume} * economics.prices[static_cast<std::size_t>(k)];
}

int modelAgeLimit(std::int16_t model) {
    return model == 7 ? 58 : 60;
}

std::optional<std::string> regimeProblem(const Regime &regime, int presentAge, int ageLimit) {
    if (!regime.thins()) {
        return std::nullopt;
    }
    if (regime.thinEvery < 1) {
        return "the years between thinnings must be 1 or more";
    }
    if (!(regime.thinVolume > 0.0f)) {
        return "the volume of a thinning must be above 0 m3/ha";
    }
    if (regime.thinFrom < presentAge) {
        return "the first thinning (age " + ageText(regime.thinFrom) +
               ") is before the present age " + ageText(presentAge);
    }
    if (regime.thinFrom >= ageLimit) {
        return "the first thinning (age " + ageText(regime.thinFrom) +
               ") is not before the model's age limit " + ageText(ageLimit);
    }
    if (regime.thinUntil && *regime.thinUntil < regime.thinFrom) {
        return "the last thinning (age " + ageText(*regime.thinUntil) +
               ") is before the first (age " + ageText(regime.thinFrom) + ")";
    }
    return std::nullopt;
}

std::optional<std::string> rotationProblem(const GrowthPath &path, const Regime &regime,
                                           int rotation) {
    if (rotation > path.ageLimit) {
        return "the rotation (age " + ageText(rotation) + ") is past the model's age limit " +
               ageText(path.ageLimit);
    }
    if (rotation > path.lastAge() && path.stop && !path.stop->text.empty()) {
        // The window refuses to go on where the path stops.
        return path.stop->text;
    }
    if (rotation < path.presentAge || rotation < 1) {
        return "the rotation (age " + ageText(rotation) + ") is before the present age " +
               ageText(path.presentAge);
    }
    if (regime.thins()) {
        // Without a last thinning the regime stops before the final cut by
        // itself; with one, every thinning it names must come before it.
        const int thinsAt = regime.thinUntil
                                ? regime.thinFrom + (*regime.thinUntil - regime.thinFrom) /
                                                        regime.thinEvery * regime.thinEvery
                                : regime.thinFrom;
        if (thinsAt >= rotation) {
            return "the regime thins at age " + ageText(thinsAt) +
                   ", not before the final cut at age " + ageText(rotation);
        }
    }
    return std::nullopt;
}

namespace {

/// The engine's reports passed on as they are, the text of the last message
/// kept: a rotation refused because the engine failed says what the window
/// would have shown.
class KeepingLastMessage : public engine::IEngineReport {
public:
    explicit KeepingLastMessage(engine::Grow &grow) : m_grow(grow), m_next(grow.report()) {
        m_grow.setReport(this);
    }
    ~KeepingLastMessage() override { m_grow.setReport(m_next); }
    KeepingLastMessage(const KeepingLastMessage &) = delete;
    KeepingLastMessage &operator=(const KeepingLastMessage &) = delete;

    void showMessage(std::string_view title, std::string_view text, int style) override {
        m_last = text;
        if (m_next != nullptr) {
            m_next->showMessage(title, text, style);
        }
    }
    void logError(std::string_view message) override {
        if (m_last.empty()) {
            m_last = message;
        }
        if (m_next != nullptr) {
            m_next->logError(message);
        }
    }
    /// The last message, or `otherwise` when the engine showed none.
    std::string lastOr(std::string_view otherwise) const {
        return m_last.empty() ? std::string(otherwise) : m_last;
    }

private:
    engine::Grow &m_grow;
    engine::IEngineReport *m_next;
    std::string m_last;
};

} // namespace

std::optional<GrowthPath> growPath(engine::Grow &grow, const Stand &stand, const Regime &regime,
                                   GrowthFailure &failure, const ThinningLimits *limits,
                                   std::optional<int> finalCut) {
    engine::clearUpperVectorState();
    KeepingLastMessage messages(grow);
    const unsigned faultsBefore = grow.faultCount();
    const auto engineFailed = [&](std::string_view text) {
        failure = {false, messages.lastOr(text)};
        return std::nullopt;
    };
    // The model chosen with the stand's site index in force, as the window
    // does when the model is chosen again after the stand is typed: the
    // correction factor follows the site index current at selection.
    grow.GetModel(stand.model);
    grow.SiteIndex(stand.age, stand.height);
    grow.GetVCF();
    GrowthPath path;
    path.model = stand.model;
    path.ageLimit = modelAgeLimit(stand.model);
    path.volumeRatio = grow.volumeRatio();
    if (auto fault = standFault(stand, grow.maxTopHeight())) {
        failure = {true, std::move(*fault)};
        return std::nullopt;
    }
    const auto presentAge = static_cast<int>(std::nearbyint(stand.age));
    if (presentAge > path.ageLimit) {
        failure = {true, "the stand (age " + ageText(presentAge) +
                             ") is past the model's age limit " + ageText(path.ageLimit)};
        return std::nullopt;
    }
    if (const auto problem = regimeProblem(regime, presentAge, path.ageLimit)) {
        failure = {true, *problem};
        return std::nullopt;
    }
    if (regime.thins() && !grow.isThinnedModel()) {
        failure = {true, "model " + ageText(stand.model) + " (" + grow.label() +
                             ") has no thinning response: it cannot be thinned"};
        return std::nullopt;
    }

    // The model's coefficients stay those of the stand's model along the path.
    const float maxTopHeight = grow.maxTopHeight();
    const int growTo = finalCut ? std::min(*finalCut, path.ageLimit) : path.ageLimit;
    const std::optional<int> lastThinning = lastThinningAge(regime, growTo);
    int nextThinning = regime.thinFrom;
    path.years.reserve(static_cast<std::size_t>(std::max(0, growTo - presentAge)) + 2);
    // Each press of Grow: from its stand (the typed one, then each thinned
    // one, exact as the table keeps it) to the next thinning or the end.
    engine::StandState from{stand.age, stand.basalArea, stand.stocking, stand.height, 0.0f};
    bool first = true;
    while (true) {
        const bool thinning = lastThinning && nextThinning <= *lastThinning;
        const int target = thinning ? nextThinning : growTo;
        if (!first) {
            // The window checks what its fields show of the thinned stand.
            if (auto fault = shownGrowFromFault(from, static_cast<float>(target), maxTopHeight,
                                                path.ageLimit)) {
                path.stop = GrowthPath::Stop{static_cast<int>(from.age), std::move(fault->text)};
                break;
            }
        }
        // The states go straight onto the path; the first is where the
        // projection started from, which after a thinning the path holds as
        // the state before it.
        const std::size_t start = path.years.size();
        const Growth growth =
            growStand(grow, from.age, from.basalArea, from.stocking, from.topHeight,
                      static_cast<float>(target), 1.0f, path.years);
        if (!growth.projected || grow.faultCount() != faultsBefore) {
            return engineFailed(standtext::kProjectionFailed);
        }
        if (first) {
            path.presentAge = static_cast<int>(growth.age);
            path.siteIndex = growth.siteIndex;
            first = false;
        } else {
            path.years.erase(path.years.begin() + static_cast<std::ptrdiff_t>(start));
        }
        if (!thinning) {
            break;
        }
        const engine::StandState pre = path.years.back();
        if (limits != nullptr &&
            double{regime.thinVolume} > limits->maxRemovalShare * double{pre.volume}) {
            path.stop = GrowthPath::Stop{target, {}, true};
            break;
        }
        const VolumeThinningStep step = thinByVolume(grow, pre, double{regime.thinVolume});
        if (step.thinned.outcome == engine::VolumeThinningOutcome::kSolverFailed ||
            grow.faultCount() != faultsBefore) {
            path.stop = GrowthPath::Stop{target, messages.lastOr(standtext::kProjectionFailed)};
            break;
        }
        if (step.refusal) {
            path.stop = GrowthPath::Stop{target, *step.refusal};
            break;
        }
        if (limits != nullptr && step.thinned.stocking < limits->minStocking) {
            path.stop = GrowthPath::Stop{target, {}, true};
            break;
        }
        const Harvest t = thinningHarvest(target, std::fabs(pre.volume - step.thinned.volume),
                                          pre.stocking - step.thinned.stocking,
                                          pre.basalArea - step.thinned.basalArea,
                                          {pre.age, step.thinned.basalArea, step.thinned.stocking,
                                           pre.topHeight, step.thinned.volume});
        path.thinnings.push_back(t);
        from = t.residual;
        nextThinning += regime.thinEvery;
    }
    return path;
}

int pathYieldClass(const GrowthPath &path) {
    std::vector<double> mai;
    meanAnnualIncrements(path, path.presentAge, path.lastAge(), mai);
    return yieldClass(mai);
}

void divideThinnings(GrowthPath &path) {
    engine::clearUpperVectorState();
    for (Harvest &t : path.thinnings) {
        t.assortments = divideHarvest(t.volume, t.basalArea, t.stocking, path.volumeRatio);
    }
    path.thinningsDivided = true;
}

bool readsThinningClasses(const Economics &economics) {
    return economics.valuation == Valuation::kAssortments || economics.carbon.counts();
}

RotationHarvests rotationHarvests(const GrowthPath &path, int rotation) {
    RotationHarvests h;
    h.model = path.model;
    h.presentAge = path.presentAge;
    h.rotation = rotation;
    h.standing.reserve(static_cast<std::size_t>(std::max(0, rotation - path.presentAge + 1)));
    for (int a = path.presentAge; a <= rotation; ++a) {
        h.standing.push_back(path.at(a).volume);
    }
    h.volumeRatio = path.volumeRatio;
    h.thinningsDivided = path.thinningsDivided;
    for (const Harvest &t : path.thinnings) {
        if (t.age < rotation) {
            h.thinnings.push_back(t);
        }
    }
    h.finalCut = finalCutHarvest(rotation, path.at(rotation));
    return h;
}

RotationValue valueHarvests(const RotationHarvests &harvests, const Economics &economics,
                            Appraisal appraisal) {
    engine::clearUpperVectorState();
    RotationValue v;
    const int rotation = harvests.rotation;
    v.rotation = rotation;
    v.thinnings = harvests.thinnings;
    double removed = 0.0;
    for (Harvest &t : v.thinnings) {
        price(t, harvests.volumeRatio, economics, harvests.thinningsDivided);
        removed += double{t.volume};
    }
    v.finalCut = harvests.finalCut;
    price(v.finalCut, harvests.volumeRatio, economics, false);
    std::vector<Harvest> all = v.thinnings;
    all.push_back(v.finalCut);
    if (economics.carbonAccount || economics.carbon.counts()) {
        v.carbon = rotationCarbon(harvests, economics.carbonParameters);
    }
    const bool carbonCounts = economics.carbon.counts() && !v.carbon.years.empty();
    const Flows f = cashFlows(all, rotation, economics,
                              carbonCounts ? carbon::carbonCashFlow(v.carbon, economics.carbon,
                                                                    economics.carbonParameters,
                                                                    economics.ratePercent)
                                           : std::vector<double>{});
    for (int a = 0; a <= rotation; ++a) {
        const auto i = static_cast<std::size_t>(a);
        v.cashflow.push_back(
            {a, f.cost[i], f.revenue[i], f.other[i], carbonCounts ? f.carbon[i] : 0.0});
    }
    // Total production: the crop felled and everything thinned before it.
    v.mai = rotation > 0 ? (double{v.finalCut.volume} + removed) / rotation : 0.0;
    const Figures fig = figures(f, harvests.presentAge, economics.ratePercent);
    v.npv = fig.npv;
    v.lev = fig.lev;
    v.forestValue = fig.forestValue;
    if (carbonCounts) {
        const Figures timber = figures(f.timberNet, harvests.presentAge, economics.ratePercent);
        const Figures carbon = figures(f.carbon, harvests.presentAge, economics.ratePercent);
        v.npvTimber = timber.npv;
        v.levTimber = timber.lev;
        v.npvCarbon = carbon.npv;
        v.levCarbon = carbon.lev;
    } else {
        v.npvTimber = v.npv;
        v.levTimber = v.lev;
        v.npvCarbon = 0.0;
        v.levCarbon = v.lev ? std::optional<double>(0.0) : std::nullopt;
    }
    if (v.lev) {
        v.eaa = valuation::equivalentAnnualAnnuity(*v.lev, economics.ratePercent);
    }
    if (appraisal == Appraisal::kWithoutRates) {
        return v;
    }
    v.irr = valuation::internalRateOfReturn(f.net);
    // Other revenues and carbon do not follow timber prices: they lower the
    // costs the timber must pay for.
    std::vector<double> netCost(f.cost.size());
    for (std::size_t a = 0; a < netCost.size(); ++a) {
        netCost[a] = f.cost[a] - f.other[a] - (carbonCounts ? f.carbon[a] : 0.0);
    }
    v.breakEvenPriceFactor =
        valuation::breakEvenPriceFactor(f.revenue, netCost, economics.ratePercent);
    return v;
}

RotationValue valueRotation(const GrowthPath &path, int rotation, const Economics &economics,
                            Appraisal appraisal) {
    RotationValue v = valueHarvests(rotationHarvests(path, rotation), economics, appraisal);
    std::vector<double> mai;
    meanAnnualIncrements(path, path.presentAge, rotation, mai);
    v.maxMai = mai.empty() ? 0.0 : *std::max_element(mai.begin(), mai.end());
    v.yieldClass = yieldClass(mai);
    return v;
}

int firstRotation(const GrowthPath &path, const Regime &regime) {
    const std::optional<int> last =
        regime.thinUntil ? lastThinningAge(regime, path.ageLimit)
                         : (regime.thins() ? std::optional<int>(regime.thinFrom) : std::nullopt);
    return std::max({path.presentAge, last ? *last + 1 : 0, 1});
}

RotationExplorer exploreRotations(const GrowthPath &given, const Regime &regime,
                                  const Economics &economics) {
    engine::clearUpperVectorState();
    // Every final cut reads the thinnings' classes: divided once here, not
    // again at every age.
    std::optional<GrowthPath> divided;
    if (!given.thinningsDivided && !given.thinnings.empty() && readsThinningClasses(economics)) {
        divided = given;
        divideThinnings(*divided);
    }
    const GrowthPath &path = divided ? *divided : given;
    RotationExplorer e;
    double bestMai = -std::numeric_limits<double>::infinity();
    double bestLev = -std::numeric_limits<double>::infinity();
    // A path that ended early (limits, or grown for one final cut) has no later ages.
    for (int r = firstRotation(path, regime); r <= path.lastAge(); ++r) {
        Harvest finalCut;
        const Flows f = cashFlows(harvests(path, r, economics, finalCut), r, economics,
                                  carbonMoney(path, r, economics));
        const Figures fig = figures(f, path.presentAge, economics.ratePercent);
        RotationRow row{r,       finalCut.volume, meanAnnualIncrement(path, r),
                        fig.npv, fig.lev,         fig.forestValue};
        // The earliest age wins a tie.
        if (row.mai > bestMai) {
            bestMai = row.mai;
            e.biologicalRotation = r;
        }
        if (row.lev && *row.lev > bestLev) {
            bestLev = *row.lev;
            e.economicRotation = r;
        }
        e.rows.push_back(row);
    }
    return e;
}

RotationChoice chooseRotation(const GrowthPath &path, const Regime &regime,
                              const Economics &economics, std::optional<int> rotation) {
    RotationChoice choice;
    choice.age = rotation ? *rotation : exploreRotations(path, regime, economics).economicRotation;
    if (!rotation && choice.age == 0 && path.stop && !path.stop->text.empty()) {
        // No rotation to value: the window refuses the regime before any.
        choice.problem = path.stop->text;
        return choice;
    }
    choice.problem = rotationProblem(path, regime, choice.age);
    return choice;
}

Candidate scoreRotation(const GrowthPath &path, const Regime &regime, int rotation,
                        const Economics &economics, Objective objective) {
    engine::clearUpperVectorState();
    Candidate c;
    c.rotation = rotation;
    Harvest finalCut;
    const std::vector<Harvest> all = harvests(path, rotation, economics, finalCut);
    c.regime = regime;
    if (all.size() > 1) {
        c.regime.thinUntil = all[all.size() - 2].age;
    } else {
        c.regime = {};
    }
    c.volume = meanAnnualIncrement(path, rotation) * rotation;
    std::vector<double> carbonFlow;
    if (economics.carbon.counts() || objective == Objective::kCarbon) {
        const carbon::Account account =
            rotationCarbon(rotationHarvests(path, rotation), economics.carbonParameters);
        c.carbonStock = account.longTermAverage;
        if (economics.carbon.counts()) {
            carbonFlow = carbon::carbonCashFlow(account, economics.carbon,
                                                economics.carbonParameters, economics.ratePercent);
        }
    }
    const Figures fig = figures(cashFlows(all, rotation, economics, std::move(carbonFlow)),
                                path.presentAge, economics.ratePercent);
    c.npv = fig.npv.value_or(-std::numeric_limits<double>::infinity());
    c.lev = fig.lev.value_or(-std::numeric_limits<double>::infinity());
    c.score = objective == Objective::kLev      ? c.lev
              : objective == Objective::kNpv    ? c.npv
              : objective == Objective::kCarbon ? c.carbonStock
                                                : c.volume;
    return c;
}

} // namespace arbolex::rotation
