#pragma once

#include <string_view>

namespace arbolex::engine {

/// Message-box styles used by the engine (icon plus buttons).
enum MessageStyle : int {
    kStyleCritical = 16,    ///< stop icon, OK
    kStyleExclamation = 48, ///< exclamation icon, OK
    kStyleExclamationOkCancel = 49,
    kStyleInformation = 64,
};

/// How the engine reaches the user. The engine never shows anything itself:
/// the application installs an implementation that shows the box and appends
/// the log line to the error log.
class IEngineReport {
public:
    virtual ~IEngineReport() = default;
    /// A message box with its title, text and style.
    virtual void showMessage(std::string_view title, std::string_view text, int style) = 0;
    /// One failure line for the error log, without its date and time stamp.
    virtual void logError(std::string_view message) = 0;
};

/// Titles of the engine's message boxes.
namespace titles {
inline constexpr std::string_view kModelSelection = "MODEL SELECTION";
inline constexpr std::string_view kOstran = "OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT";
inline constexpr std::string_view kArbolex =
    "ARBOLEX --- OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT";
/// The Newton solver's own title: "ARBOLEX" directly followed by the rest.
inline constexpr std::string_view kArbolexNewton =
    "ARBOLEXOSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT";
} // namespace titles

} // namespace arbolex::engine
