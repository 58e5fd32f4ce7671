#include "report/chartbuilder.hpp"

#include <QAreaSeries>
#include <QFont>
#include <QLegendMarker>
#include <QLineSeries>
#include <QPen>
#include <QScatterSeries>
#include <QValueAxis>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace arbolex::report {

using charts::ChartData;
using charts::ChartPoint;
using charts::ChartSeries;

namespace {

/// Colours of the series in order: distinct in print and for colour-blind readers.
constexpr std::array<QRgb, 6> kPalette = {0x1b6ca8, 0x2e8b57, 0xb8860b,
                                          0x8b3a3a, 0x6a4c93, 0x555555};
constexpr QRgb kMarkColour = 0xc0392b;
/// Width of a bar of the yearly cash flow, years.
constexpr double kBarWidth = 0.8;

struct Range {
    double low = std::numeric_limits<double>::max();
    double high = std::numeric_limits<double>::lowest();
    void include(double v) {
        low = std::min(low, v);
        high = std::max(high, v);
    }
    bool valid() const { return low <= high; }
};

QFont sized(int pointSize, bool bold = false) {
    QFont font;
    font.setPointSize(pointSize);
    font.setBold(bold);
    return font;
}

QValueAxis *valueAxis(const QString &title) {
    auto *axis = new QValueAxis;
    axis->setTitleText(title);
    axis->setTitleFont(sized(9));
    axis->setLabelsFont(sized(8));
    axis->setLabelFormat(QStringLiteral("%.0f"));
    axis->setGridLineColor(QColor(0xdd, 0xdd, 0xdd));
    return axis;
}

/// A readable step: 1, 2, 2.5 or 5 times a power of ten, at least `rough`.
double niceStep(double rough) {
    if (!(rough > 0.0)) {
        return 1.0;
    }
    const double power = std::pow(10.0, std::floor(std::log10(rough)));
    for (const double factor : {1.0, 2.0, 2.5, 5.0, 10.0}) {
        if (factor * power >= rough) {
            return factor * power;
        }
    }
    return 10.0 * power;
}

/// Ranges of the value axes from 0 (or below, for money spent) to their
/// highest value in readable steps, every axis with the same number of steps
/// below and above 0: their zeros and grid lines are level.
void setAlignedRanges(const std::vector<QValueAxis *> &axes, std::vector<Range> ranges) {
    constexpr double kSteps = 5.0;
    int below = 0;
    int above = 1;
    std::vector<double> steps;
    for (Range &range : ranges) {
        if (!range.valid()) {
            range = {0.0, 1.0};
        }
        range.include(0.0);
        const double step = niceStep((range.high - range.low) / kSteps);
        steps.push_back(step);
        below = std::max(below, static_cast<int>(std::ceil(-range.low / step - 1e-9)));
        above = std::max(above, static_cast<int>(std::ceil(range.high / step - 1e-9)));
    }
    for (std::size_t a = 0; a < axes.size(); ++a) {
        axes[a]->setRange(-below * steps[a], above * steps[a]);
        axes[a]->setTickCount(below + above + 1);
        // A small step (a top height in tenths) needs its decimals.
        if (steps[a] < 1.0) {
            axes[a]->setLabelFormat(QStringLiteral("%.1f"));
        }
    }
}

QXYSeries *lineSeries(const ChartSeries &s, QColor colour) {
    auto *line = new QLineSeries;
    for (const ChartPoint &p : s.points) {
        line->append(p.x, p.y);
    }
    QPen pen(colour);
    pen.setWidthF(2.0);
    line->setPen(pen);
    return line;
}

QAreaSeries *barSeries(const ChartSeries &s, QColor colour) {
    auto *outline = new QLineSeries;
    auto *base = new QLineSeries;
    for (const ChartPoint &p : s.points) {
        const double left = p.x - kBarWidth / 2.0;
        const double right = p.x + kBarWidth / 2.0;
        outline->append(left, 0.0);
        outline->append(left, p.y);
        outline->append(right, p.y);
        outline->append(right, 0.0);
        base->append(left, 0.0);
        base->append(right, 0.0);
    }
    auto *bars = new QAreaSeries(outline, base);
    bars->setColor(colour);
    bars->setBorderColor(colour.darker(130));
    return bars;
}

} // namespace

