#include "rotation/uncertainty.hpp"

#include "engine/vectorstate.hpp"
#include "valuation/discounting.hpp"

#include <algorithm>
#include <cmath>
#include <numbers>
#include <random>
#include <span>

namespace arbolex::rotation {

namespace {

/// Revenue and cost by age of one rotation, and how to value them moved.
class Flows {
public:
    struct Value {
        std::optional<double> npv;
        std::optional<double> lev;
    };

    Flows(const RotationHarvests &harvests, const Economics &economics)
        : m_presentAge(harvests.presentAge), m_economics(economics),
          m_carbonCounts(economics.carbon.counts()) {
        const RotationValue v = valueHarvests(harvests, economics, Appraisal::kWithoutRates);
        for (const CashFlowYear &c : v.cashflow) {
            m_revenue.push_back(c.revenue);
            m_other.push_back(c.otherRevenue);
            m_cost.push_back(c.cost);
            m_carbon.push_back(c.carbon);
        }
        m_harvests = v.thinnings;
        m_harvests.push_back(v.finalCut);
        m_net.resize(m_revenue.size());
    }

    /// Revenue by age with every harvest's volume, and so its mean tree, times
    /// `volumeFactor`: the mean tree may move to another price class.
    std::vector<double> revenueWithVolume(double volumeFactor) const {
        std::vector<double> revenue(m_revenue.size(), 0.0);
        for (const Harvest &h : m_harvests) {
            revenue[static_cast<std::size_t>(h.age)] +=
                harvestRevenue(h, m_economics, volumeFactor);
        }
        return revenue;
    }

    /// NPV and LEV with the timber revenue times `revenueFactor` (other
    /// revenues do not follow timber prices), the costs times
    /// `costFactor`, the carbon money times `carbonFactor`, at `ratePercent`.
    Value value(double revenueFactor, double costFactor, double ratePercent,
                double carbonFactor = 1.0) {
        return value(m_revenue, revenueFactor, costFactor, ratePercent, carbonFactor);
    }

