#pragma once

// The grow-from checks of a stand, without the window: the ranges the main
// window accepts and the messages it refuses a value with. The main window
// shows these texts; the estate reader writes them beside the refused row.

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

/// The first message the main window would refuse `stand` with (the height
/// field's limit, then age, stocking, top height against `maxTopHeight` (m)
/// and basal area, in the window's order), or std::nullopt when it accepts it.
std::optional<std::string> standFault(const Stand &stand, float maxTopHeight);

} // namespace arbolex::rotation
