#pragma once

// The work on one sub-compartment as a whole, to keep it (a document) and put
// it back exactly as it stood, growing, thinning and the cash flow going on
// from there without recomputing anything.

#include "rotation/priceclasses.hpp"
#include "work/mdlnpv.hpp"
#include "work/projectiontable.hpp"
#include "work/subcompartment.hpp"

#include <QString>

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

namespace arbolex::work {

/// The fields of the main window that the work keeps, as typed: the grow-from
/// stand, the age to grow to and the step, and the net area.
enum class WorkField : int {
    FromAge,
    FromStocking,
    FromHeight,
    FromBasalArea,
    FromDbh,
    ToAge,
    ByStep,
    NetArea,
};
inline constexpr int kWorkFieldCount = 8;

/// Every work field, in order.
inline constexpr std::array<WorkField, kWorkFieldCount> kWorkFields{
    WorkField::FromAge, WorkField::FromStocking, WorkField::FromHeight, WorkField::FromBasalArea,
    WorkField::FromDbh, WorkField::ToAge,        WorkField::ByStep,     WorkField::NetArea};

/// The name of the main window's field that shows `field` ("txtFromA"); a
/// document names its fields so.
std::string_view workFieldName(WorkField field);

struct WorkSnapshot {
    SubCompartment identification;
    /// Model identifier 0 to 21.
    int modelId = 0;
    /// Texts of the work fields, in the order of kWorkFields.
    std::array<QString, kWorkFieldCount> fields;
    /// Site index as `lblSI` shows it, and the engine's value, m.
    QString siteIndexText;
    float siteIndex = 0.0f;

    HeaderLayout layout = HeaderLayout::WithMoney;
    std::vector<TableRow> rows;
    int currentRow = 0;
    int selectionEnd = 0;
    /// Volume per ha of the last stand, m³/ha (written for older readers; the
    /// work derives it from the rows).
    double standingVolume = 0.0;
    /// True when the rows end with a final cut (written for older readers).
    bool felled = false;

    /// The cash flow year by year (empty when none is laid out) and its first year.
    int cashFlowFirstYear = 0;
    std::vector<CashFlowRecord> cashFlow;
    /// Interest rate, percent.
    double interestRate = 0.0;
    /// Establishment cost, euro/ha, and yearly cost, euro/ha/year; none in a
    /// document written before the work had them (the defaults then hold).
    std::optional<double> establishmentCost;
    std::optional<double> annualCost;

    /// Price set in use and the prices the rows were valued with, euro/m³.
    std::int16_t priceSetInUse = 0;
    rotation::PriceList pricesInUse{};

    /// True when `other` holds the same work; where the selection stands does not count.
    bool sameWork(const WorkSnapshot &other) const;
};

} // namespace arbolex::work
