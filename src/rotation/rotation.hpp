#pragma once

// A rotation: a regime applied to the present stand (thinnings that remove a
// given volume per ha, then the final cut), grown by the engine and valued
// from its yearly cash flow. One library for every caller: the economics
// window, the optimiser and the command-line program (docs/economics.md).

#include "carbon/account.hpp"
#include "engine/grow.hpp"
#include "engine/standstate.hpp"
#include "rotation/assortmentprices.hpp"
#include "rotation/priceclasses.hpp"
#include "valuation/forestvalue.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::rotation {

/// Oldest age a projection of `model` may reach, years: 60, but 58 for model 7.
int modelAgeLimit(std::int16_t model);

/// A sub-compartment today, per hectare.
struct Stand {
    std::int16_t model = 0;
    /// Age, years.
    float age = 0.0f;
    /// Stocking, stems/ha.
    float stocking = 0.0f;
    /// Top height, m.
    float height = 0.0f;
    /// Basal area, m²/ha.
    float basalArea = 0.0f;
};

/// Thinnings of a rotation: each removes `thinVolume` at the ages thinFrom,
/// thinFrom + thinEvery, … up to and including thinUntil (without it, up to
/// the age before the final cut), and only before the final cut.
struct Regime {
    /// Age of the first thinning, years; 0 for a rotation without thinning.
    int thinFrom = 0;
    /// Years between two thinnings, at least 1.
    int thinEvery = 1;
    /// Volume removed by each thinning, m³/ha to 7 cm top.
    float thinVolume = 0.0f;
    /// Age of the last thinning, years.
    std::optional<int> thinUntil;

    bool thins() const { return thinFrom > 0; }
};

/// How the harvests of a rotation are valued.
enum class Valuation {
    /// The whole volume at the standing price of the mean tree's class.
    kStandingPrice,
    /// Each top-diameter class of the assortment report at its own price.
    kAssortments,
};

/// A cost and a revenue other than timber at one age, euro/ha: an entry of the
/// cash flow the user typed for the work.
struct CashFlowEntry {
    /// Age, years.
    int age = 0;
    double cost = 0.0;
    double otherRevenue = 0.0;

    bool operator==(const CashFlowEntry &) const = default;
};

/// What the money of a rotation is counted with.
struct Economics {
    /// Interest rate, percent.
    double ratePercent = 0.0;
    /// Cost of establishment, euro/ha, at age 0 (planting): it counts in the
    /// figures of bare land, never in the value of the stand standing today.
    double establishmentCost = 0.0;
    /// Yearly cost, euro/ha, at every age from 1 to the final cut.
    double annualCost = 0.0;
    /// Standing prices, euro/m³, by mean tree volume class.
    PriceList prices{};
    Valuation valuation = Valuation::kStandingPrice;
    /// Prices of the top-diameter classes, euro/m³, when valued by assortments.
    AssortmentPriceList assortmentPrices{};
    /// Further costs and other revenues by age; an entry counts in every
    /// rotation that reaches its age.
    std::vector<CashFlowEntry> entries{};
    /// What carbon earns: nothing unless a payment and a price are set.
    carbon::Pricing carbon{};
    /// The constants of the carbon account.
    carbon::Parameters carbonParameters{};
    /// Whether a valuation keeps the carbon account when carbon money does
    /// not count: dividing every harvest into its products costs as much as
    /// growing the stand, which an estate asks for only when it wants carbon.
    bool carbonAccount = true;
};

/// A thinning or the final cut, per hectare.
struct Harvest {
    /// Age, years.
    int age = 0;
    /// Volume removed, m³/ha.
    float volume = 0.0f;
    /// Stems removed, stems/ha.
    float stocking = 0.0f;
    /// Basal area removed, m²/ha.
    float basalArea = 0.0f;
    /// Volume of the mean tree removed, m³.
    double meanTreeVolume = 0.0;
    /// Price class 0 to 12 of the mean tree.
    int priceClass = 0;
    /// Volume in each top-diameter class, m³/ha; filled when the rotation is
    /// valued by assortments.
    AssortmentVolumes assortments{};
    /// Revenue, euro/ha: volume × standing price of the mean tree's class, or
    /// the sum of the classes' volumes × their prices.
    double revenue = 0.0;
    /// The stand a thinning leaves (the record of its row in the table); the
    /// final cut leaves none.
    engine::StandState residual{};
};

