#pragma once

#include "rotation/priceclasses.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"
#include "work/subcompartment.hpp"
#include "workflow/maincontrols.hpp"

#include <QString>

#include <array>
#include <cstdint>
#include <vector>

namespace arbolex::workflow {

/// The fields of the main window a sub-compartment keeps, as typed.
inline constexpr std::array<MainControl, 8> kSnapshotFields{
    MainControl::txtFromA, MainControl::txtFromN, MainControl::txtFromH, MainControl::txtFromB,
    MainControl::txtFromD, MainControl::txtToA,   MainControl::txtByA,   MainControl::txtNetArea};

/// Everything the main window holds of one sub-compartment, to continue work
/// exactly where it stood: taken by MainWindowLogic::snapshot(), put back by
/// MainWindowLogic::restore() without recomputing anything.
struct MainSnapshot {
    work::SubCompartment identification;
    /// Model identifier 0 to 21.
    int modelId = 0;
    /// Texts of kSnapshotFields, in that order.
    std::array<QString, kSnapshotFields.size()> fields;
    /// Site index as `lblSI` shows it, and the engine's value, m.
    QString siteIndexText;
    float siteIndex = 0.0f;

    work::HeaderLayout layout = work::HeaderLayout::WithMoney;
    std::vector<work::TableRow> rows;
    int currentRow = 0;
    int selectionEnd = 0;
    /// Volume per ha of the last growth row, m³/ha.
    double standingVolume = 0.0;
    bool felled = false;

    /// The cash flow year by year (empty when none is laid out) and its first year.
    int cashFlowFirstYear = 0;
    std::vector<work::CashFlowRecord> cashFlow;
    /// Interest rate, percent.
    double interestRate = 0.0;

    /// Price set in use and the prices the rows were valued with, euro/m³.
    std::int16_t priceSetInUse = 0;
    rotation::PriceList pricesInUse{};

    /// True when `other` holds the same work; where the selection stands does not count.
    bool sameWork(const MainSnapshot &other) const;
};

} // namespace arbolex::workflow
