#pragma once

// How carbon is written wherever it shows: the price and its payment in
// words, tonnes of CO₂e per hectare, and the constants of the account with
// their sources as the carbon file names them.

#include "carbon/carbonfile.hpp"

#include <QString>
#include <QStringList>

#include <vector>

namespace arbolex::economics {

/// "56.00": a carbon price as its field shows it, euro per t CO₂e.
QString carbonPriceText(double price);
/// "carbon at 56 €/t CO₂e (flow)"; "carbon at 56 €/t CO₂e, not paid"
/// without a payment.
QString pricingText(const carbon::Pricing &pricing);
/// "1,234.5": tonnes of CO₂e per ha, one decimal, thousands separated.
QString tonnesText(double tonnes);
/// The constants of the account: captions, then name, value and what it is
/// with its source (only on the first name under one comment of the file).
std::vector<QStringList> constantsGrid(const carbon::Settings &settings);

} // namespace arbolex::economics
