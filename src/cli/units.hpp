#pragma once

// The unit of every figure the command-line program prints, by the key that
// names it in the outputs (docs/cli.md lists them). One table: a command
// never writes a unit of its own, and a key keeps one unit in every output
// of one stand. The estate's files count some amounts for a
// sub-compartment's whole area; their keys read the estate's table first.

#include <QString>
#include <QStringView>

namespace arbolex::cli::units {

inline constexpr const char *kYears = "years";
inline constexpr const char *kCalendarYear = "calendar year";
inline constexpr const char *kMetres = "m";
inline constexpr const char *kCentimetres = "cm";
inline constexpr const char *kStemsPerHa = "stems/ha";
inline constexpr const char *kSquareMetresPerHa = "m2/ha";
inline constexpr const char *kCubicMetres = "m3";
inline constexpr const char *kCubicMetresPerHa = "m3/ha";
inline constexpr const char *kCubicMetresPerHaYear = "m3/ha/yr";
inline constexpr const char *kEuro = "EUR";
inline constexpr const char *kEuroPerHa = "EUR/ha";
inline constexpr const char *kEuroPerHaYear = "EUR/ha/yr";
inline constexpr const char *kEuroPerCubicMetre = "EUR/m3";
inline constexpr const char *kEuroPerTonneCo2e = "EUR/t CO2e";
inline constexpr const char *kTonnesCo2ePerHa = "t CO2e/ha";
inline constexpr const char *kTonnesCo2e = "t CO2e";
inline constexpr const char *kPercent = "%";
inline constexpr const char *kPercentPerYear = "%/yr";
/// A pure number: a count, an identifier, a share or a factor.
inline constexpr const char *kNumber = "1";

/// Which outputs a key belongs to.
enum class Table {
    /// Everything about one stand, per hectare.
    kStand,
    /// The estate's files: amounts for the sub-compartment's area beside
    /// those per hectare.
    kEstate,
};

/// The unit of `key`, or nullptr when the key names no figure.
const char *unitOf(QStringView key, Table table = Table::kStand);

} // namespace arbolex::cli::units
