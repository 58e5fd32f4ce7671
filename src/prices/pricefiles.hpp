#pragma once

// The price files of the data folder as the program keeps them: read at
// start-up and after a restore, written back at exit with a dated copy of
// each file it writes over.

#include <QString>

namespace arbolex::shell {
class DataHistory;
class ErrorLog;
} // namespace arbolex::shell

namespace arbolex::prices {

class Prices;

/// The price lists, categories, assortment prices, default costs and carbon
/// settings from `dataFolder`.
void readPriceFiles(const QString &dataFolder, Prices &prices, shell::ErrorLog &log);

/// Forgets the prices and reads them from `dataFolder` again (after a file was
/// restored), keeping the price set in use.
void rereadPriceFiles(const QString &dataFolder, Prices &prices, shell::ErrorLog &log);

/// Writes the price lists, the user's categories and the assortment prices
/// back to `dataFolder`, and the carbon settings when the user changed them,
/// each file kept in `history` first (when there is one).
/// A failure is logged under `label` and the other files are still written.
void writePriceFilesAtExit(const QString &dataFolder, const Prices &prices,
                           const shell::DataHistory *history, const QString &label,
                           shell::ErrorLog &log);

} // namespace arbolex::prices
