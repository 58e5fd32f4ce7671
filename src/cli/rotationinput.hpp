#pragma once

// What the rotation commands share: the regime typed on the command line, the
// money options (interest rate, costs, price list) and the prices read from
// the data folder as the program reads them.

#include "cli/options.hpp"
#include "cli/resultdocument.hpp"
#include "cli/standinput.hpp"
#include "rotation/rotation.hpp"

#include <QString>
#include <QTextStream>

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

/// The regime as its options (nothing for a rotation without thinning).
Fields regimeFields(const rotation::Regime &regime);

/// The option names of the money of a rotation, without their dashes.
std::vector<const char *> economicsOptionNames();

/// Help lines of the money options.
QString economicsOptionsHelp();

/// Reads the interest rate (above 0, the program's default rate without it),
/// the costs (never negative; without their options those of the data
/// folder's cost file, 0 when it has none) and the price list (long-term
/// average prices without --prices), whose prices come from the data folder's
/// files as the program reads them, each as its absolute value, and the
/// valuation (--valuation, by assortments with the prices of
/// --assortment-prices or the data folder's assortment price file). Records
/// them in `run`, with the files read and the prices used. Throws UsageError.
rotation::Economics readEconomics(const Options &options, const QString &dataFolder,
                                  RunRecord &run);

/// The valuation of the harvests as the output names it: "stand" or "assortment".
QString valuationName(const rotation::Economics &economics);

/// The option names of a command over one stand's rotations: the stand, the
/// regime, the money, "rotation" and "format", then `more`.
std::vector<const char *> rotationOptionNames(std::initializer_list<const char *> more = {});

/// What every command over one stand's rotation reads.
struct RotationInput {
    StandInput stand;
    rotation::Regime regime;
    rotation::Economics economics;
    /// --rotation: the final-cut age, when given.
    std::optional<int> rotation;
    Format format = Format::kTsv;
};

/// Reads the stand, the regime, --rotation, --format and the money, and
/// records them in `run`. Throws UsageError.
RotationInput readRotationInput(const Options &options, const QString &dataFolder, RunRecord &run);

/// The site index, the model, the rate and the valuation: the "#" lines
/// above a table.
Fields rotationPreamble(const engine::Grow &grow, const rotation::Economics &economics);

/// The stand grown under the regime and the final-cut age (--rotation, else
/// the economic rotation), or the exit status after the reason has been
/// written to `err` ("arbolex-cli <command>: ..."): 2 for a stand, regime or
/// rotation the model cannot carry, 1 when the engine failed.
struct GrownRotation {
    std::optional<rotation::GrowthPath> path;
    int rotation = 0;
    int status = 0;
};
GrownRotation growRotation(engine::Grow &grow, const RotationInput &input, const QString &command,
                           QTextStream &err);

} // namespace arbolex::cli
