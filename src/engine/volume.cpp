// Standing volume to 7 cm top and the volume correction factor.
#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/trapped.hpp"

namespace arbolex::engine {

float Grow::getV7(float G, float N, float H) const {
    using checked::div;
    using checked::single;
    const double g = G;
    const double n = N;
    const double h = H;
    const double si = m_siteIndex;
    // V = VCF · G · Σ Vi·xi; a term whose coefficient is 0 is skipped, so an
    // undefined term (100 / (G·H) for G = 0) does no harm where it is unused.
    // Each term is stored in single precision, and so is the running sum.
    float sum = 0.0f;
    auto add = [&sum, this](int i, auto term) {
        if (m_v[static_cast<std::size_t>(i)] != 0.0) {
            const float x = single(term());
            sum = single(double{sum} + m_v[static_cast<std::size_t>(i)] * x);
        }
    };
    add(0, [] { return 1.0; });
    add(1, [h] { return h; });
    add(2, [h, n] { return div(h, checked::sqrt(n)); });
    add(3, [n, h, g] { return div(n * h, g); });
    add(4, [h] { return div(1.0, h); });
    add(5, [h, n] { return div(h, n); });
    add(6, [g, h] { return div(g, h); });
    add(7, [g, h] { return div(100.0, g * h); });
    add(8, [si, g] { return div(si, g); });
    add(9, [si, g] { return div(si * si, g); });
    const float v = single(double{sum} * g);
    return single(double{m_vcf} * v);
}

float Grow::GetV7(float G, float N, float H) {
    return trapped<float>("Unable to complete volume calculation. Reason: ", " in Grow.GetV7()",
                          [&] { return getV7(G, N, H); });
}

bool Grow::GetVCF() {
    // The factor follows the site index current at model selection (0 before
    // the first projection), not that of a later projection.
    double factor = 1.0;
    const float si = m_siteIndex;
    if (m_modelId == 16) {
        if (si <= 13.5f) {
            factor = 0.994367307;
        } else if (si <= 16.5f) {
            factor = 0.96947558;
        } else if (si <= 19.5f) {
            factor = 0.952574;
        } else if (si <= 22.5f) {
            factor = 0.951985;
        } else {
            factor = 0.944195;
        }
    } else if (m_modelId == 17) {
        if (si <= 13.5f) {
            factor = 0.95472905;
        } else if (si <= 16.5f) {
            factor = 0.95809963;
        } else if (si <= 19.5f) {
            factor = 1.008985622;
        } else {
            factor = 0.9900969916;
        }
    }
    m_vcf = static_cast<float>(factor);
    return true;
}

} // namespace arbolex::engine