/// Pattern of a mean tree volume in the projection table, m³.
inline constexpr std::string_view kMeanTreeCell = "#0.000";

/// Mean tree of a thinning's removal, m³: the volume removed over the whole
/// number of stems removed; 0 without stems or without volume.
double removedMeanTree(float removedVolume, float removedStocking);

/// Mean tree of a felled crop as the table shows it (its volume over its whole
/// number of stems, in kMeanTreeCell), read back: the final cut's price class
/// is read from that figure. 0 without stems or without volume.
double felledMeanTree(float volume, float stocking);

/// A thinning at `age` that removes `volume` (m³/ha), `stocking` (stems/ha)
/// and `basalArea` (m²/ha) and leaves `residual`: its mean tree and price
/// class, not yet valued.
Harvest thinningHarvest(int age, float volume, float stocking, float basalArea,
                        const engine::StandState &residual);

/// The final cut at `age` of the standing crop `crop`: its mean tree as the
/// table shows it and its price class, not yet valued.
Harvest finalCutHarvest(int age, const engine::StandState &crop);

/// Revenue of `harvest`, euro/ha, valued as `economics` says, with its volume
/// and mean tree times `volumeFactor` (at the same stems, so the mean tree may
/// change its price class; its assortments keep their shares).
double harvestRevenue(const Harvest &harvest, const Economics &economics,
                      double volumeFactor = 1.0);

/// The stand under a regime, year by year from the present age to the age
/// limit, with every thinning of the regime up to there. One path serves every
/// final-cut age: a rotation of R years takes the state at R and the thinnings
/// before R.
struct GrowthPath {
    /// Model grown, 0 to 21.
    std::int16_t model = 0;
    /// Present age, years: the stand's age moved to the nearest whole year.
    int presentAge = 0;
    /// Last age of the path, years.
    int ageLimit = 0;
    /// Site index, m (top height at age 30).
    float siteIndex = 0.0f;
    /// The model's volume-ratio function, which divides a harvest into
    /// assortments.
    engine::VolumeRatioCoefficients volumeRatio{};
    /// State at presentAge + i, before any thinning of that age.
    std::vector<engine::StandState> years;
    /// The thinnings, oldest first; revenues 0 until a rotation is valued.
    std::vector<Harvest> thinnings;
    /// True once divideThinnings has divided the thinnings into assortments.
    bool thinningsDivided = false;
    /// Why the path ends before the age it was grown to, when it does: the
    /// window refuses to go on from there (a thinning, or the grow from the
    /// thinned stand) with `text`, or the optimiser's limits stop it.
    struct Stop {
        int age = 0;
        std::string text;
        bool byLimits = false;
    };
    std::optional<Stop> stop;

    /// Last age grown, years: the age limit, or the age of a thinning the
    /// limits did not allow.
    int lastAge() const { return presentAge + static_cast<int>(years.size()) - 1; }

    const engine::StandState &at(int age) const {
        return years[static_cast<std::size_t>(age - presentAge)];
    }
};

/// Why a path could not be grown.
struct GrowthFailure {
    /// True when the input is at fault (a regime the stand cannot carry, a
    /// stand past the age limit); false when the engine failed (and reported).
    bool badInput = false;
    std::string text;
};

/// What is wrong with a regime for a stand of `presentAge` and a model whose
/// projections end at `ageLimit`, or std::nullopt when it can be grown.
std::optional<std::string> regimeProblem(const Regime &regime, int presentAge, int ageLimit);

/// What is wrong with a final cut at `rotation` after `regime` on `path`, or
/// std::nullopt when it is a rotation: not before the present age, not past
/// the age limit, and after every thinning the regime names.
std::optional<std::string> rotationProblem(const GrowthPath &path, const Regime &regime,
                                           int rotation);

