#pragma once

// Module Grow: the growth model engine. One active model at a time; the site
// index, the state transform and its projection between ages, the volume
// function and the thinning-response solver all read the active model's
// coefficient sets and never ask which model is active (except the volume
// correction factor and the assortment calculation).

#include "engine/assortment.hpp"
#include "engine/catalogue.hpp"
#include "engine/checkedmath.hpp"
#include "engine/report.hpp"
#include "engine/standstate.hpp"

#include <array>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace arbolex::engine {

struct RuntimeFault;

/// Which coefficient sets GetModel loads.
enum ModelPart : std::int16_t {
    kPartAll = 0,
    kPartStateModel = 1,
    kPartThinningResponse = 2,
    kPartVolume = 3,
    kPartAssortment = 4,
};

/// How a thinning prescribed by volume came out.
enum class VolumeThinningOutcome {
    kDone,
    /// The model has no thinning response: basal area and stocking are not tied.
    kNoThinningResponse,
    /// NEWTON did not converge or failed, and said so.
    kSolverFailed,
    /// The solution leaves no basal area or no stems.
    kNothingLeft,
};

/// The stand after a thinning prescribed by volume.
struct VolumeThinning {
    VolumeThinningOutcome outcome = VolumeThinningOutcome::kDone;
    float basalArea = 0.0f; ///< m²/ha
    float stocking = 0.0f;  ///< stems/ha
    float volume = 0.0f;    ///< m³/ha

    bool done() const { return outcome == VolumeThinningOutcome::kDone; }
};

/// Volume a removal of `removal` m³/ha leaves of `volume` m³/ha, as the
/// thinning window computes it: in double, stored in single precision.
inline float residualVolume(float volume, double removal) {
    return static_cast<float>(double{volume} - removal);
}

/// Messages of the thinning window about a prescription the engine refuses.
namespace thinningtext {
inline constexpr std::string_view kRemovalLeavesNoVolume =
    "FAULT - Proposed thinning leads to negative or zero Volume.";
inline constexpr std::string_view kNothingLeft =
    "FAULT - Negative or zero Basal Area or Stocking predicted";
inline constexpr std::string_view kNoThinningResponse =
    "FAULT - The model in use has no thinning response: a thinning may only be prescribed by "
    "Basal area & Stocking reductions.";
} // namespace thinningtext

/// A 3 × 3 single-precision matrix, rows then columns, 0-based.
using Matrix3 = std::array<std::array<float, 3>, 3>;

/// The growth model engine with its active model, site index and volume
/// correction factor. Not thread-safe: one instance per thread of work.
class Grow {
public:
    /// The engine reports through `report`; without one, reports are dropped.
    explicit Grow(IEngineReport *report = nullptr) : m_report(report) {}

    void setReport(IEngineReport *report) { m_report = report; }
    IEngineReport *report() const { return m_report; }

    // ---- Model catalogue -------------------------------------------------

    /// Makes catalogue entry `modelId` active, loading the coefficient sets
    /// that `part` asks for (label and identifier whatever the part). An
    /// identifier outside 0..21 shows "FAULT - Unknown model selection",
    /// returns false and changes nothing.
    bool GetModel(std::int16_t modelId, std::int16_t part = kPartAll);

    std::int16_t modelId() const { return m_modelId; }
    const std::string &label() const { return m_label; }
    /// True when the active model offers thinning (the "1+3+5+7+9" test).
    bool isThinnedModel() const { return IsThinnedModel(m_modelId); }

    /// State-model coefficient Si, i = 1..34.
    float S(int i) const { return m_s[static_cast<std::size_t>(i - 1)]; }
    /// Thinning-response coefficient Ti, i = 1..4 (a, c, d, e).
    double T(int i) const { return m_t[static_cast<std::size_t>(i - 1)]; }
    /// Volume coefficient Vi, i = 0..9.
    double V(int i) const { return m_v[static_cast<std::size_t>(i)]; }
    /// Assortment coefficient Ai, i = 1..38.
    float A(int i) const { return m_a[static_cast<std::size_t>(i - 1)]; }
    /// The volume-ratio function the active model's assortment coefficients select.
    VolumeRatioCoefficients volumeRatio() const { return VolumeRatioFor(m_a); }

