#pragma once

#include "charts/chartdata.hpp"
#include "estatewindow/iestateview.hpp"

#include <QWidget>

class QAction;
class QChartView;
class QMenu;
class QLabel;
class QProgressDialog;
class QTabWidget;
class QTableView;
class QThread;

namespace arbolex::estatewindow {
class EstateWindowLogic;
}

namespace arbolex::ui {

class EstateSortModel;

/// The estate window `frmEstate`: the sub-compartments of the estate as a
/// sortable table (rows not grown in red, their message on hover) and the
/// harvest forecast as bars stacked by species; a double-click opens a
/// sub-compartment in the main window. The run shows a progress dialog.
class EstateWindow : public QWidget, public estatewindow::IEstateView {
    Q_OBJECT
public:
    explicit EstateWindow(QWidget *parent = nullptr);
    ~EstateWindow() override;

    void attach(estatewindow::EstateWindowLogic &logic);
    /// Puts File → Open Estate… into `fileMenu` after the entry `after`.
    QAction *addOpenEntry(QMenu &fileMenu, QAction *after);
    /// Waits for a run under way (the program ends).
    void waitForWork();

    QTabWidget *tabs() const { return m_tabs; }
    QTableView *table() const { return m_table; }

    // IEstateView
    QString chooseEstateFile() override;
    void setProgress(long long rowsDone, long long rowsInInput) override;
    void runInBackground(std::function<void()> work, std::function<void()> done) override;
    void resultsChanged() override;
    void showWindow() override;

private:
    void drawForecast();

    estatewindow::EstateWindowLogic *m_logic = nullptr;
    QTabWidget *m_tabs = nullptr;
    QLabel *m_summary = nullptr;
    QTableView *m_table = nullptr;
    EstateSortModel *m_sorted = nullptr;
    QChartView *m_chart = nullptr;
    /// The forecast as drawn, for the hover text of its bars.
    charts::ChartData m_drawn;
    QProgressDialog *m_progress = nullptr;
    QThread *m_worker = nullptr;
};

} // namespace arbolex::ui
