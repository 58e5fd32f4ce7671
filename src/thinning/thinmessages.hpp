#pragma once

// Every text of the thinning window and the thinning commands, in one place.

#include "engine/grow.hpp"

#include <QString>

#include <string_view>

namespace arbolex::thinning::text {

/// A text the engine's volume thinning shares with this window.
inline QString engineText(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

inline QString lf() {
    return QStringLiteral("\n");
}
inline QString cr() {
    return QStringLiteral("\r");
}

// Main window's thin command
inline QString cannotThinLead() {
    return QStringLiteral("A Sub-Compartment of ");
}
inline QString cannotThinYears() {
    return QStringLiteral(" years of age ");
}
inline QString cannotThinAt() {
    return QStringLiteral("cannot be thinned at age ");
}
inline QString singleRowRequired() {
    return QStringLiteral("FAULT - Thinning requires selection of a ") + lf() + cr() +
           QStringLiteral("single Growth Projection row.");
}
inline QString growthRowRequired() {
    return QStringLiteral(
        "FAULT - Thinning requires that the selected row be a Growth Projection row.");
}
inline QString growBeforeThinning() {
    return QStringLiteral("Please grow the Sub-Compartment  before thinning again.");
}
inline QString loopOffer() {
    return QStringLiteral("You now have the option of thinning only once") + cr() + lf() +
           QStringLiteral("OR ") + cr() + lf() +
           QStringLiteral("to set a thinning frequency and intensity.") + cr() + lf() + lf() +
           QStringLiteral("Do you wish to set a thinning frequency and intensity ?");
}
inline QString thinningAtAge() {
    return QStringLiteral("Thinning at age ");
}

// Field checks
inline QString remBNonNumeric() {
    return QStringLiteral("FAULT - thinning Basal Area removal is nonnumeric.");
}
inline QString remNNonNumeric() {
    return QStringLiteral("FAULT - thinning Stocking removal is nonnumeric.");
}
inline QString remVNonNumeric() {
    return QStringLiteral("FAULT - thinning Volume removal is nonnumeric.");
}
inline QString postBNonNumeric() {
    return QStringLiteral("FAULT - Post thinning Basal Area in nonnumeric.");
}
inline QString postNNonNumeric() {
    return QStringLiteral("FAULT - Post thinning Stocking is nonnumeric.");
}
inline QString postVNonNumeric() {
    return QStringLiteral("FAULT - Post thinning Volume is nonnumeric.");
}
inline QString postBNotPositive() {
    return QStringLiteral("FAULT - Post thinning Basal Area is negative or zero.");
}
inline QString postNNotPositive() {
    return QStringLiteral("FAULT - Post thinning Stocking is negative or zero.");
}
inline QString postVNotPositive() {
    return QStringLiteral("FAULT - Post thinning Volume is negative or zero.");
}
inline QString removalLeavesNoBasalArea() {
    return QStringLiteral("FAULT - Proposed thinning leads to negative or zero Basal Area.");
}
inline QString removalLeavesNoStocking() {
    return QStringLiteral("FAULT - Proposed thinning leads to negative or zero Stocking.");
}
inline QString removalLeavesNoVolume() {
    return engineText(engine::thinningtext::kRemovalLeavesNoVolume);
}
inline QString howToPrescribe() {
    return QStringLiteral("FAULT - a thinning may be correctly prescribed by:") + lf() + cr() +
           lf() + QStringLiteral("1) Specifying Basal area & Stocking reductions; or") + lf() +
           cr() + QStringLiteral("2) Specifying Basal area reduction; or") + lf() + cr() +
           QStringLiteral("3) Specifying Stocking reduction; or") + lf() + cr() +
           QStringLiteral("4) Specifying Stand volume reduction");
}
inline QString nothingLeft() {
    return engineText(engine::thinningtext::kNothingLeft);
}
/// A model without a thinning response ties no basal area to stocking.
inline QString noThinningResponse() {
    return engineText(engine::thinningtext::kNoThinningResponse);
}

// Accept and loop
inline QString acceptFailed() {
    return QStringLiteral("ERROR - difficulty in frmThin.cmdAccept_Click().");
}
inline QString enterFrequency() {
    return QStringLiteral("Please enter a frequence for the projected thinnings.");
}
inline QString enterThinUntil() {
    return QStringLiteral("Please enter a value for the projected age to grow to.");
}

} // namespace arbolex::thinning::text
