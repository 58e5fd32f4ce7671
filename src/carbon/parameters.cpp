#include "carbon/parameters.hpp"

#include <cmath>

namespace arbolex::carbon {

double Parameters::gravityOf(std::string_view code) const {
    for (const SpeciesGravity &g : gravity) {
        if (g.species == code) {
            return g.gravity;
        }
    }
    return gravity.front().gravity;
}

std::string_view paymentName(Payment payment) {
    switch (payment) {
    case Payment::kFlow:
        return "flow";
    case Payment::kUnits:
        return "units";
    case Payment::kNone:
        break;
    }
    return "none";
}

bool paymentFromName(std::string_view name, Payment &payment) {
    for (const Payment p : {Payment::kNone, Payment::kFlow, Payment::kUnits}) {
        if (paymentName(p) == name) {
            payment = p;
            return true;
        }
    }
    return false;
}

namespace {

bool share(double s) {
    return std::isfinite(s) && s >= 0.0 && s <= 1.0;
}

} // namespace

std::string parameterFault(const Parameters &p) {
    for (const SpeciesGravity &g : p.gravity) {
        if (!(std::isfinite(g.gravity) && g.gravity > 0.0 && g.gravity < 1.5)) {
            return "the specific gravity of " + std::string(g.species) +
                   " must be above 0 and below 1.5 t/m3";
        }
    }
    if (!(std::isfinite(p.branchExpansion) && p.branchExpansion >= 1.0 &&
          p.branchExpansion <= 5.0)) {
        return "the branch expansion factor must be from 1 to 5";
    }
    if (!std::isfinite(p.rootIntercept) || !(p.rootSlope > 0.0 && p.rootSlope <= 1.5)) {
        return "the root equation's slope must be above 0 and at most 1.5";
    }
    if (!(p.carbonFraction > 0.0 && p.carbonFraction <= 1.0)) {
        return "the carbon fraction must be above 0 and at most 1";
    }
    for (int i = 0; i < kPoolCount; ++i) {
        const auto k = static_cast<std::size_t>(i);
        if (!share(p.millRecovery[k])) {
            return "the mill recovery into " + std::string(kPoolNames[k]) + " must be from 0 to 1";
        }
        if (!(std::isfinite(p.halfLife[k]) && p.halfLife[k] > 0.0)) {
            return "the half-life of " + std::string(kPoolNames[k]) + " must be above 0 years";
        }
    }
    if (!(share(p.bufferShare) && p.bufferShare < 1.0)) {
        return "the buffer share must be from 0 to below 1";
    }
    if (p.firstVintage < 1 || p.vintageYears < 1) {
        return "the first vintage and the years between vintages must be 1 or more";
    }
    return {};
}

} // namespace arbolex::carbon