QChart *buildChart(const ChartData &data) {
    auto *chart = new QChart;
    chart->setTitle(data.note.isEmpty()
                        ? data.title
                        : QStringLiteral("%1<br><span style=\"font-size:9pt; font-weight:normal\">"
                                         "%2</span>")
                              .arg(data.title.toHtmlEscaped(), data.note.toHtmlEscaped()));
    chart->setTitleFont(sized(12, true));
    chart->legend()->setAlignment(Qt::AlignBottom);
    chart->legend()->setFont(sized(9));
    chart->setMargins(QMargins(6, 6, 6, 6));
    chart->setBackgroundRoundness(0);

    auto *xAxis = valueAxis(data.xTitle);
    Range xRange;
    std::vector<Range> yRanges(data.axes.size());
    std::vector<QValueAxis *> yAxes;
    chart->addAxis(xAxis, Qt::AlignBottom);
    for (const charts::ChartAxis &a : data.axes) {
        QValueAxis *axis = valueAxis(a.title);
        chart->addAxis(axis, a.right ? Qt::AlignRight : Qt::AlignLeft);
        yAxes.push_back(axis);
    }

    for (std::size_t i = 0; i < data.series.size(); ++i) {
        const ChartSeries &s = data.series[i];
        const QColor colour(kPalette.at(i % kPalette.size()));
        const auto axis = static_cast<std::size_t>(
            std::clamp<int>(s.axis, 0, static_cast<int>(yAxes.size()) - 1));
        QAbstractSeries *drawn = s.style == ChartSeries::Style::Bars
                                     ? static_cast<QAbstractSeries *>(barSeries(s, colour))
                                     : lineSeries(s, colour);
        for (const ChartPoint &p : s.points) {
            xRange.include(p.x);
            yRanges[axis].include(p.y);
        }
        drawn->setName(s.name);
        drawn->setProperty(kSeriesIndexProperty, static_cast<int>(i));
        chart->addSeries(drawn);
        drawn->attachAxis(xAxis);
        drawn->attachAxis(yAxes[axis]);
    }

    for (const charts::ChartMark &m : data.marks) {
        auto *mark = new QScatterSeries;
        mark->append(m.at.x, m.at.y);
        mark->setMarkerSize(11.0);
        mark->setColor(QColor(kMarkColour));
        mark->setBorderColor(Qt::white);
        // A format without placeholders prints the label itself.
        mark->setPointLabelsFormat(m.label);
        mark->setPointLabelsVisible(true);
        mark->setPointLabelsClipping(false);
        mark->setPointLabelsFont(sized(9, true));
        mark->setPointLabelsColor(QColor(kMarkColour).darker(120));
        mark->setName(m.label);
        chart->addSeries(mark);
        const auto axis = static_cast<std::size_t>(
            std::clamp<int>(m.axis, 0, static_cast<int>(yAxes.size()) - 1));
        mark->attachAxis(xAxis);
        mark->attachAxis(yAxes[axis]);
        xRange.include(m.at.x);
        yRanges[axis].include(m.at.y);
        // The label beside the point says it all; the legend lists the series.
        for (QLegendMarker *marker : chart->legend()->markers(mark)) {
            marker->setVisible(false);
        }
    }

    if (xRange.valid()) {
        // A mark's label is centred over its point: room for it at the ends.
        const double span = xRange.high - xRange.low;
        for (const charts::ChartMark &m : data.marks) {
            xRange.include(m.at.x + 0.15 * span);
            xRange.include(m.at.x - 0.15 * span);
        }
        // Whole years at the ends, and room for the bars' half widths.
        xAxis->setRange(std::floor(xRange.low - kBarWidth / 2.0),
                        std::ceil(xRange.high + kBarWidth / 2.0));
    } else {
        xAxis->setRange(0.0, 1.0);
    }
    xAxis->setTickType(QValueAxis::TicksDynamic);
    xAxis->setTickAnchor(0.0);
    const double years = xAxis->max() - xAxis->min();
    xAxis->setTickInterval(years > 60.0 ? 10.0 : 5.0);
    setAlignedRanges(yAxes, yRanges);
    return chart;
}

bool nearestPoint(const ChartSeries &series, double x, double y, ChartPoint &found) {
    if (series.points.empty()) {
        return false;
    }
    const auto distance = [x, y](const ChartPoint &p) {
        return std::pair{std::abs(p.x - x), std::abs(p.y - y)};
    };
    found = *std::min_element(series.points.begin(), series.points.end(),
                              [&distance](const ChartPoint &a, const ChartPoint &b) {
                                  return distance(a) < distance(b);
                              });
    return true;
}

QString hoverText(const ChartData &data, const ChartSeries &series, const ChartPoint &point) {
    const int decimals = std::abs(point.y) < 100.0 ? 1 : 0;
    return QStringLiteral("%1\n%2: %3\n%4 %5")
        .arg(series.name, data.xTitle, QString::number(point.x, 'f', 0),
             QString::number(point.y, 'f', decimals), series.unit);
}

} // namespace arbolex::report
