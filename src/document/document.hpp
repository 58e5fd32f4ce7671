#pragma once

// A sub-compartment as a document: the file format's name and version, and
// the work it holds (the work on the sub-compartment as a whole).

#include "work/worksnapshot.hpp"

namespace arbolex::document {

/// The work of one sub-compartment as a file holds it.
using Document = work::WorkSnapshot;

/// Value of the "format" field that opens every file.
inline constexpr const char *kFormatName = "ARBOLEX sub-compartment";
/// Version this program writes; it reads this and every older one. Version 2
/// adds the establishment and yearly costs to the cash flow.
inline constexpr int kFormatVersion = 2;
/// Suffix of a document's file name, without the dot.
inline constexpr const char *kFileSuffix = "arbolex";

// Names of the fields of the file.
namespace key {
inline constexpr const char *format = "format";
inline constexpr const char *version = "version";
inline constexpr const char *subCompartment = "subCompartment";
inline constexpr const char *forest = "forest";
inline constexpr const char *compartment = "compartment";
inline constexpr const char *notes = "notes";
inline constexpr const char *model = "model";
inline constexpr const char *fields = "fields";
inline constexpr const char *siteIndex = "siteIndex";
inline constexpr const char *siteIndexText = "siteIndexText";
inline constexpr const char *table = "table";
inline constexpr const char *layout = "layout";
inline constexpr const char *rows = "rows";
inline constexpr const char *currentRow = "currentRow";
inline constexpr const char *selectionEnd = "selectionEnd";
inline constexpr const char *standingVolume = "standingVolume";
inline constexpr const char *felled = "felled";
inline constexpr const char *kind = "kind";
inline constexpr const char *label = "label";
inline constexpr const char *cells = "cells";
inline constexpr const char *record = "record";
inline constexpr const char *numbers = "numbers";
inline constexpr const char *removedValue = "removedValue";
inline constexpr const char *timberRevenue = "timberRevenue";
inline constexpr const char *finalCut = "finalCut";
inline constexpr const char *cashFlow = "cashFlow";
inline constexpr const char *interestRate = "interestRate";
inline constexpr const char *firstYear = "firstYear";
inline constexpr const char *years = "years";
inline constexpr const char *year = "year";
inline constexpr const char *operation = "operation";
inline constexpr const char *cost = "cost";
inline constexpr const char *otherRevenues = "otherRevenues";
inline constexpr const char *totalRevenues = "totalRevenues";
inline constexpr const char *cashFlowValue = "cashFlow";
inline constexpr const char *discountedCashFlow = "discountedCashFlow";
inline constexpr const char *establishmentCost = "establishmentCost";
inline constexpr const char *annualCost = "annualCost";
inline constexpr const char *prices = "prices";
inline constexpr const char *setInUse = "setInUse";
inline constexpr const char *inUse = "inUse";
} // namespace key

/// Names of the row kinds and header layouts in the file.
inline constexpr const char *kRowKindNames[] = {"failed", "growth", "thinning", "text"};
inline constexpr const char *kLayoutWithMoney = "withMoney";
inline constexpr const char *kLayoutWithoutMoney = "withoutMoney";

/// Fields of a row record in the file, in the order of workflow::RowRecord.
inline constexpr const char *kRecordFields[] = {
    "age", "topHeight",        "basalArea",       "stocking",      "volume",
    "dbh", "removedBasalArea", "removedStocking", "removedVolume", "postDbh"};

} // namespace arbolex::document
