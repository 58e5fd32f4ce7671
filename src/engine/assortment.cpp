// The assortment calculation: AsmtG sets the class bounds, AsmtH evaluates the
// stand volume ratio at them, AsmtB divides GetV7 among the classes.
//
// A stand's trees follow a two-parameter Weibull distribution of diameters
// recovered from the quadratic mean diameter; each tree's volume to a top
// diameter t is its volume times the ratio exp(b1 · (t/d)^b2); tree volume is
// taken proportional to basal area. The stand ratio S(t) is therefore the
// basal-area-weighted mean of the tree ratios, and a class [t1, t2) receives
// GetV7 · (S(t1) − S(t2)) / S(6.5). See docs/assortments.md.
#include "engine/assortment.hpp"
#include "engine/checkedmath.hpp"
#include "engine/grow.hpp"
#include "engine/vectorstate.hpp"

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>
#include <utility>
#include <vector>

namespace arbolex::engine {

namespace {

/// Weibull shape of the diameter distribution: at 3.6 the Weibull is close to
/// the normal distribution, the shape of an even-aged plantation's diameters.
constexpr double kWeibullShape = 3.6;
/// Quadrature of the relative diameter x = d/b over [0, kUpperX]: beyond it
/// the Weibull density is below e^(−35).
constexpr double kUpperX = 2.7;
constexpr int kIntervals = 64;
/// Widening of a category's bounds (whole centimetres to diameter limits).
constexpr double kBelow = 0.5;
constexpr double kAbove = 0.499;
/// What separates one class's upper bound from the next class's lower bound.
constexpr double kGap = 0.001;
/// A tree ratio below e^(−40) counts as nothing.
constexpr double kNegligibleExponent = -40.0;

/// The quadrature nodes: ln x and the Simpson weight times the basal-area
/// weighted Weibull density x² · c · x^(c−1) · exp(−x^c), normalised to 1.
/// They depend on the shape only, so they are computed once.
struct Quadrature {
    std::array<double, kIntervals> logX{};
    std::array<double, kIntervals> weight{};

