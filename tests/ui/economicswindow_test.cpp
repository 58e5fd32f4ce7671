// The economics window on the screen: its charts are drawn, the optimiser
// runs beside the window with its progress bar, and Cancel stops it.
#include "guifixture.hpp"

#include "economics/economicswindowlogic.hpp"
#include "thinning/thinwindowlogic.hpp"
#include "ui/economicswindow.hpp"
#include "ui/thinwindow.hpp"

#include <QAbstractButton>
#include <QChart>
#include <QChartView>
#include <QDeadlineTimer>
#include <QProgressBar>
#include <QTabWidget>
#include <QTableView>

namespace arbolex::testing {
namespace {

using economics::EconomicsControl;

/// The stand of the start-up file grown to 45 and the economics window open on it.
class EconomicsWindowGuiTest : public MainWindowGuiTest {
protected:
    EconomicsWindowGuiTest() {
        window.show();
        field(MainControl::txtToA)->setText(QStringLiteral("45"));
        logic.cmdGrow_Click();
        economics.cmdEconomics_Click();
    }

    /// Lets the window's events run until the optimiser is done (at most 60 s).
    void waitForOptimiser() {
        const QDeadlineTimer deadline(60000);
        while (economics.optimising() && !deadline.hasExpired()) {
            QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        }
        QCoreApplication::processEvents();
    }

    ~EconomicsWindowGuiTest() override { economicsWindow.waitForWork(); }

    thinning::ThinWindowLogic &thin = session.thinning();
    ui::EconomicsWindow &economicsWindow = desktop.economicsWindow();
    economics::EconomicsWindowLogic &economics = session.economics();
};

TEST_F(EconomicsWindowGuiTest, EveryChartIsDrawnByTheTimeItsTabIsShown) {
    ASSERT_TRUE(economicsWindow.isVisible());
    ASSERT_TRUE(economics.valued());
    const QList<QChartView *> charts = economicsWindow.findChildren<QChartView *>();
    ASSERT_EQ(charts.size(), 4);
    auto *tabs = economicsWindow.findChild<QTabWidget *>();
    ASSERT_NE(tabs, nullptr);
    int drawn = 0;
    for (int tab = 0; tab < tabs->count(); ++tab) {
        tabs->setCurrentIndex(tab);
        for (const QChartView *view : charts) {
            if (!tabs->currentWidget()->isAncestorOf(view)) {
                continue;
            }
            ++drawn;
            EXPECT_FALSE(view->chart()->series().isEmpty()) << view->chart()->title().toStdString();
            EXPECT_TRUE(view->chart()->title().contains(QStringLiteral("% a year")))
                << view->chart()->title().toStdString();
        }
    }
    EXPECT_EQ(drawn, 4);
}

TEST_F(EconomicsWindowGuiTest, OptimiserRunsBesideTheWindowAndFillsItsTable) {
    click(economicsWindow.control(EconomicsControl::cmdOptimise));
    EXPECT_TRUE(economics.optimising());
    EXPECT_FALSE(economicsWindow.control(EconomicsControl::cmdOptimise)->isEnabled());
    EXPECT_TRUE(economicsWindow.control(EconomicsControl::cmdCancel)->isEnabled());
    waitForOptimiser();
    ASSERT_FALSE(economics.optimising());
    EXPECT_EQ(economicsWindow.findChild<QProgressBar *>()->value(), 1000);
    // Five regimes and the user's own.
    EXPECT_EQ(economicsWindow.findChild<QTableView *>()->model()->rowCount(), 6);
    EXPECT_TRUE(economicsWindow.control(EconomicsControl::cmdApply)->isEnabled());
}

TEST_F(EconomicsWindowGuiTest, CancelStopsTheSearch) {
    click(economicsWindow.control(EconomicsControl::cmdOptimise));
    click(economicsWindow.control(EconomicsControl::cmdCancel));
    waitForOptimiser();
    ASSERT_FALSE(economics.optimising());
    EXPECT_TRUE(economicsWindow.text(EconomicsControl::lblOptimiser)
                    .startsWith(QStringLiteral("Cancelled")));
    EXPECT_LT(economicsWindow.findChild<QProgressBar *>()->value(), 1000);
    EXPECT_TRUE(economicsWindow.control(EconomicsControl::cmdOptimise)->isEnabled());
}

} // namespace
} // namespace arbolex::testing
