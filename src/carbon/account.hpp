#pragma once

// The carbon account of one rotation, year by year from planting to the final
// cut: the living trees, the product pools the harvests feed, what is
// emitted, the net removal, and the carbon units issued on it
// (docs/carbon.md). The account closes: what the trees took up equals what
// stands in them, what is in products and what was emitted, every year.

#include "carbon/parameters.hpp"

#include <array>
#include <vector>

namespace arbolex::carbon {

/// Carbon in the living trees of a stand whose stem volume to 7 cm top is
/// `stemVolume` (m³/ha), of a species of specific gravity `gravity`: stem,
/// branches, foliage and roots, t CO₂e/ha.
double liveTrees(double stemVolume, double gravity, const Parameters &parameters);

/// Carbon in stem wood of `volume` (m³/ha), t CO₂e/ha: what a mill receives.
double stemWood(double volume, double gravity, const Parameters &parameters);

/// One year of the rotation as the stand gives it.
struct YearInput {
    /// Carbon in the living trees at this age before any harvest of the age,
    /// t CO₂e/ha.
    double trees = 0.0;
    /// Carbon the harvest of the age takes out of the living trees, t CO₂e/ha
    /// (0 without harvest).
    double harvested = 0.0;
    /// The harvest's stem carbon in each assortment class (7-14, 14-20,
    /// >20 cm), t CO₂e/ha: what goes to the mill. The rest of the harvested
    /// carbon (branches, foliage, roots, tops) is left and counted emitted.
    std::array<double, kPoolCount> stem{};
};

/// One year of the account, t CO₂e/ha.
struct AccountYear {
    int age = 0;
    /// In the living trees at the end of the year (after its harvest).
    double trees = 0.0;
    /// In products in use at the end of the year, every pool.
    double products = 0.0;
    /// Taken up by the trees in the year: their growth.
    double sequestration = 0.0;
    /// Taken out of the trees by the harvest of the year.
    double harvested = 0.0;
    /// Emitted in the year: what the harvest left and the mill lost, and
    /// what the products' decay released.
    double emissions = 0.0;
    /// Sequestration less emissions.
    double netRemoval = 0.0;
    /// Net removal from planting to the end of the year.
    double cumulativeNetRemoval = 0.0;
    /// Carbon units issued at the end of the year (after the buffer).
    double units = 0.0;
};

struct Account {
    /// Ages 0 to the final cut.
    std::vector<AccountYear> years;
    /// Mean over the rotation of the stock units are claimed on (the trees,
    /// with the products when they count): the cap of the claims, t CO₂e/ha.
    double longTermAverage = 0.0;
    /// Every unit issued, t CO₂e/ha.
    double unitsTotal = 0.0;
    /// Each pool's products in use at the final cut, t CO₂e/ha: they go on
    /// decaying after the rotation ends.
    std::array<double, kPoolCount> poolsAtEnd{};
};

/// The account of a rotation from planting (age 0) to `inputs.size() - 1`,
/// the final cut, whose harvest takes the whole crop.
Account account(const std::vector<YearInput> &inputs, const Parameters &parameters);

/// What the products in use at the final cut will emit in all the years after
/// it, discounted to the final cut at `ratePercent`, t CO₂e/ha: for each pool
/// P · (1 − e^−k) / (1 + i − e^−k), all of P at a rate of 0.
double discountedProductRelease(const Account &account, const Parameters &parameters,
                                double ratePercent);

/// What carbon earns in each year of `account`, euro/ha: the price on the
/// net removal (flow), with the later release of the products in use at the
/// final cut charged at it, discounted at `ratePercent`; or the price on the
/// units issued (units). All 0 when carbon does not count.
std::vector<double> carbonCashFlow(const Account &account, const Pricing &pricing,
                                   const Parameters &parameters, double ratePercent);

} // namespace arbolex::carbon