    /// Tallest top height the active model allows, m: the height asymptote
    /// K^(1/b) with K = S6 and b = S1.
    float maxTopHeight() const;

    // ---- Site index and projection ---------------------------------------

    /// Site index (top height at age 30, m) of a stand of age A and top height
    /// H; stores it in the engine and returns SI > 0.
    bool SiteIndex(float A, float H);

    /// The engine's current site index, m.
    float siteIndex() const { return m_siteIndex; }
    void setSiteIndex(float si) { m_siteIndex = si; }

    /// Rate of the stand, 1/year, from a site index: −ln(1 − SI^b/K) / (30 − t0).
    float rate(float siteIndex) const;

    /// Builds the one-year transition M1 and its backward counterpart M2 for
    /// site index SI, and stores exp(−ρ) in S8.
    void TM(float SI);

    const Matrix3 &M1() const { return m_m1; }
    const Matrix3 &M2() const { return m_m2; }

    /// Moves the stand from age A to the nearest whole year (halves to even),
    /// rewriting A, G, N and H; rounds A2 in place. SI gives the rate.
    void STATEYR(float &A, float &G, float &N, float &H, float &A2, float &SI);

    /// Projects the stand from age A to `targetAge` by steps of `step` years.
    /// Appends the start state, one state per step and a last shorter step
    /// landing on the target when the span is not a multiple of the step; a
    /// target below A projects backwards. Returns false when the projection
    /// failed; the states computed before the failure stay in `states`.
    bool PROJ(float A, float G, float N, float H, float targetAge, float step,
              std::vector<StandState> &states);

    // ---- Volume ------------------------------------------------------------

    /// Standing volume to 7 cm top, m³/ha, of basal area G (m²/ha), stocking
    /// N (stems/ha) and top height H (m). Reports a failure and returns 0.
    float GetV7(float G, float N, float H);

    /// Sets the volume correction factor for the active model and the
    /// current site index; returns true.
    bool GetVCF();

    float volumeCorrectionFactor() const { return m_vcf; }

    /// How many failures the engine has reported so far: a caller compares
    /// it before and after a call to learn that the call failed.
    unsigned faultCount() const { return m_faultCount; }

    // ---- Thinning response --------------------------------------------------

    /// Residual stocking for a residual basal area Gr.
    float NRES(float H, float N, float G, float Gr);
    /// Residual basal area for a residual stocking Nr.
    double BRES(float H, float N, float G, float Nr);
    /// dNr/dGr along the thinning-response relation.
    double PARN2B2(float H, float N, float G, float Gr);
    /// Derivative of (Vt − volume) with respect to Gr along the relation.
    double PARFB2(float H, float N, float G, float Nr, float Gr);
    /// Residual stocking Nr and basal area Gr for a residual volume Vt, by a
    /// Newton iteration of at most 100 steps. Returns false when it did not
    /// converge (Gr = Nr = 0, message shown) or failed (reported).
    bool NEWTON(float N, float G, float H, float Vt, float &Nr, float &Gr);

    /// Newton iteration limit.
    static constexpr int kNewtonIterationLimit = 100;

    /// The thinning window's volume method: the stand (stocking N, basal area
    /// G, top height H) thinned to `residualVolume` (m³/ha), its residual
    /// basal area and stocking from the thinning response by NEWTON. A failure
    /// of the solver has been shown by the engine itself.
    VolumeThinning thinToVolume(float N, float G, float H, float residualVolume);

    // ---- Assortments (docs/assortments.md) -------------------------------

    /// Class bounds of the categories, cm: each widened by −0.5 below and
    /// +0.499 above (big-end 0: no upper limit); no categories give the three
    /// fixed classes. Bad bounds show "ERROR - Non-recoverable AsmtG
    /// calculation error" and return false.
    bool AsmtG(std::span<const AssortmentCategory> categories, AssortmentBounds &bounds);

    /// The active model's volume-ratio expression exp(b1 · (t/d)^b2), taken
    /// over the stand's diameter distribution (basal area G, m²/ha, stocking
    /// N, stems/ha) at every class bound. A failure shows "ERROR -
    /// Non-recoverable AsmtH calculation error" and returns false.
    bool AsmtH(float G, float N, const AssortmentBounds &bounds, AssortmentRatios &ratios);

