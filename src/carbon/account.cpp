#include "carbon/account.hpp"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace arbolex::carbon {

double stemWood(double volume, double gravity, const Parameters &p) {
    return volume > 0.0 ? volume * gravity * p.carbonFraction * kCo2PerCarbon : 0.0;
}

double liveTrees(double stemVolume, double gravity, const Parameters &p) {
    if (!(stemVolume > 0.0)) {
        return 0.0;
    }
    const double aboveGround = stemVolume * gravity * p.branchExpansion;
    const double roots = std::exp(p.rootIntercept + p.rootSlope * std::log(aboveGround));
    return (aboveGround + roots) * p.carbonFraction * kCo2PerCarbon;
}

namespace {

/// A product pool under first-order decay: the stock at the end of a year
/// from the stock at its start and the year's inflow (the inflow decays from
/// the middle of the year on average).
struct Decay {
    double keep = 1.0;
    double inflowKept = 1.0;

    explicit Decay(double halfLife) {
        const double k = std::log(2.0) / halfLife;
        keep = std::exp(-k);
        inflowKept = (1.0 - keep) / k;
    }
};

/// Vintage ends: the first verification, then every `vintageYears`, and the
/// final cut (verified on the crop before it is felled).
bool vintageEnds(int age, int rotation, const Parameters &p) {
    if (age == rotation) {
        return true;
    }
    return age >= p.firstVintage && (age - p.firstVintage) % p.vintageYears == 0;
}

} // namespace

Account account(const std::vector<YearInput> &inputs, const Parameters &p) {
    Account a;
    if (inputs.empty()) {
        return a;
    }
    const int rotation = static_cast<int>(inputs.size()) - 1;
    std::array<Decay, kPoolCount> decay{Decay(p.halfLife[0]), Decay(p.halfLife[1]),
                                        Decay(p.halfLife[2])};
    std::array<double, kPoolCount> pools{};
    double treesBefore = 0.0;
    double cumulative = 0.0;
    // Stock claimed at each vintage end, before the cap is known.
    std::vector<double> claimed(inputs.size(), -1.0);
    double claimedSum = 0.0;
    for (int age = 0; age <= rotation; ++age) {
        const YearInput &in = inputs[static_cast<std::size_t>(age)];
        AccountYear y;
        y.age = age;
        y.harvested = std::clamp(in.harvested, 0.0, in.trees);
        y.trees = in.trees - y.harvested;
        y.sequestration = in.trees - treesBefore;
        // The mill never receives more than the harvest took.
        double toMill = 0.0;
        for (const double s : in.stem) {
            toMill += std::max(s, 0.0);
        }
        const double scale = toMill > y.harvested ? y.harvested / toMill : 1.0;
        double intoProducts = 0.0;
        double decayed = 0.0;
        for (std::size_t k = 0; k < pools.size(); ++k) {
            const double inflow = std::max(in.stem[k], 0.0) * scale * p.millRecovery[k];
            const double before = pools[k];
            pools[k] = decay[k].keep * before + decay[k].inflowKept * inflow;
            intoProducts += inflow;
            decayed += before + inflow - pools[k];
        }
        y.products = std::accumulate(pools.begin(), pools.end(), 0.0);
        y.emissions = (y.harvested - intoProducts) + decayed;
        y.netRemoval = y.sequestration - y.emissions;
        cumulative += y.netRemoval;
        y.cumulativeNetRemoval = cumulative;
        const double stock = y.trees + (p.productsInClaims ? y.products : 0.0);
        if (age < rotation) {
            claimedSum += stock;
        }
        if (vintageEnds(age, rotation, p)) {
            // The final cut is verified on the crop before it is felled.
            claimed[static_cast<std::size_t>(age)] =
                age == rotation ? in.trees + (p.productsInClaims ? y.products : 0.0) : stock;
        }
        treesBefore = y.trees;
        a.years.push_back(y);
    }
    a.poolsAtEnd = pools;
    a.longTermAverage = rotation > 0 ? claimedSum / rotation : 0.0;
    double issued = 0.0;
    for (std::size_t i = 0; i < claimed.size(); ++i) {
        if (claimed[i] < 0.0) {
            continue;
        }
        const double claimable =
            p.capAtLongTermAverage ? std::min(claimed[i], a.longTermAverage) : claimed[i];
        const double units = std::max(0.0, (1.0 - p.bufferShare) * claimable - issued);
        a.years[i].units = units;
        issued += units;
    }
    a.unitsTotal = issued;
    return a;
}

double discountedProductRelease(const Account &account, const Parameters &parameters,
                                double ratePercent) {
    const double i = ratePercent / 100.0;
    double release = 0.0;
    for (std::size_t k = 0; k < account.poolsAtEnd.size(); ++k) {
        const double keep = Decay(parameters.halfLife[k]).keep;
        release += account.poolsAtEnd[k] * (1.0 - keep) / (1.0 + i - keep);
    }
    return release;
}

std::vector<double> carbonCashFlow(const Account &account, const Pricing &pricing,
                                   const Parameters &parameters, double ratePercent) {
    std::vector<double> flow(account.years.size(), 0.0);
    if (!pricing.counts() || flow.empty()) {
        return flow;
    }
    const bool onFlow = pricing.payment == Payment::kFlow;
    for (std::size_t a = 0; a < flow.size(); ++a) {
        const AccountYear &y = account.years[a];
        flow[a] = pricing.price * (onFlow ? y.netRemoval : y.units);
    }
    if (onFlow) {
        flow.back() -= pricing.price * discountedProductRelease(account, parameters, ratePercent);
    }
    return flow;
}

} // namespace arbolex::carbon
