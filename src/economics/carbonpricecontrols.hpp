#pragma once

#include <QString>

#include <optional>

namespace arbolex::economics {

/// The controls of the carbon price window `frmCarbonPrice`.
enum class CarbonPriceControl {
    /// The carbon price, euro per t CO₂e.
    txtCarbonPrice,
    // how carbon is paid, each option with its one-line explanation
    OptPaymentNone,
    OptPaymentFlow,
    OptPaymentUnits,
    lblPaymentNone,
    lblPaymentFlow,
    lblPaymentUnits,
    // what the window is, and the heading of the constants' table
    lblCarbonDesc,
    lblConstants,
    // commands
    cmdChangeCarbonPrice,
    cmdCloseCarbonPrice,
};

inline constexpr int kCarbonPriceControlCount =
    static_cast<int>(CarbonPriceControl::cmdCloseCarbonPrice) + 1;

/// The control's name ("txtCarbonPrice").
QString carbonPriceControlName(CarbonPriceControl control);
/// The control named `name`, if the window has one.
std::optional<CarbonPriceControl> carbonPriceControlFromName(const QString &name);
/// True for the three payment options.
bool isPaymentOption(CarbonPriceControl control);

} // namespace arbolex::economics