    /// Volume per hectare of the stand (G, N, top height H, m) in each
    /// category, or in the fixed classes 7-14, 14-20 and >20 cm when no
    /// category is given; the classes are shares of GetV7. Returns the
    /// success flag; on failure `result` is empty and "ERROR -
    /// Non-recoverable Assortment calculation error." has been shown (after
    /// AsmtG's or AsmtH's own message when one of them failed).
    bool AsmtB(float G, float N, float H, std::span<const AssortmentCategory> categories,
               Assortment &result);

private:
    /// The transformed state z. Kept in double: z2 + S5 can be a small
    /// difference of large numbers (1/N − S5 for some models), which single
    /// precision would blur step after step.
    struct State3 {
        double z1, z2, z3;
    };

    /// Factors that scale the modal coordinates over a span of years.
    struct StepFactors {
        double f1, f2, f3;
    };

    /// The rate, the transition and the step factors, each kept for the
    /// arguments it was last computed from (projection.cpp).
    float rateOf(float siteIndex) const;
    StepFactors projectionFactors(double years, float rho) const;
    float computeRate(float siteIndex) const;
    void makeTransition(float SI);
    StepFactors computeFactors(double years, float rho) const;
    State3 forward(float G, float N, float H) const;
    bool invertible(const State3 &z) const;
    void applyStep(const State3 &z, double f1, double f2, double f3, State3 &out) const;
    StandState inverseComplete(const State3 &z, float age);

    float getV7(float G, float N, float H) const;
    float nres(float H, float N, float G, float Gr) const;
    double bres(float H, float N, float G, float Nr) const;
    double parn2b2(float H, float N, float G, float Gr) const;
    double parfb2(float H, float N, float G, float Nr, float Gr) const;

    /// Runs `body` (a procedure's unchecked form); a run-time failure inside
    /// it is reported with `lead` and `mark` and the result is `Result{}`.
    template <typename Result, typename Body>
    Result trapped(std::string_view lead, std::string_view mark, Body &&body);

    /// Reports a run-time failure: a message box (title, lead + description)
    /// when `lead` is not empty, then the log line with the procedure mark.
    void reportFault(const RuntimeFault &fault, std::string_view title, std::string_view lead,
                     std::string_view mark);
    void showMessage(std::string_view title, std::string_view text, int style);
    /// Shows one of the assortment calculation's failure messages and logs it.
    void assortmentFailure(std::string_view text, std::string_view mark);

    IEngineReport *m_report = nullptr;
    /// Changed by every GetModel: what was kept for one model's coefficients
    /// is never used for another's.
    unsigned m_modelGeneration = 0;
    struct KeptRate {
        bool known = false;
        unsigned generation = 0;
        std::uint32_t siteIndex = 0;
        float rho = 0.0f;
    };
    mutable KeptRate m_keptRate;
    struct KeptTransition {
        bool known = false;
        unsigned generation = 0;
        std::uint32_t siteIndex = 0;
    };
    KeptTransition m_keptTransition;
    struct KeptFactors {
        bool known = false;
        unsigned generation = 0;
        std::uint64_t years = 0;
        std::uint32_t rho = 0;
        StepFactors factors{};
    };
    mutable KeptFactors m_keptFactors;
    /// The thinning response's last powers (a pure function of their
    /// arguments, so kept whatever the model).
    mutable checked::PowerMemo m_powers;

    std::int16_t m_modelId = 0;
    std::string m_label;
    std::array<float, 34> m_s{};
    std::array<double, 4> m_t{};
    std::array<double, 10> m_v{};
    std::array<float, 38> m_a{};
    Matrix3 m_m1{};
    Matrix3 m_m2{};

    float m_siteIndex = 0.0f;
    float m_vcf = 1.0f;
    /// Set when a procedure reported a failure; GetModel resets it.
    std::int16_t m_errorFlag = 0;
    /// Count of failures reported so far; lets a caller inside the engine see
    /// that a procedure it called has failed and stop at the first report.
    unsigned m_faultCount = 0;
};

} // namespace arbolex::engine
