// Thinning response: basal area and stocking after a thinning are tied by
//   Gr^(−a) − G^(−a) = −(H^d / e) · (Nr^c − N^c)
// with the active model's a, c, d, e.
#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/trapped.hpp"
#include "engine/vectorstate.hpp"

#include <cmath>

namespace arbolex::engine {

namespace {
constexpr std::string_view kNresLead = "ERROR - in residual stocking calculation. Reason: ";
constexpr std::string_view kBresLead = "ERROR - in residual Basal Area calculation. Reason: ";
constexpr std::string_view kParn2b2Lead =
    "ERROR - in calculating Residual Stocking partial derivative. Reason: ";
constexpr std::string_view kParfb2Lead =
    "ERROR - in calculating Volume Equation partial derivative. Reason: ";
constexpr std::string_view kNewtonLead =
    "ERROR - Calculation error in Newton's algorithm. Reason: ";
} // namespace

float Grow::nres(float H, float N, float G, float Gr) const {
    using checked::div;
    checked::PowerMemo &pow = m_powers;
    const double a = m_t[0];
    const double c = m_t[1];
    const double d = m_t[2];
    const double e = m_t[3];
    const double inner = pow(N, c) + div(e * (pow(G, -a) - pow(Gr, -a)), pow(H, d));
    return checked::single(pow(inner, div(1.0, c)));
}

double Grow::bres(float H, float N, float G, float Nr) const {
    using checked::div;
    using checked::pow;
    const double a = m_t[0];
    const double c = m_t[1];
    const double d = m_t[2];
    const double e = m_t[3];
    const double inner = pow(G, -a) - div(pow(H, d), e) * (pow(Nr, c) - pow(N, c));
    return pow(inner, div(-1.0, a));
}

double Grow::parn2b2(float H, float N, float G, float Gr) const {
    using checked::div;
    checked::PowerMemo &pow = m_powers;
    const double a = m_t[0];
    const double c = m_t[1];
    const double d = m_t[2];
    const double e = m_t[3];
    const double nr = nres(H, N, G, Gr);
    return checked::finite(pow(nr, 1.0 - c) * div(a * e, c) * div(pow(Gr, -a - 1.0), pow(H, d)));
}

double Grow::parfb2(float H, float N, float G, float Nr, float Gr) const {
    using checked::div;
    using checked::pow;
    const double np = parn2b2(H, N, G, Gr);
    const double h = H;
    const double nr = Nr;
    const double gr = Gr;
    // Every term is evaluated here, zero coefficients included; V7..V9 do not
    // depend on Gr once multiplied by G.
    const double d =
        m_v[0] + m_v[1] * h + m_v[2] * h * (pow(nr, -0.5) - 0.5 * gr * np * pow(nr, -1.5)) +
        m_v[3] * h * np + div(m_v[4], h) + m_v[5] * h * (div(1.0, nr) - div(gr * np, nr * nr)) +
        div(m_v[6] * 2.0 * gr, h);
    return checked::finite(-double{m_vcf} * d);
}

float Grow::NRES(float H, float N, float G, float Gr) {
    return trapped<float>(kNresLead, " in Grow.NRES", [&] { return nres(H, N, G, Gr); });
}

double Grow::BRES(float H, float N, float G, float Nr) {
    return trapped<double>(kBresLead, " in Grow.BRES()", [&] { return bres(H, N, G, Nr); });
}

double Grow::PARN2B2(float H, float N, float G, float Gr) {
    return trapped<double>(kParn2b2Lead, " in Grow.PARN2B2()",
                           [&] { return parn2b2(H, N, G, Gr); });
}

double Grow::PARFB2(float H, float N, float G, float Nr, float Gr) {
    return trapped<double>(kParfb2Lead, " in Grow.PARFB2()",
                           [&] { return parfb2(H, N, G, Nr, Gr); });
}

bool Grow::NEWTON(float N, float G, float H, float Vt, float &Nr, float &Gr) {
    clearUpperVectorState();
    // The procedures called here report their own failures; the iteration
    // stops at the first one, so a failure is shown once, not once a step.
    const unsigned faultsBefore = m_faultCount;
    auto failed = [&] {
        if (m_faultCount == faultsBefore) {
            return false;
        }
        Nr = 0.0f;
        Gr = 0.0f;
        return true;
    };
    try {
        const float v0 = GetV7(G, N, H);
        if (failed()) {
            return false;
        }
        // Start from the basal area reduced in proportion to the volume.
        Gr = checked::single(checked::div(double{G} * Vt, v0));
        int i = 1;
        for (; i <= kNewtonIterationLimit; ++i) {
            Nr = NRES(H, N, G, Gr);
            if (failed()) {
                return false;
            }
            const float vr = GetV7(Gr, Nr, H);
            if (failed()) {
                return false;
            }
            const float f = checked::single(double{Vt} - vr);
            const double g = PARFB2(H, N, G, Nr, Gr);
            if (failed()) {
                return false;
            }
            const double step = checked::div(f, g);
            Gr = checked::single(Gr - step);
            // Nr stays the value computed from Gr before this update: the pair
            // is one Newton step apart, as the preview has always shown it.
            if (std::fabs(checked::single(step)) <= 0.001f || std::fabs(f) <= 0.001f) {
                break;
            }
        }
        if (i > kNewtonIterationLimit) {
            Gr = 0.0f;
            Nr = 0.0f;
            showMessage(titles::kOstran, "ERROR - Exceed iteration limit in Newton's Algorithm.",
                        kStyleExclamation);
            return false;
        }
        return true;
    } catch (const RuntimeFault &fault) {
        Gr = 0.0f;
        Nr = 0.0f;
        reportFault(fault, titles::kArbolexNewton, kNewtonLead, " in Grow.NEWTON()");
        return false;
    }
}

VolumeThinning Grow::thinToVolume(float N, float G, float H, float residualVolume) {
    VolumeThinning t;
    if (T(1) == 0.0) {
        // Without a thinning response basal area and stocking are not tied.
        t.outcome = VolumeThinningOutcome::kNoThinningResponse;
        return t;
    }
    t.volume = residualVolume;
    const unsigned faultsBefore = m_faultCount;
    if (!NEWTON(N, G, H, t.volume, t.stocking, t.basalArea) || m_faultCount != faultsBefore) {
        t.outcome = VolumeThinningOutcome::kSolverFailed;
        return t;
    }
    if (!(t.basalArea > 0.0f) || !(t.stocking > 0.0f) || !std::isfinite(t.volume)) {
        t.outcome = VolumeThinningOutcome::kNothingLeft;
    }
    return t;
}

} // namespace arbolex::engine