    /// The same with `revenue` by age in place of the rotation's own.
    Value value(const std::vector<double> &revenue, double revenueFactor, double costFactor,
                double ratePercent, double carbonFactor = 1.0) {
        for (std::size_t a = 0; a < m_net.size(); ++a) {
            m_net[a] = revenueFactor * revenue[a] + m_other[a] - costFactor * m_cost[a];
        }
        if (m_carbonCounts) {
            // Added after the rest, as the valuation adds it.
            for (std::size_t a = 0; a < m_net.size(); ++a) {
                m_net[a] += carbonFactor * m_carbon[a];
            }
        }
        const std::span<const double> fromPresent =
            std::span<const double>(m_net).subspan(static_cast<std::size_t>(m_presentAge));
        return {valuation::netPresentValueOf(fromPresent, ratePercent),
                valuation::landExpectationValue(m_net, ratePercent)};
    }

private:
    int m_presentAge;
    Economics m_economics;
    std::vector<Harvest> m_harvests;
    std::vector<double> m_revenue;
    std::vector<double> m_other;
    std::vector<double> m_cost;
    std::vector<double> m_net;
    std::vector<double> m_carbon;
    bool m_carbonCounts;
};

/// Uniform on [0, 1) from the top 53 bits: the same numbers on every platform.
double uniform(std::mt19937_64 &engine) {
    return static_cast<double>(engine() >> 11) * 0x1.0p-53;
}

/// Standard normal by the Box–Muller transform (one of the pair is used).
double normal(std::mt19937_64 &engine) {
    const double u1 = 1.0 - uniform(engine); // in (0, 1]: its logarithm is finite
    const double u2 = uniform(engine);
    return std::sqrt(-2.0 * std::log(u1)) * std::cos(2.0 * std::numbers::pi * u2);
}

/// Percentile p (0 to 1) of sorted values, interpolated between ranks.
double percentile(const std::vector<double> &sorted, double p) {
    if (sorted.empty()) {
        return 0.0;
    }
    const double rank = p * static_cast<double>(sorted.size() - 1);
    const auto below = static_cast<std::size_t>(std::floor(rank));
    const std::size_t above = std::min(below + 1, sorted.size() - 1);
    return sorted[below] + (rank - static_cast<double>(below)) * (sorted[above] - sorted[below]);
}

Percentiles percentiles(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return {percentile(values, 0.05), percentile(values, 0.5), percentile(values, 0.95)};
}

} // namespace

std::vector<TornadoBar> tornado(const GrowthPath &path, int rotation, const Economics &economics) {
    return tornado(rotationHarvests(path, rotation), economics);
}

std::vector<TornadoBar> tornado(const RotationHarvests &harvests, const Economics &economics) {
    engine::clearUpperVectorState();
    Flows flows(harvests, economics);
    const double r = economics.ratePercent;
    struct Move {
        const char *factor;
        double revenueLow, revenueHigh, costLow, costHigh, rateLow, rateHigh;
    };
    const Move moves[] = {{"timber prices \u00b120 %", 0.8, 1.2, 1.0, 1.0, r, r},
                          {"interest rate \u00b11 point", 1.0, 1.0, 1.0, 1.0, r - 1.0, r + 1.0},
                          {"costs \u00b120 %", 1.0, 1.0, 0.8, 1.2, r, r}};
    std::vector<TornadoBar> bars;
    for (const Move &m : moves) {
        const Flows::Value low = flows.value(m.revenueLow, m.costLow, m.rateLow);
        const Flows::Value high = flows.value(m.revenueHigh, m.costHigh, m.rateHigh);
        bars.push_back({m.factor, low.npv, high.npv, low.lev, high.lev});
    }
    if (economics.carbon.counts()) {
        const Flows::Value low = flows.value(1.0, 1.0, r, 0.8);
        const Flows::Value high = flows.value(1.0, 1.0, r, 1.2);
        bars.push_back({"carbon price \u00b120 %", low.npv, high.npv, low.lev, high.lev});
    }
    // Volume moves the mean trees too, so it is valued harvest by harvest.
    const Flows::Value low = flows.value(flows.revenueWithVolume(0.9), 1.0, 1.0, r);
    const Flows::Value high = flows.value(flows.revenueWithVolume(1.1), 1.0, 1.0, r);
    bars.push_back({"volume \u00b110 %", low.npv, high.npv, low.lev, high.lev});
    return bars;
}

MonteCarloResult monteCarlo(const GrowthPath &path, int rotation, const Economics &economics,
                            const MonteCarloSettings &settings) {
    return monteCarlo(rotationHarvests(path, rotation), economics, settings);
}

MonteCarloResult monteCarlo(const RotationHarvests &harvests, const Economics &economics,
                            const MonteCarloSettings &settings) {
    engine::clearUpperVectorState();
    Flows flows(harvests, economics);
    std::mt19937_64 engine(settings.seed);
    std::vector<double> npv;
    std::vector<double> lev;
    npv.reserve(static_cast<std::size_t>(std::max(settings.draws, 0)));
    lev.reserve(npv.capacity());
    int negative = 0;
    for (int i = 0; i < settings.draws; ++i) {
        // Three numbers per draw, always drawn, so a spread of 0 leaves the
        // other draws where they were.
        const double price = std::exp(settings.priceSpread * normal(engine));
        const double rate =
            settings.rateLow + (settings.rateHigh - settings.rateLow) * uniform(engine);
        const double cost = std::exp(settings.costSpread * normal(engine));
        // A fourth number only when carbon counts: without carbon the draws
        // stay those of a valuation that never knew carbon.
        const double carbonPrice =
            economics.carbon.counts() ? std::exp(settings.carbonSpread * normal(engine)) : 1.0;
        const Flows::Value v = flows.value(price, cost, rate, carbonPrice);
        if (!v.npv || !v.lev) {
            continue; // a factor that overflows: the draw is left out
        }
        npv.push_back(*v.npv);
        lev.push_back(*v.lev);
        negative += *v.npv < 0.0 ? 1 : 0;
    }
    MonteCarloResult result;
    if (npv.empty()) {
        return result;
    }
    result.npv = percentiles(npv);
    result.lev = percentiles(lev);
    result.probabilityNpvBelowZero =
        static_cast<double>(negative) / static_cast<double>(npv.size());
    const auto [lowest, highest] = std::minmax_element(npv.begin(), npv.end());
    result.npvLowest = *lowest;
    result.npvHighest = *highest;
    const int bins = std::max(settings.bins, 1);
    result.histogram.assign(static_cast<std::size_t>(bins), 0);
    const double width = (result.npvHighest - result.npvLowest) / bins;
    for (const double x : npv) {
        const int bin = width > 0.0 ? static_cast<int>((x - result.npvLowest) / width) : 0;
        ++result.histogram[static_cast<std::size_t>(std::min(bin, bins - 1))];
    }
    return result;
}

} // namespace arbolex::rotation
