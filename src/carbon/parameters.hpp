#pragma once

// The constants of the carbon account, each named and with its source
// (docs/carbon.md): how stem volume becomes carbon in the living trees, where
// the carbon of a harvest goes and how long it stays there, and the rules by
// which carbon units are issued. A user of another code changes them here.

#include <array>
#include <string>
#include <string_view>

namespace arbolex::carbon {

/// Tonnes of CO₂ in a tonne of carbon: the molar masses 44/12.
inline constexpr double kCo2PerCarbon = 44.0 / 12.0;

/// The product pools a harvest feeds, in the order of the assortment classes
/// 7-14, 14-20 and >20 cm: pulpwood to paper, pallet wood to panels and
/// pallets, sawlog to sawnwood.
enum class Pool { kPaper, kPanels, kSawnwood };
inline constexpr int kPoolCount = 3;
inline constexpr std::array<std::string_view, kPoolCount> kPoolNames = {"paper", "panels",
                                                                        "sawnwood"};

/// Nominal specific gravity of a species: oven-dry tonnes per m³ of fresh
/// stem volume.
struct SpeciesGravity {
    /// Abbreviation as the model labels begin: "SS", "NS", "DF", "LPC", "SP".
    std::string_view species;
    double gravity = 0.0;
};

struct Parameters {
    /// Nominal specific gravity by species, t/m³.
    std::array<SpeciesGravity, 5> gravity{{
        {"SS", 0.33},
        {"NS", 0.33},
        {"DF", 0.41},
        {"LPC", 0.39},
        {"SP", 0.42},
    }};
    /// Above-ground biomass over the biomass of the stem to 7 cm top (BEF₂
    /// of temperate conifers).
    double branchExpansion = 1.3;
    /// Root biomass from above-ground biomass, both t/ha:
    /// exp(rootIntercept + rootSlope · ln(above-ground)).
    double rootIntercept = -0.7747;
    double rootSlope = 0.8836;
    /// Carbon in a tonne of dry biomass, t.
    double carbonFraction = 0.5;
    /// Share of each class's stem carbon that the mill makes into the pool's
    /// products; the rest is burnt or lost in the year of the harvest.
    std::array<double, kPoolCount> millRecovery{0.5, 0.6, 0.55};
    /// Half-life of each pool, years.
    std::array<double, kPoolCount> halfLife{2.0, 25.0, 35.0};
    /// Share of every carbon unit held back in the buffer against losses.
    double bufferShare = 0.2;
    /// Age of the first verification, years, and the years between the later ones.
    int firstVintage = 5;
    int vintageYears = 10;
    /// True when the units claimed are capped at the long-term average
    /// carbon stock of the rotation.
    bool capAtLongTermAverage = true;
    /// True when the carbon in products counts in the stock units are
    /// claimed on (and in the long-term average).
    bool productsInClaims = false;

    /// Specific gravity of species `code`, or of Sitka spruce when the code
    /// is not in the table.
    double gravityOf(std::string_view code) const;
};

/// How carbon becomes money.
enum class Payment {
    /// Not at all: carbon is shown, never counted in the cash flow.
    kNone,
    /// Paid on each year's net removal, charged on each year's release.
    kFlow,
    /// Paid on the carbon units issued.
    kUnits,
};

/// "none", "flow", "units".
std::string_view paymentName(Payment payment);
/// The payment of `name`, false when it names none.
bool paymentFromName(std::string_view name, Payment &payment);

/// What carbon earns.
struct Pricing {
    /// Carbon price, euro per t CO₂e.
    double price = 0.0;
    Payment payment = Payment::kNone;

    /// True when carbon counts in the cash flow.
    bool counts() const { return payment != Payment::kNone && price != 0.0; }
};

/// What is wrong with `parameters`, empty when nothing is.
std::string parameterFault(const Parameters &parameters);

} // namespace arbolex::carbon
