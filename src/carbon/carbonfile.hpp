#pragma once

// The carbon file "Carbon.qdm": the carbon price and how it is paid, and
// every constant of the carbon account, one `name = value` a line with `#`
// comments naming the sources. The desktop program reads it at start and
// writes it at exit; the command-line program reads its constants (the price
// only from its options). A file is read whole or not at all.

#include "carbon/parameters.hpp"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace arbolex::carbon {

/// Name of the carbon file in the data folder.
inline constexpr const char *kCarbonFile = "Carbon.qdm";

/// What the carbon file holds.
struct Settings {
    Pricing pricing{};
    Parameters parameters{};

    bool operator==(const Settings &other) const;
};

/// The shipped carbon price, euro per t CO₂e: Ireland's carbon tax on fossil
/// fuels from 1 May 2024 (Finance Act 2020), not counted until a payment is
/// chosen.
inline constexpr double kDefaultCarbonPrice = 56.0;

/// Highest carbon price a file or a field may hold, euro per t CO₂e.
inline constexpr double kMaxCarbonPrice = 10000.0;

/// The settings a first start has: the shipped price, no payment, the
/// constants' defaults.
Settings defaultSettings();

/// What reading a carbon file gave: its settings, or the first fault with its
/// line ("line 4: the half-life of paper must be above 0 years").
struct CarbonReading {
    std::optional<Settings> settings;
    std::string fault;
};

/// Reads the text of a carbon file. Every name must be known and appear at
/// most once; a name left out keeps its default; the settings must pass
/// parameterFault.
CarbonReading readCarbonText(std::string_view text);

/// The text of a carbon file holding `settings`, every name with its
/// source as a comment.
std::string carbonText(const Settings &settings);

/// One constant of the account as the carbon file writes it.
struct ConstantEntry {
    /// Its name in the file ("half_life.paper").
    std::string name;
    /// Its value as the file writes it ("2", "yes").
    std::string value;
    /// The comment above it: what it is and its source. A name that follows
    /// another under the same comment has none.
    std::string source;
};

/// Every constant of the account in `settings` (not the price nor the
/// payment), in the file's order.
std::vector<ConstantEntry> constantEntries(const Settings &settings);

} // namespace arbolex::carbon
