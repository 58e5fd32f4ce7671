#pragma once

#include "workflow/mainwindowfixture.hpp"

#include "prices/costfile.hpp"
#include "prices/pricedata.hpp"
#include "shell/vbformat.hpp"
#include "thinning/headlessthinview.hpp"
#include "thinning/thinwindowlogic.hpp"

#include <QDir>

namespace arbolex::testing {

using thinning::ThinControl;

/// The main window with a thinning window attached, the shipped price lists
/// and default costs, and model 0 grown from age 15 to `to`.
class ThinningTest : public MainWindowTest {
protected:
    ThinningTest() {
        const QDir source(QStringLiteral(ARBOLEX_DATA_SOURCE));
        prices::GetPricesFromFiles(source.path(), prices.data(), log);
        prices::GetCostsFromFile(source.path(), prices.data(), log);
    }

    void growTo(const QString &to, const QString &by = QStringLiteral("5")) {
        typeStand(to, by);
        logic.cmdGrow_Click();
    }

    /// Grows to `to` and opens the thinning window on the last row.
    void openThinning(const QString &to = QStringLiteral("30")) {
        growTo(to);
        logic.cmdThin_Click();
    }

    /// Opens the thinning window at 30 and previews a removal of `volume` m³/ha.
    void previewThinning(const QString &volume = QStringLiteral("60")) {
        openThinning();
        typeThin(ThinControl::txtRemV, volume);
        thin.cmdThin_Click();
    }

    void typeThin(ThinControl c, const QString &text) { thin.typeText(c, text); }
    float number(ThinControl c) const { return static_cast<float>(shell::val(thinView.text(c))); }

    const work::TableRow &lastRow() const { return logic.table().row(logic.table().lastRow()); }

    thinning::ThinWindowLogic &thin = session.thinning();
};

} // namespace arbolex::testing
