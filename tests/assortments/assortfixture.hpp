#pragma once

#include "thinning/thinningfixture.hpp"

#include "assortments/assortuserlogic.hpp"
#include "assortments/assortwindowlogic.hpp"
#include "assortments/headlessassortview.hpp"

namespace arbolex::testing {

using assortments::AssortControl;
using assortments::AssortUserControl;

/// The main and thinning windows with the assortment report and the user
/// categories windows attached, the shipped categories loaded.
class AssortTest : public ThinningTest {
protected:
    /// The labels of the rows after the last thinning row.
    QStringList labelsAfterThinning() const {
        QStringList labels;
        bool after = false;
        for (int r = 1; r <= logic.table().lastRow(); ++r) {
            const work::TableRow &row = logic.table().row(r);
            if (after) {
                labels << row.label;
            }
            after = after || row.isThinning();
        }
        return labels;
    }

    assortments::AssortWindowLogic &assort = session.assort();
    assortments::AssortUserLogic &user = session.assortUser();
};

} // namespace arbolex::testing
