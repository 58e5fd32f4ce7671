#pragma once

#include "charts/chartdata.hpp"
#include "economics/ieconomicsview.hpp"

#include <QDialog>

#include <array>
#include <functional>
#include <map>

class QChartView;
class QGroupBox;
class QLabel;
class QProgressBar;
class QTabWidget;
class QTableView;
class QThread;

namespace arbolex::economics {
class EconomicsWindowLogic;
}

namespace arbolex::ui {

class StringGridModel;

/// The economics window `frmEconomics`: the value of the rotation in the
/// projection table, NPV, LEV and MAI by rotation age, the regime optimiser,
/// the tornado and the Monte Carlo draws, each on a tab. Not modal. The
/// optimiser runs on a thread of its own while the window stays alive.
class EconomicsWindow : public QDialog, public economics::IEconomicsView {
    Q_OBJECT
public:
    explicit EconomicsWindow(QWidget *main = nullptr);
    ~EconomicsWindow() override;

    /// Binds the window to its logic, which must outlive the window.
    void attach(economics::EconomicsWindowLogic &logic);

    QWidget *control(economics::EconomicsControl control) const;
    QTabWidget *tabs() const { return m_tabs; }
    /// Cancels the optimiser if it runs and waits for its thread: called
    /// before the logic goes, since the search reads the logic's Cancel.
    void waitForWork();

    // IEconomicsView
    using QDialog::setEnabled;
    QString text(economics::EconomicsControl control) const override;
    void setText(economics::EconomicsControl control, const QString &text) override;
    void setEnabled(economics::EconomicsControl control, bool enabled) override;
    void focus(economics::EconomicsControl control) override;
    void figuresChanged() override;
    void regimesChanged() override;
    void monteCarloChanged() override;
    void setProgress(double fraction) override;
    void runInBackground(std::function<void()> work, std::function<void()> done) override;
    void showWindow() override;
    void close() override;
    bool isShown() const override;

private:
    QWidget *buildRotationTab();
    /// Timber and carbon side by side, under the figures of the rotation tab.
    QWidget *buildCarbonFigures();
    QWidget *buildOptimiserTab();
    QWidget *buildSensitivityTab();
    QWidget *buildMonteCarloTab();
    QWidget *field(economics::EconomicsControl control, int characters);
    QLabel *label(economics::EconomicsControl control);
    /// The choice cboValuation: standing price of the mean tree or assortments.
    QWidget *valuationChoice();
    QWidget *button(economics::EconomicsControl control, const QString &caption);
    /// Draws `chart` in `view` now when its tab is in view, or when its tab is
    /// next shown, deleting the chart it showed before.
    void showChart(QChartView *view, charts::ChartData chart);
    /// Draws `chart` in `view`, deleting the chart it showed before.
    static void draw(QChartView *view, const charts::ChartData &chart);
    void showPendingCharts();

    economics::EconomicsWindowLogic *m_logic = nullptr;
    std::array<QWidget *, economics::kEconomicsControlCount> m_controls{};
    QTabWidget *m_tabs = nullptr;
    QGroupBox *m_valueBox = nullptr;
    QLabel *m_optimiserTitle = nullptr;
    QChartView *m_rotationChart = nullptr;
    QChartView *m_tornadoNpv = nullptr;
    QChartView *m_tornadoLev = nullptr;
    QChartView *m_histogram = nullptr;
    /// Charts waiting for their tab to be shown.
    std::map<QChartView *, charts::ChartData> m_pendingCharts;
    QProgressBar *m_progress = nullptr;
    QTableView *m_regimes = nullptr;
    StringGridModel *m_regimeModel = nullptr;
    QThread *m_worker = nullptr;
};

} // namespace arbolex::ui
