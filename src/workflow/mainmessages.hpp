#pragma once

// Every text the main window shows, in one place: a changed caption is one edit.

#include "rotation/standchecks.hpp"

#include <QString>

namespace arbolex::workflow::text {

/// A grow-from text the estate reader shares.
inline QString stand(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

// Titles
inline QString titleArbolex() {
    return QStringLiteral("ARBOLEX --- OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT");
}
inline QString titleOstran() {
    return QStringLiteral("OSTRAN DYNAMIC YIELD MODELS FOR FOREST MANAGMENT");
}
/// Title of the thinning messages, misspelt as it always was.
inline QString titleArbolexYeld() {
    return QStringLiteral("ARBOLEX --- OSTRAN DYNAMIC YELD MODELS FOR FOREST MANAGMENT");
}
inline QString captionModelInUse() {
    return QStringLiteral("   ---- MODEL IN USE :  ");
}

// Form check of the grow-from fields
inline QString faultFromAge() {
    return stand(rotation::standtext::kFaultFromAge);
}
inline QString faultFromStocking() {
    return stand(rotation::standtext::kFaultFromStocking);
}
inline QString faultFromHeight() {
    return stand(rotation::standtext::kFaultFromHeight);
}
inline QString faultFromBasalAreaOrDbh() {
    return stand(rotation::standtext::kFaultFromBasalAreaOrDbh);
}
inline QString faultToAge() {
    return QStringLiteral("FAULT - Grow To AGE has not been specified correctly.");
}
inline QString faultByStep() {
    return QStringLiteral("FAULT - Grow BY Step AGE has not been specified correctly.");
}

// Range check
inline QString rangeAge() {
    return stand(rotation::standtext::kRangeAge);
}
inline QString rangeStocking() {
    return stand(rotation::standtext::kRangeStocking);
}
inline QString rangeHeightLead() {
    return stand(rotation::standtext::kRangeHeightLead);
}
inline QString incompatibleBasalAreaDbh() {
    return QStringLiteral("FAULT - Grow From BASAL AREA & DIAMETER fields are incompatible.");
}
inline QString rangeBasalArea() {
    return stand(rotation::standtext::kRangeBasalArea);
}
inline QString rangeToAgeLead() {
    return stand(rotation::standtext::kRangeToAgeLead);
}
inline QString maximumHeight() {
    return stand(rotation::standtext::kMaximumHeight);
}

// Grow command
inline QString changesNotAllowed() {
    return QStringLiteral("Changes are not allowed in the growing process. ") +
           QStringLiteral("\r\n") +
           QStringLiteral(" If you wish to have a different projection, ") +
           QStringLiteral("\r\n") +
           QStringLiteral("use the Clear All button and enter the new informations.");
}
inline QString projectionFailed() {
    return stand(rotation::standtext::kProjectionFailed);
}
inline QString transferFailed() {
    return QStringLiteral("ERROR - difficulty in transferring data.");
}

// Yield class hints
inline QString yieldClassInsufficient() {
    return QStringLiteral("Insufficient data to calculate accurate Yield Class");
}
inline QString yieldClassAtClearfell() {
    return QStringLiteral("Yield Class calculated at clearfell age");
}

// Row labels

// Information
inline QString speciesNotFound() {
    return QStringLiteral("Species not found! Please select a model in the Model Menu.");
}
inline QString thresholdLead() {
    return QStringLiteral("The threshold BA for ");
}
inline QString thresholdIs() {
    return QStringLiteral(" is :  ");
}
inline QString thresholdNotCalculated() {
    return QStringLiteral(" is not calculated but would be & vbCrLf & equal or greater then :");
}
inline QString warnLead() {
    return QStringLiteral("Please note the following with regard to use of:");
}

// Buttons
inline QString gotoSummary() {
    return QStringLiteral("GoTo Summary");
}
inline QString showTimberPrices() {
    return QStringLiteral("Show Timber Prices");
}

// Final cut, summary and row deletion
inline QString titleNpv() {
    return QStringLiteral("NPV");
}
inline QString npvOffer() {
    return QStringLiteral("You now have the option to view the Net Present Value of this "
                          "sub-compartment. If you wish to avail of this possibility, clik Yes");
}
inline QString nothingToFell() {
    return QStringLiteral("FAULT - There is no stand to fell: grow the stand first.");
}
inline QString failedRowsBeforeFinalCut() {
    return QStringLiteral("FAULT - The projection failed before its last row. Delete the "
                          "failed rows before the final cut.");
}
inline QString nothingToSummarize() {
    return QStringLiteral("Sorry!  Nothing to summurize.");
}
inline QString standProjections() {
    return QStringLiteral("Stand Projections");
}
inline QString summary() {
    return QStringLiteral("Summary");
}
/// Heading of the summary's carbon block, naming the carbon money.
inline QString summaryCarbonHeading(const QString &pricing) {
    return QStringLiteral("Carbon, t CO\u2082e/ha \u00b7 ") + pricing;
}
inline QString summaryCarbonAtFinalCut() {
    return QStringLiteral("Stock at the final cut (trees, before felling)");
}
inline QString summaryCarbonAverage() {
    return QStringLiteral("Long-term average stock");
}
inline QString summaryCarbonNetRemoval() {
    return QStringLiteral("Total net removal");
}
inline QString summaryCarbonUnits() {
    return QStringLiteral("Units issued");
}
inline QString summaryCarbonNpv() {
    return QStringLiteral("Carbon revenue NPV");
}
/// Before a final cut: the stock of the last stand.
inline QString summaryCarbonInTrees(int age) {
    return QStringLiteral("In the trees at %1 years (no final cut yet)").arg(age);
}
inline QString gotoStandProjections() {
    return QStringLiteral("GoTo Stand Projections");
}
inline QString yieldClassHint() {
    return QStringLiteral("Yield Class: the culminated mean annual increment");
}
inline QString selectRowToDelete() {
    return QStringLiteral("FAULT - Select the first row to delete in the projection table.");
}
inline QString confirmDelete(int first, int last) {
    return QStringLiteral("PLEASE CONFIRM - Delete rows ") + QString::number(first) +
           QStringLiteral(" to ") + QString::number(last) +
           QStringLiteral(" of the projection table?") + QStringLiteral("\r\n") +
           QStringLiteral("The projection will go on from the row before them.");
}

} // namespace arbolex::workflow::text
