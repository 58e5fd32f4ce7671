#pragma once

#include "workflow/mainwindowfixture.hpp"

#include "prices/costfile.hpp"
#include "prices/pricedata.hpp"
#include "shell/vbformat.hpp"
#include "thinning/headlessthinview.hpp"
#include "thinning/thinwindowlogic.hpp"

#include <QDir>
#include <QStringList>

#include <vector>

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

    /// From a cleared table: the young stand (on `netArea` ha, if given) grown
    /// by one-year steps and thinned by `volumes[i]` m³/ha at `ages[i]` (one
    /// volume: the same at every age), grown on to `finalCut` and felled there
    /// (0: no final cut).
    void typeRotation(const std::vector<int> &ages, const QStringList &volumes, int finalCut,
                      const QString &netArea = {}) {
        const auto growTo = [this](int to) {
            type(MainControl::txtToA, QString::number(to));
            type(MainControl::txtByA, QStringLiteral("1"));
            logic.cmdGrow_Click();
        };
        logic.cmdClear_Click();
        typeStand();
        if (!netArea.isEmpty()) {
            type(MainControl::txtNetArea, netArea);
        }
        for (std::size_t i = 0; i < ages.size(); ++i) {
            growTo(ages[i]);
            if (i > 0) {
                interactive.answers.append(false); // no thinning loop
            }
            logic.cmdThin_Click();
            typeThin(ThinControl::txtRemV, volumes.value(volumes.size() == 1 ? 0 : qsizetype(i)));
            thin.cmdThin_Click();
            thin.cmdAccept_Click();
        }
        if (finalCut > 0) {
            growTo(finalCut);
            logic.cmdFinalCut_Click();
        }
    }

    void typeThin(ThinControl c, const QString &text) { thin.typeText(c, text); }
    float number(ThinControl c) const { return static_cast<float>(shell::val(thinView.text(c))); }

    const work::TableRow &lastRow() const { return logic.table().row(logic.table().lastRow()); }

    thinning::ThinWindowLogic &thin = session.thinning();
};

} // namespace arbolex::testing
