#pragma once

// The grow-from checks of a stand, without the window: the ranges the main
// window accepts, in its order, and the messages it refuses a value with. The
// main window shows these texts; a rotation refuses a regime with them when a
// stand it would grow from lies outside; the estate reader writes them beside
// the refused row.

#include "rotation/rotation.hpp"

#include <optional>
#include <string>
#include <string_view>

namespace arbolex::rotation {

namespace standtext {
inline constexpr std::string_view kFaultFromAge =
    "FAULT - Grow From AGE has not been specified correctly.";
inline constexpr std::string_view kFaultFromStocking =
    "FAULT - Grow From STOCKING has not been specified correctly.";
inline constexpr std::string_view kFaultFromHeight =
    "FAULT - Grow From TOP HEIGHT has not been specified correctly.";
inline constexpr std::string_view kFaultFromBasalAreaOrDbh =
    "FAULT - Grow From BASAL AREA or Mean DBH has not been specified correctly.";
inline constexpr std::string_view kRangeAge =
    "FAULT - Grow From AGE not in acceptable range [10, 60]";
inline constexpr std::string_view kRangeStocking =
    "FAULT - Grow From STOCKING not in acceptable range [100, 5000]";
/// Followed by the model's tallest top height ("##0.00") and "]".
inline constexpr std::string_view kRangeHeightLead =
    "FAULT - Grow From TOP HEIGHT not in acceptable range [5,";
inline constexpr std::string_view kRangeBasalArea =
    "FAULT - Grow From BASAL AREA not in acceptable range [10, 100]";
/// Followed by the oldest age the model may be grown to and "]".
inline constexpr std::string_view kRangeToAgeLead =
    "FAULT - Grow To AGE not in acceptable range [10,";
/// The grow command's message when a projection fails part-way.
inline constexpr std::string_view kProjectionFailed =
    "Error - unable to complete Projection (state inversion problem).";
/// The height field's own refusal, misspelt as it always was.
inline constexpr std::string_view kMaximumHeight = "Maximum height alowed is 49";
} // namespace standtext

/// Ranges of the grow-from fields, bounds included.
inline constexpr float kMinAge = 10.0f;
inline constexpr float kMaxAge = 60.0f;
inline constexpr float kMinStocking = 100.0f;
inline constexpr float kMaxStocking = 5000.0f;
/// Top height, m: at least kMinHeight, at most the model's tallest top height.
inline constexpr float kMinHeight = 5.0f;
/// Tallest top height the height field accepts, m, whatever the model.
inline constexpr float kHeightFieldLimit = 49.0f;
inline constexpr float kMinBasalArea = 10.0f;
inline constexpr float kMaxBasalArea = 100.0f;

/// Youngest age a stand may be grown to, years.
inline constexpr float kMinTargetAge = 10.0f;

/// The field a range check refuses.
enum class GrowFromField { kAge, kStocking, kHeight, kBasalArea, kTargetAge };

/// A refused grow-from value: the field and the message the window shows.
struct GrowFromFault {
    GrowFromField field = GrowFromField::kAge;
    std::string text;
};

/// A grow-from stand as the grow command reads it from its fields, and the
/// age it is grown to.
struct GrowFromValues {
    float age = 0.0f;       ///< years
    float stocking = 0.0f;  ///< stems/ha
    float height = 0.0f;    ///< top height, m
    float basalArea = 0.0f; ///< m²/ha
    float targetAge = 0.0f; ///< years
};

/// The first range the grow command refuses before it completes the basal
/// area and diameter pair: age, stocking, then top height against
/// `maxTopHeight` (m).
std::optional<GrowFromFault> standRangeFault(float age, float stocking, float height,
                                             float maxTopHeight);

/// The ranges checked after the pair is completed: basal area, then the age to
/// grow to against `maxTargetAge` (years).
std::optional<GrowFromFault> basalAreaAndTargetFault(float basalArea, float targetAge,
                                                     int maxTargetAge);

/// Every range check of the grow command on `values`, in its order.
std::optional<GrowFromFault> growFromFault(const GrowFromValues &values, float maxTopHeight,
                                           int maxTargetAge);

/// The first message the main window would refuse `stand` with when it is
/// typed in (the height field's limit, then age, stocking, top height against
/// `maxTopHeight` (m) and basal area, in the window's order), or std::nullopt
/// when it accepts it.
std::optional<std::string> standFault(const Stand &stand, float maxTopHeight);

} // namespace arbolex::rotation
