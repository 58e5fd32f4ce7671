// Site index, the state transform and its projection between ages.
//
// Basal area G, stocking N and top height H map by a power transform to a
// state z = (z1, z2, z3) in which growth is linear; the modal form splits the
// step into two eigen-directions (rates S2, S3) and the height direction.
#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/vectorstate.hpp"

#include <array>
#include <charconv>
#include <cmath>
#include <string_view>

namespace arbolex::engine {

namespace {

/// Models whose rate is scaled when it falls below S10. The list is kept
/// empty on purpose: no catalogue entry is site-scaled today. The candidates
/// once considered stand beside it and are not consulted.
constexpr std::string_view kSiteScaledModels;
[[maybe_unused]] constexpr std::string_view kSiteScaleCandidates = "+14+15+20+21+";

bool isSiteScaled(int modelId) {
    // The identifier is searched between two "+" signs.
    std::array<char, 16> key{'+'};
    char *end = std::to_chars(key.data() + 1, key.data() + key.size() - 1, modelId).ptr;
    *end++ = '+';
    const std::string_view needle(key.data(), static_cast<std::size_t>(end - key.data()));
    return kSiteScaledModels.find(needle) != std::string_view::npos;
}

} // namespace

bool Grow::SiteIndex(float A, float H) {
    clearUpperVectorState();
    try {
        const double b = S(1);
        const double K = S(6);
        const double t0 = S(7);
        const double r = checked::div(30.0 - t0, A - t0);
        const double remaining = 1.0 - checked::div(checked::pow(H, b), K);
        const double si =
            checked::pow(K * (1.0 - checked::pow(remaining, r)), checked::div(1.0, b));
        m_siteIndex = checked::single(si);
    } catch (const RuntimeFault &fault) {
        // The caller shows an empty site index; the failure goes to the log.
        m_siteIndex = 0.0f;
        reportFault(fault, {}, {}, " in Grow.SiteIndex()");
        return false;
    }
    return m_siteIndex > 0.0f;
}

float Grow::computeRate(float siteIndex) const {
    const double b = S(1);
    const double K = S(6);
    const double t0 = S(7);
    const double remaining = 1.0 - checked::div(checked::pow(siteIndex, b), K);
    return checked::single(checked::div(-checked::log(remaining), 30.0 - t0));
}

float Grow::rate(float siteIndex) const {
    clearUpperVectorState();
    try {
        return rateOf(siteIndex);
    } catch (const RuntimeFault &) {
        return 0.0f;
    }
}

void Grow::makeTransition(float SI) {
    clearUpperVectorState();
    try {
        const double rho = rateOf(SI);
        const double e[2] = {checked::exp(S(2) * rho), checked::exp(S(3) * rho)};
        m_s[7] = checked::single(checked::exp(-rho)); // S8
        // Y[k][j] multiplies z_j in w_k; X[i][k] multiplies w_k in z_i'.
        const double Y[2][3] = {{S(23), S(25), S(27)}, {S(24), S(26), S(28)}};
        const double X[2][2] = {{S(29), S(31)}, {S(30), S(32)}};
        const double W[2] = {S(33), S(34)};
        const double s8 = S(8);
        for (std::size_t i = 0; i < 2; ++i) {
            for (std::size_t j = 0; j < 3; ++j) {
                double forwardSum = 0.0;
                double backwardSum = 0.0;
                for (std::size_t k = 0; k < 2; ++k) {
                    forwardSum += X[i][k] * e[k] * Y[k][j];
                    backwardSum += checked::div(X[i][k] * Y[k][j], e[k]);
                }
                m_m1[i][j] = checked::single(forwardSum);
                m_m2[i][j] = checked::single(backwardSum);
            }
            m_m1[i][2] = checked::single(m_m1[i][2] + W[i] * s8);
            m_m2[i][2] = checked::single(m_m2[i][2] + checked::div(W[i], s8));
        }
    } catch (const RuntimeFault &fault) {
        reportFault(fault, titles::kArbolex,
                    "ERROR - Unable to make transition matrix: ", " in Grow.TM()");
    }
}

Grow::State3 Grow::forward(float G, float N, float H) const {
    using checked::pow;
    const double g = G;
    const double n = N;
    const double h = H;
    return {pow(g, S(11)) * pow(n, S(13)) * pow(h, S(15)) - S(4),
            pow(g, S(12)) * pow(n, S(14)) * pow(h, S(16)) - S(5), pow(h, S(1)) - S(6)};
}

bool Grow::invertible(const State3 &z) const {
    // Each base is rounded to single precision before it is tested.
    return checked::single(S(4) + z.z1) > 0.0f && checked::single(S(5) + z.z2) > 0.0f &&
           checked::single(S(6) + z.z3) > 0.0f;
}

void Grow::applyStep(const State3 &z, double f1, double f2, double f3, State3 &out) const {
    const double w1 = (S(23) * z.z1 + S(25) * z.z2 + S(27) * z.z3) * f1;
    const double w2 = (S(24) * z.z1 + S(26) * z.z2 + S(28) * z.z3) * f2;
    const double w3 = z.z3 * f3;
    out.z1 = checked::finite(S(29) * w1 + S(31) * w2 + S(33) * w3);
    out.z2 = checked::finite(S(30) * w1 + S(32) * w2 + S(34) * w3);
    out.z3 = w3;
}

Grow::StepFactors Grow::computeFactors(double years, float rho) const {
    const double e = checked::exp(years * rho);
    return {checked::pow(e, S(2)), checked::pow(e, S(3)), checked::pow(e, -1.0)};
}

StandState Grow::inverseComplete(const State3 &z, float age) {
    using checked::pow;
    const double p1 = S(4) + z.z1;
    const double p2 = S(5) + z.z2;
    const double p3 = S(6) + z.z3;
    StandState s;
    s.age = age;
    s.basalArea = checked::single(pow(p2, S(19)) * pow(p1, S(17)) * pow(p3, S(21)));
    s.stocking = checked::single(pow(p2, S(20)) * pow(p1, S(18)) * pow(p3, S(22)));
    s.topHeight = checked::single(pow(p3, 1.0 / S(1)));
    return s;
}

void Grow::STATEYR(float &A, float &G, float &N, float &H, float &A2, float &SI) {
    clearUpperVectorState();
    try {
        A2 = std::nearbyint(A2); // the default rounding mode sends halves to even
        if (A == std::trunc(A)) {
            return;
        }
        const State3 z = forward(G, N, H);
        const double rho = rateOf(SI);
        const float whole = std::nearbyint(A);
        const double delta = (double{whole} - A) * rho;
        A = whole;
        State3 moved{};
        applyStep(z, checked::exp(S(2) * delta), checked::exp(S(3) * delta), checked::exp(-delta),
                  moved);
        if (!invertible(moved)) {
            showMessage(titles::kOstran, "ERROR - Unable to invert state transform.",
                        kStyleExclamationOkCancel);
            return;
        }
        // Stocking comes back through its one-factor form here; the projection
        // uses the complete inverse.
        using checked::pow;
        const double p1 = S(4) + moved.z1;
        const double p2 = S(5) + moved.z2;
        const double p3 = S(6) + moved.z3;
        G = checked::single(pow(p2, S(19)) * pow(p1, S(17)) * pow(p3, S(21)));
        N = checked::single(pow(p2, S(20)));
        H = checked::single(pow(p3, 1.0 / S(1)));
    } catch (const RuntimeFault &fault) {
        reportFault(fault, titles::kArbolex,
                    "ERROR - Unable to convert to nearest year: ", " in Grow.STATEYR()");
    }
}

bool Grow::PROJ(float A, float G, float N, float H, float targetAge, float step,
                std::vector<StandState> &states) {
    clearUpperVectorState();
    try {
        const float startAge = std::nearbyint(A);
        states.push_back({startAge, G, N, H, GetV7(G, N, H)});

        const double span = double{targetAge} - startAge;
        const double total = std::fabs(span);
        if (total == 0.0) {
            return true;
        }
        const double direction = span > 0.0 ? 1.0 : -1.0;
        double stepYears = (std::isfinite(step) && step > 0.0f) ? double{step} : total;
        if (stepYears > total) {
            stepYears = total;
        }

        float rho = rateOf(m_siteIndex);
        if (isSiteScaled(m_modelId) && rho < S(10)) {
            const double below = double{rho} - S(10);
            rho = checked::single((below * below * S(9) + 1.0) * rho);
            if (rho <= 0.0f) {
                showMessage(titles::kOstran, "ERROR - Unable to Perform Nonlinear Site Scaling",
                            kStyleExclamation);
                return false;
            }
        }

        // Whole steps first, then one shorter step that lands on the target.
        const auto wholeSteps = static_cast<long long>(std::floor(total / stepYears + 1e-9));
        double lastYears = total - static_cast<double>(wholeSteps) * stepYears;
        if (lastYears < 1e-6 * stepYears) {
            lastYears = 0.0;
        }
        const StepFactors whole = projectionFactors(direction * stepYears, rho);
        const long long stepCount = wholeSteps + (lastYears > 0.0 ? 1 : 0);
        states.reserve(states.size() + static_cast<std::size_t>(stepCount));

        StandState current = states.back();
        for (long long k = 1; k <= stepCount; ++k) {
            const bool last = k == stepCount;
            const StepFactors f =
                (last && lastYears > 0.0) ? projectionFactors(direction * lastYears, rho) : whole;
            State3 next{};
            applyStep(forward(current.basalArea, current.stocking, current.topHeight), f.f1, f.f2,
                      f.f3, next);
            if (!invertible(next)) {
                showMessage(titles::kOstran, "ERROR - Unable to Invert State transform",
                            kStyleExclamation);
                return false;
            }
            const float age =
                last
                    ? targetAge
                    : static_cast<float>(startAge + direction * static_cast<double>(k) * stepYears);
            current = inverseComplete(next, age);
            current.volume = GetV7(current.basalArea, current.stocking, current.topHeight);
            states.push_back(current);
        }
        return true;
    } catch (const RuntimeFault &fault) {
        reportFault(fault, {}, {}, " in Grow.PROJ()");
        return false;
    }
}

// What the projection keeps of its last rate, transition and step factors.
// Each is a function of the model's coefficients and its arguments alone, so
// asking again with the same arguments for the same model gives the very
// same numbers: a path grown press after press asks for the rate of one site
// index in TM and again in PROJ, and often for the same site index after a
// thinning as before it. Only what was computed without a failure is kept.
// (Defined here, after the procedures, so that the lines the error log names
// in them stay where they were.)

float Grow::rateOf(float siteIndex) const {
    const auto key = std::bit_cast<std::uint32_t>(siteIndex);
    if (m_keptRate.known && m_keptRate.generation == m_modelGeneration &&
        m_keptRate.siteIndex == key) {
        return m_keptRate.rho;
    }
    const float rho = computeRate(siteIndex);
    m_keptRate = {true, m_modelGeneration, key, rho};
    return rho;
}

void Grow::TM(float SI) {
    clearUpperVectorState();
    const auto key = std::bit_cast<std::uint32_t>(SI);
    if (m_keptTransition.known && m_keptTransition.generation == m_modelGeneration &&
        m_keptTransition.siteIndex == key) {
        return; // M1, M2 and S8 are those of this site index already
    }
    m_keptTransition.known = false;
    const unsigned faultsBefore = m_faultCount;
    makeTransition(SI);
    if (m_faultCount == faultsBefore) {
        m_keptTransition = {true, m_modelGeneration, key};
    }
}

Grow::StepFactors Grow::projectionFactors(double years, float rho) const {
    const auto yearsKey = std::bit_cast<std::uint64_t>(years);
    const auto rhoKey = std::bit_cast<std::uint32_t>(rho);
    if (m_keptFactors.known && m_keptFactors.generation == m_modelGeneration &&
        m_keptFactors.years == yearsKey && m_keptFactors.rho == rhoKey) {
        return m_keptFactors.factors;
    }
    const StepFactors factors = computeFactors(years, rho);
    m_keptFactors = {true, m_modelGeneration, yearsKey, rhoKey, factors};
    return factors;
}

} // namespace arbolex::engine