/// What a thinning may do: remove at most a share of the standing volume and
/// leave at least a stocking.
struct ThinningLimits {
    double maxRemovalShare = 1.0;
    /// Stems/ha.
    float minStocking = 0.0f;
};

/// Grows `stand` under `regime` to the model's age limit with `grow`, as the
/// main window does when the regime is typed into it: the model chosen with
/// the stand's site index in force (so its volume correction factor is the
/// window's), the stand grown by one-year steps to the first thinning, each
/// thinning the thinning window's volume method (the volume removal checked
/// against the volume the window shows, then Grow::thinToVolume), and the
/// thinned stand grown on to the next one. Every stand the window grows from
/// passes the grow command's range checks on what its fields show
/// (shownGrowFrom); every projection starts with the site index of its stand
/// and age, as each press of Grow does. A thinning or a grow the window would
/// refuse ends the path there (`stop`, with the window's message); a
/// rotation past it is refused with that message. With `limits`, the path
/// also ends at the first thinning they do not allow (its crop recorded, the
/// thinning not made). With `finalCut`, the path ends at that age (the age
/// limit still bounds it): enough for the one rotation felled there, and no
/// thinning after it can stop the path; the explorer needs a path grown to
/// the limit. Returns std::nullopt and fills `failure` when the stand itself
/// is refused or the engine fails.
std::optional<GrowthPath> growPath(engine::Grow &grow, const Stand &stand, const Regime &regime,
                                   GrowthFailure &failure, const ThinningLimits *limits = nullptr,
                                   std::optional<int> finalCut = std::nullopt);

/// Yield class of the stand over its whole path (grown to the model's age
/// limit, or to where the window stops), as the window shows it after growing
/// the stand under its regime by one-year steps that far: 0 only when the
/// mean annual increment never culminates on the path.
int pathYieldClass(const GrowthPath &path);

/// Divides the thinnings of `path` into their assortments once, so that
/// valuing its rotations by assortments reads them instead of dividing them
/// again for every final-cut age.
void divideThinnings(GrowthPath &path);

/// True when valuing a final cut under `economics` reads the thinnings'
/// assortment classes (valued by assortments, or with carbon money): a path
/// valued at many ages then wants divideThinnings first.
bool readsThinningClasses(const Economics &economics);

/// One year of the cash flow of a rotation from bare land, euro/ha.
struct CashFlowYear {
    int age = 0;
    /// The establishment or yearly cost and the entries' costs of the age.
    double cost = 0.0;
    /// Timber revenue: what the harvests of the age earn.
    double revenue = 0.0;
    /// The entries' other revenues of the age.
    double otherRevenue = 0.0;
    /// What carbon earns in the year (below 0 when a release is charged);
    /// 0 unless carbon counts.
    double carbon = 0.0;
};

/// The harvests of one rotation, before any money is counted: the thinnings
/// and the final cut of a grown path, or those of a projection table.
struct RotationHarvests {
    /// Model grown, 0 to 21: its species sets the carbon of the wood.
    std::int16_t model = 0;
    /// Present age, years: the value of the stand today counts from here.
    int presentAge = 0;
    /// Final-cut age, years.
    int rotation = 0;
    /// The thinnings, oldest first, none after the final cut.
    std::vector<Harvest> thinnings;
    Harvest finalCut;
    /// The model's volume-ratio function, which divides a harvest into
    /// assortments.
    engine::VolumeRatioCoefficients volumeRatio{};
    /// True when the thinnings are divided into assortments already.
    bool thinningsDivided = false;
    /// Standing volume before any harvest of the age, m³/ha, at every age
    /// from the present to the final cut: the carbon in the living trees.
    std::vector<float> standing;
};

/// The harvests of the rotation felled at `rotation` on `path`: the thinnings
/// before it and the whole standing crop at it.
RotationHarvests rotationHarvests(const GrowthPath &path, int rotation);

