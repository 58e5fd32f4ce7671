#pragma once

// What the rotation commands share: the regime typed on the command line, the
// money options (interest rate, costs, price list) and the prices read from
// the data folder as the program reads them.

#include "cli/options.hpp"
#include "rotation/rotation.hpp"

#include <QString>

#include <cstdint>
#include <vector>

namespace arbolex::cli {

/// The option names of the regime, without their dashes.
std::vector<const char *> regimeOptionNames();

/// Help lines of the regime options.
QString regimeOptionsHelp();

/// Reads the regime: none of its options gives a rotation without thinning;
/// --thin-from, --thin-every and --thin-volume come together. Throws UsageError.
rotation::Regime readRegime(const Options &options);

/// The option names of the money of a rotation, without their dashes.
std::vector<const char *> economicsOptionNames();

/// Help lines of the money options.
QString economicsOptionsHelp();

/// Reads the interest rate (above 0, the program's default rate without it),
/// the costs (0 by default, never negative) and the price list (long-term
/// average prices without --prices), whose prices come from the data folder's
/// files as the program reads them, each as its absolute value. Throws
/// UsageError.
rotation::Economics readEconomics(const Options &options, const QString &dataFolder);

/// The output format: "tsv" (the default) or "json". Throws UsageError.
QString readFormat(const Options &options);

} // namespace arbolex::cli
