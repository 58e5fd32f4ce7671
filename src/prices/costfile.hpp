#pragma once

// The cost file "Costs.qdm": the establishment cost and the yearly cost,
// euro per ha, one number a line in the format of the price files. A new work
// starts with them, and the command-line program counts them unless its
// options say otherwise. Read only.

#include "prices/pricedata.hpp"

#include <QString>

#include <optional>

namespace arbolex::shell {
class ErrorLog;
}

namespace arbolex::prices {

/// Highest cost of either kind, euro per ha: what a cost field shows ("#0.00").
inline constexpr double kMaxCost = 99999.99;

/// What reading a cost file gave: the costs, or why not.
struct CostsReading {
    std::optional<CostDefaults> costs;
    /// True when there is no such file at all.
    bool missing = false;
    /// What is wrong with the file, naming it and the value at fault.
    QString fault;
};

/// Reads and checks a whole cost file: exactly two numbers, the establishment
/// cost then the yearly cost, each from 0 to kMaxCost. A file that cannot be
/// read, a value that is not a number or out of range, too few or too many
/// values: no costs.
CostsReading readCosts(const QString &path);

/// Start-up: the data folder's costs replace `data`'s only when the whole
/// file is right; otherwise one line goes to the error log and the costs stay
/// as they were.
void GetCostsFromFile(const QString &dataFolder, PriceData &data, shell::ErrorLog &log);

} // namespace arbolex::prices