/// A rotation valued.
struct RotationValue {
    /// Final-cut age, years.
    int rotation = 0;
    /// The thinnings before the final cut, valued.
    std::vector<Harvest> thinnings;
    /// The final cut: the whole standing crop.
    Harvest finalCut;
    /// Cost and revenue of every age from 0 to the rotation. Ages before the
    /// present carry the costs only: the path does not see their thinnings.
    std::vector<CashFlowYear> cashflow;
    /// Mean annual increment at the final cut, m³/ha/year: standing volume and
    /// the thinnings over the age.
    double mai = 0.0;
    /// Largest mean annual increment from the present age to the rotation,
    /// m³/ha/year.
    double maxMai = 0.0;
    /// Yield class: the culminated maximum of the MAI from the present age to
    /// the rotation, made even (0 when it has not culminated).
    int yieldClass = 0;
    /// Net present value, euro/ha, of the cash flows from the present age,
    /// discounted to it as the cash-flow window does.
    std::optional<double> npv;
    /// Land expectation value, euro/ha.
    std::optional<double> lev;
    /// Equivalent annual annuity, euro/ha/year.
    std::optional<double> eaa;
    /// Forest value of the stand today, euro/ha.
    std::optional<double> forestValue;
    valuation::InternalRate irr;
    /// Factor on all timber prices that brings the LEV to 0.
    std::optional<double> breakEvenPriceFactor;
    /// The carbon account of the rotation, from planting to the final cut.
    carbon::Account carbon;
    /// NPV and LEV of the money without carbon, and of the carbon money
    /// alone, euro/ha: npv and lev are their sums.
    std::optional<double> npvTimber;
    std::optional<double> npvCarbon;
    std::optional<double> levTimber;
    std::optional<double> levCarbon;
};

/// How much of a rotation's value to compute.
enum class Appraisal {
    /// Every figure.
    kFull,
    /// Without the internal rate of return and the break-even price factor,
    /// whose searches cost more than the rest of the valuation together.
    kWithoutRates,
};

/// Values `harvests` and the cash flow of `economics`: every harvest at its
/// price, the costs and other revenues by age, and the figures. The MAI at
/// the final cut comes from the harvests; the largest MAI and the yield class,
/// which need the stand of every year, are left 0.
RotationValue valueHarvests(const RotationHarvests &harvests, const Economics &economics,
                            Appraisal appraisal = Appraisal::kFull);

/// The carbon account of `harvests` with the constants of `parameters`. The
/// account runs from planting: before the present age, which the stand does
/// not show, the carbon in the trees is taken to rise in a straight line from
/// none at planting to the present stock.
carbon::Account rotationCarbon(const RotationHarvests &harvests,
                               const carbon::Parameters &parameters);

/// Values the rotation that ends with the final cut at `rotation` (checked
/// with rotationProblem beforehand): valueHarvests of its harvests, with the
/// largest MAI and the yield class of the path.
RotationValue valueRotation(const GrowthPath &path, int rotation, const Economics &economics,
                            Appraisal appraisal = Appraisal::kFull);

/// One final-cut age of the rotation explorer.
struct RotationRow {
    int age = 0;
    /// Standing volume at the final cut, m³/ha.
    float volume = 0.0f;
    double mai = 0.0;
    std::optional<double> npv;
    std::optional<double> lev;
    std::optional<double> forestValue;
};

/// The final cut at every age from the year after the last thinning (the
/// present age without thinnings) to the age limit.
struct RotationExplorer {
    std::vector<RotationRow> rows;
    /// Age of the largest MAI (the biological rotation), years.
    int biologicalRotation = 0;
    /// Age of the largest LEV (the economic rotation), years; 0 when no LEV
    /// could be computed (no positive rate).
    int economicRotation = 0;
};

/// First final-cut age the explorer shows for `regime` on `path`.
int firstRotation(const GrowthPath &path, const Regime &regime);

RotationExplorer exploreRotations(const GrowthPath &path, const Regime &regime,
                                  const Economics &economics);

/// The final-cut age of a rotation: `rotation` when given, else the economic
/// rotation of the explorer.
struct RotationChoice {
    int age = 0;
    /// What is wrong with that age (rotationProblem), when anything is.
    std::optional<std::string> problem;
};
RotationChoice chooseRotation(const GrowthPath &path, const Regime &regime,
                              const Economics &economics, std::optional<int> rotation);

} // namespace arbolex::rotation
