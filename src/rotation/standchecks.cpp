#include "rotation/standchecks.hpp"

#include <cstdio>

namespace arbolex::rotation {

std::optional<std::string> standFault(const Stand &stand, float maxTopHeight) {
    // The height field refuses a tall stand as soon as it is typed, before
    // any range check.
    if (stand.height > kHeightFieldLimit) {
        return std::string(standtext::kMaximumHeight);
    }
    if (stand.age < kMinAge || stand.age > kMaxAge) {
        return std::string(standtext::kRangeAge);
    }
    if (stand.stocking < kMinStocking || stand.stocking > kMaxStocking) {
        return std::string(standtext::kRangeStocking);
    }
    if (stand.height < kMinHeight || stand.height > maxTopHeight) {
        char limit[32];
        std::snprintf(limit, sizeof limit, "%.2f", static_cast<double>(maxTopHeight));
        return std::string(standtext::kRangeHeightLead) + limit + "]";
    }
    if (stand.basalArea < kMinBasalArea || stand.basalArea > kMaxBasalArea) {
        return std::string(standtext::kRangeBasalArea);
    }
    return std::nullopt;
}

} // namespace arbolex::rotation
