#include "rotation/optimiser.hpp"

#include "engine/vectorstate.hpp"

#include <algorithm>
#include <limits>
#include <set>
#include <tuple>

namespace arbolex::rotation {

namespace {

/// Rounds of refinement at the most; each grows only regimes not grown before.
constexpr int kRefineRounds = 6;
/// Steps of the refinement: whole years and this volume, m³/ha.
constexpr float kVolumeStep = 5.0f;

/// A thinning regime as grown: thinnings up to the age limit, the final cut
/// deciding which of them a rotation takes.
using Grid = std::tuple<int, int, float>; // first age, years between, volume

/// Same thinnings and final cut: one regime, however its interval is written.
auto identity(const Candidate &c) {
    const bool thins = c.regime.thins();
    const int until = c.regime.thinUntil.value_or(0);
    const bool several = thins && until > c.regime.thinFrom;
    return std::make_tuple(c.rotation, thins ? c.regime.thinFrom : 0, until,
                           several ? c.regime.thinEvery : 0, thins ? c.regime.thinVolume : 0.0f);
}

/// Best first; ties go to the earlier final cut, then to the lighter regime,
/// so the order never depends on the order of the search.
bool better(const Candidate &a, const Candidate &b) {
    if (a.score != b.score) {
        return a.score > b.score;
    }
    return identity(a) < identity(b);
}

class Search {
public:
    Search(const Stand &stand, const Economics &economics, const OptimiserSettings &settings)
        : m_stand(stand), m_economics(economics),
          m_settings(settings), m_limits{settings.maxRemovalShare, settings.minStocking} {}

    /// Scores every final cut of `path`: grown within the limits, it ends at
    /// the first thinning they do not allow.
    void scorePath(const GrowthPath &path, const Regime &regime) {
        const int first = regime.thins() ? regime.thinFrom + 1 : std::max(path.presentAge, 1);
        for (int r = first; r <= path.lastAge(); ++r) {
            m_candidates.push_back(
                scoreRotation(path, regime, r, m_economics, m_settings.objective));
        }
    }

    /// Grows and scores a thinning regime once; false when it was grown before.
    bool grow(const Grid &g) {
        if (!m_grown.insert(g).second) {
            return false;
        }
        const Regime regime{std::get<0>(g), std::get<1>(g), std::get<2>(g), std::nullopt};
        GrowthFailure failure;
        ++m_regimesGrown;
        // A regime the engine cannot grow is left out: its own engine keeps
        // such failures from the user's report.
        if (std::optional<GrowthPath> path =
                growPath(m_quiet, m_stand, regime, failure, &m_limits)) {
            // Valued by assortments or with its carbon, every final cut reads
            // the thinnings' classes: divided once for all of them.
            if (readsThinningClasses(m_economics) || m_settings.objective == Objective::kCarbon) {
                divideThinnings(*path);
            }
            scorePath(*path, regime);
        }
        return true;
    }

    /// The distinct thinning regimes of the best candidates.
    std::vector<Grid> bestRegimes(std::size_t count) {
        std::sort(m_candidates.begin(), m_candidates.end(), better);
        std::vector<Grid> regimes;
        for (const Candidate &c : m_candidates) {
            if (regimes.size() == count) {
                break;
            }
            if (!c.regime.thins()) {
                continue;
            }
            const Grid g{c.regime.thinFrom, c.regime.thinEvery, c.regime.thinVolume};
            if (std::find(regimes.begin(), regimes.end(), g) == regimes.end()) {
                regimes.push_back(g);
            }
        }
        return regimes;
    }

    double bestScore() const {
        double best = -std::numeric_limits<double>::infinity();
        for (const Candidate &c : m_candidates) {
            best = std::max(best, c.score);
        }
        return best;
    }

    OptimiserResult result() {
        std::sort(m_candidates.begin(), m_candidates.end(), better);
        OptimiserResult r;
        r.regimesGrown = m_regimesGrown;
        std::set<decltype(identity(Candidate{}))> seen;
        for (const Candidate &c : m_candidates) {
            if (static_cast<int>(r.best.size()) == m_settings.top) {
                break;
            }
            if (seen.insert(identity(c)).second) {
                r.best.push_back(c);
            }
        }
        return r;
    }

private:
    engine::Grow m_quiet;
    const Stand &m_stand;
    const Economics &m_economics;
    const OptimiserSettings &m_settings;
    const ThinningLimits m_limits;
    std::set<Grid> m_grown;
    std::vector<Candidate> m_candidates;
    int m_regimesGrown = 0;
};

} // namespace

std::optional<OptimiserResult> optimise(engine::Grow &grow, const Stand &stand,
                                        const Economics &economics,
                                        const OptimiserSettings &settings, GrowthFailure &failure,
                                        const Progress &progress) {
    engine::clearUpperVectorState();
    // The caller's progress callback may run any library's code (a window's
    // progress bar): the search goes on from a clean vector state.
    auto goOn = [&progress](double fraction) {
        const bool more = progress(fraction);
        engine::clearUpperVectorState();
        return more;
    };
    const std::optional<GrowthPath> unthinned = growPath(grow, stand, {}, failure);
    if (!unthinned) {
        return std::nullopt;
    }
    Search search(stand, economics, settings);
    search.scorePath(*unthinned, {});
    if (!grow.isThinnedModel() || grow.T(1) == 0.0) {
        return search.result();
    }
    const int present = unthinned->presentAge;
    const int limit = unthinned->ageLimit;
    std::vector<int> from = settings.thinFrom;
    if (from.empty()) {
        for (int a = present; a <= limit - 10; a += 3) {
            from.push_back(a);
        }
    }
    std::vector<Grid> grid;
    for (const int f : from) {
        for (const int e : settings.thinEvery) {
            for (const float v : settings.thinVolume) {
                grid.emplace_back(f, e, v);
            }
        }
    }
    // Progress counts the grid, then each round of refinement as one more share.
    const double shares = static_cast<double>(grid.size()) + (settings.refine ? kRefineRounds : 0);
    for (std::size_t i = 0; i < grid.size(); ++i) {
        search.grow(grid[i]);
        if (progress && !goOn(static_cast<double>(i + 1) / shares)) {
            OptimiserResult r = search.result();
            r.completed = false;
            return r;
        }
    }
    for (int round = 0; settings.refine && round < kRefineRounds; ++round) {
        const double before = search.bestScore();
        bool grewAny = false;
        for (const auto &[f0, e0, v0] :
             search.bestRegimes(static_cast<std::size_t>(settings.top))) {
            for (int df = -2; df <= 2; ++df) {
                for (int de = -1; de <= 1; ++de) {
                    for (int dv = -2; dv <= 2; ++dv) {
                        const int f = f0 + df;
                        const int e = e0 + de;
                        const float v = v0 + static_cast<float>(dv) * kVolumeStep;
                        if (f >= present && f < limit && e >= 1 && v > 0.0f) {
                            grewAny = search.grow({f, e, v}) || grewAny;
                        }
                    }
                }
            }
        }
        if (progress && !goOn((static_cast<double>(grid.size()) + round + 1) / shares)) {
            OptimiserResult r = search.result();
            r.completed = false;
            return r;
        }
        if (!grewAny || !(search.bestScore() > before)) {
            break;
        }
    }
    if (progress) {
        progress(1.0);
    }
    return search.result();
}

} // namespace arbolex::rotation
