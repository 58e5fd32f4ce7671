#include "rotation/standchecks.hpp"

#include "format/displayformat.hpp"

namespace arbolex::rotation {

std::optional<GrowFromFault> standRangeFault(float age, float stocking, float height,
                                             float maxTopHeight) {
    if (age < kMinAge || age > kMaxAge) {
        return GrowFromFault{GrowFromField::kAge, std::string(standtext::kRangeAge)};
    }
    if (stocking < kMinStocking || stocking > kMaxStocking) {
        return GrowFromFault{GrowFromField::kStocking, std::string(standtext::kRangeStocking)};
    }
    if (height < kMinHeight || height > maxTopHeight) {
        return GrowFromFault{GrowFromField::kHeight,
                             std::string(standtext::kRangeHeightLead) +
                                 format::formatNumber(maxTopHeight, "##0.00") + "]"};
    }
    return std::nullopt;
}

std::optional<GrowFromFault> basalAreaAndTargetFault(float basalArea, float targetAge,
                                                     int maxTargetAge) {
    if (basalArea < kMinBasalArea || basalArea > kMaxBasalArea) {
        return GrowFromFault{GrowFromField::kBasalArea, std::string(standtext::kRangeBasalArea)};
    }
    if (targetAge < kMinTargetAge || targetAge > static_cast<float>(maxTargetAge)) {
        return GrowFromFault{GrowFromField::kTargetAge, std::string(standtext::kRangeToAgeLead) +
                                                            std::to_string(maxTargetAge) + "]"};
    }
    return std::nullopt;
}

std::optional<GrowFromFault> growFromFault(const GrowFromValues &values, float maxTopHeight,
                                           int maxTargetAge) {
    if (auto fault = standRangeFault(values.age, values.stocking, values.height, maxTopHeight)) {
        return fault;
    }
    return basalAreaAndTargetFault(values.basalArea, values.targetAge, maxTargetAge);
}

std::optional<std::string> standFault(const Stand &stand, float maxTopHeight) {
    // The height field refuses a tall stand as soon as it is typed, before
    // any range check.
    if (stand.height > kHeightFieldLimit) {
        return std::string(standtext::kMaximumHeight);
    }
    if (auto fault = standRangeFault(stand.age, stand.stocking, stand.height, maxTopHeight)) {
        return std::move(fault->text);
    }
    if (stand.basalArea < kMinBasalArea || stand.basalArea > kMaxBasalArea) {
        return std::string(standtext::kRangeBasalArea);
    }
    return std::nullopt;
}

} // namespace arbolex::rotation
