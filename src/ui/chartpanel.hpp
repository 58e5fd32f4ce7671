#pragma once

#include "charts/chartdata.hpp"
#include "charts/reportcontent.hpp"

#include <QWidget>

#include <array>
#include <functional>

class QChartView;
class QLabel;
class QPushButton;
class QTabWidget;

namespace arbolex::ui {

/// The charts beside the projection table, one tab each: stand development,
/// increments, cash flow and carbon. Values show on hover; the chart in view exports
/// to PNG and SVG.
class ChartPanel : public QWidget {
    Q_OBJECT
public:
    enum Chart : int { kStand = 0, kIncrements = 1, kCashFlow = 2, kCarbon = 3, kChartCount = 4 };

    explicit ChartPanel(QWidget *parent = nullptr);

    /// Takes the charts' data and draws the chart in view; the others are
    /// drawn when their tab is first shown.
    void showCharts(const charts::RotationCharts &drawn);
    const charts::ChartData &data(Chart chart) const;
    QChartView *view(Chart chart) const;
    QTabWidget *tabs() const { return m_tabs; }
    Chart current() const;
    void setCurrent(Chart chart);

    /// Saves the chart in view as PNG or SVG (by the file's suffix) at the
    /// size it has on screen; false when the file cannot be written.
    bool exportCurrent(const QString &path) const;

    /// Called with the path and the outcome after an export chosen in the
    /// panel's file dialog.
    void onExported(std::function<void(const QString &path, bool ok)> handler) {
        m_exported = std::move(handler);
    }

private:
    void draw(Chart chart);
    void exportAs(const QString &suffix);
    void hovered(Chart chart, int series, double x, double y, bool state);

    QTabWidget *m_tabs = nullptr;
    std::array<QChartView *, kChartCount> m_views{};
    std::array<QLabel *, kChartCount> m_empty{};
    std::array<charts::ChartData, kChartCount> m_data;
    /// The view shows m_data (drawn since the data last changed).
    std::array<bool, kChartCount> m_drawn{};
    std::function<void(const QString &, bool)> m_exported;
};

} // namespace arbolex::ui
