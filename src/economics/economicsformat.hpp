#pragma once

// How the economics window writes its figures: whole euro with thousands
// separators, rates with two decimals, whatever the locale of the machine.

#include <QString>

#include <optional>

namespace arbolex::economics {

/// "12,345", "−1,234": whole euro with thousands separators.
QString euroText(double euro);
/// "12,345 €/ha", or "—" when the figure does not exist.
QString euroPerHaText(const std::optional<double> &euro);
/// "3.00", "2.75": a rate in percent with at least two decimals.
QString percentText(double percent);
/// "1,234.5": a quantity with thousands separators and `decimals` decimals.
QString quantityText(double value, int decimals);

} // namespace arbolex::economics