    Quadrature() {
        const double h = kUpperX / kIntervals;
        double total = 0.0;
        // Node 0 (x = 0) has weight 0 and is left out.
        for (int k = 1; k <= kIntervals; ++k) {
            const double x = h * k;
            const double simpson = (k == kIntervals) ? 1.0 : (k % 2 == 1 ? 4.0 : 2.0);
            const double density = kWeibullShape * std::pow(x, kWeibullShape + 1.0) *
                                   std::exp(-std::pow(x, kWeibullShape));
            const auto i = static_cast<std::size_t>(k - 1);
            logX[i] = std::log(x);
            weight[i] = simpson * density;
            total += weight[i];
        }
        for (double &w : weight) {
            w /= total;
        }
    }
};

const Quadrature &quadrature() {
    static const Quadrature q;
    return q;
}

/// Scale b of the Weibull whose quadratic mean is dq: E[d²] = b² Γ(1 + 2/c).
double weibullScale(double dq) {
    static const double factor = std::sqrt(std::tgamma(1.0 + 2.0 / kWeibullShape));
    return dq / factor;
}

/// The mean of the distinct (A7, A8) pairs of the entries that carry their
/// own volume-ratio function (A1 = 0).
VolumeRatioCoefficients referenceRatio() {
    std::vector<std::pair<float, float>> pairs;
    for (const CatalogueEntry &entry : catalogue()) {
        if (entry.a[0] == 0.0f) {
            const std::pair<float, float> p{entry.a[6], entry.a[7]};
            if (std::find(pairs.begin(), pairs.end(), p) == pairs.end()) {
                pairs.push_back(p);
            }
        }
    }
    VolumeRatioCoefficients mean;
    for (const auto &[b1, b2] : pairs) {
        mean.b1 += b1;
        mean.b2 += b2;
    }
    mean.b1 /= static_cast<double>(pairs.size());
    mean.b2 /= static_cast<double>(pairs.size());
    return mean;
}

} // namespace

double StandVolumeRatio(double dq, double t, VolumeRatioCoefficients ratio) {
    if (std::isinf(t)) {
        return 0.0;
    }
    const Quadrature &q = quadrature();
    const double logZ = std::log(t / weibullScale(dq));
    double sum = 0.0;
    // Nodes run from thin to thick trees; thin trees hold nothing above t.
    for (std::size_t k = 0; k < q.weight.size(); ++k) {
        const double exponent = ratio.b1 * std::exp(ratio.b2 * (logZ - q.logX[k]));
        if (exponent > kNegligibleExponent) {
            sum += q.weight[k] * std::exp(exponent);
        }
    }
    return std::min(sum, 1.0);
}

VolumeRatioCoefficients VolumeRatioFor(std::span<const float, 38> a) {
    if (a[0] == 0.0f) {
        return {a[6], a[7]};
    }
    static const VolumeRatioCoefficients reference = referenceRatio();
    return reference;
}

std::optional<AssortmentBounds> ClassBounds(std::span<const AssortmentCategory> categories) {
    if (categories.empty()) {
        categories = kFixedClasses;
    }
    if (categories.size() > kMaxAssortmentClasses) {
        return std::nullopt;
    }
    AssortmentBounds bounds;
    for (std::size_t i = 0; i < categories.size(); ++i) {
        const double small = categories[i].smallEnd;
        const double big = categories[i].bigEnd;
        if (!(std::isfinite(small) && std::isfinite(big) && small - kBelow >= kAssortmentFloor &&
              (big == 0.0 || big >= small))) {
            return std::nullopt;
        }
        bounds.lower[i] = small - kBelow;
        bounds.upper[i] = big == 0.0 ? std::numeric_limits<double>::infinity() : big + kAbove;
    }
    bounds.count = categories.size();
    return bounds;
}

std::optional<AssortmentRatios> StandRatios(float G, float N, const AssortmentBounds &bounds,
                                            VolumeRatioCoefficients ratio) {
    if (!(std::isfinite(G) && std::isfinite(N) && G > 0.0f && N > 0.0f)) {
        return std::nullopt;
    }
    // Quadratic mean diameter, cm, as everywhere in the program.
    const double dq = 200.0 * std::sqrt(double{G} / (double{N} * 3.14159265358979));
    // Neighbouring classes share their bounds, and the first starts at the
    // floor: each distinct diameter is evaluated once.
    std::array<std::pair<double, double>, 2 * kMaxAssortmentClasses + 1> evaluated{};
    std::size_t count = 0;
    auto ratioAt = [&](double t) {
        for (std::size_t k = 0; k < count; ++k) {
            if (evaluated[k].first == t) {
                return evaluated[k].second;
            }
        }
        const double s = StandVolumeRatio(dq, t, ratio);
        evaluated[count++] = {t, s};
        return s;
    };
    AssortmentRatios ratios;
    ratios.reference = ratioAt(kAssortmentFloor);
    for (std::size_t i = 0; i < bounds.count; ++i) {
        ratios.lower[i] = ratioAt(bounds.lower[i]);
        // A class reaches up to the next class's lower bound, across the gap.
        ratios.upper[i] = ratioAt(bounds.upper[i] + kGap);
    }
    bool valid = std::isfinite(ratios.reference) && ratios.reference > 0.0;
    for (std::size_t i = 0; valid && i < bounds.count; ++i) {
        valid = std::isfinite(ratios.lower[i]) && std::isfinite(ratios.upper[i]);
    }
    return valid ? std::optional(ratios) : std::nullopt;
}

Assortment DivideVolume(float volume, const AssortmentBounds &bounds,
                        const AssortmentRatios &ratios) {
    Assortment result;
    result.volume = volume;
    result.count = bounds.count;
    if (volume > 0.0f) {
        for (std::size_t i = 0; i < bounds.count; ++i) {
            const double share =
                std::max(0.0, ratios.lower[i] - ratios.upper[i]) / ratios.reference;
            result.classVolume[i] = static_cast<float>(double{volume} * share);
        }
    }
    return result;
}

void Grow::assortmentFailure(std::string_view text, std::string_view mark) {
    ++m_faultCount;
    m_errorFlag = -1;
    showMessage(titles::kArbolex, text, kStyleCritical);
    if (m_report != nullptr) {
        std::string line(text);
        line += mark;
        m_report->logError(line);
    }
}

bool Grow::AsmtG(std::span<const AssortmentCategory> categories, AssortmentBounds &bounds) {
    const std::optional<AssortmentBounds> set = ClassBounds(categories);
    bounds = set.value_or(AssortmentBounds{});
    if (!set) {
        assortmentFailure("ERROR - Non-recoverable AsmtG calculation error", " in Grow.AsmtG()");
        return false;
    }
    return true;
}

bool Grow::AsmtH(float G, float N, const AssortmentBounds &bounds, AssortmentRatios &ratios) {
    clearUpperVectorState();
    const std::optional<AssortmentRatios> found = StandRatios(G, N, bounds, VolumeRatioFor(m_a));
    ratios = found.value_or(AssortmentRatios{});
    if (!found) {
        assortmentFailure("ERROR - Non-recoverable AsmtH calculation error", " in Grow.AsmtH()");
        return false;
    }
    return true;
}

bool Grow::AsmtB(float G, float N, float H, std::span<const AssortmentCategory> categories,
                 Assortment &result) {
    clearUpperVectorState();
    result = {};
    AssortmentBounds bounds;
    AssortmentRatios ratios;
    const unsigned faultsBefore = m_faultCount;
    bool ok = AsmtG(categories, bounds) && AsmtH(G, N, bounds, ratios);
    float volume = 0.0f;
    if (ok) {
        volume = GetV7(G, N, H);
        ok = m_faultCount == faultsBefore && std::isfinite(volume);
    }
    if (!ok) {
        assortmentFailure("ERROR - Non-recoverable Assortment calculation error.",
                          " in Grow.AsmtB()");
        return false;
    }
    result = DivideVolume(volume, bounds, ratios);
    return true;
}

} // namespace arbolex::engine
