#pragma once

// The assortment price file "AssortPrices.qdm": the standing prices of the
// top-diameter classes 7-14, 14-20 and >20 cm, euro per m³, one number a line
// in the format of the other price files. Read at start-up and written at
// exit beside them.

#include "prices/pricedata.hpp"

#include <QString>

#include <optional>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::prices {

/// Highest price of a class, euro per m³: what a price field shows ("#0.00").
inline constexpr double kMaxAssortmentPrice = 9999.99;

/// What reading an assortment price file gave: the prices, or why not.
struct AssortmentPricesReading {
    std::optional<rotation::AssortmentPriceList> prices;
    /// What is wrong with the file, naming it and the value at fault.
    QString fault;
};

/// Reads and checks a whole assortment price file: exactly three prices, each
/// a number from 0 to kMaxAssortmentPrice. A file that cannot be read, a value
/// that is not a number or out of range, too few or too many values: no prices.
AssortmentPricesReading readAssortmentPrices(const QString &path);

/// Start-up: the data folder's assortment prices replace `data`'s only when
/// the whole file is right; otherwise one line goes to the error log and the
/// prices stay as they were.
void GetAssortmentPricesFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log);

/// Exit: writes the three prices, one a line. Failures are logged; a file that
/// cannot be written is left as it was.
void WriteAssortmentPricesInFile(const QString &dataFolder, const PriceData &data,
                                 shell::ErrorLog &log);

} // namespace arbolex::prices
