#pragma once

#include <QString>

#include <array>

namespace arbolex::assortments {

/// Report kinds, as the index of the thinning window's Assort buttons.
enum ReportKind : int {
    kPreThin = 0,  ///< the crop before the thinning
    kThinning = 1, ///< the removed trees
    kPostThin = 2, ///< the crop after the thinning
};

/// The assortment state shared by the reports, the thinning window and the
/// rows written after a thinning is accepted.
struct AssortmentSession {
    /// Kind of the report being built (ReportKind).
    int reportKind = kPreThin;
    /// When set, reports are built over the user categories (frmAssortLoadMod).
    bool userCategories = false;
    /// Report-kind digits asked for since the thinning window was loaded.
    QString pending;
    /// Title of the last report of each kind.
    std::array<QString, 3> descriptions;
};

} // namespace arbolex::assortments
